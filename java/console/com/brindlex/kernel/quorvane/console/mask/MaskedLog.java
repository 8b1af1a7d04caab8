package com.brindlex.kernel.quorvane.console.mask;

import com.brindlex.kernel.quorvane.console.Utf8;
import com.brindlex.kernel.quorvane.console.log.LogEntry;
import com.brindlex.kernel.quorvane.console.log.LogLine;
import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.log.LogReader;
import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import java.io.IOException;
import java.util.ArrayList;
import java.util.List;
import java.util.Set;
import java.util.function.Consumer;

/**
 * Writes a log without its secrets. It is read twice: a secret may stand alone on a line before the
 * request that shows it to be one.
 */
public final class MaskedLog {
    /** The calls that are given the text of a certificate, and log it behind its length. */
    private static final String TAKES_CERTIFICATE = "RegisterCertEncode: Len:";

    private final Masker masker;
    private LogMessage length;
    private final List<Runnable> held = new ArrayList<>();
    private int longer;

    /** Opens the log anew; each reader is closed. */
    public interface Source {
        LogReader open() throws IOException;
    }

    /** Masks all secrets but those of the kinds {@code kept}. */
    public MaskedLog(Set<Secret> kept) {
        this.masker = new Masker(kept);
    }

    /**
     * Reads the log to its end, and writes it line by line, each with its end. A log without any
     * message is not written: whoever cannot read it cannot know what is secret in it.
     *
     * @return whether there was a message
     */
    public boolean mask(Source source, Consumer<String> out) throws IOException {
        boolean speaks = false;
        try (LogReader log = source.open()) {
            boolean certificate = false;
            for (LogMessage each = log.next(line -> { }); each != null;
                    each = log.next(line -> { })) {
                if (certificate) {
                    masker.learn(Secret.SIGNATURE, each.text());
                }
                certificate = each.text().startsWith(TAKES_CERTIFICATE);
                masker.learn(each.text());
                speaks |= each.kind() != Kind.TEXT;
            }
        }
        if (!speaks) {
            return false;
        }
        try (LogReader log = source.open()) {
            Consumer<LogLine> others = line -> later(() ->
                    out.accept(masker.mask(line.text()) + line.end()));
            for (LogMessage each = log.next(others); each != null; each = log.next(others)) {
                take(each, out);
            }
        }
        flush();
        return true;
    }

    /** Writes at once, or behind the length line that waits for the message that it counts. */
    private void later(Runnable write) {
        if (length == null) {
            write.run();
        } else {
            held.add(write);
        }
    }

    private void flush() {
        List<Runnable> all = new ArrayList<>(held);
        held.clear();
        length = null;
        all.forEach(Runnable::run);
    }

    private void take(LogMessage message, Consumer<String> out) {
        boolean counts = MessageReader.kind(message.text()) == Kind.LENGTH;
        if (counts) {
            flush();
            length = message;
            longer = 0;
            held.add(() -> writeLength(message, out));
            return;
        }
        Masker.Masked masked = masker.mask(message.text(), message.splits());
        longer = Utf8.length(masked.text()) - Utf8.length(message.text());
        flush();
        write(message, masked, out);
    }

    private void writeLength(LogMessage message, Consumer<String> out) {
        LogEntry entry = message.entries().get(0);
        int colon = message.text().lastIndexOf(':');
        long count = Long.parseLong(message.text().substring(colon + 1)) + longer;
        out.accept(around(entry, message.text().substring(0, colon + 1) + Math.max(0, count)));
    }

    private String around(LogEntry entry, String text) {
        String line = entry.line().text();
        return masker.mask(line.substring(0, entry.begin())) + text
                + masker.mask(line.substring(entry.end())) + entry.line().end();
    }

    private void write(LogMessage message, Masker.Masked masked, Consumer<String> out) {
        List<LogEntry> entries = message.entries();
        int begin = 0;
        int entry = 0;
        for (int i = 0; i <= masked.places().size(); i++) {
            int end = i < masked.places().size() ? masked.places().get(i)
                                                 : masked.text().length();
            if (end < 0) {
                continue;  // the line went with what was replaced
            }
            String text = masked.text().substring(begin, end);
            String original = entries.get(entry).text();
            if (i < masked.places().size() && text.endsWith("\n")) {
                text = text.substring(0, text.length() - 1);
            }
            if (text.endsWith("\r") && !original.endsWith("\r")) {
                text = text.substring(0, text.length() - 1);
            }
            out.accept(around(entries.get(entry), text));
            begin = end;
            entry = i + 1;
        }
    }
}
