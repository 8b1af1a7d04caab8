package com.brindlex.kernel.quorvane.console.log;

/**
 * What a log writes around a text.
 *
 * @param format how it is written; null for what an app writes itself
 * @param time as the log writes it; empty when it does not
 * @param process number of the process; empty when the log does not write it
 * @param thread number of the thread; empty when the log does not write it
 * @param tag the tag of the text; null when the log does not write it
 */
public record LogHeader(LogFormat format, String time, String process, String thread, String tag) {
    /** What an app wrote around a text: the time that stands there, beside a header of the log. */
    static LogHeader withTime(LogHeader header, String time) {
        return header == null ? new LogHeader(null, time, "", "", null)
                : new LogHeader(header.format, time, header.process, header.thread, header.tag);
    }

    /** Whether a text with another header can belong to the same message. */
    boolean isOfSameSource(LogHeader other) {
        return process.equals(other.process) && thread.equals(other.thread)
                && (tag == null ? other.tag == null : tag.equals(other.tag));
    }
}
