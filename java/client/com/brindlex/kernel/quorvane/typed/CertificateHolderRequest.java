package com.brindlex.kernel.quorvane.typed;

/** Applies for, renews or revokes a certificate. */
public final class CertificateHolderRequest extends Request {
    CertificateHolderRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** Date of birth of the holder, sent as given. */
    public CertificateHolderRequest birthDate(String text) {
        set("birth", text);
        return this;
    }

    /** The message of the certificate software; it is sent as Base64. */
    public CertificateHolderRequest certificateMessage(String text) {
        set("certMsg", text);
        return this;
    }
}
