package com.brindlex.kernel.quorvane.typed;

/** A futures or options order, of one leg or two: new unless it names another function. */
public final class FuturesOrderRequest extends Request {
    FuturesOrderRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** A futures contract: month as YYYYMM. */
    public FuturesOrderRequest futures(Side side, String commodity, String month) {
        set("orderKind", 1);
        leg(1, side, commodity, month, "", "");
        return this;
    }

    /** One option: month as YYYYMM, strike price as text. */
    public FuturesOrderRequest option(
            Side side, String commodity, String month, CallPut kind, String strike) {
        set("orderKind", 2);
        leg(1, side, commodity, month, kind.code(), strike);
        return this;
    }

    /** The second leg of an option: the order becomes a combination. */
    public FuturesOrderRequest andOption(
            Side side, String commodity, String month, CallPut kind, String strike) {
        set("orderKind", 3);
        leg(2, side, commodity, month, kind.code(), strike);
        return this;
    }

    /** The second leg of a futures contract: the order becomes a spread. */
    public FuturesOrderRequest andFutures(Side side, String commodity, String month) {
        set("orderKind", 4);
        leg(2, side, commodity, month, "", "");
        return this;
    }

    /** Contracts of each leg. */
    public FuturesOrderRequest quantityContracts(int number) {
        set("quantity", number);
        return this;
    }

    /** Limit price in ten-thousandths: 180000000 is 18000. */
    public FuturesOrderRequest priceTenThousandths(int number) {
        set("priceType", 2);
        set("price", number);
        return this;
    }

    /** Price type: 1 and 3 are market-price types, any other a limit price. */
    public FuturesOrderRequest priceType(int number) {
        set("priceType", number);
        return this;
    }

    /** How long the order stands; the rest of the day unless set. */
    public FuturesOrderRequest timeInForce(TimeInForce time) {
        set("timeInForce", time.letter());
        return this;
    }

    /** What to do with an order: I new, C change its quantity, A change its price, D cancel it. */
    public FuturesOrderRequest function(char letter) {
        set("function", letter);
        return this;
    }

    /** The order to act on, by both of its numbers. */
    public FuturesOrderRequest order(String orderNumber, String gatewayNumber) {
        set("orderReference", orderNumber + "&" + gatewayNumber);
        return this;
    }

    /** The order to act on: a row of {@link FuturesOrders}. */
    public FuturesOrderRequest order(Row order) {
        order(order.text(FuturesOrders.ORDER_NUMBER), order.text(FuturesOrders.GATEWAY_NUMBER));
        return this;
    }

    /** Date of the order; none is sent without it. */
    public FuturesOrderRequest orderDate(TradeDate day) {
        set("orderDate", day.rocText());
        return this;
    }

    /** Flag of the broker, tag W3. */
    public FuturesOrderRequest flagW3(char flag) {
        set("flagW3", flag);
        return this;
    }

    /** Handling flag of the broker, tag N6. */
    public FuturesOrderRequest handlingFlag(int number) {
        set("handlingFlag", number);
        return this;
    }

    private void leg(
            int leg, Side side, String commodity, String month, String callPut, String strike) {
        set("side" + leg, side.letter());
        set("commodity" + leg, commodity);
        set("month" + leg, month);
        set("callPut" + leg, callPut);
        set("strike" + leg, strike);
    }
}
