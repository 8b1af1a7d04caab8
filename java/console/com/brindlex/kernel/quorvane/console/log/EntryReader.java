package com.brindlex.kernel.quorvane.console.log;

import java.io.Closeable;
import java.io.IOException;
import java.util.regex.Matcher;

/** Finds what a log writes around its texts: headers, colours, the gaps between long entries. */
public final class EntryReader implements Closeable {
    private static final LogFormat[] FORMATS = LogFormat.values();
    private static final char ESCAPE = '\u001B';

    private final LineReader lines;
    private LogFormat last = LogFormat.THREADTIME;
    private LastHeader before;
    private LogHeader above;
    private boolean isFirstBelow;
    private int padding;

    /** Reads the lines of {@code lines}. */
    public EntryReader(LineReader lines) {
        this.lines = lines;
    }

    /** The next line with what stands around its text; null at the end. */
    public LogEntry next() throws IOException {
        LogLine line = lines.next();
        return line == null ? null : entry(line);
    }

    private LogEntry entry(LogLine line) {
        String text = line.text();
        int begin = colour(text);
        int end = colourEnd(text, begin);
        String shown = end == text.length() ? text : text.substring(0, end);
        if (text.startsWith("--------- ", begin)) {
            above = null;
            return LogEntry.without(line);
        }
        LogHeader again = before == null ? null : before.again(text, begin, end);
        if (again != null) {
            return found(line, again, begin + before.length(), end);
        }
        for (int i = -1; i < FORMATS.length; i++) {
            LogFormat format = i < 0 ? last : FORMATS[i];
            Matcher found = format.match(shown, begin);
            if (found != null) {
                last = format;
                LogHeader header = format.header(found);
                before = LastHeader.of(text, begin, end, header, found);
                return found(line, header, found.end(), end);
            }
        }
        return below(line, begin, end);
    }

    private LogEntry found(LogLine line, LogHeader header, int begin, int end) {
        if (header.format().isAbove()) {
            above = header;
            isFirstBelow = true;
            return LogEntry.without(line);
        }
        above = null;
        // the blanks behind a header may be lost where no text follows
        padding = !header.format().isPadded() ? 0 : begin < end ? begin : Integer.MAX_VALUE;
        int textEnd = header.format() == LogFormat.PROCESS
                ? line.text().lastIndexOf("  (" + header.tag()) : end;
        return new LogEntry(line, header, Math.min(begin, textEnd), textEnd);
    }

    /** A line without a header: below one, or the rest of a message that the log wrote in lines. */
    private LogEntry below(LogLine line, int begin, int end) {
        if (above == null) {
            int from = begin;
            while (from < end && from < padding && line.text().charAt(from) == ' ') {
                from++;
            }
            return new LogEntry(line, null, from, end);
        }
        boolean gap = begin == end && !isFirstBelow;
        LogHeader header = above;
        above = gap ? null : above;
        isFirstBelow = false;
        return gap ? LogEntry.without(line) : new LogEntry(line, header, begin, end);
    }

    private static int colour(String text) {
        int at = 0;
        while (at < text.length() && text.charAt(at) == ESCAPE) {
            int end = text.indexOf('m', at);
            if (end < 0) {
                break;
            }
            at = end + 1;
        }
        return at;
    }

    private static int colourEnd(String text, int begin) {
        int end = text.length();
        while (end > begin && text.charAt(end - 1) == 'm') {
            int escape = text.lastIndexOf(ESCAPE, end - 1);
            if (escape < begin || !text.substring(escape, end).matches("\u001B\\[[0-9;]*m")) {
                break;
            }
            end = escape;
        }
        return end;
    }

    @Override
    public void close() throws IOException {
        lines.close();
    }
}
