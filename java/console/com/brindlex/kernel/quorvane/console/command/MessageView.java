package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.Screen;
import com.brindlex.kernel.quorvane.console.Screen.Style;
import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.message.Fault;
import com.brindlex.kernel.quorvane.console.message.Field;
import com.brindlex.kernel.quorvane.console.message.Group;
import com.brindlex.kernel.quorvane.console.message.Message;
import com.brindlex.kernel.quorvane.console.timeline.Event;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;

/** A message taken apart, as text or as a value for JSON. */
final class MessageView {
    /** Columns of a message that are shown around a fault. */
    private static final int AROUND = 60;

    /** Columns of the place, the value and its meaning. */
    private static final int PLACE = 6;
    private static final int VALUE = 24;

    private MessageView() {}

    static String text(Screen screen, LogMessage source, Event event, Message message,
            List<Fault> faults) {
        StringBuilder out = new StringBuilder();
        String kind = message.kind().name().toLowerCase(Locale.ROOT);
        out.append(screen.styled(Style.TITLE, kind + ": " + message.words())).append('\n');
        out.append(screen.styled(Style.DIM, "  " + origin(source, event, message))).append('\n');
        for (Group group : message.groups()) {
            if (message.groups().size() > 1) {
                out.append("  ").append(screen.styled(Style.STRONG, group.title())).append('\n');
            }
            group.fields().forEach(field -> out.append(line(screen, field)).append('\n'));
        }
        faults.forEach(fault -> fault(screen, message.text(), fault, out));
        return out.append('\n').toString();
    }

    private static String origin(LogMessage source, Event event, Message message) {
        StringBuilder origin = new StringBuilder("line " + source.line());
        if (source.entries().size() > 1) {
            origin.append(" and ").append(source.entries().size() - 1).append(" more");
        }
        if (source.header() != null && !source.header().time().isEmpty()) {
            origin.append(", ").append(source.header().time());
        }
        int many = message.operations().size();
        if (many > 0 && many <= 3) {
            origin.append(", ").append(String.join(" or ", message.operations()));
        }
        if (event != null && event.row().requestLine() > 0) {
            origin.append(", answers line ").append(event.row().requestLine());
        }
        if (event != null && event.row().millis() != null) {
            origin.append(" after ").append(event.row().millis()).append(" ms");
        }
        return origin.toString();
    }

    private static String line(Screen screen, Field field) {
        String value = visible(field.value());
        String name = field.name() == null ? "(unknown)" : field.name();
        String meaning = field.meaning().isEmpty() ? "" : ": " + visible(field.meaning());
        return "  " + screen.styled(Style.LABEL, Screen.pad(field.tag(), PLACE)) + " "
                + Screen.pad(value, VALUE) + " " + screen.styled(Style.DIM, name + meaning);
    }

    private static String visible(String text) {
        return text.replace("\r", "\\r").replace("\n", "\\n");
    }

    private static void fault(Screen screen, String text, Fault fault, StringBuilder out) {
        int at = Math.min(fault.offset(), text.length());
        int from = Math.max(0, at - AROUND / 2);
        int to = Math.min(text.length(), from + AROUND);
        String before = (from > 0 ? "…" : " ") + blank(text.substring(from, at));
        out.append(screen.styled(Style.BAD, "  " + fault.kind() + ": " + fault.text()))
                .append("\n    ").append(before).append(blank(text.substring(at, to)))
                .append(to < text.length() ? "…" : "").append("\n    ")
                .append(" ".repeat(Screen.width(before))).append(screen.styled(Style.BAD, "^"))
                .append('\n');
    }

    private static String blank(String text) {
        return text.replace('\n', ' ').replace('\r', ' ');
    }

    static Map<String, Object> json(LogMessage source, Event event, Message message,
            List<Fault> faults) {
        Map<String, Object> value = new LinkedHashMap<>();
        value.put("line", source.line());
        value.put("time", source.header() == null ? "" : source.header().time());
        value.put("kind", message.kind().name().toLowerCase(Locale.ROOT));
        value.put("operations", message.operations());
        value.put("words", message.words());
        value.put("text", message.text());
        value.put("groups", message.groups());
        value.put("faults", faults);
        value.put("facts", message.facts());
        value.put("requestLine", event == null ? 0 : event.row().requestLine());
        value.put("millis", event == null ? null : event.row().millis());
        return value;
    }
}
