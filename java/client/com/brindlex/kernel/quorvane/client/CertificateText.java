package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/** What the certificate office sent, for the certificate software to read. Never changes. */
public final class CertificateText {
    private final String text;

    CertificateText(String text) {
        this.text = text;
    }

    /** The text exactly as it was sent; it may be empty. */
    @NotNull
    public String text() {
        return text;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof CertificateText && ((CertificateText) other).text.equals(text);
    }

    @Override
    public int hashCode() {
        return text.hashCode();
    }

    @Override
    public String toString() {
        return "CertificateText of " + text.length() + " characters";
    }
}
