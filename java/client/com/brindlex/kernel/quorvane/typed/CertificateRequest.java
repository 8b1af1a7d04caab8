package com.brindlex.kernel.quorvane.typed;

/** Sends a message of the certificate software. */
public final class CertificateRequest extends Request {
    CertificateRequest(Operation operation, Session session) {
        super(operation, session);
    }

    /** The message, of any characters; it is sent as Base64. */
    public CertificateRequest certificateMessage(String text) {
        set("certMsg", text);
        return this;
    }
}
