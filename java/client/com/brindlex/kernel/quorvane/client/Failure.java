package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/** Why a request came to nothing: who says so, under which code, and what. Never changes. */
public final class Failure {
    /** Who says it. */
    public enum Source {
        /** This device. */
        CLIENT,
        /** The gateway. */
        GATEWAY,
        /** The broker's host. */
        BROKER,
        /** The certificate office. */
        CERT,
        /** Nobody is named. */
        UNKNOWN
    }

    private final Source source;
    private final String code;
    private final String text;

    Failure(Source source, String code, String text) {
        this.source = source;
        this.code = code;
        this.text = text;
    }

    /** A message as a decoder returns it, taken apart: its text is empty when it says nothing. */
    @NotNull
    public static Failure of(@NotNull String message) {
        for (Source source : Source.values()) {
            String mark = "[" + source + "]";
            if (source != Source.UNKNOWN && message.startsWith(mark)) {
                String rest = message.substring(mark.length());
                return source == Source.CERT ? certificate(rest) : coded(source, rest);
            }
        }
        return coded(Source.UNKNOWN, message);
    }

    /** {@code text(code)}, or a text without a code. */
    private static Failure coded(Source source, String rest) {
        int open = rest.lastIndexOf('(');
        boolean coded = open >= 0 && rest.endsWith(")");
        return coded ? new Failure(source, rest.substring(open + 1, rest.length() - 1).trim(),
                       rest.substring(0, open).trim())
                     : new Failure(source, "", rest.trim());
    }

    /** {@code code text}. */
    private static Failure certificate(String rest) {
        int blank = rest.indexOf(' ');
        return blank < 0 ? new Failure(Source.CERT, "", rest.trim())
                         : new Failure(Source.CERT, rest.substring(0, blank),
                                 rest.substring(blank + 1).trim());
    }

    /** Who says it. */
    @NotNull
    public Source source() {
        return source;
    }

    /** The gateway's result code; empty when there is none. */
    @NotNull
    public String code() {
        return code;
    }

    /** What to tell the user, in Traditional Chinese; never empty in a reply. */
    @NotNull
    public String text() {
        return text;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Failure && ((Failure) other).source == source
                && ((Failure) other).code.equals(code) && ((Failure) other).text.equals(text);
    }

    @Override
    public int hashCode() {
        return text.hashCode() * 31 + code.hashCode();
    }

    @Override
    public String toString() {
        return "[" + source + "]" + text + (code.isEmpty() ? "" : "(" + code + ")");
    }
}
