package com.brindlex.kernel.quorvane.typed;

/** Asks for the margin account. */
public final class MarginRequest extends Request {
    MarginRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** Kind of margin account. */
    public MarginRequest kind(int number) {
        set("queryType", number);
        return this;
    }
}
