package com.brindlex.kernel.quorvane.typed;

/** Asks for another trading password; the one of the credentials is the old one. */
public final class ChangePasswordRequest extends Request {
    ChangePasswordRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** The password to change to. */
    public ChangePasswordRequest newPassword(String text) {
        set("newPassword", text);
        return this;
    }
}
