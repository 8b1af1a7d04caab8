package com.brindlex.kernel.quorvane.console.log;

import com.brindlex.kernel.quorvane.console.message.Kind;
import java.util.List;

/**
 * A message of a log, joined from the lines that the log made of it.
 *
 * @param kind what it is
 * @param entries its lines; never empty
 * @param text the message
 * @param splits characters of the text before each line but the first
 * @param flaws what the log did to it
 */
public record LogMessage(Kind kind, List<LogEntry> entries, String text, List<Integer> splits,
        List<Flaw> flaws) {
    /**
     * What a log did to a message.
     *
     * @param kind its name, the same in every version: {@code cut-by-log}
     * @param offset characters of the text before it
     * @param text in words
     */
    public record Flaw(String kind, int offset, String text) {}

    /** The number of its first line. */
    public long line() {
        return entries.get(0).line().number();
    }

    /** What stands around its first line; null when nothing does. */
    public LogHeader header() {
        return entries.get(0).header();
    }
}
