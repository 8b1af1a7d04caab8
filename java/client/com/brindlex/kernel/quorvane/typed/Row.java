package com.brindlex.kernel.quorvane.typed;

import java.util.ArrayList;
import java.util.Collections;
import java.util.List;

/** One record of a result. */
public final class Row {
    private final Table table;
    private final List<Cell<?>> cells;

    Row(Table table, List<Cell<?>> cells) {
        this.table = table;
        this.cells = cells;
    }

    /** The columns of this row. */
    public Table table() {
        return table;
    }

    /** All values in the order of the columns. */
    public List<Cell<?>> cells() {
        return Collections.unmodifiableList(cells);
    }

    /**
     * The value of a column; null when the field is empty or cannot be read.
     *
     * @throws IllegalArgumentException when the table has no such column
     */
    @SuppressWarnings("unchecked")
    public <T> T get(Column<T> column) {
        return (T) cells.get(table.indexOf(column)).value();
    }

    /**
     * The text of a column as it stands in the result; empty when the record has none.
     *
     * @throws IllegalArgumentException when the table has no such column
     */
    public String text(Column<?> column) {
        return cells.get(table.indexOf(column)).text();
    }

    /** Whether nothing stands in any column. */
    boolean isBlank() {
        for (Cell<?> cell : cells) {
            if (!cell.text().isEmpty()) {
                return false;
            }
        }
        return true;
    }

    @Override
    public String toString() {
        StringBuilder line = new StringBuilder();
        for (Cell<?> cell : cells) {
            if (!cell.text().isEmpty()) {
                line.append(line.length() == 0 ? "" : ", ")
                        .append(cell.column())
                        .append('=')
                        .append(cell.label());
            }
        }
        return line.toString();
    }

    /** Reads one record. */
    static Row read(Table table, String record, int offset, List<Fault> faults) {
        List<String> fields = split(record, '@', Integer.MAX_VALUE);
        table.fillGaps(fields);
        if (fields.size() != table.positions()) {
            faults.add(new Fault(offset, "a record of " + fields.size() + " fields; "
                    + table.name() + " has " + table.positions(), true));
        }
        List<Cell<?>> cells = new ArrayList<Cell<?>>();
        int at = offset;
        for (int position = 0; position < table.positions(); position++) {
            String field = position < fields.size() ? fields.get(position) : null;
            readField(table.slot(position), field, at, cells, faults);
            at += field == null ? 0 : field.length() + 1;
        }
        return new Row(table, cells);
    }

    private static void readField(
            Table.Slot slot, String field, int offset, List<Cell<?>> cells, List<Fault> faults) {
        int at = offset;
        List<String> parts = field == null ? Collections.<String>emptyList()
                                           : split(field, '&', slot.parts.length);
        for (int i = 0; i < slot.parts.length; i++) {
            String part = i < parts.size() ? parts.get(i) : null;
            readPart(slot.parts[i], part, at, cells, faults);
            at += part == null ? 0 : part.length() + 1;
        }
    }

    private static void readPart(
            Column<?>[] columns, String part, int offset, List<Cell<?>> cells, List<Fault> faults) {
        int at = offset;
        List<String> texts =
                part == null ? Collections.<String>emptyList() : split(part, '|', columns.length);
        for (int i = 0; i < columns.length; i++) {
            String text = i < texts.size() ? texts.get(i) : null;
            addCell(columns[i], text, at, cells, faults);
            at += text == null ? 0 : text.length() + 1;
        }
    }

    private static <T> void addCell(
            Column<T> column, String text, int offset, List<Cell<?>> cells, List<Fault> faults) {
        if (column == Column.UNUSED) {
            if (text != null && !text.isEmpty()) {
                faults.add(new Fault(offset, "a text where the field is always empty"));
            }
            return;
        }
        String there = text == null ? "" : text;
        if (!column.form().accepts(there)) {
            faults.add(new Fault(offset, column.key() + " is no " + column.form().name()));
        }
        cells.add(new Cell<T>(column, there, text == null ? -1 : offset));
    }

    /** Cuts a text at a sign into at most so many pieces; the last keeps what is left. */
    static List<String> split(String text, char sign, int limit) {
        List<String> pieces = new ArrayList<String>();
        int from = 0;
        int at = text.indexOf(sign);
        while (at >= 0 && pieces.size() < limit - 1) {
            pieces.add(text.substring(from, at));
            from = at + 1;
            at = text.indexOf(sign, from);
        }
        pieces.add(text.substring(from));
        return pieces;
    }
}
