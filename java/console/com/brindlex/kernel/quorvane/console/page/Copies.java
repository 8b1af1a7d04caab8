package com.brindlex.kernel.quorvane.console.page;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.console.WrittenRequest;
import java.util.Map;
import java.util.function.UnaryOperator;

/** A call as it is written in Java, in Kotlin, and among the golden cases. */
final class Copies {

    private Copies() {}

    /** The call that builds a request from these texts. */
    static Map<String, String> of(Operation operation, Map<String, String> texts) {
        return Map.of("java", "String request = " + request(operation, texts, false) + ";\n",
                "kotlin", "val request = " + request(operation, texts, true) + "\n",
                "golden", golden(operation, texts::get));
    }

    /** The call that reads a reply. */
    static Map<String, String> ofReply(Operation decoder, String reply) {
        String call = "RawReply.of(Operation." + decoder.name() + ", Market.SECURITIES,\n        ";
        return Map.of("java", "RawReply read = " + call + literal(reply, false) + ");\n",
                "kotlin", "val read = " + call + literal(reply, true) + ")\n",
                "golden", golden(decoder, name -> name.equals("reply") ? reply : "1"));
    }

    private static String request(Operation operation, Map<String, String> texts, boolean kotlin) {
        StringBuilder call = new StringBuilder("RawRequest.of(Operation." + operation.name()
                + ", Session.of(" + literal(texts.get("serialNo"), kotlin) + ", "
                + literal(texts.get("localIP"), kotlin) + ")\n"
                + "                .withMarket(Market.of(" + digits(texts, "market") + "))\n"
                + "                .withPlatform(Platform.of(" + digits(texts, "platform") + "))\n"
                + "                .withSequence(" + digits(texts, "seqNo") + "))\n");
        for (Argument argument : operation.arguments()) {
            call.append("        .set(\"").append(argument.name()).append("\", ")
                    .append(literal(texts.get(argument.name()), kotlin)).append(")\n");
        }
        return call + "        .build().text()";
    }

    private static int digits(Map<String, String> texts, String name) {
        return Integer.parseInt(texts.get(name));
    }

    private static String literal(String text, boolean kotlin) {
        StringBuilder literal = new StringBuilder("\"");
        for (char c : text.toCharArray()) {
            if (c == '"' || c == '\\' || kotlin && c == '$') {
                literal.append('\\').append(c);
            } else if (c < ' ' || c == 0x7F) {
                literal.append(String.format("\\u%04x", (int) c));
            } else {
                literal.append(c);
            }
        }
        // a line feed by its number would end the line of a Java source
        return literal.append('"').toString().replace("\\u000a", "\\n").replace("\\u000d", "\\r");
    }

    private static String golden(Operation operation, UnaryOperator<String> texts) {
        StringBuilder lines = new StringBuilder("== title that says the point of the case\nop "
                + operation.method() + "\n");
        for (Argument argument : WrittenRequest.arguments(operation)) {
            String value = golden(argument.type(), texts.apply(argument.name()));
            lines.append(argument.name()).append(' ').append(value.stripTrailing()).append('\n');
        }
        return lines.toString();
    }

    private static String golden(Argument.Type type, String text) {
        return switch (type) {
            case TEXT -> "str " + escaped(text);
            case INT -> "int " + text;
            case SMALL -> "byte " + text;
            case BYTE_LETTER -> "byte '" + text + "'";
            case LETTER -> text.length() == 1 && text.charAt(0) > '~' ? "char " + (int) text.charAt(0)
                                                                      : "char '" + text + "'";
        };
    }

    private static String escaped(String text) {
        String escaped = text.replace("\\", "\\\\").replace("\n", "\\n").replace("\r", "\\r")
                                 .replace("\t", "\\t");
        return escaped.endsWith(" ") ? escaped.substring(0, escaped.length() - 1) + "\\s" : escaped;
    }
}
