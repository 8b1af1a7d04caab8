package com.brindlex.kernel.quorvane.console.log;

/**
 * A line of a log, and where the text within it stands.
 *
 * @param line the whole line
 * @param header what stands around the text; null when nothing does
 * @param begin characters of the line before the text
 * @param end characters of the line up to the end of the text
 */
public record LogEntry(LogLine line, LogHeader header, int begin, int end) {
    private static final String PRINTABLE_RETURN = "\\r";

    /** A line that carries no text: a heading, a gap. */
    static LogEntry without(LogLine line) {
        return new LogEntry(line, null, -1, -1);
    }

    /** Whether the line carries a text, if an empty one. */
    public boolean hasText() {
        return begin >= 0;
    }

    /** The text alone. A carriage return ends it where {@code logcat -v printable} wrote one. */
    public String text() {
        boolean printable = end - begin >= PRINTABLE_RETURN.length()
                && line.text().startsWith(PRINTABLE_RETURN, end - PRINTABLE_RETURN.length());
        return printable ? line.text().substring(begin, end - PRINTABLE_RETURN.length()) + "\r"
                         : line.text().substring(begin, end);
    }
}
