package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Brokerage;
import java.time.LocalDateTime;

/** One fill of a stock order, with the money that it moves. */
final class StockFill {
    private static final long MIN_FEE = 20;

    final StockOrder order;
    final long shares;
    final long price;
    final LocalDateTime at;

    StockFill(StockOrder order, long shares, long price, LocalDateTime at) {
        this.order = order;
        this.shares = shares;
        this.price = price;
        this.at = at;
    }

    private long amount() {
        return shares * price / 100;
    }

    /** 0.1425 percent, at least 20. */
    private long fee() {
        return Math.max(MIN_FEE, amount() * 1425 / 1000000);
    }

    /** 0.3 percent on sales. */
    private long tax() {
        return order.side == 'S' ? amount() * 3 / 1000 : 0;
    }

    /** The part of a margin purchase that the broker lends, in whole thousands. */
    private long loan() {
        return amount() * 60 / 100 / 1000 * 1000;
    }

    /** Whether the fill bought or sold on margin (order kinds 1 and 3). */
    boolean onMargin() {
        return order.kind == 1 || order.kind == 3;
    }

    /** Whether the fill belongs to a short sale (order kinds 2 and 4). */
    boolean isShort() {
        return order.kind == 2 || order.kind == 4;
    }

    /** Writes the fill as a record of the fill list. */
    void write(Reply reply) {
        writeTrade(reply);
        reply.field("51", Texts.time(at.toLocalTime())).close();
    }

    /** Writes the fill as a record of the settlement. */
    void writeSettlement(Reply reply, Brokerage brokerage) {
        long net = order.side == 'B' ? -(amount() + fee()) : amount() - fee() - tax();
        long ownFunds = amount() - loan();
        if (onMargin()) {
            net = order.side == 'B' ? -(ownFunds + fee()) : net - loan();
        } else if (isShort()) {
            net = order.side == 'S' ? -(amount() * 90 / 100) : net;
        }
        writeTrade(reply);
        if (brokerage == Brokerage.JZG) {
            reply.field("KT", onMargin() ? "12" : isShort() ? "21" : "0");
        }
        reply.field("79", fee())
                .field("78", tax())
                .field("84", 0)
                .field("81", onMargin() ? loan() : 0)
                .field("82", onMargin() ? ownFunds : 0)
                .field("85", isShort() ? amount() : 0)
                .field("87", isShort() ? amount() * 90 / 100 : 0)
                .field("86", 0)
                .field("89", 0)
                .field("88", 0)
                .field("96", net < 0 ? "-" : "")
                .field("97", Math.abs(net))
                .close();
    }

    private void writeTrade(Reply reply) {
        reply.record()
                .field("36", order.number).field("27", order.kind).field("28", order.tradeType)
                .field("32", order.side).field("29", order.stock.code)
                .field("47", shares).field("48", String.format("%d.%02d", price / 100, price % 100))
                .field("49", amount()).field("50", Texts.date(at.toLocalDate()));
    }
}
