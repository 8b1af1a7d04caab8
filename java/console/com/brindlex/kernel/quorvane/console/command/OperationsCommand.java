package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.Column;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Shape;
import com.brindlex.kernel.quorvane.console.Screen.Style;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Reply;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.LinkedHashMap;
import java.util.LinkedHashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;
import java.util.concurrent.Callable;
import java.util.stream.Collectors;
import picocli.CommandLine.Command;
import picocli.CommandLine.Parameters;
import picocli.CommandLine.ParentCommand;

/** Lists the operations, or one of them with its arguments and results. */
@Command(name = "operations", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Lists the operations, or one with its arguments, forms and columns.")
final class OperationsCommand implements Callable<Integer> {
    @ParentCommand
    private Quorvane parent;

    @Parameters(arity = "0..1", paramLabel = "OPERATION", converter = Quorvane.OperationName.class,
            description = "The operation to show in full.")
    private Operation operation;

    @Override
    public Integer call() {
        Terminal terminal = parent.terminal();
        if (terminal.isJson()) {
            terminal.json(operation == null
                            ? Arrays.stream(Operation.values()).map(OperationsCommand::describe)
                                      .collect(Collectors.toList())
                            : describe(operation));
        } else if (operation == null) {
            list(terminal);
        } else {
            show(terminal, operation);
        }
        return 0;
    }

    private static void list(Terminal terminal) {
        for (boolean encoders : new boolean[] {true, false}) {
            terminal.screen().title(encoders ? "Requests" : "Replies");
            List<List<String>> rows = new ArrayList<>();
            for (Operation each : Operation.values()) {
                if (each.isEncoder() == encoders) {
                    rows.add(List.of(each.method(), each.title(), encoders ? names(each)
                                                                             : tables(each)));
                }
            }
            terminal.screen().texts(List.of("operation", "what for",
                    encoders ? "arguments of its own" : "result"), rows);
        }
    }

    private static String names(Operation each) {
        if (each.arguments().size() > 9) {
            return each.arguments().size() + " arguments: see operations " + each;
        }
        return each.arguments().stream().map(Argument::name).collect(Collectors.joining(" "));
    }

    private static String tables(Operation each) {
        String tables = each.layout().shapes().stream().map(Shape::name)
                                .collect(Collectors.joining(", "));
        return each.layout().kind().name().toLowerCase()
                + (tables.isEmpty() ? "" : " of " + tables);
    }

    private static void show(Terminal terminal, Operation one) {
        terminal.screen().title(one.method() + ": " + one.title());
        List<List<String>> arguments = new ArrayList<>();
        for (Argument argument : Options.all(one)) {
            arguments.add(List.of(argument.name(), argument.type().javaType().getSimpleName(),
                    argument.usual() == null ? "required" : "'" + argument.usual() + "'",
                    argument.purpose()));
        }
        terminal.screen().texts(List.of("argument", "type", "usual value", "meaning"), arguments);
        for (String form : forms(one)) {
            terminal.line("  " + terminal.screen().styled(Style.DIM, form.replace("\n", "\\n")));
        }
        if (one.isEncoder()) {
            terminal.line("  read by " + one.decoders());
            return;
        }
        terminal.line("  reply tags " + String.join(" ", replyTags(one)));
        terminal.line("  result: " + tables(one));
        int section = 0;
        for (Shape<?> table : one.layout().shapes()) {
            terminal.line("");
            terminal.line("  " + terminal.screen().styled(Style.STRONG,
                    (one.layout().mark(section++) + " " + table.name()).trim()));
            List<List<String>> rows = new ArrayList<>();
            for (int position = 0; position < table.fields(); position++) {
                for (Column<?, ?> column : table.at(position)) {
                    rows.add(List.of(table.separatorBefore(column) + position, column.name(),
                            column.form().name(), column.tags(), column.meaning()));
                }
            }
            terminal.screen().texts(List.of("position", "column", "form", "tags", "meaning"), rows);
        }
    }

    /** The forms of a request: the name of its header, and what stands behind it. */
    private static List<String> forms(Operation one) {
        var known = Dictionary.get().operation(one.method());
        return known.forms().stream().map(form -> "<" + known.header() + "> " + form.body())
                .collect(Collectors.toList());
    }

    /** The tags that a decoder reads. */
    private static Set<String> replyTags(Operation one) {
        Reply reply = Dictionary.get().reply(one.method());
        Set<String> tags = new LinkedHashSet<>();
        reply.replyTags().forEach(bound -> tags.add(bound.tag()));
        if (reply.record() != null) {
            reply.record().tags().forEach(bound -> tags.add(bound.tag()));
        }
        return tags;
    }

    private static Map<String, Object> describe(Operation one) {
        Map<String, Object> map = new LinkedHashMap<>();
        map.put("operation", one.method());
        map.put("kind", one.isEncoder() ? "encoder" : "decoder");
        map.put("summary", one.title());
        List<Object> arguments = new ArrayList<>();
        for (Argument argument : Options.all(one)) {
            Map<String, Object> entry = new LinkedHashMap<>();
            entry.put("name", argument.name());
            entry.put("type", argument.type().javaType().getSimpleName());
            entry.put("required", argument.usual() == null);
            entry.put("usual", argument.usual());
            entry.put("meaning", argument.purpose());
            arguments.add(entry);
        }
        map.put("arguments", arguments);
        if (one.isEncoder()) {
            map.put("forms", forms(one));
            map.put("decoders", one.decoders());
            return map;
        }
        map.put("replyTags", replyTags(one));
        map.put("layout", one.layout().kind().name().toLowerCase());
        List<Object> tables = new ArrayList<>();
        for (Shape<?> table : one.layout().shapes()) {
            tables.add(describe(table, one.layout().mark(tables.size())));
        }
        map.put("tables", tables);
        return map;
    }

    private static Map<String, Object> describe(Shape<?> table, String mark) {
        List<Object> columns = new ArrayList<>();
        for (int position = 0; position < table.fields(); position++) {
            for (Column<?, ?> column : table.at(position)) {
                Map<String, Object> entry = new LinkedHashMap<>();
                entry.put("position", position);
                entry.put("separator", table.separatorBefore(column));
                entry.put("column", column.name());
                entry.put("form", column.form().name());
                entry.put("tags", column.tags());
                entry.put("meaning", column.meaning());
                columns.add(entry);
            }
        }
        Map<String, Object> map = new LinkedHashMap<>();
        map.put("name", table.name());
        map.put("mark", mark);
        map.put("positions", table.fields());
        map.put("columns", columns);
        return map;
    }
}
