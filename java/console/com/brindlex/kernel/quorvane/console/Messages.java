package com.brindlex.kernel.quorvane.console;

import java.util.HashMap;
import java.util.Map;

/** The messages that the library makes itself, in English. */
final class Messages {
    private static final Map<String, String> ENGLISH = new HashMap<>();

    static {
        for (String[] row : Dictionary.MESSAGES) {
            ENGLISH.put(row[0], row[1]);
        }
    }

    private Messages() {}

    /** What a message says, or the empty text when it is not one of the library's. */
    static String english(String text) {
        return ENGLISH.getOrDefault(text.replaceFirst("^[A-Za-z0-9]+Encode2?\\(\\)", ""), "");
    }

    /** Whether a text is a message though it does not say from whom. */
    static boolean isBare(String text) {
        return !english(text).isEmpty();
    }
}
