package com.brindlex.kernel.quorvane.console.timeline;

import com.brindlex.kernel.quorvane.console.Newest;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Operation;
import com.brindlex.kernel.quorvane.console.log.LogHeader;
import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.log.LogTime;
import com.brindlex.kernel.quorvane.console.message.Fault;
import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.Message;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import java.util.ArrayList;
import java.util.List;
import java.util.Map;

/**
 * Makes the timeline of a log, message by message. A reply is tied to its request by the request
 * id that it carries, else to the oldest request that it can answer. Where the library logs no
 * reply, its result stands for it. What is remembered is bounded, however long the log is.
 */
public final class Timeline {
    private static final int MOST_THREADS = 256;

    /** The one decoder whose result is not logged, nor its reply. */
    private static final String UNLOGGED = "FutQueryOrderDecode";

    private static final List<String> DECODERS = decoders(false);
    private static final List<String> STOCK_DECODERS = decoders(true);

    private final Pending pending = new Pending();
    private final Map<String, Call> calls = new Newest<>(MOST_THREADS);
    private String lastReply = "";
    private String lastResult = "";
    private Message lastRead;
    private List<String> lastDecoders = List.of();

    /** The row of the next message of the log; null when the message makes none. */
    public Event accept(LogMessage source) {
        String thread = thread(source.header());
        Call call = calls.computeIfAbsent(thread, each -> new Call());
        Kind kind = source.kind();
        return switch (kind) {
            case REQUEST -> request(source, call);
            case REPLY -> reply(source, call);
            case RESULT, MESSAGE -> result(source, call, kind);
            case LENGTH -> {
                call.decoder = source.text().split(":")[0];
                yield null;
            }
            case TEXT -> {
                call.text = source;
                yield null;
            }
            case END -> {
                call.isStock |= source.text().equals("~CGatewayStk");
                yield call.isStock && source.text().equals("~CGatewayStk") ? null
                                                                          : end(source, call);
            }
            default -> null;
        };
    }

    /** The requests that no reply was found for. */
    public List<Row> unanswered() {
        return pending.waiting();
    }

    /** What a message says; one that comes twice in a row is read once. */
    private Message glance(LogMessage source, List<String> decoders) {
        boolean again = lastRead != null && lastRead.text().equals(source.text())
                && lastDecoders.equals(decoders);
        if (!again) {
            lastRead = MessageReader.glance(source.kind(), source.text(), decoders);
            lastDecoders = decoders;
        }
        return lastRead;
    }

    private static String thread(LogHeader header) {
        boolean named = header != null
                && (!header.process().isEmpty() || !header.thread().isEmpty());
        return named ? header.process() + ":" + header.thread() : "";
    }

    private Event request(LogMessage source, Call call) {
        Message message = glance(source, List.of());
        if (message.kind() == Kind.HEADER) {
            call.header = message;
            return null;
        }
        call.isAsked = true;
        call.isAnswered = false;
        if (message.kind() == Kind.MESSAGE) {
            return row(source, message, null, "refused");
        }
        if (pending.has(message.fact("requestId"), source.text())) {
            return null;
        }
        Event event = row(source, message, null, "sent");
        pending.add(event.row(), millis(source), message);
        return event;
    }

    private Event reply(LogMessage source, Call call) {
        boolean repeated = source.text().equals(lastReply);
        call.isAnswered = true;
        String id = requestId(source.text());
        List<String> named = named(call);
        Pending.Request request = id.isEmpty() ? null : pending.take(id);
        lastReply = source.text();
        if (repeated && request == null && !id.isEmpty()) {
            return null;  // an app may decode a reply twice, or log it, too
        }
        List<String> decoders = request != null && !request.decoders().isEmpty()
                ? readers(request.decoders(), named) : named;
        Message message = glance(source, decoders);
        if (request == null && id.isEmpty()) {
            request = message.operations().isEmpty()
                    ? null : pending.takeOldest(message.operations());
            request = request != null || !decoders.isEmpty()
                    ? request : pending.takeOldest(family(message));
            if (request != null && decoders.isEmpty()) {
                message = glance(source, request.decoders());
            }
        }
        return request == null && repeated ? null
                                           : row(source, message, request, status(message));
    }

    /** The decoders of receipts, or of everything else: short replies look alike. */
    private static List<String> family(Message message) {
        boolean receipt = message.operation() != null
                && Dictionary.get().reply(message.operation()).isReceipt();
        return Dictionary.get().operations().stream().map(Operation::name)
                .filter(each -> Dictionary.get().reply(each) != null
                        && Dictionary.get().reply(each).isReceipt() == receipt).toList();
    }

    /** The decoder that a length line named, where it is one of those that can answer. */
    private static List<String> readers(List<String> decoders, List<String> named) {
        List<String> both = decoders.stream().filter(named::contains).toList();
        return both.isEmpty() || decoders.size() > 1 ? decoders : both;
    }

    /** Two decoders borrow the length line of another. */
    private static List<String> named(Call call) {
        if (call.decoder == null || Dictionary.get().reply(call.decoder) == null) {
            return List.of();
        }
        List<String> named = new ArrayList<>(List.of(call.decoder));
        for (String borrower : new String[] {call.decoder + "JZG", "OpenCertDecode"}) {
            boolean open = !borrower.equals("OpenCertDecode")
                    || call.decoder.equals("GetCertStatusDecode");
            if (open && Dictionary.get().reply(borrower) != null) {
                named.add(borrower);
            }
        }
        return named;
    }

    private static String requestId(String reply) {
        int at = reply.indexOf("|65=");
        if (at < 0) {
            return "";
        }
        int end = reply.indexOf('|', at + 1);
        return reply.substring(at + 4, end < 0 ? reply.length() : end);
    }

    private Event result(LogMessage source, Call call, Kind kind) {
        if (call.isAnswered) {
            return null;
        }
        call.isAnswered = true;
        if (kind == Kind.MESSAGE && isOfEncoder(source.text(), call)) {
            call.isAsked = true;
            return row(source, refused(source, call), null, "refused");
        }
        Message guessed = glance(source, List.of());
        List<String> decoders = kind == Kind.RESULT ? guessed.operations() : ofClass(call);
        Pending.Request request = pending.takeOldest(decoders);
        boolean repeated = source.text().equals(lastResult);
        lastResult = source.text();
        if (request == null && repeated) {
            return null;  // an app may decode a reply twice
        }
        Message message = request == null || kind == Kind.MESSAGE ? guessed
                : glance(source, request.decoders());
        return row(source, message, request, status(message));
    }

    /** A message of the library, with what the header tells of the request that was not built. */
    private Message refused(LogMessage source, Call call) {
        Message said = glance(source, List.of());
        return call.header == null ? said : new Message(said.kind(), List.of(), said.words(),
                said.text(), said.groups(), said.faults(), call.header.facts());
    }

    /** Whether a message says that no request was built. */
    private static boolean isOfEncoder(String text, Call call) {
        if (call.header != null) {
            return true;
        }
        String bare = MessageReader.bare(text);
        for (Dictionary.Message each : Dictionary.get().messages()) {
            if (each.text().equals(bare)) {
                return Dictionary.get().operations().stream().noneMatch(operation ->
                        !operation.isEncoder() && refuses(operation, each));
            }
        }
        return false;
    }

    private static boolean refuses(Operation operation, Dictionary.Message message) {
        return operation.refusals().contains(message.id());
    }

    private static List<String> decoders(boolean ofStock) {
        return Dictionary.get().operations().stream().filter(each -> !each.isEncoder()
                && (!ofStock || each.gatewayClass().equals("CGatewayStk")))
                .map(Operation::name).toList();
    }

    private static List<String> ofClass(Call call) {
        return call.isStock ? STOCK_DECODERS : DECODERS;
    }

    /** The end of a call that has shown nothing: its text, if an empty one, was its result. */
    private Event end(LogMessage source, Call call) {
        calls.remove(thread(source.header()));
        if (call.isAsked || call.isAnswered || call.header != null) {
            return null;
        }
        Pending.Request oldest = pending.oldest();
        if (!call.isStock && oldest != null && oldest.decoders().contains(UNLOGGED)) {
            return answered(source, pending.takeOldest(List.of(UNLOGGED)),
                    "answered; the library does not log how", "answered");
        }
        if (call.text == null || oldest == null) {
            return null;
        }
        boolean empty = call.text.text().isEmpty();
        List<String> decoders = ofClass(call).stream().filter(each -> empty
                        == Dictionary.get().reply(each).result().equals("empty")
                || !empty && Dictionary.get().reply(each).isReceipt()).toList();
        Pending.Request request = pending.takeOldest(decoders);
        if (request == null) {
            return null;
        }
        return empty ? answered(call.text, request, "accepted", "done")
                     : answered(call.text, request, "refused: " + call.text.text(), "refused");
    }

    private Event answered(LogMessage source, Pending.Request request, String words,
            String status) {
        Message message = new Message(Kind.RESULT, request.decoders(), words, source.text(),
                List.of(), List.of(), Map.of());
        return row(source, message, request, status);
    }

    private static String status(Message message) {
        String outcome = message.fact("outcome");
        return outcome.isEmpty() ? "done" : outcome;
    }

    private static long millis(LogMessage source) {
        return source.header() == null ? LogTime.NONE : LogTime.millis(source.header().time());
    }

    private Event row(LogMessage source, Message message, Pending.Request request,
            String status) {
        boolean asks = status.equals("sent") || message.kind() == Kind.MESSAGE && request == null;
        Row asked = request == null ? null : request.row();
        Long took = request == null ? null : LogTime.between(request.millis(), millis(source));
        String operation = message.operation() != null ? message.operation()
                : asked == null || request.decoders().isEmpty() ? "" : request.decoders().get(0);
        Operation known = Dictionary.get().operation(operation);
        Row row = new Row(source.line(), time(source, message, asks), asks, operation,
                known == null ? "" : known.title(),
                asked == null ? account(message) : asked.account(),
                asked == null ? message.fact("idNumber") : asked.idNumber(),
                asked == null ? message.fact("instrument") : asked.instrument(),
                message.words(), status,
                asked == null ? message.fact("requestId") : asked.requestId(),
                asked == null ? 0 : asked.line(), took, faults(source, message));
        return new Event(row, source, message);
    }

    private static String account(Message message) {
        String account = message.fact("account");
        return account.isEmpty() ? message.fact("idNumber") : account;
    }

    private static String time(LogMessage source, Message message, boolean asks) {
        if (source.header() != null && !source.header().time().isEmpty()) {
            return source.header().time();
        }
        String id = message.fact("requestId");
        return asks && id.length() == 10
                ? id.substring(2, 4) + ":" + id.substring(4, 6) + ":" + id.substring(6, 8) : "";
    }

    /** The faults of a message; what the log has cut off is no fault of the message. */
    static List<Fault> faults(LogMessage source, Message message) {
        if (source.flaws().isEmpty()) {
            return message.faults();
        }
        List<Fault> all = new ArrayList<>();
        boolean cut = source.flaws().stream().anyMatch(flaw -> flaw.kind().equals("cut-by-log"));
        if (!cut) {
            all.addAll(message.faults());
        }
        source.flaws().forEach(flaw -> all.add(new Fault(flaw.offset(), flaw.kind(), flaw.text())));
        return all;
    }
}
