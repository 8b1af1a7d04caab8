package com.brindlex.kernel.quorvane.typed;

/** Cancels a stock order or takes off some of its quantity. */
public final class StockChangeRequest extends Request {
    StockChangeRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** The order to act on, by both of its numbers. */
    public StockChangeRequest order(String orderNumber, String gatewayNumber) {
        set("orderReference", orderNumber + "&" + gatewayNumber);
        return this;
    }

    /** The order to act on: a row of {@link StockOrders}. */
    public StockChangeRequest order(Row order) {
        order(order.text(StockOrders.ORDER_NUMBER), order.text(StockOrders.GATEWAY_NUMBER));
        return this;
    }

    /** Stock code, at most six characters. */
    public StockChangeRequest stockCode(String text) {
        set("stockCode", text);
        return this;
    }

    /** Date of the order; none is sent without it. */
    public StockChangeRequest orderDate(TradeDate day) {
        set("orderDate", day.rocText());
        return this;
    }

    /** Quantity in lots; for board lots. */
    public StockChangeRequest quantityLots(int number) {
        set("quantity", number);
        return this;
    }

    /** Quantity in shares, as an odd lot. */
    public StockChangeRequest quantityOddLotShares(int shares) {
        set("quantity", shares);
        set("tradeType", 2);
        return this;
    }

    /** Shares per lot, 1000 unless set. */
    public StockChangeRequest sharesPerLot(int number) {
        set("unit", number);
        return this;
    }

    /** Limit price in hundredths of the currency unit: 1005 is 10.05. */
    public StockChangeRequest priceHundredths(int number) {
        set("price", number);
        return this;
    }

    /** Buy or sell. */
    public StockChangeRequest side(Side side) {
        set("side", side.letter());
        return this;
    }

    /** Flag of the broker, tag 13. */
    public StockChangeRequest flag13(char flag) {
        set("flag13", flag);
        return this;
    }

    /** Order kind as the broker numbers them: 0 cash, 1 to 5 and 8 the others. */
    public StockChangeRequest orderKind(int number) {
        set("orderKind", number);
        return this;
    }

    /** Trade type: 0 board lots, 2 odd lot, 3 board lots at the fixed price of the session. */
    public StockChangeRequest tradeType(int number) {
        set("tradeType", number);
        return this;
    }

    /** Handling flag of the broker, tag N6. */
    public StockChangeRequest handlingFlag(int number) {
        set("handlingFlag", number);
        return this;
    }
}
