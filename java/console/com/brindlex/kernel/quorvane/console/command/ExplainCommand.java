package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.log.LogReader;
import com.brindlex.kernel.quorvane.console.message.Fault;
import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.Message;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import com.brindlex.kernel.quorvane.console.timeline.Event;
import com.brindlex.kernel.quorvane.console.timeline.Timeline;
import java.io.IOException;
import java.util.EnumSet;
import java.util.List;
import java.util.Set;
import java.util.concurrent.Callable;
import picocli.CommandLine.Command;
import picocli.CommandLine.Mixin;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParentCommand;

/** Explains the messages of a log. */
@Command(name = "explain", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Names every field of requests, replies and results, message by message as "
                + "they come, and says where a damaged one breaks. It reads every format of logcat "
                + "and Android Studio, and a message behind any prefix.",
        footer = {"", "With --json, one object a line.", "",
                "Exit codes: 0 done, 1 a message is damaged or there was none, 2 usage.", "",
                "  adb logcat -s gatewayjni | quorvane explain",
                "  quorvane explain 'F=7|68=0000|00=1|67=1|...'"})
final class ExplainCommand implements Callable<Integer> {
    /** What tells of a call, and nothing of the protocol. */
    private static final Set<Kind> NOISE =
            EnumSet.of(Kind.HEADER, Kind.LENGTH, Kind.MARK, Kind.END, Kind.TEXT);

    @ParentCommand
    private Quorvane parent;

    @Mixin
    private LogOptions log;

    @Option(names = "--operation", paramLabel = "OPERATION",
            converter = Quorvane.DictionaryOperation.class,
            description = "The operation of the messages, where that is known.")
    private String operation;

    @Option(names = "--all",
            description = "Also what is no message: headers that a request repeats, "
            + "lengths, marks, texts.")
    private boolean all;

    private final Output out = new Output();
    private Terminal terminal;
    private List<String> last = List.of();
    private long shown;

    @Override
    public Integer call() throws IOException {
        terminal = parent.terminal();
        Timeline timeline = new Timeline();
        boolean sound = true;
        boolean read = true;
        try (LogReader reader = log.open()) {
            LogMessage source;
            while (read && (source = reader.next(line -> { })) != null) {
                Event event = timeline.accept(source);
                Message message = message(source, event);
                List<Fault> faults = event == null ? message.faults() : event.row().faults();
                if (all || log.isMessage() || !NOISE.contains(message.kind()) || isText(event)) {
                    sound &= faults.isEmpty();
                    read = show(source, event, message, faults);
                }
            }
        }
        if (shown == 0) {
            terminal.error("nothing to explain");
        }
        return sound && shown > 0 ? 0 : 1;
    }

    /** Whether a text was found to be the result of a call. */
    private static boolean isText(Event event) {
        return event != null;
    }

    private Message message(LogMessage source, Event event) {
        List<String> decoders = decoders(event);
        Message message = MessageReader.read(source.text(), decoders);
        last = message.kind() == Kind.REPLY ? message.operations()
                : message.kind() == Kind.REQUEST ? List.of() : last;
        return message;
    }

    private List<String> decoders(Event event) {
        if (operation != null) {
            boolean decoder = Dictionary.get().reply(operation) != null;
            return decoder ? List.of(operation)
                           : Dictionary.get().operation(operation).answeredBy();
        }
        return event == null ? last : event.message().operations().stream()
                .filter(each -> Dictionary.get().reply(each) != null).toList();
    }

    private boolean show(LogMessage source, Event event, Message message, List<Fault> faults) {
        shown++;
        return terminal.isJson()
                ? out.json(MessageView.json(source, event, message, faults))
                : out.write(MessageView.text(terminal.screen(), source, event, message, faults));
    }
}
