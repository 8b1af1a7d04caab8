package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.Json;
import com.brindlex.kernel.quorvane.console.Screen.Style;
import com.brindlex.kernel.quorvane.console.Screen;
import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.io.PrintStream;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.NoSuchFileException;
import java.nio.file.Path;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine;

/** Where commands read and write: texts with colours, or JSON. */
final class Terminal {
    private final PrintStream out;
    private final PrintStream err;
    private final boolean json;
    private final Screen screen;

    Terminal(boolean json, boolean colours) {
        this.out = new PrintStream(System.out, true, StandardCharsets.UTF_8);
        this.err = new PrintStream(System.err, true, StandardCharsets.UTF_8);
        this.json = json;
        this.screen = new Screen(out, colours, System.console() != null);
    }

    boolean isJson() {
        return json;
    }

    Screen screen() {
        return screen;
    }

    /** Writes a value as JSON. */
    void json(Object value) {
        out.println(Json.write(value));
    }

    void line(String text) {
        out.println(text);
    }

    /** Writes a text exactly, with a line feed behind it when it has none. */
    void raw(String text) {
        out.print(text.endsWith("\n") ? text : text + "\n");
        out.flush();
    }

    /** Writes something beside what was asked for. */
    void note(String text) {
        err.println(screen.styled(Style.DIM, text));
    }

    void error(String text) {
        err.println(screen.styled(Style.BAD, text));
    }

    /** Asks for a text that is not shown; null when the terminal is gone. */
    static String prompt(String purpose) {
        char[] typed = System.console().readPassword("%s: ", purpose);
        return typed == null ? null : new String(typed);
    }

    /** A line of the standard input, no byte more; null at its end. */
    static String readLine() {
        ByteArrayOutputStream line = new ByteArrayOutputStream();
        try {
            int next = System.in.read();
            if (next < 0) {
                return null;
            }
            for (; next >= 0 && next != '\n'; next = System.in.read()) {
                line.write(next);
            }
        } catch (IOException broken) {
            return null;
        }
        String text = line.toString(StandardCharsets.UTF_8);
        return text.endsWith("\r") ? text.substring(0, text.length() - 1) : text;
    }

    /** Reads a whole file, or the standard input for {@code -}. */
    static String read(CommandSpec spec, String file) {
        try {
            byte[] bytes = file.equals("-") ? System.in.readAllBytes()
                                            : Files.readAllBytes(Path.of(file));
            return new String(bytes, StandardCharsets.UTF_8);
        } catch (NoSuchFileException missing) {
            throw new CommandLine.ParameterException(spec.commandLine(), "no file " + file);
        } catch (IOException broken) {
            throw new CommandLine.ParameterException(
                    spec.commandLine(), "cannot read " + file + ": " + broken.getMessage());
        }
    }
}
