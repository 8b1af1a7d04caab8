package com.brindlex.kernel.quorvane.client;

import java.util.ArrayList;
import java.util.List;
import org.jetbrains.annotations.NotNull;

/**
 * A new order for futures or options, of one leg or two. Legs, quantity, price and whether it is
 * live must be given; what is wrong is told by {@link #build}. For one thread.
 */
public final class FuturesOrderBuilder {
    private final Session session;
    private final Credentials user;
    private final List<Side> sides = new ArrayList<Side>();
    private final List<Contract> contracts = new ArrayList<Contract>();
    private Integer quantity;
    private Price price;
    private Handling handling;
    private TimeInForce timeInForce;
    private Character flagW3;
    private TradeDate orderDate;
    private Signature signature = Signature.BARE;

    FuturesOrderBuilder(Session session, Credentials user) {
        this.session = session;
        this.user = user;
    }

    /** A leg that buys; a second one makes a combination of options or a spread of futures. */
    @NotNull
    public FuturesOrderBuilder buy(@NotNull Contract contract) {
        return leg(Side.BUY, contract);
    }

    /** A leg that sells; a second one makes a combination of options or a spread of futures. */
    @NotNull
    public FuturesOrderBuilder sell(@NotNull Contract contract) {
        return leg(Side.SELL, contract);
    }

    /** A leg. */
    @NotNull
    public FuturesOrderBuilder leg(@NotNull Side side, @NotNull Contract contract) {
        sides.add(side);
        contracts.add(contract);
        return this;
    }

    /** Contracts of each leg. */
    @NotNull
    public FuturesOrderBuilder quantity(int number) {
        quantity = number;
        return this;
    }

    /** The limit price, at most four decimals, or the market or range market price. */
    @NotNull
    public FuturesOrderBuilder price(@NotNull Price limit) {
        price = limit;
        return this;
    }

    /** Sends it as a live order. */
    @NotNull
    public FuturesOrderBuilder live() {
        return handling(Handling.LIVE);
    }

    /** Sends it as a reservation. */
    @NotNull
    public FuturesOrderBuilder reservation() {
        return handling(Handling.RESERVATION);
    }

    /** Sends it with a handling number of the broker. */
    @NotNull
    public FuturesOrderBuilder handling(@NotNull Handling how) {
        handling = how;
        return this;
    }

    /** How long it stands; the rest of the day unless given. */
    @NotNull
    public FuturesOrderBuilder timeInForce(@NotNull TimeInForce time) {
        timeInForce = time;
        return this;
    }

    /** Flag of the broker (tag W3), one character; a blank unless given. */
    @NotNull
    public FuturesOrderBuilder flagW3(char flag) {
        flagW3 = flag;
        return this;
    }

    /** Date of the order; none is sent unless given. With {@link Signature#TAG_PL} none ever is. */
    @NotNull
    public FuturesOrderBuilder orderDate(@NotNull TradeDate day) {
        orderDate = day;
        return this;
    }

    /** Where it carries its signature payload; bare unless given. */
    @NotNull
    public FuturesOrderBuilder signature(@NotNull Signature place) {
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
        Draft<FuturesOrderReceipt> draft = new Draft<FuturesOrderReceipt>(
                signature == Signature.TAG_PL ? Operation.FUT_SUBMIT_ORDER_ENCODE1
                                              : Operation.FUT_SUBMIT_ORDER_ENCODE,
                session, ReplyTypes.FUT_SUBMIT_ORDER);
        user.fill(draft);
        FuturesTerms.legs(draft, sides, contracts);
        FuturesTerms.price(draft, price, contracts.size());
        FuturesTerms.timeInForce(draft, timeInForce);
        draft.set("quantity", quantity).set("flagW3", flagW3);
        if (orderDate != null && signature == Signature.TAG_PL) {
            draft.refuse("orderDate", "is not sent with the signature in tag PL");
        }
        draft.set("orderDate", orderDate);
        if (handling == null) {
            draft.refuse("handlingFlag", "must be chosen: live or a reservation");
        }
        return draft.set("handlingFlag", handling).build();
    }
}
