package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Brokerage;
import java.time.LocalDate;
import java.util.Map;
import java.util.TreeMap;

/** What an account holds of each stock: at the opening, and what the day's fills change. */
final class StockHoldings {
    private static final int CASH = 0;
    private static final int MARGIN = 1;
    private static final int SHORT = 2;

    private static final int KINDS = 3;

    /** One stock: for each way of holding it the opening quantity, what came and what went. */
    static final class Held {
        private final long[] opening = new long[KINDS];
        private final long[] came = new long[KINDS];
        private final long[] went = new long[KINDS];
        private long other;

        private Held opening(Holding holding) {
            opening[CASH] = holding.cash;
            opening[MARGIN] = holding.margin;
            opening[SHORT] = holding.shortSold;
            other = holding.pledged;
            return this;
        }

        long cash() {
            return opening[CASH] + came[CASH] - went[CASH];
        }

        private void apply(StockFill fill) {
            int way = fill.onMargin() ? MARGIN : fill.isShort() ? SHORT : CASH;
            // a short position grows by selling
            boolean grows = (fill.order.side == 'B') != (way == SHORT);
            (grows ? came : went)[way] += fill.shares;
        }

        private void write(Reply reply, String code, Brokerage brokerage) {
            reply.record().field("29", code);
            for (int way = 0; way < KINDS; way++) {
                String tag = String.valueOf(75 + way);
                reply.field(tag, opening[way]);
                if (brokerage == Brokerage.JZG) {
                    reply.field(tag + "1", came[way]).field(tag + "2", -went[way]);
                } else {
                    reply.field(tag + "1", came[way] - went[way]);
                }
            }
            if (brokerage == Brokerage.STANDARD) {
                reply.field("PS", other);
            }
            reply.close();
        }
    }

    private final Period session;

    StockHoldings(LocalDate today) {
        this.session = new Period(today, LocalDate.MAX);
    }

    /** The account's holdings now. */
    Map<String, Held> of(TradingAccount account, Iterable<StockFill> fills) {
        Map<String, Held> holdings = new TreeMap<>();
        for (Holding holding : account.holdings) {
            holdings.put(holding.stockCode, new Held().opening(holding));
        }
        for (StockFill fill : fills) {
            if (fill.order.account == account && session.contains(fill.at)) {
                holdings.computeIfAbsent(fill.order.stock.code, code -> new Held()).apply(fill);
            }
        }
        return holdings;
    }

    void write(Map<String, Held> holdings, Reply reply, Brokerage brokerage) {
        holdings.forEach((code, holding) -> holding.write(reply, code, brokerage));
    }
}
