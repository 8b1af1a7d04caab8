package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.console.Explanation.Group;
import com.brindlex.kernel.quorvane.console.Explanation.Item;
import com.brindlex.kernel.quorvane.console.Explanation.Kind;
import com.brindlex.kernel.quorvane.console.Explanation.Trouble;
import com.brindlex.kernel.quorvane.typed.Cell;
import com.brindlex.kernel.quorvane.typed.Code;
import com.brindlex.kernel.quorvane.typed.Column;
import com.brindlex.kernel.quorvane.typed.Layout;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Result;
import com.brindlex.kernel.quorvane.typed.Row;
import com.brindlex.kernel.quorvane.typed.Section;
import com.brindlex.kernel.quorvane.typed.Table;
import java.util.ArrayList;
import java.util.List;

/** Explains results. */
final class ResultReading {
    /** A fault weighs more than any number of codes that have no name; a wrong shape most. */
    private static final int FAULT = 1000;
    private static final int SHAPE = 10 * FAULT;

    private ResultReading() {}

    static Explanation explain(String text, Operation hint) {
        boolean known = hint != null && !hint.isEncoder();
        List<Operation> operations = known ? List.of(hint) : writers(text);
        Result result = Result.of(operations.get(0), 1, text);
        List<Trouble> faults = new ArrayList<>();
        result.faults().forEach(fault -> faults.add(new Trouble(fault.offset(), fault.text())));
        return new Explanation(Kind.RESULT, operations, "result: " + summary(result, operations),
                text, groups(result), faults);
    }

    private static String summary(Result result, List<Operation> operations) {
        boolean empty = result.sections().stream().allMatch(part -> part.rows().isEmpty());
        return operations.size() == 1 ? operations.get(0).summary()
                : empty ? "an empty list" : operations.get(0).summary();
    }

    /** The decoders whose layout the text fits best. */
    private static List<Operation> writers(String text) {
        List<Operation> best = new ArrayList<>();
        int least = Integer.MAX_VALUE;
        for (Operation operation : Operation.values()) {
            Layout.Kind kind = operation.layout().kind();
            if (operation.isEncoder() || kind == Layout.Kind.EMPTY || kind == Layout.Kind.TEXT) {
                continue;
            }
            int oddity = oddity(Result.of(operation, 1, text));
            if (oddity < least) {
                best.clear();
                least = oddity;
            }
            if (oddity == least) {
                best.add(operation);
            }
        }
        return best;
    }

    private static int oddity(Result result) {
        int oddity = result.faults().stream()
                             .mapToInt(fault -> fault.isShape() ? SHAPE : FAULT).sum();
        for (Section section : result.sections()) {
            for (Row row : section.rows()) {
                for (Cell<?> cell : row.cells()) {
                    boolean nameless = !cell.text().isEmpty() && cell.value() instanceof Code
                            && !((Code<?>) cell.value()).isKnown();
                    oddity += nameless ? 1 : 0;
                }
            }
        }
        return oddity;
    }

    /** Every row, field by field. */
    static List<Group> groups(Result result) {
        List<Group> groups = new ArrayList<>();
        for (Section section : result.sections()) {
            int number = 0;
            for (Row row : section.rows()) {
                groups.add(new Group(section.table().name() + " " + ++number, items(row)));
            }
        }
        return groups;
    }

    private static List<Item> items(Row row) {
        List<Item> items = new ArrayList<>();
        Table table = row.table();
        int index = 0;
        for (int position = 0; position < table.positions(); position++) {
            int part = 0;
            for (Column<?> column : table.at(position)) {
                Cell<?> cell = row.cells().get(index++);
                String place = position + (++part == 1 ? "" : table.separatorBefore(column) + part);
                if (cell.offset() >= 0) {
                    items.add(new Item(cell.offset(), place, cell.text(), column.meaning(),
                            cell.label().equals(cell.text()) ? "" : cell.label()));
                }
            }
        }
        return items;
    }
}
