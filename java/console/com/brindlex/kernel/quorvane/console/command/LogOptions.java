package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.log.LineReader;
import com.brindlex.kernel.quorvane.console.log.LogReader;
import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import java.io.ByteArrayInputStream;
import java.io.IOException;
import java.io.InputStream;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.InvalidPathException;
import java.nio.file.Path;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.Parameters;
import picocli.CommandLine.Spec;

/** Where a log comes from: what all commands that read one have in common. */
final class LogOptions {
    /** What is said of a log in which nothing was found. */
    static final String NOTHING =
            "no message found; is the tag or the charset another one (--tag, --charset)?";

    @Spec(Spec.Target.MIXEE)
    private CommandSpec spec;

    @Parameters(arity = "0..1", paramLabel = "LOG", defaultValue = "-",
            description = "A file, or one message in quotes; the standard input without it or for "
                    + "'-'.")
    private String log;

    @Option(names = "--charset", paramLabel = "NAME", defaultValue = "UTF-8",
            converter = CharsetName.class,
            description = "Charset of a log without a byte order mark: UTF-8 (the usual one), "
                    + "Big5, UTF-16LE ...")
    private Charset charset;

    @Option(names = "--tag", paramLabel = "TAG", defaultValue = LogReader.TAG,
            description = "Tag that the library's lines have in the log; usually "
                    + LogReader.TAG + ". In lines of other tags, requests and replies are found.")
    private String tag;

    /** The name of the log, for messages about it. */
    String name() {
        return log.equals("-") ? "(input)" : isMessage() ? "(message)" : log;
    }

    boolean isStandardInput() {
        return log.equals("-");
    }

    Charset charset() {
        return charset;
    }

    Path file() {
        return Path.of(log);
    }

    /** Whether the argument is a message and no file. */
    boolean isMessage() {
        return !log.equals("-") && !isFile() && MessageReader.kind(log) != Kind.TEXT;
    }

    /** Whether the log is this very file. */
    boolean isFile(Path file) throws IOException {
        return isFile() && Files.exists(file) && Files.isSameFile(Path.of(log), file);
    }

    private boolean isFile() {
        try {
            return !log.isEmpty() && Files.exists(Path.of(log));
        } catch (InvalidPathException message) {
            return false;
        }
    }

    LogReader open() throws IOException {
        return open(stream());
    }

    LogReader open(InputStream stream) {
        return new LogReader(lines(stream), tag);
    }

    LineReader lines(InputStream stream) {
        return new LineReader(stream, isMessage() ? StandardCharsets.UTF_8 : charset);
    }

    /**
     * The bytes of the log.
     *
     * @throws ParameterException when there is no such file
     */
    InputStream stream() throws IOException {
        if (log.equals("-")) {
            return System.in;
        }
        if (isMessage()) {
            return new ByteArrayInputStream(log.getBytes(StandardCharsets.UTF_8));
        }
        if (!isFile()) {
            throw new ParameterException(
                    spec.commandLine(), "neither a file nor a message: '" + log + "'");
        }
        if (Files.isDirectory(Path.of(log))) {
            throw new ParameterException(spec.commandLine(), log + " is a folder");
        }
        return Files.newInputStream(Path.of(log));
    }
}
