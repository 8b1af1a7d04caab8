package com.brindlex.kernel.quorvane.simulator;

import java.time.LocalDateTime;

/** What every order in the broker's book has: its numbers, its account and what became of it. */
abstract class BookedOrder {
    final TradingAccount account;
    final String number;
    final String gatewayNumber;
    final long ordered;
    final LocalDateTime entered;
    long filled;
    long reduced;
    long cancelled;
    private String failure = "";

    /**
     * Numbers an order.
     *
     * @param letter letter of its order number
     * @param sequence its place in the book, from 1
     * @param gatewayNumber its number at the gateway
     */
    BookedOrder(TradingAccount account, char letter, int sequence, long gatewayNumber, long ordered,
            LocalDateTime entered) {
        this.account = account;
        this.number = String.format("%c%04d", letter, sequence);
        this.gatewayNumber = String.format("%010d", gatewayNumber);
        this.ordered = ordered;
        this.entered = entered;
    }

    /** What can still be filled, reduced or cancelled. */
    final long open() {
        return failed() ? 0 : ordered - filled - reduced - cancelled;
    }

    /** Refuses a fill of more than is open, in a sentence. */
    final void checkFill(long quantity, String unit) {
        if (quantity <= 0 || quantity > open()) {
            throw new IllegalArgumentException("The order " + number + " has " + open() + " " + unit
                    + " open: 1 to " + open() + " can be filled, not " + quantity + ".");
        }
    }

    final boolean failed() {
        return !failure.isEmpty();
    }

    final String failure() {
        return failure;
    }

    /** The exchange refuses the order after the broker had taken it. */
    final void fail(String text) {
        failure = text;
    }

    /** Writes the order as a record of the order book. */
    abstract void write(Reply reply);
}
