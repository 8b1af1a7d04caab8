package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.Screen.Style;
import com.brindlex.kernel.quorvane.typed.Argument;
import com.brindlex.kernel.quorvane.typed.Column;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Table;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;
import java.util.concurrent.Callable;
import java.util.stream.Collectors;
import picocli.CommandLine.Command;
import picocli.CommandLine.Parameters;
import picocli.CommandLine.ParentCommand;

/** Lists the operations, or one of them with its arguments and results. */
@Command(name = "operations", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Lists the 59 operations, or one with its arguments, forms and columns.")
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
                    rows.add(List.of(each.method(), each.summary(), encoders ? names(each)
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
        String tables = each.layout().tables().stream().map(Table::name)
                                .collect(Collectors.joining(", "));
        return each.layout().kind().name().toLowerCase()
                + (tables.isEmpty() ? "" : " of " + tables);
    }

    private static void show(Terminal terminal, Operation one) {
        terminal.screen().title(one.method() + ": " + one.summary());
        List<List<String>> arguments = new ArrayList<>();
        for (Argument argument : one.allArguments()) {
            arguments.add(List.of(argument.name(), argument.type().javaType().getSimpleName(),
                    argument.isRequired() ? "required" : "'" + argument.initial() + "'",
                    argument.meaning()));
        }
        terminal.screen().texts(List.of("argument", "type", "usual value", "meaning"), arguments);
        for (String form : one.requestForms()) {
            terminal.line("  " + terminal.screen().styled(Style.DIM, form.replace("\n", "\\n")));
        }
        if (one.isEncoder()) {
            terminal.line("  read by " + one.decoders());
            return;
        }
        terminal.line("  reply tags " + String.join(" ", one.replyTags()));
        terminal.line("  result: " + tables(one));
        int section = 0;
        for (Table table : one.layout().tables()) {
            terminal.line("");
            terminal.line("  " + terminal.screen().styled(Style.STRONG,
                    (one.layout().mark(section++) + " " + table.name()).trim()));
            List<List<String>> rows = new ArrayList<>();
            for (int position = 0; position < table.positions(); position++) {
                for (Column<?> column : table.at(position)) {
                    rows.add(List.of(table.separatorBefore(column) + position, column.key(),
                            column.form().name(), column.tags(), column.meaning()));
                }
            }
            terminal.screen().texts(List.of("position", "column", "form", "tags", "meaning"), rows);
        }
    }

    private static Map<String, Object> describe(Operation one) {
        Map<String, Object> map = new LinkedHashMap<>();
        map.put("operation", one.method());
        map.put("kind", one.isEncoder() ? "encoder" : "decoder");
        map.put("summary", one.summary());
        List<Object> arguments = new ArrayList<>();
        for (Argument argument : one.allArguments()) {
            Map<String, Object> entry = new LinkedHashMap<>();
            entry.put("name", argument.name());
            entry.put("type", argument.type().javaType().getSimpleName());
            entry.put("required", argument.isRequired());
            entry.put("usual", argument.initial());
            entry.put("meaning", argument.meaning());
            arguments.add(entry);
        }
        map.put("arguments", arguments);
        if (one.isEncoder()) {
            map.put("forms", one.requestForms());
            map.put("decoders", one.decoders());
            return map;
        }
        map.put("replyTags", one.replyTags());
        map.put("layout", one.layout().kind().name().toLowerCase());
        List<Object> tables = new ArrayList<>();
        for (Table table : one.layout().tables()) {
            tables.add(describe(table, one.layout().mark(tables.size())));
        }
        map.put("tables", tables);
        return map;
    }

    private static Map<String, Object> describe(Table table, String mark) {
        List<Object> columns = new ArrayList<>();
        for (int position = 0; position < table.positions(); position++) {
            for (Column<?> column : table.at(position)) {
                Map<String, Object> entry = new LinkedHashMap<>();
                entry.put("position", position);
                entry.put("separator", table.separatorBefore(column));
                entry.put("column", column.key());
                entry.put("form", column.form().name());
                entry.put("tags", column.tags());
                entry.put("meaning", column.meaning());
                columns.add(entry);
            }
        }
        Map<String, Object> map = new LinkedHashMap<>();
        map.put("name", table.name());
        map.put("mark", mark);
        map.put("positions", table.positions());
        map.put("columns", columns);
        return map;
    }
}
