package com.brindlex.kernel.quorvane.typed;

/** A message for the user: who says it, what, and under which result code. */
public final class Message {
    /** Who says it. */
    public enum Source {
        /** This device: the library refused the arguments. */
        CLIENT,
        /** The gateway. */
        GATEWAY,
        /** The broker's host. */
        BROKER,
        /** The certificate office. */
        CERT,
        /** The text does not say. */
        UNKNOWN
    }

    private final String full;
    private final Source source;
    private final String text;
    private final String code;

    private Message(String full, Source source, String text, String code) {
        this.full = full;
        this.source = source;
        this.text = text;
        this.code = code;
    }

    /** Takes a message apart. Any text can be a message. */
    static Message of(String full) {
        for (Source source : Source.values()) {
            String mark = "[" + source + "]";
            if (source != Source.UNKNOWN && full.startsWith(mark)) {
                String rest = full.substring(mark.length());
                return source == Source.CERT ? certificate(full, rest) : coded(full, source, rest);
            }
        }
        return coded(full, Source.UNKNOWN, full);
    }

    /** {@code text(code)}, or a text without a code. */
    private static Message coded(String full, Source source, String rest) {
        int open = rest.lastIndexOf('(');
        boolean coded = open >= 0 && rest.endsWith(")") && open < rest.length() - 2;
        return coded ? new Message(full, source, rest.substring(0, open).trim(),
                       rest.substring(open + 1, rest.length() - 1))
                     : new Message(full, source, rest.trim(), "");
    }

    /** {@code code text}. */
    private static Message certificate(String full, String rest) {
        int blank = rest.indexOf(' ');
        return blank < 0 ? new Message(full, Source.CERT, rest, "")
                         : new Message(full, Source.CERT, rest.substring(blank + 1),
                                 rest.substring(0, blank));
    }

    /** The whole text as it came. */
    public String full() {
        return full;
    }

    /** Who says it. */
    public Source source() {
        return source;
    }

    /** What it says, without source and code. */
    public String text() {
        return text;
    }

    /** The result code of the gateway; empty when there is none. */
    public String code() {
        return code;
    }

    @Override
    public String toString() {
        return full;
    }
}
