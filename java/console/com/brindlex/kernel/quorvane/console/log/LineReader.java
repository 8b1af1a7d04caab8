package com.brindlex.kernel.quorvane.console.log;

import java.io.Closeable;
import java.io.IOException;
import java.io.InputStream;
import java.io.InputStreamReader;
import java.io.PushbackInputStream;
import java.io.Reader;
import java.nio.charset.Charset;
import java.nio.charset.CodingErrorAction;
import java.nio.charset.StandardCharsets;

/**
 * Reads a stream line by line, as it comes. A byte order mark decides the charset; what is no
 * character of it becomes U+FFFD. A line is kept up to a bound, however long it is.
 */
public final class LineReader implements Closeable {
    /** The characters that are kept of a line. */
    public static final int LONGEST = 1 << 20;

    private final InputStream stream;
    private final char[] buffer = new char[1 << 16];
    private final StringBuilder line = new StringBuilder();
    private Charset charset;
    private Reader in;
    private int at;
    private int filled;
    private long number;
    private int carriageReturns;

    /**
     * Reads from {@code stream}.
     *
     * @param charset of a stream without a byte order mark
     */
    public LineReader(InputStream stream, Charset charset) {
        this.stream = stream;
        this.charset = charset;
    }

    private void begin() throws IOException {
        if (in == null) {
            PushbackInputStream bytes = new PushbackInputStream(stream, 3);
            charset = marked(bytes, charset);
            in = new InputStreamReader(bytes, charset.newDecoder()
                    .onMalformedInput(CodingErrorAction.REPLACE)
                    .onUnmappableCharacter(CodingErrorAction.REPLACE));
        }
    }

    /** What a byte order mark says; the mark itself is passed over. */
    private static Charset marked(PushbackInputStream in, Charset otherwise) throws IOException {
        byte[] head = new byte[3];
        int read = 0;
        while (read < head.length) {
            int count = in.read(head, read, head.length - read);
            if (count < 0) {
                break;
            }
            read += count;
            // a mark is needed to go on waiting
            if (head[0] != (byte) 0xEF && head[0] != (byte) 0xFF && head[0] != (byte) 0xFE) {
                break;
            }
        }
        boolean two = read >= 2;
        if (read == 3 && head[0] == (byte) 0xEF && head[1] == (byte) 0xBB
                && head[2] == (byte) 0xBF) {
            return StandardCharsets.UTF_8;
        }
        if (two && head[0] == (byte) 0xFF && head[1] == (byte) 0xFE) {
            in.unread(head, 2, read - 2);
            return StandardCharsets.UTF_16LE;
        }
        if (two && head[0] == (byte) 0xFE && head[1] == (byte) 0xFF) {
            in.unread(head, 2, read - 2);
            return StandardCharsets.UTF_16BE;
        }
        in.unread(head, 0, read);
        return otherwise;
    }

    /** The charset that the stream is read in. */
    public Charset charset() throws IOException {
        begin();
        return charset;
    }

    /** The next line; null at the end. */
    public LogLine next() throws IOException {
        begin();
        line.setLength(0);
        boolean cut = false;
        while (true) {
            if (at == filled && !fill()) {
                return line.length() == 0 ? null : ended(line.toString(), "", cut);
            }
            int end = at;
            while (end < filled && buffer[end] != '\n') {
                end++;
            }
            if (line.length() == 0 && end < filled && end - at <= LONGEST) {
                String whole = new String(buffer, at, end - at);
                at = end + 1;
                return ended(whole, "\n", false);
            }
            int room = LONGEST - line.length();
            cut |= end - at > room;
            line.append(buffer, at, Math.min(end - at, room));
            at = end;
            if (end < filled) {
                at++;
                return ended(line.toString(), "\n", cut);
            }
        }
    }

    private boolean fill() throws IOException {
        at = 0;
        filled = Math.max(0, in.read(buffer));
        return filled > 0;
    }

    /** The first line tells how many carriage returns the log ends its lines with. */
    private LogLine ended(String text, String end, boolean cut) {
        number++;
        int returns = 0;
        while (returns < text.length() && text.charAt(text.length() - 1 - returns) == '\r') {
            returns++;
        }
        if (number == 1) {
            carriageReturns = returns;
        }
        int drop = Math.min(carriageReturns, returns);
        return drop == 0 ? new LogLine(number, text, end, cut)
                : new LogLine(number, text.substring(0, text.length() - drop),
                        "\r".repeat(drop) + end, cut);
    }

    @Override
    public void close() throws IOException {
        stream.close();
    }
}
