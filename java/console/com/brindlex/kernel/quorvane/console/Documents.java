package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.typed.Argument;
import com.brindlex.kernel.quorvane.typed.Column;
import com.brindlex.kernel.quorvane.typed.Layout;
import com.brindlex.kernel.quorvane.typed.Named;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Table;
import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;
import java.util.function.Supplier;
import java.util.stream.Collectors;

/**
 * The tables of docs/operations.md and docs/results.md. A document opens with text that people
 * write, down to a mark; what stands below the mark is made here from the table of operations.
 */
public final class Documents {
    private static final String MARK = "<!-- scripts/quorvane documents writes what follows -->\n";

    private static final Map<String, Supplier<String>> TABLES =
            Map.of("operations.md", Documents::operations, "results.md", Documents::results);

    private Documents() {}

    /** The names of the documents. */
    public static List<String> names() {
        return TABLES.keySet().stream().sorted().collect(Collectors.toList());
    }

    /** A document as it is to be: its own opening, the tables of today. */
    public static String renewed(Path document) throws IOException {
        String text = Files.readString(document);
        int end = text.indexOf(MARK);
        if (end < 0) {
            throw new IOException(document + " has no line " + MARK.trim());
        }
        return text.substring(0, end) + MARK
                + TABLES.get(document.getFileName().toString()).get();
    }

    private static String operations() {
        StringBuilder out = new StringBuilder();
        for (boolean encoders : new boolean[] {true, false}) {
            out.append(encoders ? "\n## Requests\n" : "\n## Replies\n");
            row(out.append('\n'), "Method", "What for", encoders ? "Answer read by" : "Result");
            row(out, "---", "---", "---");
            for (Operation each : Operation.values()) {
                if (each.isEncoder() == encoders) {
                    row(out, link(each, ""), each.summary(), counterpart(each));
                }
            }
            for (Operation each : Operation.values()) {
                if (each.isEncoder() == encoders) {
                    operation(out, each);
                }
            }
        }
        return out.toString();
    }

    private static String counterpart(Operation one) {
        return one.isEncoder()
                ? one.decoders().stream().map(reader -> link(reader, "")).collect(
                          Collectors.joining(", "))
                : link(one, "results.md", shape(one.layout()));
    }

    private static void operation(StringBuilder out, Operation one) {
        out.append("\n### ").append(one.method()).append("\n\n").append(sentence(one.summary()));
        out.append(one.isEncoder() ? " Answer read by " : " Result: ").append(counterpart(one));
        out.append(".\n\n");
        row(out, "Argument", "Type", "Usual value", "Meaning and unit");
        row(out, "---", "---", "---", "---");
        if (one.isEncoder()) {
            row(out, "*five leading*", "", "", "[session](#the-five-leading-arguments)");
        }
        for (Argument argument : one.isEncoder() ? one.arguments() : one.allArguments()) {
            row(out, code(argument.name()), argument.type().javaType().getSimpleName(),
                    usual(argument), argument.meaning());
        }
        if (one.hasStatus()) {
            row(out, code("status"), "int[1]", "", "1 done, -1 failed");
        }
        out.append('\n');
        List<String> refusals = Refusals.of(one);
        if (!refusals.isEmpty()) {
            row(out, "Own error", "Meaning");
            row(out, "---", "---");
        }
        for (String message : refusals) {
            row(out, message, Messages.english(bare(message)));
        }
        if (!one.isEncoder()) {
            out.append(refusals.isEmpty() ? "" : "\n");
            out.append("A refusal by the other side is handed on with its own text.\n");
        }
    }

    /** A message without the mark of who says it. */
    private static String bare(String message) {
        return message.substring(message.indexOf(']') + 1).trim();
    }

    private static String usual(Argument argument) {
        return argument.isRequired() ? "required"
                : argument.initial().isEmpty() ? "empty" : code(argument.initial());
    }

    private static String results() {
        StringBuilder out = new StringBuilder();
        Map<String, Named[]> codes = new LinkedHashMap<>();
        for (Operation each : Operation.values()) {
            if (!each.isEncoder()) {
                result(out, each, codes);
            }
        }
        out.append("\n## Codes\n");
        codes.forEach((name, values) -> {
            out.append("\n### ").append(name).append("\n\n");
            row(out, "Code", "Meaning", "Named value");
            row(out, "---", "---", "---");
            for (Named value : values) {
                row(out, code(value.code()), value.label(), code(name + "." + value));
            }
        });
        return out.toString();
    }

    private static void result(StringBuilder out, Operation one, Map<String, Named[]> codes) {
        Layout layout = one.layout();
        out.append("\n## ").append(one.method()).append("\n\n");
        out.append(link(one, "operations.md", sentence(one.summary())));
        out.append(' ').append(sentence(shape(layout))).append('\n');
        for (int i = 0; i < layout.tables().size(); i++) {
            Table table = layout.tables().get(i);
            String mark = layout.mark(i);
            out.append("\n").append(mark.isEmpty() ? "" : code(mark) + " ");
            out.append("**").append(table.name()).append("**, ").append(table.positions());
            out.append(table.positions() == 1 ? " position\n\n" : " positions\n\n");
            table(out, table, codes);
        }
    }

    private static void table(StringBuilder out, Table table, Map<String, Named[]> codes) {
        row(out, "Position", "Column", "Form", "Tags", "Meaning");
        row(out, "---", "---", "---", "---", "---");
        for (int position = 0; position < table.positions(); position++) {
            List<Column<?>> columns = table.at(position);
            if (columns.isEmpty()) {
                row(out, "" + position, "", "", "", "always empty");
            }
            for (Column<?> column : columns) {
                String sign = table.separatorBefore(column);
                row(out, sign.isEmpty() ? "" + position : position + ", behind " + code(sign),
                        code(column.key()), form(column, codes), column.tags(), column.meaning());
            }
        }
    }

    private static String form(Column<?> column, Map<String, Named[]> codes) {
        Named[] values = column.form().codes();
        if (values.length == 0) {
            return column.form().name();
        }
        String name = values[0].getClass().getSimpleName();
        codes.put(name, values);
        return "[" + name + "](#" + name.toLowerCase(Locale.ROOT) + ")";
    }

    private static String shape(Layout layout) {
        switch (layout.kind()) {
            case EMPTY:
                return "empty, the status says it all";
            case TEXT:
                return "one text as the gateway sent it";
            case RECORD:
                return "one record";
            case LIST:
                return "a list";
            default:
                return "lists behind numbered marks";
        }
    }

    private static String link(Operation one, String document) {
        return link(one, document, one.method());
    }

    private static String link(Operation one, String document, String text) {
        return "[" + text + "](" + document + "#" + one.method().toLowerCase(Locale.ROOT) + ")";
    }

    private static String sentence(String text) {
        return Character.toUpperCase(text.charAt(0)) + text.substring(1) + ".";
    }

    private static String code(String text) {
        return "`" + text + "`";
    }

    private static void row(StringBuilder out, String... cells) {
        List<String> escaped = new ArrayList<>();
        for (String cell : cells) {
            escaped.add(cell.replace("|", "\\|").replace("<M>", "`<M>`"));
        }
        out.append("| ").append(String.join(" | ", escaped)).append(" |\n");
    }
}
