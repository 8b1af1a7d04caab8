package com.brindlex.kernel.quorvane.simulator;

import org.jetbrains.annotations.NotNull;

/**
 * What an account holds of a stock when the gateway opens, in shares. Never changes: each method
 * gives another holding.
 */
public final class Holding {
    final String stockCode;
    final long cash;
    final long margin;
    final long shortSold;
    final long pledged;

    private Holding(String stockCode, long cash, long margin, long shortSold, long pledged) {
        if (cash < 0 || margin < 0 || shortSold < 0 || pledged < 0) {
            throw new IllegalArgumentException(
                    "A holding of " + stockCode + " counts shares: it cannot be below 0.");
        }
        this.stockCode = stockCode;
        this.cash = cash;
        this.margin = margin;
        this.shortSold = shortSold;
        this.pledged = pledged;
    }

    /** A holding of a stock, of no shares yet. */
    @NotNull
    public static Holding of(@NotNull String stockCode) {
        return new Holding(stockCode, 0, 0, 0, 0);
    }

    /** Shares that were paid for: these can be sold. */
    @NotNull
    public Holding cash(long shares) {
        return new Holding(stockCode, shares, margin, shortSold, pledged);
    }

    /** Shares that were bought on margin. */
    @NotNull
    public Holding margin(long shares) {
        return new Holding(stockCode, cash, shares, shortSold, pledged);
    }

    /** Shares that were sold short. */
    @NotNull
    public Holding shortSold(long shares) {
        return new Holding(stockCode, cash, margin, shares, pledged);
    }

    /** Shares that are pledged, among those that were paid for. */
    @NotNull
    public Holding pledged(long shares) {
        return new Holding(stockCode, cash, margin, shortSold, shares);
    }
}
