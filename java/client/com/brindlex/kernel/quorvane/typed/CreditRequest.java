package com.brindlex.kernel.quorvane.typed;

/** Asks for the credit figures of a stock. */
public final class CreditRequest extends Request {
    CreditRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** Stock code. */
    public CreditRequest stockCode(String text) {
        set("stockCode", text);
        return this;
    }
}
