package com.brindlex.kernel.quorvane.simulator;

/** A trading account: its class letter ('S' securities, 'F' futures), branch, number and label. */
public final class Account {
    final char market;
    final String branch;
    final String number;
    final String label;

    /** Whether the account may trade; a blocked one is listed and refuses orders. */
    final boolean active;

    Account(char market, String branch, String number, String label, boolean active) {
        this.market = market;
        this.branch = branch;
        this.number = number;
        this.label = label;
        this.active = active;
    }

    /** The number as a decimal one, so that leading zeros do not matter. */
    boolean hasNumber(String text) {
        return text.matches("[0-9]{1,18}") && Long.parseLong(text) == Long.parseLong(number);
    }

    @Override
    public String toString() {
        return market + " " + branch + "-" + number;
    }
}
