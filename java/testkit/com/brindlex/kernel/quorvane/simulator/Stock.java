package com.brindlex.kernel.quorvane.simulator;

/** A listed stock: its reference price, the day's price limits and its credit figures. */
final class Stock {
    private static final Stock[] LISTED = {
        new Stock("2330", 100000, true),
        new Stock("2317", 20000, true),
        new Stock("0050", 18500, true),
        new Stock("6547", 5000, false),
    };

    final String code;

    /** Reference price in hundredths. */
    final long reference;

    /** Whether margin purchases and short sales are allowed. */
    final boolean credit;

    private Stock(String code, long reference, boolean credit) {
        this.code = code;
        this.reference = reference;
        this.credit = credit;
    }

    /** The stock behind a code, or null. */
    static Stock byCode(String code) {
        for (Stock stock : LISTED) {
            if (stock.code.equals(code)) {
                return stock;
            }
        }
        return null;
    }

    long limitUp() {
        return reference * 110 / 100;
    }

    long limitDown() {
        return (reference * 90 + 99) / 100;
    }
}
