package com.brindlex.kernel.quorvane.console.page;

import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.log.LineReader;
import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.log.LogReader;
import com.brindlex.kernel.quorvane.console.mask.MaskedLog;
import com.brindlex.kernel.quorvane.console.mask.Secret;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import com.brindlex.kernel.quorvane.console.timeline.Event;
import com.brindlex.kernel.quorvane.console.timeline.Row;
import com.brindlex.kernel.quorvane.console.timeline.Timeline;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.UncheckedIOException;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;
import java.util.Map;
import java.util.Set;

/** A log that the page shows, with the events of its timeline. */
final class OpenLog {
    /** The most rows that are kept of a log, and that are handed out at a time. */
    static final int MOST_ROWS = 200_000;
    static final int MOST_AT_ONCE = 5_000;

    private final Source source;
    private final Charset charset;
    private final String tag;
    private final Path file;
    private final List<Event> events = new ArrayList<>();
    private FollowedFile followed;
    private boolean isCut;

    /** The bytes of a log, from their beginning. */
    private interface Source {
        InputStream open() throws IOException;
    }

    private OpenLog(Source source, Charset charset, String tag, Path file) {
        this.source = source;
        this.charset = charset;
        this.tag = tag;
        this.file = file;
    }

    /** Reads a log that is whole. */
    static OpenLog of(byte[] bytes, Charset charset, String tag) throws IOException {
        return whole(() -> new ByteArrayInputStream(bytes), charset, tag);
    }

    private static OpenLog whole(Source source, Charset charset, String tag) throws IOException {
        OpenLog log = new OpenLog(source, charset, tag, null);
        log.read(log.lines());
        return log;
    }

    /** Reads a file, and goes on for as long as it grows. */
    static OpenLog following(Path file, Charset charset, String tag) throws IOException {
        OpenLog log = new OpenLog(() -> bounded(file), charset, tag, file);
        log.followed = new FollowedFile(file);
        Thread reader = new Thread(() -> {
            try {
                log.read(new LineReader(log.followed, charset));  // waits for the first bytes
            } catch (IOException ended) {
                // what was read stays
            }
        }, "log");
        reader.setDaemon(true);
        reader.start();
        return log;
    }

    /** The same log, read again in another charset. */
    OpenLog in(Charset other) throws IOException {
        return file == null ? whole(source, other, tag) : following(file, other, tag);
    }

    /** Ends to wait for more of it. */
    void close() throws IOException {
        if (followed != null) {
            followed.close();
        }
    }

    private LineReader lines() throws IOException {
        return new LineReader(source.open(), charset);
    }

    private static InputStream bounded(Path file) throws IOException {
        if (Files.size(file) > PageServer.LONGEST_LOG) {
            throw new IllegalArgumentException("too long to mask here: quorvane mask " + file);
        }
        return Files.newInputStream(file);
    }

    private void read(LineReader lines) throws IOException {
        Timeline timeline = new Timeline();
        try (LogReader reader = new LogReader(lines, tag)) {
            LogMessage message;
            while ((message = reader.next(line -> { })) != null) {
                Event event = timeline.accept(message);
                if (event != null && !add(event)) {
                    return;
                }
            }
        }
    }

    private synchronized boolean add(Event event) {
        isCut = events.size() >= MOST_ROWS;
        return !isCut && events.add(event);
    }

    /** Rows from the one numbered {@code from}, some thousands at a time. */
    synchronized Map<String, Object> rows(int from) {
        int begin = Math.min(from, events.size());
        int end = Math.min(events.size(), begin + MOST_AT_ONCE);
        List<Row> rows = events.subList(begin, end).stream().map(Event::row).toList();
        return Map.of("rows", rows, "total", events.size(), "cut", isCut);
    }

    /** The event of a row; null when there is none. */
    private synchronized Event event(int row) {
        return row < events.size() ? events.get(row) : null;
    }

    /** A message taken apart, with the faults that its row tells of. */
    Map<String, Object> message(int row) {
        Event event = event(row);
        if (event == null) {
            throw new IllegalArgumentException("no such row");
        }
        List<String> decoders = event.message().operations().stream()
                .filter(each -> Dictionary.get().reply(each) != null).toList();
        var message = MessageReader.read(event.source().text(), decoders);
        return TakenApart.of(message, event.row().faults());
    }

    /** The same log without its secrets but those of the kinds {@code kept}, in UTF-8. */
    byte[] masked(Set<Secret> kept) throws IOException {
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        MaskedLog masked = new MaskedLog(kept);
        if (!masked.mask(() -> new LogReader(lines(), tag), line -> write(line, out))) {
            throw new IllegalArgumentException("no message was found: nothing can be masked");
        }
        return out.toByteArray();
    }

    private static void write(String line, ByteArrayOutputStream out) {
        try {
            out.write(line.getBytes(StandardCharsets.UTF_8));
        } catch (IOException broken) {
            throw new UncheckedIOException(broken);
        }
    }
}
