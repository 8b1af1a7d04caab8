package com.brindlex.kernel.quorvane.client;

import java.util.ArrayList;
import java.util.List;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * A cancellation or change of an order of the futures book. What its row shows is taken from there;
 * what it does not show must be given, and is told by {@link #build} when it is not: the second
 * commodity of a spread, and the legs of an order whose sides the book does not show, for there the
 * kind of product stands for another order. For one thread.
 */
public final class FuturesAmendment {
    /** What is to be done, with its function letter. */
    enum Function {
        CANCEL('D'),
        CHANGE_QUANTITY('C'),
        CHANGE_PRICE('A');

        private final char letter;

        Function(char letter) {
            this.letter = letter;
        }
    }

    private final Session session;
    private final Credentials user;
    private final FuturesOrder order;
    private final Function function;
    private Integer quantity;
    private Price price;
    private String secondCommodity;
    private final List<Side> sides = new ArrayList<Side>();
    private final List<Contract> contracts = new ArrayList<Contract>();
    private TimeInForce timeInForce;
    private Handling handling;
    private Signature signature = Signature.BARE;

    FuturesAmendment(Session session, Credentials user, FuturesOrder order, Function function,
            @Nullable Integer quantity, @Nullable Price price) {
        this.session = session;
        this.user = user;
        this.order = order;
        this.function = function;
        this.quantity = quantity;
        this.price = price;
    }

    /** The commodity of the second leg of a futures spread. */
    @NotNull
    public FuturesAmendment secondCommodity(@NotNull String commodity) {
        secondCommodity = commodity;
        return this;
    }

    /** A leg as it was ordered, where the book does not show it; called for each leg in order. */
    @NotNull
    public FuturesAmendment leg(@NotNull Side side, @NotNull Contract contract) {
        sides.add(side);
        contracts.add(contract);
        return this;
    }

    /** The price of the order, where the book does not show one that can be sent. */
    @NotNull
    public FuturesAmendment price(@NotNull Price limit) {
        price = limit;
        return this;
    }

    /** The time in force, where the book does not show it. */
    @NotNull
    public FuturesAmendment timeInForce(@NotNull TimeInForce time) {
        timeInForce = time;
        return this;
    }

    /** The handling number, where the book does not show it. */
    @NotNull
    public FuturesAmendment handling(@NotNull Handling how) {
        handling = how;
        return this;
    }

    /** Where it carries its signature payload; bare unless given. A new price always has tag PL. */
    @NotNull
    public FuturesAmendment signature(@NotNull Signature place) {
        signature = place;
        return this;
    }

    /**
     * Builds the request.
     *
     * @throws InvalidRequestException with all that is wrong
     */
    @NotNull
    public Request<FuturesOrderReceipt> build() {
        // a new price is signed in no other form
        boolean bare = signature == Signature.BARE && function != Function.CHANGE_PRICE;
        Draft<FuturesOrderReceipt> draft = new Draft<FuturesOrderReceipt>(
                bare ? Operation.FUT_SUBMIT_ORDER_ENCODE : Operation.FUT_SUBMIT_ORDER_ENCODE1,
                session, ReplyTypes.FUT_SUBMIT_ORDER);
        user.fill(draft);
        BookFacts<FuturesOrder> facts = new BookFacts<FuturesOrder>(draft, order);
        facts.reference(order.text(FuturesOrder.ORDER_NUMBER),
                order.text(FuturesOrder.GATEWAY_NUMBER), 47);
        draft.set("function", function.letter);
        fillLegs(draft, facts);
        fillQuantity(draft, facts);
        FuturesTerms.price(draft, facts.given("price", price,
                facts.value("price", FuturesOrder.PRICE)), 2);
        Code<TimeInForce> shown = facts.value("timeInForce", FuturesOrder.TIME_IN_FORCE);
        FuturesTerms.timeInForce(draft, facts.given("timeInForce", timeInForce,
                shown == null || shown.is(TimeInForce.UNKNOWN) ? null : shown.value()));
        facts.handling(handling, order.text(FuturesOrder.HANDLING_FLAG));
        if (bare) {
            draft.set("orderDate", facts.value("orderDate", FuturesOrder.ORDER_DATE));
        }
        return draft.build();
    }

    private void fillLegs(Draft<?> draft, BookFacts<FuturesOrder> facts) {
        if (contracts.isEmpty()) {
            BookLegs shown = new BookLegs(order, facts, secondCommodity);
            if (shown.missing() == null) {
                FuturesTerms.legs(draft, shown.sides(), shown.contracts());
            } else {
                draft.refuse(shown.missing(), "must be given: the order book does not show it");
                // whatever these would be, they are not what is missing
                draft.set("orderKind", 1).set("commodity1", "X").set("month1", "X");
                draft.set("side1", 'B');
            }
        } else {
            FuturesTerms.legs(draft, sides, contracts);
        }
    }

    private void fillQuantity(Draft<?> draft, BookFacts<FuturesOrder> facts) {
        Long open = facts.open(FuturesOrder.ORDERED_QUANTITY, FuturesOrder.FILLED_QUANTITY,
                FuturesOrder.CANCELLED_QUANTITY);
        if (open == null) {
            facts.given("quantity", null, null);
        } else if (quantity == null) {
            draft.set("quantity", (int) Math.min(open, Integer.MAX_VALUE));
        } else {
            draft.set("quantity", quantity);
            if (quantity > open) {
                draft.refuse("quantity", "must not exceed the " + open
                        + " contracts still open, not " + quantity);
            }
        }
    }
}
