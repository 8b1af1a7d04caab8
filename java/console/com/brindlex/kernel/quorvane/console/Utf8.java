package com.brindlex.kernel.quorvane.console;

import java.nio.charset.StandardCharsets;

/** How long texts are on the wire. */
public final class Utf8 {
    /** No character of a text takes more bytes. */
    private static final int MOST_OF_ONE = 3;

    private Utf8() {}

    /** The bytes of a text. */
    public static int length(String text) {
        return text.getBytes(StandardCharsets.UTF_8).length;
    }

    /** Whether a text takes so many bytes or more; most are so short that none need be counted. */
    public static boolean isAtLeast(String text, int bytes) {
        return text.length() >= bytes
                || text.length() * MOST_OF_ONE >= bytes && length(text) >= bytes;
    }
}
