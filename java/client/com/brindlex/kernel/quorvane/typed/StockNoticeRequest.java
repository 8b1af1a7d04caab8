package com.brindlex.kernel.quorvane.typed;

/** The short notice of a stock order. */
public final class StockNoticeRequest extends Request {
    StockNoticeRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** Order function letter: I new, D cancel, C change. */
    public StockNoticeRequest function(char letter) {
        set("function", letter);
        return this;
    }

    /** Trade type, any from 0 to 255. */
    public StockNoticeRequest tradeType(int number) {
        set("tradeType", number);
        return this;
    }
}
