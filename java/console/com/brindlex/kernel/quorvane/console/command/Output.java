package com.brindlex.kernel.quorvane.console.command;

import com.google.gson.Gson;
import com.google.gson.GsonBuilder;
import java.io.ByteArrayOutputStream;
import java.io.FilterInputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.PrintStream;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;

/** Writes what a log gives, message by message, until nobody reads it any more. */
final class Output {
    private static final Gson JSON =
            new GsonBuilder().disableHtmlEscaping().serializeNulls().create();

    private static final int HELD = 1 << 16;

    private final PrintStream out;
    private final Charset charset;
    private final ByteArrayOutputStream held = new ByteArrayOutputStream();
    private boolean holds;
    private boolean isRead = true;

    Output() {
        this(StandardCharsets.UTF_8);
    }

    Output(Charset charset) {
        this.out = System.out;
        this.charset = charset;
    }

    /** Writes a text and lets it go, unless it may be held; whether somebody still reads. */
    boolean write(String text) {
        held.writeBytes(text.getBytes(charset));
        if (!holds || held.size() >= HELD) {
            send();
        }
        return isRead;
    }

    /**
     * The same stream. From now on what is written is held until more is asked of it, which may have
     * to be waited for: a call of the system for every line costs a long log a sixth of its time.
     * Whoever holds must {@link #send} at the end.
     */
    InputStream holdingUntil(InputStream stream) {
        holds = true;
        return new FilterInputStream(stream) {
            @Override
            public int read() throws IOException {
                send();
                return super.read();
            }

            @Override
            public int read(byte[] bytes, int offset, int length) throws IOException {
                send();
                return super.read(bytes, offset, length);
            }
        };
    }

    /** Lets go what is held. */
    void send() {
        if (held.size() > 0) {
            out.write(held.toByteArray(), 0, held.size());
            held.reset();
            isRead = !out.checkError();
        }
    }

    /** Writes a value as one line of JSON. */
    boolean json(Object value) {
        return write(JSON.toJson(value) + "\n");
    }
}
