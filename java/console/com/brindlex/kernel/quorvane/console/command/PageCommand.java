package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.log.LogReader;
import com.brindlex.kernel.quorvane.console.page.Logs;
import com.brindlex.kernel.quorvane.console.page.PageServer;
import java.io.IOException;
import java.nio.charset.Charset;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Locale;
import java.util.concurrent.Callable;
import java.util.concurrent.CountDownLatch;
import picocli.CommandLine.Command;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.Parameters;
import picocli.CommandLine.ParentCommand;
import picocli.CommandLine.Spec;

/** Serves the page. */
@Command(name = "page", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Opens one page in the browser: logs as a timeline with each message taken "
                + "apart, forms for all operations, a session with the simulated gateway, and the "
                + "dictionary. It is served on the loopback address alone, and nothing leaves this "
                + "machine. Ctrl-C ends it.",
        footer = {"", "  quorvane page", "  quorvane page log.txt    shows the log as it grows"})
final class PageCommand implements Callable<Integer> {
    @ParentCommand
    private Quorvane parent;

    @Spec
    private CommandSpec spec;

    @Parameters(arity = "0..1", paramLabel = "LOG",
            description = "A file to show, and to follow as it grows.")
    private Path log;

    @Option(names = "--port", paramLabel = "NUMBER", defaultValue = "0",
            description = "The port; one that is free without it.")
    private int port;

    @Option(names = "--no-open", description = "Write the address alone, and "
            + "start no browser.")
    private boolean noOpen;

    @Option(names = "--charset", paramLabel = "NAME", defaultValue = "UTF-8",
            converter = CharsetName.class,
            description = "Charset of files without a byte order mark; usually UTF-8.")
    private Charset charset;

    @Option(names = "--tag", paramLabel = "TAG", defaultValue = LogReader.TAG,
            description = "Tag that the library's lines have in the log; usually "
                    + LogReader.TAG + ".")
    private String tag;

    @Override
    public Integer call() throws IOException, InterruptedException {
        Logs logs = new Logs(charset, tag);
        if (log != null) {
            if (!Files.isRegularFile(log)) {
                throw new ParameterException(spec.commandLine(), "no file " + log);
            }
            logs.follow(log);
        }
        try (PageServer server = new PageServer(port, logs)) {
            parent.terminal().line(server.address());
            if (!noOpen) {
                open(server.address());
            }
            new CountDownLatch(1).await();  // until the user ends it
        }
        return 0;
    }

    /** Asks the desktop to show the address; it was written for where there is no desktop. */
    private void open(String address) {
        String system = System.getProperty("os.name").toLowerCase(Locale.ROOT);
        String opener = system.contains("mac") ? "open" : "xdg-open";
        try {
            new ProcessBuilder(opener, address).redirectErrorStream(true)
                    .redirectOutput(ProcessBuilder.Redirect.DISCARD).start();
        } catch (IOException none) {
            parent.terminal().note("no browser was found: open the address above in one");
        }
    }
}
