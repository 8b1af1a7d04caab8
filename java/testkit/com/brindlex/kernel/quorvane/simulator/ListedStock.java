package com.brindlex.kernel.quorvane.simulator;

import java.math.BigDecimal;
import org.jetbrains.annotations.NotNull;

/**
 * A listed stock: its reference price, the day's price limits and its credit figures. Never
 * changes: each method gives another stock.
 */
public final class ListedStock {
    private static final long MARGIN_QUOTA = 500;

    final String code;

    /** Prices in hundredths. */
    final long reference;
    final long limitDown;
    final long limitUp;

    /** Lots that may be bought on margin and sold short; both 0 where there is no credit. */
    final long marginQuota;
    final long shortQuota;

    private ListedStock(String code, long reference, long limitDown, long limitUp,
            long marginQuota, long shortQuota) {
        if (limitDown <= 0 || limitDown > reference || limitUp < reference) {
            throw new IllegalArgumentException("The price limits of " + code + " must lie around its"
                    + " reference price.");
        }
        this.code = code;
        this.reference = reference;
        this.limitDown = limitDown;
        this.limitUp = limitUp;
        this.marginQuota = marginQuota;
        this.shortQuota = shortQuota;
    }

    /**
     * A stock that may be traded on credit and within ten percent of its reference price.
     *
     * @param code 1 to 6 characters
     * @param reference the reference price of the day, such as {@code "1000.00"}
     */
    @NotNull
    public static ListedStock of(@NotNull String code, @NotNull String reference) {
        if (!code.matches("[0-9A-Z]{1,6}")) {
            throw new IllegalArgumentException("The code of a stock is 1 to 6 digits and capital"
                    + " letters, such as \"2330\", not \"" + code + "\".");
        }
        long price = hundredths(reference);
        return new ListedStock(code, price, (price * 90 + 99) / 100, price * 110 / 100,
                MARGIN_QUOTA, MARGIN_QUOTA / 2);
    }

    /** The lowest and the highest price of the day. */
    @NotNull
    public ListedStock limits(@NotNull String down, @NotNull String up) {
        return new ListedStock(
                code, reference, hundredths(down), hundredths(up), marginQuota, shortQuota);
    }

    /** The lots that may be bought on margin and sold short. */
    @NotNull
    public ListedStock credit(long marginLots, long shortLots) {
        return new ListedStock(code, reference, limitDown, limitUp, marginLots, shortLots);
    }

    /** A stock that is traded for cash alone. */
    @NotNull
    public ListedStock withoutCredit() {
        return credit(0, 0);
    }

    boolean hasCredit() {
        return marginQuota > 0 || shortQuota > 0;
    }

    static long hundredths(String price) {
        if (!price.matches("[0-9]{1,8}(\\.[0-9]{1,2})?")) {
            throw new IllegalArgumentException("A price of a stock is written as \"995.50\", with at"
                    + " most two decimals, not \"" + price + "\".");
        }
        return new BigDecimal(price).movePointRight(2).longValueExact();
    }
}
