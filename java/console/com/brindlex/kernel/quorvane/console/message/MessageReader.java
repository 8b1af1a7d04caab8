package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import java.util.HashMap;
import java.util.List;
import java.util.Map;
import java.util.regex.Pattern;

/** Says of any text what it is, and takes it apart. */
public final class MessageReader {
    private static final Pattern LENGTH = Pattern.compile("\\w+: Len:[0-9]+|regMsg Len:[0-9]+");
    private static final Pattern MARK = Pattern.compile(
            "\\[(?:strResult2?|status)\\].*|test1|(?:gatewayjni_)?GetCertEncode2?(?:_+[0-9])?"
            + "|Java_com_brindlex_kernel_quorvane_gatewayjni_\\w+");
    private static final Pattern RESULT = Pattern.compile(
            "[0-9]{1,9}!|<[0-9]>!|[^|=]*@[^|]*!\\z");
    private static final Pattern FIELDS =
            Pattern.compile("[A-Z0-9]{1,7}=[^|]*\\||[^|]{0,40}\\|[A-Z0-9]{1,7}=");
    private static final String[] OF_REQUESTS = {"BHNO=", "CB=", "IP=", "VER=", "SN=", "11="};
    private static final String[] SOURCES = {"[CLIENT]", "[GATEWAY]", "[BROKER]", "[CERT]"};

    /** A header has nine of them before the identity; damage may add some. */
    private static final int FIELDS_IN_FRONT = 16;

    /** No name of a call makes a length line longer. */
    private static final int LONGEST_LENGTH = 100;

    private MessageReader() {}

    /** What a text is. */
    public static Kind kind(String text) {
        if (text.startsWith("F=1|") || text.startsWith("F=7|")) {
            return isRequest(text) ? Kind.REQUEST : Kind.REPLY;
        }
        if (text.startsWith("~CGateway")) {
            return Kind.END;
        }
        if (text.startsWith("[GATEWAY]error") || text.startsWith("[BROKER]timeout")) {
            return Kind.REPLY;
        }
        if (isLength(text)) {
            return Kind.LENGTH;
        }
        if (isMark(text)) {
            return Kind.MARK;
        }
        for (String source : SOURCES) {
            if (text.startsWith(source)) {
                return Kind.MESSAGE;
            }
        }
        if (text.indexOf('!') >= 0 && RESULT.matcher(text).lookingAt()) {
            return Kind.RESULT;
        }
        if (text.indexOf('|') >= 0 && FIELDS.matcher(text).lookingAt()) {
            return isRequest(text) ? Kind.REQUEST : Kind.REPLY;
        }
        return isKnownMessage(text) ? Kind.MESSAGE : Kind.TEXT;
    }

    private static boolean isLength(String text) {
        return text.length() < LONGEST_LENGTH && text.contains("Len:")
                && LENGTH.matcher(text).matches();
    }

    private static boolean isMark(String text) {
        char first = text.isEmpty() ? ' ' : text.charAt(0);
        boolean like = first == '[' || first == 't' || first == 'g' || first == 'G' || first == 'J';
        return like && MARK.matcher(text).matches();
    }

    /** Without the trade type, which one encoder writes behind a message. */
    public static String bare(String text) {
        return text.contains("|28=") ? text.replaceFirst("\\|28=[0-9]+$", "") : text;
    }

    /** Two fields in front that requests alone carry; replies begin alike. */
    private static boolean isRequest(String text) {
        int found = 0;
        int bar = text.indexOf('|');
        for (int field = 0; field < FIELDS_IN_FRONT && bar >= 0 && found < 2; field++) {
            for (String tag : OF_REQUESTS) {
                found += text.startsWith(tag, bar + 1) ? 1 : 0;
            }
            bar = text.indexOf('|', bar + 1);
        }
        return found == 2;
    }

    private static boolean isKnownMessage(String text) {
        return !text.isEmpty() && !Dictionary.get().english(bare(text)).isEmpty();
    }

    /** Takes a text apart. */
    public static Message read(String text) {
        return read(text, List.of());
    }

    /**
     * Takes a text apart that answers something known.
     *
     * @param decoders the operations that can read it, where it is a reply or a result; empty when
     *         nobody knows
     */
    public static Message read(String text, List<String> decoders) {
        return read(kind(text), text, decoders, true);
    }

    /** Says of a text of a known kind what is wrong with it; its fields are left out. */
    public static Message glance(Kind kind, String text, List<String> decoders) {
        return read(kind, text, decoders, false);
    }

    private static Message read(Kind kind, String text, List<String> decoders, boolean full) {
        return switch (kind) {
            case REQUEST -> RequestReader.read(text, full);
            case REPLY -> isFailure(text) ? failure(text, decoders)
                                          : ReplyReader.read(text, decoders, full);
            case RESULT -> ResultReader.read(text, decoders, full);
            case MESSAGE -> message(text);
            case LENGTH -> logLine(kind, text, "length of what a call was given, in bytes");
            case END -> logLine(kind, text, "a call ends");
            case MARK -> logLine(kind, text, text.startsWith("[")
                            ? "a value on the way through a login reply"
                            : "a mark on the way through a call");
            default -> logLine(Kind.TEXT, text, text.isEmpty()
                            ? "nothing: the empty result of an operation"
                            : "a text without fields");
        };
    }

    private static Message logLine(Kind kind, String text, String words) {
        return new Message(kind, List.of(), words, text,
                List.of(new Group("log line", List.of(new Field(0, "", text, words, "")))),
                List.of(), Map.of());
    }

    /** Such a marker speaks for the whole reply, wherever it stands. */
    private static boolean isFailure(String text) {
        return text.contains("[GATEWAY]error") || text.contains("[BROKER]timeout");
    }

    /** A marker of the way to the host, in place of a reply. */
    private static Message failure(String text, List<String> decoders) {
        boolean gateway = text.contains("[GATEWAY]error");
        String english = Dictionary.get().english(gateway ? "[GATEWAY]error" : "[BROKER]timeout");
        return new Message(Kind.REPLY, decoders, "no reply: " + english.replaceFirst(".*: ", ""),
                text, List.of(new Group("message", List.of(new Field(0, "", text,
                        "transport failure in place of a reply", english)))),
                List.of(), Map.of("outcome", "failed"));
    }

    private static Message message(String text) {
        String bare = bare(text);
        String english = Dictionary.get().english(bare);
        boolean waits = bare.equals("委託單傳送中!!");
        Map<String, String> facts = new HashMap<>();
        facts.put("outcome", waits ? "pending" : bare.contains("連線失敗") ? "failed" : "refused");
        String by = bare.startsWith("[CLIENT]") ? "refused by the library: " : "refused: ";
        String said = english.isEmpty() ? bare : english;
        String words = waits || facts.get("outcome").equals("failed") ? said : by + said;
        return new Message(Kind.MESSAGE, List.of(), words, text,
                List.of(new Group("message", List.of(new Field(0, "", text, "message for the user",
                        english)))), List.of(), facts);
    }
}
