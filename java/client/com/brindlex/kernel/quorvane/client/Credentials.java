package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * Who asks: branch, ID number, account and password. Never changes, and never shows ID number or
 * password. What is out of range is told when a request is built.
 */
public final class Credentials {
    private final String branch;
    private final String idNumber;  // null for a user by account alone
    private final String account;   // null for a user by ID number alone
    private final String password;

    private Credentials(String branch, String idNumber, String account, String password) {
        this.branch = branch;
        this.idNumber = idNumber;
        this.account = account;
        this.password = password;
    }

    /**
     * A user by ID number and account.
     *
     * @param branch branch code of the brokerage
     * @param idNumber ID number, 8 to 10 letters and digits
     * @param account account, 2 to 7 digits
     * @param password trading password
     */
    @NotNull
    public static Credentials of(@NotNull String branch, @NotNull String idNumber,
            @NotNull String account, @NotNull String password) {
        return new Credentials(branch, idNumber, account, password);
    }

    /** A user by ID number alone. */
    @NotNull
    public static Credentials ofIdNumber(
            @NotNull String branch, @NotNull String idNumber, @NotNull String password) {
        return new Credentials(branch, idNumber, null, password);
    }

    /** A user by account alone. */
    @NotNull
    public static Credentials ofAccount(
            @NotNull String branch, @NotNull String account, @NotNull String password) {
        return new Credentials(branch, null, account, password);
    }

    /** The same user with another password. */
    @NotNull
    public Credentials withPassword(@NotNull String other) {
        return new Credentials(branch, idNumber, account, other);
    }

    /** Branch code of the brokerage. */
    @NotNull
    public String branch() {
        return branch;
    }

    /** ID number; empty for a user by account alone. */
    @NotNull
    public String idNumber() {
        return idNumber == null ? "" : idNumber;
    }

    /** Account; empty for a user by ID number alone. */
    @NotNull
    public String account() {
        return account == null ? "" : account;
    }

    /** Trading password. */
    @NotNull
    public String password() {
        return password;
    }

    /** Writes branch, identity and password into a request. */
    void fill(Draft<?> draft) {
        draft.set("branch", branch).set("password", password);
        identify(draft);
    }

    /** Writes the identity into a request. */
    void identify(Draft<?> draft) {
        if (idNumber != null && !idNumber.matches("[A-Za-z0-9]{8,10}")) {
            draft.refuse("idNumber", "must have 8 to 10 letters and digits");
        }
        if (account != null && !account.matches("[0-9]{2,7}")) {
            draft.refuse("account", "must have 2 to 7 digits");
        }
        draft.set("identity", idNumber == null ? account + "&" : idNumber + "&" + account());
    }

    @Override
    public boolean equals(Object other) {
        if (!(other instanceof Credentials)) {
            return false;
        }
        Credentials user = (Credentials) other;
        return user.branch.equals(branch) && user.idNumber().equals(idNumber())
                && user.account().equals(account()) && user.password.equals(password);
    }

    @Override
    public int hashCode() {
        return (branch.hashCode() * 31 + idNumber().hashCode()) * 31 + account().hashCode();
    }

    @Override
    public String toString() {
        return "Credentials(branch " + branch + ", account " + account() + ")";
    }
}
