package com.brindlex.kernel.quorvane.typed;

import java.util.Collections;
import java.util.List;

/** A list of rows of one table within a result. */
public final class Section {
    private final Table table;
    private final List<Row> rows;

    Section(Table table, List<Row> rows) {
        this.table = table;
        this.rows = rows;
    }

    /** The columns of its rows. */
    public Table table() {
        return table;
    }

    /** Its rows, in the order of the result. */
    public List<Row> rows() {
        return Collections.unmodifiableList(rows);
    }
}
