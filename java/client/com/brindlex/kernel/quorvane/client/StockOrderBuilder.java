package com.brindlex.kernel.quorvane.client;

import java.util.Arrays;
import java.util.List;
import org.jetbrains.annotations.NotNull;

/**
 * A new stock order. Side, stock, quantity, price and whether it is live must be given; what is
 * wrong is told by {@link #build}. For one thread.
 */
public final class StockOrderBuilder {
    private static final List<Integer> KINDS = Arrays.asList(0, 1, 2, 3, 4, 5, 8);
    private static final List<Integer> TRADE_TYPES = Arrays.asList(0, 2, 3);

    private final Session session;
    private final Credentials user;
    private Side side;
    private String stockCode;
    private Quantity quantity;
    private Price price;
    private Handling handling;
    private OrderKind orderKind;
    private TradeType tradeType;
    private Character flag13;
    private TradeDate orderDate;
    private Signature signature = Signature.BARE;

    StockOrderBuilder(Session session, Credentials user) {
        this.session = session;
        this.user = user;
    }

    /** Buys this stock. */
    @NotNull
    public StockOrderBuilder buy(@NotNull String code) {
        return order(Side.BUY, code);
    }

    /** Sells this stock. */
    @NotNull
    public StockOrderBuilder sell(@NotNull String code) {
        return order(Side.SELL, code);
    }

    /** Buys or sells this stock: its code has at most six letters and digits. */
    @NotNull
    public StockOrderBuilder order(@NotNull Side which, @NotNull String code) {
        side = which;
        stockCode = code;
        return this;
    }

    /** How much: lots, or shares of an odd lot. */
    @NotNull
    public StockOrderBuilder quantity(@NotNull Quantity amount) {
        quantity = amount;
        return this;
    }

    /** The limit price, at most two decimals, or the flat, limit-up or limit-down price. */
    @NotNull
    public StockOrderBuilder price(@NotNull Price limit) {
        price = limit;
        return this;
    }

    /** Sends it as a live order. */
    @NotNull
    public StockOrderBuilder live() {
        return handling(Handling.LIVE);
    }

    /** Sends it as a reservation. */
    @NotNull
    public StockOrderBuilder reservation() {
        return handling(Handling.RESERVATION);
    }

    /** Sends it with a handling number of the broker. */
    @NotNull
    public StockOrderBuilder handling(@NotNull Handling how) {
        handling = how;
        return this;
    }

    /** Order kind: 0, 1, 2, 3, 4, 5 or 8; 0 unless given. */
    @NotNull
    public StockOrderBuilder orderKind(@NotNull OrderKind kind) {
        orderKind = kind;
        return this;
    }

    /**
     * Trade type: 0 for lots, 2 for shares of an odd lot, 3 for lots at no price of the order's
     * own. Unless given, the quantity says whether it is 0 or 2.
     */
    @NotNull
    public StockOrderBuilder tradeType(@NotNull TradeType type) {
        tradeType = type;
        return this;
    }

    /** Flag of the broker (tag 13), one character; 0 unless given. */
    @NotNull
    public StockOrderBuilder flag13(char flag) {
        flag13 = flag;
        return this;
    }

    /** Date of the order; none is sent unless given. */
    @NotNull
    public StockOrderBuilder orderDate(@NotNull TradeDate day) {
        orderDate = day;
        return this;
    }

    /** Where it carries its signature payload; bare unless given. */
    @NotNull
    public StockOrderBuilder signature(@NotNull Signature place) {
        signature = place;
        return this;
    }

    /**
     * Builds the request.
     *
     * @throws InvalidRequestException with all that is wrong
     */
    @NotNull
    public Request<StockOrderReceipt> build() {
        Draft<StockOrderReceipt> draft = new Draft<StockOrderReceipt>(
                signature == Signature.TAG_PL ? Operation.SUBMIT_ORDER_ENCODE1
                                              : Operation.SUBMIT_ORDER_ENCODE,
                session, ReplyTypes.SUBMIT_ORDER);
        user.fill(draft);
        Terms.side(draft, "side", side);
        draft.set("stockCode", stockCode).set("orderDate", orderDate).set("flag13", flag13);
        draft.set("orderKind", orderKind);
        if (orderKind != null && !KINDS.contains(orderKind.number())) {
            draft.refuse("orderKind", "must be one of " + KINDS + ", not " + orderKind);
        }
        int type = type(draft);
        Terms.quantity(draft, quantity, type);
        fillPrice(draft, type);
        if (handling == null) {
            draft.refuse("handlingFlag", "must be chosen: live or a reservation");
        }
        return draft.set("handlingFlag", handling).build();
    }

    private int type(Draft<?> draft) {
        int implied = quantity != null && quantity.isOddLot() ? 2 : 0;
        int type = tradeType == null ? implied : tradeType.number();
        if (!TRADE_TYPES.contains(type)) {
            draft.refuse("tradeType", "must be one of " + TRADE_TYPES + ", not " + type);
        }
        draft.set("tradeType", type);
        return type;
    }

    private void fillPrice(Draft<?> draft, int type) {
        if (type == 3) {
            if (price != null) {
                draft.refuse("price", "is not sent with trade type 3");
            }
        } else if (price == null) {
            draft.refuse("price", "must be given");
        } else if (price.isWord()) {
            int kind = price.equals(Price.FLAT) ? 5 : price.equals(Price.LIMIT_UP) ? 9
                    : price.equals(Price.LIMIT_DOWN) ? 1 : -1;
            if (kind < 0) {
                draft.refuse("price", "of a stock order cannot be " + price.word().label());
            } else {
                draft.set("priceKind", kind);
            }
        } else {
            Terms.amount(draft, price, 2, 1);
        }
    }
}
