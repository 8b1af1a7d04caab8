package com.brindlex.kernel.quorvane.typed;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;

/** How the result of a decoder is put together. */
public final class Layout {
    /** The forms of a result. */
    public enum Kind {
        /** Nothing but the status counts: the text is empty. */
        EMPTY,
        /** One text, as the gateway sent it. */
        TEXT,
        /** One record, {@code a@b!}. */
        RECORD,
        /** A count and that many records, {@code 2!a@b!c@d!}. */
        LIST,
        /** Numbered lists, {@code <0>!2!a@b!c@d!<1>!0!}. */
        SECTIONS
    }

    static final Layout EMPTY = new Layout(Kind.EMPTY, 0);
    static final Layout TEXT = new Layout(Kind.TEXT, 0);

    private final Kind kind;
    private final int firstSection;
    private final List<Table> tables;

    private Layout(Kind kind, int firstSection, Table... tables) {
        this.kind = kind;
        this.firstSection = firstSection;
        this.tables = Collections.unmodifiableList(new ArrayList<Table>(Arrays.asList(tables)));
    }

    static Layout record(Table table) {
        return new Layout(Kind.RECORD, 0, table);
    }

    /** A list; a second table is that of a last record that stands apart, {@code <M>@text!}. */
    static Layout list(Table... tables) {
        return new Layout(Kind.LIST, 0, tables);
    }

    /** Lists whose marks count up from a number. */
    static Layout sections(int first, Table... tables) {
        return new Layout(Kind.SECTIONS, first, tables);
    }

    /** The form. */
    public Kind kind() {
        return kind;
    }

    /** The tables, one for each section. */
    public List<Table> tables() {
        return tables;
    }

    /** The mark that opens a section; empty where sections have none. */
    public String mark(int section) {
        return kind == Kind.SECTIONS ? "<" + (firstSection + section) + ">" : "";
    }
}
