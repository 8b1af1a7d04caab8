package com.brindlex.kernel.quorvane.console.command;

import com.google.gson.Gson;
import com.google.gson.GsonBuilder;
import java.io.PrintStream;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;

/** Writes what a log gives, message by message, until nobody reads it any more. */
final class Output {
    private static final Gson JSON =
            new GsonBuilder().disableHtmlEscaping().serializeNulls().create();

    private final PrintStream out;
    private final Charset charset;

    Output() {
        this(StandardCharsets.UTF_8);
    }

    Output(Charset charset) {
        this.out = System.out;
        this.charset = charset;
    }

    /** Writes a text and lets it go; whether somebody still reads. */
    boolean write(String text) {
        byte[] bytes = text.getBytes(charset);
        out.write(bytes, 0, bytes.length);
        out.flush();
        return !out.checkError();
    }

    /** Writes a value as one line of JSON. */
    boolean json(Object value) {
        return write(JSON.toJson(value) + "\n");
    }
}
