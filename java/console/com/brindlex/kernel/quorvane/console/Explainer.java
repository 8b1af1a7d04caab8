package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.console.Explanation.Group;
import com.brindlex.kernel.quorvane.console.Explanation.Item;
import com.brindlex.kernel.quorvane.console.Explanation.Kind;
import com.brindlex.kernel.quorvane.console.Explanation.Trouble;
import com.brindlex.kernel.quorvane.typed.Message;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Result;
import java.util.ArrayList;
import java.util.List;
import java.util.regex.Matcher;
import java.util.regex.Pattern;

/** Says of any line what it is, what each of its fields is, and where it breaks. */
public final class Explainer {
    /** What a log writes in front of a line of the library. */
    private static final Pattern LOG_PREFIX =
            Pattern.compile("^(?:[^|@!\\[]{0,80}?\\b)?gatewayjni *(?:\\( *[0-9]+\\))? *: ?");

    private static final Pattern LENGTH = Pattern.compile("(\\w+): Len:([0-9]+)|regMsg Len:[0-9]+");
    private static final Pattern LOG_MARK = Pattern.compile(
            "~CGateway\\w+|\\[(?:strResult2?|status)\\].*|test1"
            + "|(?:gatewayjni_)?GetCertEncode2?(?:_+[0-9])?"
            + "|Java_com_brindlex_kernel_quorvane_gatewayjni_\\w+");
    private static final Pattern RESULT = Pattern.compile(
            "(?s)[0-9]{1,9}!.*|<[0-9]>!.*|[^|]*@.*!|[^|=]*@[^|=]*@[^=]*");
    private static final Pattern FIELDS =
            Pattern.compile("(?s)(?:[A-Z0-9]{1,7}=.*|.*\\|[A-Z0-9]{1,7}=.*)");

    private Explainer() {}

    /** Explains a line. */
    public static Explanation explain(String line) {
        return explain(line, null);
    }

    /**
     * Explains a line of a known operation.
     *
     * @param line the line, perhaps with what a log writes in front of it
     * @param operation the operation that wrote or reads it; null when that is to be found out
     */
    public static Explanation explain(String line, Operation operation) {
        Matcher prefix = LOG_PREFIX.matcher(line);
        String text = prefix.find() ? line.substring(prefix.end()) : line;
        boolean decoder = operation != null && !operation.isEncoder();
        if (text.startsWith("[GATEWAY]error") || text.startsWith("[BROKER]timeout")) {
            return message(Kind.REPLY, text, "transport failure in place of a reply");
        }
        if (LENGTH.matcher(text).matches() || LOG_MARK.matcher(text).matches()) {
            return logLine(text);
        }
        if (text.matches("(?s)\\[(CLIENT|GATEWAY|BROKER|CERT)\\].*") || Messages.isBare(text)) {
            return message(Kind.MESSAGE, text, "message for the user");
        }
        boolean fields = text.startsWith("F=1|") || text.startsWith("F=7|");
        if (!fields && RESULT.matcher(text).matches()) {
            return ResultReading.explain(text, operation);
        }
        if (fields || FIELDS.matcher(text).matches()) {
            boolean request = !decoder && ReplyReading.looksLikeRequest(text);
            return request ? RequestReading.explain(text, operation)
                           : ReplyReading.explain(text, operation);
        }
        if (decoder) {
            return ResultReading.explain(text, operation);
        }
        return new Explanation(Kind.TEXT, List.of(), text.isEmpty()
                        ? "nothing: the empty result of an operation whose status says all"
                        : "a text without fields: a certificate, or a message of the gateway",
                text, List.of(), List.of());
    }

    private static Explanation logLine(String text) {
        String meaning = text.startsWith("~") ? "a call ends: its gateway object is destroyed"
                : text.contains("Len:") ? "length of what a call was given, in bytes"
                : text.startsWith("[") ? "a value on the way through a login reply"
                : "a mark on the way through a call";
        return new Explanation(Kind.LOG_LINE, List.of(), meaning, text,
                List.of(new Group("log line", List.of(new Item(0, "", text, meaning, "")))),
                List.of());
    }

    private static Explanation message(Kind kind, String text, String summary) {
        // one encoder writes its last field behind the message
        String bare = text.replaceFirst("\\|28=[0-9]+$", "");
        Message message = Result.of(Operation.OPEN_ACCOUNT_DECODE, -1, bare).message();
        List<Item> items = new ArrayList<>();
        if (message.source() != Message.Source.UNKNOWN) {
            items.add(new Item(0, "source", "[" + message.source() + "]", "who says it", ""));
        }
        String said = message.text();
        items.add(new Item(Math.max(0, text.indexOf(said)), "text", said, "the message",
                Messages.english(said)));
        if (!message.code().isEmpty()) {
            items.add(new Item(text.lastIndexOf(message.code()), "code", message.code(),
                    "result code of the gateway", ""));
        }
        if (bare.length() < text.length()) {
            items.add(new Item(bare.length() + 1, "28", text.substring(bare.length() + 4),
                    "trade type", ""));
        }
        return new Explanation(kind, List.of(), summary, text,
                List.of(new Group("message", items)), List.<Trouble>of());
    }
}
