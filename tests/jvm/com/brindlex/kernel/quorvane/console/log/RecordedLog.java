package com.brindlex.kernel.quorvane.console.log;

import com.brindlex.kernel.quorvane.console.Demo;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.io.UncheckedIOException;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;

/** What the library logs while the demonstration is played, recorded through the host's log. */
public final class RecordedLog {
    private static final String HEAD = "D/gatewayjni: ";
    private static final List<String> MESSAGES = record();

    private RecordedLog() {}

    /** The messages in their order, as the library wrote them. */
    public static List<String> messages() {
        return MESSAGES;
    }

    private static List<String> record() {
        ProcessBuilder demo = new ProcessBuilder(
                Path.of(System.getProperty("java.home"), "bin", "java").toString(),
                "-Duser.timezone=GMT+08:00",
                "-Djava.library.path=" + System.getProperty("java.library.path"), "-cp",
                System.getProperty("java.class.path"), Demo.class.getName());
        demo.environment().remove("LD_PRELOAD");
        demo.environment().put("TZ", "CST-8");
        demo.environment().put("ANDROID_LOG_TAGS", "gatewayjni:D");
        demo.redirectOutput(ProcessBuilder.Redirect.DISCARD);
        try {
            Process playing = demo.start();
            byte[] log = playing.getErrorStream().readAllBytes();
            if (playing.waitFor() != 0) {
                throw new IllegalStateException(new String(log, StandardCharsets.UTF_8));
            }
            return parted(new String(log, StandardCharsets.UTF_8));
        } catch (IOException broken) {
            throw new UncheckedIOException(broken);
        } catch (InterruptedException stopped) {
            throw new IllegalStateException(stopped);
        }
    }

    /** A line without a head goes on with the message before it. */
    private static List<String> parted(String log) {
        List<String> messages = new ArrayList<>();
        for (String line : log.substring(0, log.length() - 1).split("\n", -1)) {
            if (line.startsWith(HEAD)) {
                messages.add(line.substring(HEAD.length()));
            } else {
                messages.set(messages.size() - 1, messages.get(messages.size() - 1) + "\n" + line);
            }
        }
        return messages;
    }

    /** The messages of a log, read anew. */
    public static List<LogMessage> read(byte[] log, Charset charset) throws IOException {
        List<LogMessage> all = new ArrayList<>();
        try (LogReader reader = reader(log, charset)) {
            for (LogMessage each = reader.next(line -> { }); each != null;
                    each = reader.next(line -> { })) {
                all.add(each);
            }
        }
        return all;
    }

    public static LogReader reader(byte[] log, Charset charset) {
        return new LogReader(new LineReader(new ByteArrayInputStream(log), charset), LogReader.TAG);
    }

    public static List<LogMessage> read(String log) throws IOException {
        return read(log.getBytes(StandardCharsets.UTF_8), StandardCharsets.UTF_8);
    }

    /** A text in UTF-16 with its mark, as PowerShell writes files. */
    public static byte[] utf16(String text) {
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        out.writeBytes(new byte[] {(byte) 0xFF, (byte) 0xFE});
        out.writeBytes(text.getBytes(StandardCharsets.UTF_16LE));
        return out.toByteArray();
    }
}
