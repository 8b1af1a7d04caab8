package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.log.LineReader;
import com.brindlex.kernel.quorvane.console.mask.MaskedLog;
import com.brindlex.kernel.quorvane.console.mask.Secret;
import java.io.BufferedOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.OutputStream;
import java.io.UncheckedIOException;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.StandardCopyOption;
import java.util.EnumSet;
import java.util.Set;
import java.util.concurrent.Callable;
import picocli.CommandLine.Command;
import picocli.CommandLine.Mixin;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.ParentCommand;
import picocli.CommandLine.Spec;

/** Writes a log without its secrets. */
@Command(name = "mask", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Writes the same log with its secrets replaced, alike everywhere, so that it "
                + "can be sent on and still be read: passwords always; ID numbers, accounts, "
                + "signatures and certificates, and what an applicant tells of himself unless they "
                + "are kept.",
        footer = {"", "Nothing is written before the whole log was read once.", "",
                "Exit codes: 0 done, 1 the log holds no message and is not written, 2 usage.", "",
                "  quorvane mask log.txt > log-to-send.txt",
                "  adb logcat -d | quorvane mask --keep account --output log-to-send.txt"})
final class MaskCommand implements Callable<Integer> {
    @Spec
    private CommandSpec spec;

    @ParentCommand
    private Quorvane parent;

    @Mixin
    private LogOptions log;

    @Option(names = "--keep", paramLabel = "KIND", split = ",",
            description = "Leave these as they are: id, account, signature, person.")
    private Set<Secret> kept = EnumSet.noneOf(Secret.class);

    @Option(names = {"-o", "--output"}, paramLabel = "FILE",
            description = "Write to this file; the standard output without it.")
    private Path output;

    @Override
    public Integer call() throws IOException {
        if (kept.contains(Secret.PASSWORD)) {
            throw new ParameterException(spec.commandLine(), "passwords are always replaced");
        }
        if (!log.isStandardInput()) {
            if (output != null && log.isFile(output)) {
                throw new ParameterException(spec.commandLine(), output + " is the log itself");
            }
            return mask(log::stream);
        }
        // a log is read twice: the standard input is kept where its owner alone can read it
        Path copy = Files.createTempFile("quorvane", ".log");
        try {
            Files.copy(System.in, copy, StandardCopyOption.REPLACE_EXISTING);
            return mask(() -> Files.newInputStream(copy));
        } finally {
            Files.deleteIfExists(copy);
        }
    }

    private interface Bytes {
        InputStream open() throws IOException;
    }

    private int mask(Bytes bytes) throws IOException {
        Charset charset;
        try (LineReader lines = log.lines(bytes.open())) {
            charset = lines.charset();
        }
        try (OutputStream out = output == null ? null
                        : new BufferedOutputStream(Files.newOutputStream(output))) {
            Output standard = new Output(charset);
            boolean marked = charset.equals(StandardCharsets.UTF_16LE)
                    || charset.equals(StandardCharsets.UTF_16BE);
            write(out, standard, charset, marked ? "\uFEFF" : "");
            if (new MaskedLog(kept).mask(() -> log.open(bytes.open()),
                    line -> write(out, standard, charset, line))) {
                return 0;
            }
        }
        parent.terminal().error(LogOptions.NOTHING + " Nothing is written.");
        return 1;
    }

    private static void write(OutputStream out, Output standard, Charset charset, String text) {
        try {
            if (out == null) {
                standard.write(text);
            } else {
                out.write(text.getBytes(charset));
            }
        } catch (IOException broken) {
            throw new UncheckedIOException(broken);
        }
    }
}
