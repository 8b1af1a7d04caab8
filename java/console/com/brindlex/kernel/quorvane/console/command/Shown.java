package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.Screen;
import com.brindlex.kernel.quorvane.console.Screen.Style;
import com.brindlex.kernel.quorvane.typed.Cell;
import com.brindlex.kernel.quorvane.typed.Code;
import com.brindlex.kernel.quorvane.typed.Price;
import com.brindlex.kernel.quorvane.typed.Result;
import com.brindlex.kernel.quorvane.typed.Row;
import com.brindlex.kernel.quorvane.typed.Section;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** How results are shown: as tables, or as JSON values. */
final class Shown {
    /** Columns that one row may have in a table, and that several may. */
    private static final int NARROW = 8;
    private static final int WIDE = 12;

    private Shown() {}

    /** A result as tables, one for each section that has rows. */
    static void result(Terminal terminal, Result result) {
        Screen screen = terminal.screen();
        if (result.message() != null) {
            screen.labelled("message", result.isSuccess() ? Style.PLAIN : Style.BAD,
                    result.text());
        }
        for (Section section : result.sections()) {
            if (section.rows().isEmpty()) {
                screen.labelled(section.table().name(), Style.DIM, "none");
                continue;
            }
            List<String> columns = new ArrayList<>();
            section.table().columns().forEach(column -> columns.add(column.key()));
            List<List<String>> rows = new ArrayList<>();
            for (Row row : section.rows()) {
                List<String> cells = new ArrayList<>();
                row.cells().forEach(cell -> cells.add(cell.label()));
                rows.add(cells);
            }
            if (columns.size() > (rows.size() == 1 ? NARROW : WIDE)) {
                records(screen, section.table().name(), columns, rows);
            } else {
                screen.labelled(section.table().name(), Style.DIM, rows.size() + "");
                screen.table(columns, rows);
            }
        }
        if (result.sections().isEmpty() && result.message() == null) {
            String text = result.text();
            screen.labelled("text", Style.PLAIN, text.isEmpty() ? "(none)" : text);
        }
        result.faults().forEach(fault -> terminal.error(fault.toString()));
    }

    private static void records(
            Screen screen, String name, List<String> columns, List<List<String>> rows) {
        for (int i = 0; i < rows.size(); i++) {
            List<List<String>> items = new ArrayList<>();
            for (int column = 0; column < columns.size(); column++) {
                String value = rows.get(i).get(column);
                if (!value.isBlank()) {
                    items.add(List.of(columns.get(column), value));
                }
            }
            screen.labelled(name, Style.DIM, "record " + (i + 1));
            screen.texts(List.of("column", "value"), items);
        }
    }

    /** A result as JSON. */
    static Map<String, Object> json(Result result) {
        Map<String, Object> map = new LinkedHashMap<>();
        map.put("operation", result.operation().method());
        map.put("status", result.status());
        map.put("text", result.text());
        if (result.message() != null) {
            Map<String, Object> message = new LinkedHashMap<>();
            message.put("source", result.message().source());
            message.put("text", result.message().text());
            message.put("code", result.message().code());
            map.put("message", message);
        }
        List<Object> sections = new ArrayList<>();
        for (Section section : result.sections()) {
            List<Object> rows = new ArrayList<>();
            for (Row row : section.rows()) {
                Map<String, Object> cells = new LinkedHashMap<>();
                row.cells().forEach(cell -> cells.put(cell.column().key(), value(cell)));
                rows.add(cells);
            }
            Map<String, Object> entry = new LinkedHashMap<>();
            entry.put("table", section.table().name());
            entry.put("rows", rows);
            sections.add(entry);
        }
        map.put("sections", sections);
        List<Object> faults = new ArrayList<>();
        result.faults().forEach(fault -> faults.add(fault(fault.offset(), fault.text())));
        map.put("faults", faults);
        return map;
    }

    private static Object value(Cell<?> cell) {
        Object value = cell.value();
        if (value instanceof Number) {
            return value;
        }
        if (value instanceof Code<?> code) {
            Map<String, Object> map = new LinkedHashMap<>();
            map.put("code", code.text());
            map.put("name", code.isKnown() ? code.label() : null);
            return map;
        }
        if (value instanceof Price price && price.amount() != null) {
            return price.amount();
        }
        return value == null ? cell.text().isEmpty() ? null : cell.text() : value.toString();
    }

    private static Map<String, Object> fault(int offset, String text) {
        Map<String, Object> map = new LinkedHashMap<>();
        map.put("character", offset + 1);
        map.put("text", text);
        return map;
    }
}
