package com.brindlex.kernel.quorvane.typed;

/** Asks for the orders of one day. */
public final class OrderBookRequest extends Request {
    OrderBookRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** The day, in the Republic of China calendar. */
    public OrderBookRequest day(TradeDate day) {
        set("date", day.rocText());
        return this;
    }

    /** The day, written as it is to be sent. */
    public OrderBookRequest dayText(String text) {
        set("date", text);
        return this;
    }

    /** Trade type (stocks) or order type (futures) to list. */
    public OrderBookRequest type(int number) {
        boolean stocks = operation() == Operation.QUERY_ORDER_ENCODE;
        set(stocks ? "tradeType" : "selection", number);
        return this;
    }
}
