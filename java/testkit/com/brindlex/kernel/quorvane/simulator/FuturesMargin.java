package com.brindlex.kernel.quorvane.simulator;

import java.util.List;

/** The margin account behind a futures account, in whole units of the currency. */
final class FuturesMargin {
    private static final long FEE = 50;

    private final long balance;
    private final long bound;
    private final long fees;

    FuturesMargin(long balance, List<FuturesPosition> positions, List<FuturesFill> fills) {
        this.balance = balance;
        long margin = 0;
        for (FuturesPosition position : positions) {
            margin += position.margin().longValue();
        }
        long contracts = 0;
        for (FuturesFill fill : fills) {
            contracts += fill.contracts;
        }
        bound = margin;
        fees = contracts * FEE;
    }

    long available() {
        return balance - fees - bound;
    }

    /** Margin that an order would bind if it were filled whole. */
    long needed(FuturesOrder order) {
        return order.bindsMargin() ? order.ordered * order.leg1.product.margin : 0;
    }

    String reply(Request request) {
        long equity = balance - fees;
        long maintenance = bound * 3 / 4;
        String ratio = bound == 0 ? "0" : String.valueOf(equity * 100 / bound);
        return Reply.query(request)
                .record()
                .field("LO", balance + ".00")
                .field("PN", equity)
                .field("RA", available())
                .field("QY", bound)
                .field("QX", maintenance)
                .field("U5", 0)
                .field("U9", fees)
                .field("RF", ratio)
                .field("F0", 0)
                .field("F1", 0)
                .field("F2", equity)
                .field("F3", available())
                .close()
                .end()
                .text();
    }
}
