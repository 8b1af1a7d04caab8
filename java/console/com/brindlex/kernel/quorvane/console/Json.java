package com.brindlex.kernel.quorvane.console;

import java.util.Map;

/** Writes maps, lists, texts, numbers and truth values as JSON. */
public final class Json {
    private static final String INDENT = "  ";

    private final StringBuilder out = new StringBuilder();

    private Json() {}

    /** The JSON text of a value; what is none of its types is written as a text. */
    public static String write(Object value) {
        Json json = new Json();
        json.value(value, "");
        return json.out.toString();
    }

    private void value(Object value, String indent) {
        if (value == null || value instanceof Number || value instanceof Boolean) {
            out.append(value);
        } else if (value instanceof Map<?, ?> map) {
            object(map, indent);
        } else if (value instanceof Iterable<?> list) {
            array(list, indent);
        } else {
            text(value.toString());
        }
    }

    private void object(Map<?, ?> map, String indent) {
        String mark = "{";
        for (Map.Entry<?, ?> entry : map.entrySet()) {
            out.append(mark).append('\n').append(indent).append(INDENT);
            text(entry.getKey().toString());
            out.append(": ");
            value(entry.getValue(), indent + INDENT);
            mark = ",";
        }
        close(mark, "{", "}", indent);
    }

    private void array(Iterable<?> list, String indent) {
        String mark = "[";
        for (Object element : list) {
            out.append(mark).append('\n').append(indent).append(INDENT);
            value(element, indent + INDENT);
            mark = ",";
        }
        close(mark, "[", "]", indent);
    }

    private void close(String mark, String open, String end, String indent) {
        out.append(mark.equals(open) ? open : "\n" + indent).append(end);
    }

    private void text(String text) {
        out.append('"');
        for (int i = 0; i < text.length(); i++) {
            char c = text.charAt(i);
            if (c == '"' || c == '\\') {
                out.append('\\').append(c);
            } else if (c < ' ' || Character.isSurrogate(c) && !isPaired(text, i)) {
                out.append(String.format("\\u%04x", (int) c));
            } else {
                out.append(c);
            }
        }
        out.append('"');
    }

    private static boolean isPaired(String text, int at) {
        return Character.isHighSurrogate(text.charAt(at))
                ? at + 1 < text.length() && Character.isLowSurrogate(text.charAt(at + 1))
                : at > 0 && Character.isHighSurrogate(text.charAt(at - 1));
    }
}
