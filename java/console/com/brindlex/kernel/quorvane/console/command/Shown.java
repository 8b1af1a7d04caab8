package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.client.RawReply;
import com.brindlex.kernel.quorvane.client.Reply;
import com.brindlex.kernel.quorvane.client.ResultText.Section;
import com.brindlex.kernel.quorvane.client.ResultText;
import com.brindlex.kernel.quorvane.client.Row;
import com.brindlex.kernel.quorvane.console.Screen.Style;
import com.brindlex.kernel.quorvane.console.Screen;
import java.util.ArrayList;
import java.util.List;

/** How results are shown as tables. */
final class Shown {
    /** Columns that one row may have in a table, and that several may. */
    private static final int NARROW = 8;
    private static final int WIDE = 12;

    private Shown() {}

    /** What came of a reply: a message, or tables, one for each section that has rows. */
    static void reply(Terminal terminal, RawReply read) {
        Screen screen = terminal.screen();
        Reply<?> reply = read.reply();
        if (!reply.isResult()) {
            screen.labelled("message", reply.isFailure() ? Style.BAD : Style.PLAIN,
                    reply.toString());
            return;
        }
        ResultText result = read.result();
        for (Section section : result.sections()) {
            section(screen, section);
        }
        if (result.sections().isEmpty()) {
            screen.labelled("text", Style.PLAIN, read.text().isEmpty() ? "(none)" : read.text());
        }
        result.faults().forEach(fault -> terminal.error(fault.toString()));
    }

    private static void section(Screen screen, Section section) {
        String name = section.shape().name();
        if (section.rows().isEmpty()) {
            screen.labelled(name, Style.DIM, "none");
            return;
        }
        List<String> columns = new ArrayList<>();
        section.shape().columns().forEach(column -> columns.add(column.name()));
        List<List<String>> rows = new ArrayList<>();
        for (Row<?> row : section.rows()) {
            List<String> cells = new ArrayList<>();
            for (int place = 0; place < columns.size(); place++) {
                cells.add(row.label(place));
            }
            rows.add(cells);
        }
        if (columns.size() > (rows.size() == 1 ? NARROW : WIDE)) {
            records(screen, name, columns, rows);
        } else {
            screen.labelled(name, Style.DIM, rows.size() + "");
            screen.table(columns, rows);
        }
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
}
