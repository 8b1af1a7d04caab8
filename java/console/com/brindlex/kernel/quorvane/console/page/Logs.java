package com.brindlex.kernel.quorvane.console.page;

import com.brindlex.kernel.quorvane.console.mask.Secret;
import java.io.IOException;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.nio.file.Path;
import java.util.EnumSet;
import java.util.LinkedHashMap;
import java.util.Locale;
import java.util.Map;
import java.util.Set;

/** The logs that the page has open: the one that the command named, what was pasted or dropped. */
public final class Logs {
    /** The newest logs alone are kept. */
    private static final int MOST = 4;

    private final Charset charset;
    private final String tag;
    private final Map<String, OpenLog> open = new LinkedHashMap<>();
    private final Map<String, byte[]> masked = new LinkedHashMap<>();
    private int count;
    private String followed;
    private String name;

    /**
     * No logs yet.
     *
     * @param charset of files without a byte order mark
     * @param tag the tag whose texts are the library's
     */
    public Logs(Charset charset, String tag) {
        this.charset = charset;
        this.tag = tag;
    }

    /** Shows a file from the beginning, and what is written on it. */
    public void follow(Path file) throws IOException {
        followed = add(OpenLog.following(file, charset, tag));
        name = file.getFileName().toString();
    }

    Map<String, PageServer.Place> places() {
        return Map.of("GET api/start", question -> start(), "POST api/log", this::take,
                "POST api/charset", this::readAgain, "GET api/rows",
                question -> Answer.json(find(question).rows(question.number("from"))),
                "GET api/message",
                question -> Answer.json(find(question).message(question.number("row"))),
                "POST api/mask", this::mask, "GET api/masked", this::save);
    }

    private Answer start() {
        return Answer.json(followed == null ? Map.of()
                : Map.of("log", followed, "name", name, "charset", charset.name()));
    }

    private synchronized String add(OpenLog log) {
        open.keySet().stream().filter(each -> open.size() >= MOST && !each.equals(followed))
                .findFirst().ifPresent(oldest -> {
                    open.remove(oldest);
                    masked.remove(oldest);
                });
        String id = String.valueOf(++count);
        open.put(id, log);
        return id;
    }

    private synchronized OpenLog find(Question question) {
        OpenLog log = open.get(question.value("log"));
        if (log == null) {
            throw new IllegalArgumentException("that log is no longer open");
        }
        return log;
    }

    /** What was pasted is UTF-8; what was dropped is as the files of this desk are. */
    private Answer take(Question question) throws IOException {
        boolean pasted = question.value("from").equals("paste");
        OpenLog log = OpenLog.of(question.body(), pasted ? StandardCharsets.UTF_8 : charset, tag);
        return Answer.json(Map.of("log", add(log), "charset", charset.name()));
    }

    /** The same log in another charset, in place of the one that was wrong. */
    private synchronized Answer readAgain(Question question) throws IOException {
        OpenLog before = find(question);
        OpenLog log = before.in(charset(question.value("charset")));
        before.close();
        String id = question.value("log");
        open.remove(id);
        masked.remove(id);
        boolean follows = id.equals(followed);
        String again = add(log);
        followed = follows ? again : followed;
        return Answer.json(Map.of("log", again));
    }

    private static Charset charset(String name) {
        try {
            return Charset.forName(name);
        } catch (IllegalArgumentException unknown) {
            throw new IllegalArgumentException("this machine has no charset '" + name + "'");
        }
    }

    /** Opens the masked log beside the other, so that what will be sent on is seen first. */
    private Answer mask(Question question) throws IOException {
        Set<Secret> kept = EnumSet.noneOf(Secret.class);
        for (String each : question.value("keep").split(",")) {
            if (!each.isEmpty()) {
                kept.add(Secret.valueOf(each.toUpperCase(Locale.ROOT)));
            }
        }
        if (kept.contains(Secret.PASSWORD)) {
            throw new IllegalArgumentException("passwords are always replaced");
        }
        byte[] bytes = find(question).masked(kept);
        String id = add(OpenLog.of(bytes, StandardCharsets.UTF_8, tag));
        synchronized (this) {
            masked.put(id, bytes);
        }
        return Answer.json(Map.of("log", id));
    }

    private synchronized Answer save(Question question) {
        byte[] bytes = masked.get(question.value("log"));
        if (bytes == null) {
            throw new IllegalArgumentException("mask the log first");
        }
        return Answer.file(bytes, "masked.log");
    }
}
