package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.Screen;
import com.brindlex.kernel.quorvane.console.Screen.Style;
import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.log.LogReader;
import com.brindlex.kernel.quorvane.console.timeline.Event;
import com.brindlex.kernel.quorvane.console.timeline.Row;
import com.brindlex.kernel.quorvane.console.timeline.RowFilter;
import com.brindlex.kernel.quorvane.console.timeline.Timeline;
import java.io.IOException;
import java.util.List;
import java.util.concurrent.Callable;
import java.util.regex.Pattern;
import java.util.stream.Collectors;
import picocli.CommandLine.Command;
import picocli.CommandLine.Mixin;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.ParentCommand;
import picocli.CommandLine.Spec;

/** Shows a log as a timeline. */
@Command(name = "timeline", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Shows what was asked and answered, one line a message: time, account, "
                + "operation, what it says, how it ended, how long the answer took.",
        footer = {"", "Exit codes: 0 done, 1 the log holds no message, 2 usage.", "",
                "  adb logcat -v threadtime | quorvane timeline",
                "  quorvane timeline log.txt --failures",
                "  quorvane timeline log.txt --stock 2330 --csv > orders.csv"})
final class TimelineCommand implements Callable<Integer> {
    private static final String CSV_HEAD = "line,time,direction,operation,title,account,instrument,"
            + "words,status,request_id,request_line,millis,faults\r\n";

    private static final Pattern CALCULATED = Pattern.compile("(?!-?[0-9]+\\z)[=+\\-@\t\r]");
    private static final Pattern SIMPLE = Pattern.compile("[^\",\r\n]*");

    @ParentCommand
    private Quorvane parent;

    @Spec
    private CommandSpec spec;

    @Mixin
    private LogOptions log;

    @Option(names = "--account", paramLabel = "NUMBER",
            description = "Only this account or ID number.")
    private String account;

    @Option(names = "--stock", paramLabel = "CODE", description = "Only this stock or commodity.")
    private String stock;

    @Option(names = "--operation", paramLabel = "NAME",
            description = "Only operations whose name or title holds this.")
    private String operation;

    @Option(names = "--failures", description = "Only what was refused, failed or is damaged.")
    private boolean failures;

    @Option(names = "--csv", description = "Write comma-separated values.")
    private boolean csv;

    private final Output out = new Output();
    private Terminal terminal;
    private int width;
    private int shown;
    private int requests;
    private int failed;

    @Override
    public Integer call() throws IOException {
        terminal = parent.terminal();
        if (csv && terminal.isJson()) {
            throw new ParameterException(spec.commandLine(), "--csv and --json exclude each other");
        }
        width = System.console() == null ? Integer.MAX_VALUE : spec.usageMessage().width();
        RowFilter filter = new RowFilter(account, stock, operation, failures);
        Timeline timeline = new Timeline();
        boolean read = !csv || out.write(CSV_HEAD);
        try (LogReader reader = log.open(out.holdingUntil(log.stream()))) {
            LogMessage message;
            while (read && (message = reader.next(line -> { })) != null) {
                Event event = timeline.accept(message);
                if (event != null && filter.takes(event.row())) {
                    read = show(event.row());
                }
            }
        } finally {
            out.send();
        }
        if (!csv && !terminal.isJson()) {
            summary(timeline.unanswered().stream().filter(filter::takes).toList());
        }
        return shown > 0 ? 0 : 1;
    }

    private boolean show(Row row) {
        shown++;
        requests += row.isRequest() ? 1 : 0;
        failed += row.isFailure() ? 1 : 0;
        return csv ? out.write(csv(row)) : terminal.isJson() ? out.json(row)
                                                             : out.write(line(row) + "\n");
    }

    private String line(Row row) {
        Screen screen = terminal.screen();
        String head = Screen.pad(row.time(), row.time().length() > 12 ? 18 : 12)
                + (row.isRequest() ? " → " : " ← ") + Screen.pad(row.account(), 10) + " "
                + Screen.pad(shortName(row.operation()), 17) + " "
                + Screen.pad(row.status(), 8) + " ";
        String took = row.millis() == null ? "" : " (" + row.millis() + " ms)";
        String faults = row.faults().isEmpty() ? "" : " [" + row.faults().stream()
                .map(fault -> fault.kind()).distinct().collect(Collectors.joining(", ")) + "]";
        String words = row.words().replace('\n', ' ').replace('\r', ' ') + took + faults;
        String text = Screen.cut(head + words, width);
        return screen.styled(row.isFailure() ? Style.BAD : row.isRequest() ? Style.PLAIN
                                                                          : Style.GOOD, text);
    }

    /** SubmitOrder1 for SubmitOrderEncode1. */
    private static String shortName(String operation) {
        return operation.replace("Encode", "").replace("Decode", "");
    }

    private static String csv(Row row) {
        String faults = row.faults().stream().map(fault -> fault.kind())
                                .collect(Collectors.joining(" "));
        return List.of(String.valueOf(row.line()), row.time(),
                           row.isRequest() ? "request" : "reply", row.operation(), row.title(),
                           row.account(), row.instrument(), row.words(), row.status(),
                           row.requestId(), row.requestLine() == 0 ? "" : "" + row.requestLine(),
                           row.millis() == null ? "" : row.millis().toString(), faults)
                .stream().map(TimelineCommand::quoted).collect(Collectors.joining(",", "", "\r\n"));
    }

    /** A cell that a spreadsheet would calculate is shown as the text that it is. */
    private static String quoted(String cell) {
        String text = CALCULATED.matcher(cell).lookingAt() ? "'" + cell : cell;
        return SIMPLE.matcher(text).matches() ? text
                                              : "\"" + text.replace("\"", "\"\"") + "\"";
    }

    private void summary(List<Row> unanswered) {
        if (shown == 0) {
            terminal.error(LogOptions.NOTHING);
            return;
        }
        String waiting = unanswered.isEmpty() ? "" : "; no answer found for line "
                + unanswered.stream().limit(5).map(row -> "" + row.line())
                          .collect(Collectors.joining(", "))
                + (unanswered.size() > 5 ? " and " + (unanswered.size() - 5) + " more" : "");
        terminal.note(shown + " messages: " + requests + " requests, " + (shown - requests)
                + " answers; " + failed + " refused, failed or damaged" + waiting);
    }
}
