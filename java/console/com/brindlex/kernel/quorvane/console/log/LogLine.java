package com.brindlex.kernel.quorvane.console.log;

/**
 * A line of a log.
 *
 * @param number its number, from 1
 * @param text without its end
 * @param end the line feed that ends it, with a carriage return where the log writes one; empty
 *         for a last line without an end
 * @param isCut whether it was longer than what is kept of a line
 */
public record LogLine(long number, String text, String end, boolean isCut) {
    /** Stands where bytes made no character. */
    public static final char NO_CHARACTER = '\uFFFD';

    /** Whether some of its bytes made no character. */
    public boolean isBroken() {
        return text.indexOf(NO_CHARACTER) >= 0;
    }
}
