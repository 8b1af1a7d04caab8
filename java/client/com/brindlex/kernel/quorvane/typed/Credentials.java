package com.brindlex.kernel.quorvane.typed;

/** Who asks: branch, ID number and account, password. Never changes. */
public final class Credentials {
    final String branch;
    final String identity;
    final String password;

    private Credentials(String branch, String identity, String password) {
        this.branch = branch;
        this.identity = identity;
        this.password = password;
    }

    /**
     * @param branch branch code of the brokerage
     * @param idNumber ID number of the user; may be empty when the account is not
     * @param account account number; may be empty when the ID number is not
     * @param password trading password
     */
    public static Credentials of(
            String branch, String idNumber, String account, String password) {
        // an account alone must stand first: behind an empty first part nothing is looked at
        String identity = idNumber.isEmpty() ? account + "&" : idNumber + "&" + account;
        return new Credentials(branch, identity, password);
    }

    /** Branch code. */
    public String branch() {
        return branch;
    }

    /** ID number and account as requests take them, joined by {@code &}. */
    public String identity() {
        return identity;
    }

    /** The credentials without the password. */
    @Override
    public String toString() {
        return branch + " " + identity;
    }
}
