package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.log.LogReader;
import com.brindlex.kernel.quorvane.console.message.Fault;
import com.brindlex.kernel.quorvane.console.timeline.Event;
import com.brindlex.kernel.quorvane.console.timeline.Timeline;
import java.io.IOException;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;
import java.util.concurrent.Callable;
import picocli.CommandLine.Command;
import picocli.CommandLine.Mixin;
import picocli.CommandLine.ParentCommand;

/** Holds the messages of a log against the dictionary. */
@Command(name = "check", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Holds every value against the dictionary, and every signature payload "
                + "against the order that it signs; writes what is wrong, one line a fault.",
        footer = {"",
                "Exit codes: 0 all is sound, 1 something is wrong or the log holds no message, "
                + "2 usage.", "",
                "  quorvane check log.txt",
                "  quorvane check 'F=7|KIND=S|BHNO=9A01|...'",
                "  adb logcat -d | quorvane check --json"})
final class CheckCommand implements Callable<Integer> {
    @ParentCommand
    private Quorvane parent;

    @Mixin
    private LogOptions log;

    private final Output out = new Output();
    private Terminal terminal;
    private long messages;
    private long faults;

    @Override
    public Integer call() throws IOException {
        terminal = parent.terminal();
        Timeline timeline = new Timeline();
        boolean read = true;
        try (LogReader reader = log.open()) {
            LogMessage message;
            while (read && (message = reader.next(line -> { })) != null) {
                Event event = timeline.accept(message);
                messages += event == null ? 0 : 1;
                for (Fault fault : event == null ? List.<Fault>of()
                                                 : event.row().faults()) {
                    faults++;
                    read = show(event, fault);
                }
            }
        }
        if (messages == 0) {
            terminal.error(LogOptions.NOTHING);
            return 1;
        }
        terminal.note(messages + " messages, " + (faults == 0 ? "all sound" : faults + " faults"));
        return faults == 0 ? 0 : 1;
    }

    private boolean show(Event event, Fault fault) {
        if (!terminal.isJson()) {
            return out.write(log.name() + ":" + event.row().line() + ": " + fault.kind() + ": "
                    + fault.text() + place(event) + "\n");
        }
        Map<String, Object> value = new LinkedHashMap<>();
        value.put("line", event.row().line());
        value.put("operation", event.row().operation());
        value.put("requestId", event.row().requestId());
        value.put("kind", fault.kind());
        value.put("text", fault.text());
        value.put("character", fault.offset() + 1);
        return out.json(value);
    }

    private static String place(Event event) {
        String operation = event.row().operation();
        return operation.isEmpty() ? "" : " (" + operation + ")";
    }
}
