package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * A cancellation or a change of quantity of an order of the book. What its row shows is taken from
 * there; what it does not show must be given, and is told by {@link #build} when it is not: with
 * the bare signature the flag of tag 13, with the one in tag PL shares per lot, and for some order
 * types order kind, trade type or side. For one thread.
 */
public final class StockAmendment {
    private final Session session;
    private final Credentials user;
    private final StockOrder order;
    private final Quantity quantity;
    private OrderKind orderKind;
    private TradeType tradeType;
    private Side side;
    private Integer sharesPerLot;
    private Character flag13;
    private TradeDate orderDate;
    private Handling handling;
    private Signature signature = Signature.BARE;

    /** An amendment; a cancellation without a quantity. */
    StockAmendment(
            Session session, Credentials user, StockOrder order, @Nullable Quantity quantity) {
        this.session = session;
        this.user = user;
        this.order = order;
        this.quantity = quantity;
    }

    /** The order kind, where the book shows two of them in one code or none. */
    @NotNull
    public StockAmendment orderKind(@NotNull OrderKind kind) {
        orderKind = kind;
        return this;
    }

    /** The trade type, where the book does not show it. */
    @NotNull
    public StockAmendment tradeType(@NotNull TradeType type) {
        tradeType = type;
        return this;
    }

    /** The side, where the book does not show it. */
    @NotNull
    public StockAmendment side(@NotNull Side which) {
        side = which;
        return this;
    }

    /** How many shares a lot has; a change has it from its quantity. */
    @NotNull
    public StockAmendment sharesPerLot(int shares) {
        sharesPerLot = shares;
        return this;
    }

    /** The flag of tag 13 that the order was sent with. */
    @NotNull
    public StockAmendment flag13(char flag) {
        flag13 = flag;
        return this;
    }

    /** The date of the order, where the book does not show it. */
    @NotNull
    public StockAmendment orderDate(@NotNull TradeDate day) {
        orderDate = day;
        return this;
    }

    /** The handling number, where the book does not show it. */
    @NotNull
    public StockAmendment handling(@NotNull Handling how) {
        handling = how;
        return this;
    }

    /** Where it carries its signature payload; bare unless given. */
    @NotNull
    public StockAmendment signature(@NotNull Signature place) {
        signature = place;
        return this;
    }

    /**
     * Builds the request.
     *
     * @throws InvalidRequestException with all that is wrong
     */
    @NotNull
    public Request<Confirmation> build() {
        Draft<Confirmation> draft =
                new Draft<Confirmation>(operation(), session, ReplyTypes.CANCEL_CHANGE_ORDER);
        user.fill(draft);
        BookFacts<StockOrder> facts = new BookFacts<StockOrder>(draft, order);
        facts.reference(order.text(StockOrder.ORDER_NUMBER), order.text(StockOrder.GATEWAY_NUMBER),
                39);
        draft.set("stockCode", order.text(StockOrder.STOCK_CODE));
        draft.set("orderDate", facts.given("orderDate", orderDate,
                facts.value("orderDate", StockOrder.ORDER_DATE)));
        fillPrice(draft, facts.value("price", StockOrder.PRICE));
        facts.handling(handling, order.text(StockOrder.HANDLING_FLAG));
        if (signature == Signature.BARE) {
            draft.set("flag13", facts.given("flag13", flag13, null));
        }
        fillQuantity(draft, facts, fillType(draft, facts));
        return draft.build();
    }

    private Operation operation() {
        boolean bare = signature == Signature.BARE;
        if (quantity == null) {
            return bare ? Operation.CANCEL_ORDER_ENCODE : Operation.CANCEL_ORDER_ENCODE1;
        }
        return bare ? Operation.CHANGE_ORDER_ENCODE : Operation.CHANGE_ORDER_ENCODE1;
    }

    /** Writes order kind, trade type and side; returns the trade type. */
    private int fillType(Draft<?> draft, BookFacts<StockOrder> facts) {
        Code<OrderType> shown = facts.value("orderKind", StockOrder.TYPE);
        OrderType type = shown == null ? OrderType.UNKNOWN : shown.value();
        int kind = facts.choice("orderKind", orderKind, type.kinds());
        if ((kind == 6 || kind == 7) && signature == Signature.BARE) {
            draft.refuse("signature", "must be in tag PL for the order kinds 6 and 7");
        }
        Side known = type.side().isEmpty() ? null
                : Code.of(Side.values(), type.side()).value();
        Terms.side(draft, "side", facts.given("side", side, known));
        // an order of trade type 1 reads as one of 0, which alone can be sent
        String open = type.tradeTypes().equals("0 1") ? "0"
                : type.tradeTypes().equals("not 3") ? "0 2" : type.tradeTypes();
        return facts.choice("tradeType", tradeType, open.isEmpty() ? "0 2 3" : open);
    }

    /** The price goes out as a whole number; 0 where a word stands. */
    private static void fillPrice(Draft<?> draft, @Nullable Price price) {
        if (price == null || price.isWord()) {
            draft.set("price", 0);
        } else {
            Terms.amount(draft, price, 2, 0);
        }
    }

    private void fillQuantity(Draft<?> draft, BookFacts<StockOrder> facts, int type) {
        Long open = facts.open(StockOrder.ORDERED_QUANTITY, StockOrder.FILLED_QUANTITY,
                StockOrder.CANCELLED_QUANTITY);
        if (quantity != null) {
            Terms.quantity(draft, quantity, type);
            if (open != null && quantity.shares() > open) {
                draft.refuse("quantity", "must not exceed the " + open + " shares still open, as "
                        + quantity + " do");
            }
        } else if (signature == Signature.TAG_PL) {
            fillOpenQuantity(draft, facts, facts.given("quantity", null, open), type);
        }
    }

    /** A cancellation with its signature in tag PL names what is still open. */
    private void fillOpenQuantity(
            Draft<?> draft, BookFacts<StockOrder> facts, @Nullable Long open, int type) {
        draft.set("quantity", 0);
        Integer unit = facts.given("unit", sharesPerLot, null);
        if (unit == null || open == null) {
            return;
        }
        draft.set("unit", unit);
        if (unit < 1 || open < 0 || open > Integer.MAX_VALUE || type != 2 && open % unit != 0) {
            draft.refuse("unit", "must divide the " + open + " shares still open, not be " + unit);
            return;
        }
        draft.set("quantity", (int) (type == 2 ? open : open / unit));
    }
}
