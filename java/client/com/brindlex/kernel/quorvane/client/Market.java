package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * The market that a session stands on. Login, accounts and certificates go out for it; a stock
 * request always goes out for securities and a futures request for futures, whichever it is. Never
 * changes.
 */
public final class Market {
    private static final int FUTURES_OFFSET = 100;

    /** Securities. */
    public static final Market SECURITIES = new Market(1);

    /** Futures and options. */
    public static final Market FUTURES = new Market(1 + FUTURES_OFFSET);

    private final int code;

    private Market(int code) {
        this.code = code;
    }

    /**
     * A market by its code, where the broker has several: 0 to 100 for securities, 101 to 200 for
     * futures. The order books show some states otherwise on 3, 8 and 103.
     *
     * @throws IllegalArgumentException when there is no such code
     */
    @NotNull
    public static Market of(int code) {
        if (code < 0 || code > 2 * FUTURES_OFFSET) {
            throw new IllegalArgumentException("no market has the code " + code);
        }
        return new Market(code);
    }

    /** The code. */
    public int code() {
        return code;
    }

    /** Whether it is a futures market. */
    public boolean isFutures() {
        return code > FUTURES_OFFSET;
    }

    /** The code that a stock request takes. */
    int stockCode() {
        return isFutures() ? code - FUTURES_OFFSET : code;
    }

    /** The code that a futures request takes, to which the library adds 100: never 0. */
    int futuresCode() {
        return Math.max(1, stockCode());
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Market && ((Market) other).code == code;
    }

    @Override
    public int hashCode() {
        return code;
    }

    @Override
    public String toString() {
        return (isFutures() ? "futures " : "securities ") + code;
    }
}
