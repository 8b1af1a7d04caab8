package com.brindlex.kernel.quorvane.simulator;

import java.math.BigDecimal;
import java.time.LocalDateTime;

/** A stock order. Quantities are shares, prices hundredths. */
final class StockOrder extends BookedOrder {
    private static final String TAKEN = "委託成功";

    final ListedStock stock;
    final int kind;
    final int tradeType;
    final char side;
    private final int n6;
    private final int priceKind;

    /** Limit price text; empty when the price kind or the trade type names the price. */
    private final String price;

    StockOrder(Request request, TradingAccount account, ListedStock stock, int sequence,
            LocalDateTime now) throws Refusal {
        super(account, 'A', sequence, sequence, request.number("30"), now);
        this.stock = stock;
        this.kind = (int) request.number("27");
        this.tradeType = (int) request.number("28");
        this.side = request.letter("32", "BS");
        this.priceKind = request.get("M8").isEmpty() ? 0 : (int) request.number("M8");
        this.price = tradeType == 3 || priceKind != 0 ? "" : request.get("31");
        this.n6 = (int) request.number("N6");
    }

    /** Whether it waits at the broker for the next session. */
    boolean isReservation() {
        return n6 == 0;
    }

    /** The price that a fill must not be worse than, in hundredths; 0 when there is no limit. */
    long limit() {
        return price.isEmpty() ? 0 : new BigDecimal(price).movePointRight(2).longValueExact();
    }

    /** What a purchase may cost at most, in whole units; nothing is owed for what was taken off. */
    long cost() {
        long shares = side == 'B' ? filled + open() : 0;
        return shares * (limit() == 0 ? stock.limitUp : limit()) / 100;
    }

    @Override
    void write(Reply reply) {
        reply.record()
                .field("46", gatewayNumber).field("36", number)
                .field("27", kind).field("28", tradeType).field("32", side)
                .field("29", stock.code).field("70", ordered)
                .field("41", cancelled).field("37", reduced).field("47", filled)
                .field("39", failed() ? "E" : " ").field("K1", failed() ? failure() : TAKEN)
                .field("N6", n6).field("31", price).field("M8", priceKind)
                .field("22", Texts.time(entered.toLocalTime()))
                .field("21", Texts.date(entered.toLocalDate()))
                .field("44", Texts.date(entered.toLocalDate()))
                .field("JV", open() > 0 ? "Y" : "N")
                .close();
    }
}
