package com.brindlex.kernel.quorvane.console.log;

import java.util.regex.Matcher;

/** The header of the line before: most lines have it again, but for the digits of its time. */
final class LastHeader {
    private final String text;
    private final int timeBegin;
    private final int timeEnd;
    private final LogHeader header;

    private LastHeader(String text, int timeBegin, LogHeader header) {
        this.text = text;
        this.timeBegin = timeBegin;
        this.timeEnd = timeBegin + header.time().length();
        this.header = header;
    }

    /**
     * Keeps a header.
     *
     * @param found where it stands in its line
     * @return null for one that says nothing of the next line: something stands behind the text, or
     *         the text is empty and it is not sure where it would begin
     */
    static LastHeader of(String line, int begin, int end, LogHeader header, Matcher found) {
        boolean alone = header.format().isAbove() || found.end() < end;
        if (!alone || header.format() == LogFormat.PROCESS) {
            return null;
        }
        int time = header.time().isEmpty() ? begin : found.start("time");
        return new LastHeader(line.substring(begin, found.end()), time - begin, header);
    }

    /** How long it is. */
    int length() {
        return text.length();
    }

    LogFormat format() {
        return header.format();
    }

    /** The header that a line has from {@code begin} on; null when it has another one. */
    LogHeader again(String line, int begin, int end) {
        int textBegin = begin + text.length();
        boolean same = format().isAbove() ? textBegin == end
                                          : textBegin < end && line.charAt(textBegin) != ' ';
        if (!same || !line.regionMatches(begin + timeEnd, text, timeEnd, text.length() - timeEnd)
                || !line.regionMatches(begin, text, 0, timeBegin)) {
            return null;
        }
        for (int i = timeBegin; i < timeEnd; i++) {
            char before = text.charAt(i);
            char now = line.charAt(begin + i);
            if (now != before && !(isDigit(now) && isDigit(before))) {
                return null;
            }
        }
        String time = line.substring(begin + timeBegin, begin + timeEnd);
        return new LogHeader(format(), time, header.process(), header.thread(), header.tag());
    }

    private static boolean isDigit(char c) {
        return c >= '0' && c <= '9';
    }
}
