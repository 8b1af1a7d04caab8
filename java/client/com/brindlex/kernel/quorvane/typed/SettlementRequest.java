package com.brindlex.kernel.quorvane.typed;

/** Asks for the settled trades of a period. */
public final class SettlementRequest extends Request {
    SettlementRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** One of the broker's periods, 1 to 6, in place of days. */
    public SettlementRequest period(int selector) {
        set("periodOrStartDate", selector);
        return this;
    }

    /** First day, in the Republic of China calendar. */
    public SettlementRequest from(TradeDate day) {
        set("periodOrStartDate", day.rocText());
        return this;
    }

    /** Last day, in the Republic of China calendar. */
    public SettlementRequest to(TradeDate day) {
        set("endDate", day.rocText());
        return this;
    }
}
