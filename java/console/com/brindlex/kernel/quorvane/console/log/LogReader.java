package com.brindlex.kernel.quorvane.console.log;

import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import java.io.Closeable;
import java.io.IOException;
import java.util.function.Consumer;

/**
 * Reads the messages of a log as they come, and joins what the log has split: at line feeds, at the
 * most that one entry of Android's log holds, or where an app logs a long text in pieces. It holds
 * one message at a time.
 */
public final class LogReader implements Closeable {
    /** The tag that the library logs under. */
    public static final String TAG = "gatewayjni";

    private final EntryReader entries;
    private final String tag;
    private LogHeader last;
    private Joining open;
    private LogEntry ahead;
    private int expected = -1;

    /**
     * Reads {@code lines}.
     *
     * @param tag the tag whose texts are the library's
     */
    public LogReader(LineReader lines, String tag) {
        this.entries = new EntryReader(lines);
        this.tag = tag;
    }

    /**
     * The next message; null at the end of the log.
     *
     * @param others takes each line that is part of no message
     */
    public LogMessage next(Consumer<LogLine> others) throws IOException {
        while (true) {
            LogEntry entry = ahead == null ? entries.next() : ahead;
            ahead = null;
            if (entry == null) {
                return finished();
            }
            if (!entry.hasText() && open == null) {
                others.accept(entry.line());
                continue;
            }
            if (open != null && open.takes(entry)) {
                if (open.isComplete()) {
                    return finished();
                }
                continue;
            }
            if (open != null) {
                ahead = entry;
                return finished();
            }
            open = begin(entry);
            if (open == null) {
                others.accept(entry.line());
            } else if (open.isComplete()) {
                return finished();
            }
        }
    }

    /** The message that was joined; a length line says how long the next one is. */
    private LogMessage finished() {
        if (open == null) {
            return null;
        }
        LogMessage message = open.message();
        expected = message.kind() == Kind.LENGTH ? Joining.length(message.text()) : -1;
        open = null;
        return message;
    }

    /** The message that begins within an entry; null when none does. */
    private Joining begin(LogEntry entry) {
        LogHeader header = entry.header();
        last = header == null ? last : header;
        boolean own = header != null && tag.equals(header.tag());
        boolean tagless = header == null ? last == null : header.tag() == null;
        String text = entry.text();
        Kind kind = own || tagless ? MessageReader.kind(text) : Kind.TEXT;
        int[] found = isBegin(kind, text) ? null : Unwrap.find(text);
        if (found == null) {
            return own || tagless ? new Joining(entry, text, kind, expected) : null;
        }
        boolean timed = header != null && !header.time().isEmpty();
        String time = timed ? "" : Unwrap.time(text.substring(0, found[0]));
        LogEntry message = new LogEntry(entry.line(),
                time.isEmpty() ? header : LogHeader.withTime(header, time),
                entry.begin() + found[0], entry.begin() + found[1]);
        String inside = message.text();
        return new Joining(message, inside, MessageReader.kind(inside), expected);
    }

    /** Whether a text is a message from its begin on: nothing stands around it. */
    private static boolean isBegin(Kind kind, String text) {
        return switch (kind) {
            case REQUEST, REPLY -> text.startsWith("F=") || text.startsWith("|");
            case TEXT -> false;
            default -> true;
        };
    }

    @Override
    public void close() throws IOException {
        entries.close();
    }
}
