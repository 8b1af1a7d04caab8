package com.brindlex.kernel.quorvane.typed;

import java.util.ArrayList;
import java.util.Collections;
import java.util.List;

/**
 * The columns of one kind of record, by position. A position holds one column, several joined by
 * {@code &}, or pairs joined by {@code |} within those.
 */
public final class Table {
    /** One position: what its {@code &} separates, and within that what its bars separate. */
    static final class Slot {
        final Column<?>[][] parts;

        Slot(Column<?>[]... parts) {
            this.parts = parts;
        }
    }

    /** What a table does about the fields that a record leaves out. */
    interface Gaps {
        /** Puts null where a field is missing. */
        void fill(List<String> fields);
    }

    private final String name;
    private final List<Slot> slots;
    private final List<Column<?>> columns = new ArrayList<Column<?>>();
    private final Gaps gaps;

    Table(String name, Gaps gaps, List<Slot> slots) {
        this.name = name;
        this.gaps = gaps;
        this.slots = slots;
        for (Slot slot : slots) {
            for (Column<?>[] part : slot.parts) {
                Collections.addAll(columns, part);
            }
        }
        columns.removeAll(Collections.singleton(Column.UNUSED));
    }

    /** What a row of it is. */
    public String name() {
        return name;
    }

    /** All columns that have a name, in order. */
    public List<Column<?>> columns() {
        return Collections.unmodifiableList(columns);
    }

    /** How many fields a record has. */
    public int positions() {
        return slots.size();
    }

    /**
     * The columns at a position of the record, in the order that they stand there; none where the
     * field is always empty.
     */
    public List<Column<?>> at(int position) {
        List<Column<?>> here = new ArrayList<Column<?>>();
        for (Column<?>[] part : slots.get(position).parts) {
            Collections.addAll(here, part);
        }
        here.removeAll(Collections.singleton(Column.UNUSED));
        return here;
    }

    /** The sign before a column of a position: {@code &} or {@code |}, or the empty text. */
    public String separatorBefore(Column<?> column) {
        for (Slot slot : slots) {
            for (int part = 0; part < slot.parts.length; part++) {
                for (int i = 0; i < slot.parts[part].length; i++) {
                    if (slot.parts[part][i] == column) {
                        return i > 0 ? "|" : part > 0 ? "&" : "";
                    }
                }
            }
        }
        return "";
    }

    Slot slot(int position) {
        return slots.get(position);
    }

    int indexOf(Column<?> column) {
        int index = columns.indexOf(column);
        if (index < 0) {
            throw new IllegalArgumentException("no column " + column + " in " + name);
        }
        return index;
    }

    void fillGaps(List<String> fields) {
        if (gaps != null) {
            gaps.fill(fields);
        }
    }

    /** Collects the positions of a table. */
    static final class Builder {
        private final List<Slot> slots = new ArrayList<Slot>();
        private final String name;
        private Gaps gaps;

        Builder(String name) {
            this.name = name;
        }

        /** A position with one column, or several joined by bars. */
        Builder add(Column<?>... columns) {
            slots.add(new Slot(columns));
            return this;
        }

        /** A position whose parts are joined by {@code &}. */
        Builder join(Column<?>[]... parts) {
            slots.add(new Slot(parts));
            return this;
        }

        /** Positions that are always empty. */
        Builder skip(int count) {
            for (int i = 0; i < count; i++) {
                add(Column.UNUSED);
            }
            return this;
        }

        Builder gaps(Gaps some) {
            gaps = some;
            return this;
        }

        Table build() {
            return new Table(name, gaps, slots);
        }
    }

    static Builder of(String name) {
        return new Builder(name);
    }

    /** Columns that stand together between two {@code &}. */
    static Column<?>[] part(Column<?>... columns) {
        return columns;
    }

    @Override
    public String toString() {
        return name;
    }
}
