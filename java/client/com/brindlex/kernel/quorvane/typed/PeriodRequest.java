package com.brindlex.kernel.quorvane.typed;

/** Asks for the fills of a period. */
public final class PeriodRequest extends Request {
    PeriodRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** First day. */
    public PeriodRequest from(TradeDate day) {
        set("startDate", day.rocText());
        return this;
    }

    /** Last day. */
    public PeriodRequest to(TradeDate day) {
        set("endDate", day.rocText());
        return this;
    }
}
