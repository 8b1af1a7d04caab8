package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * A column of a result. Never changes.
 *
 * @param <R> the rows that have it
 * @param <T> what its texts read as
 */
public final class Column<R, T> {
    private final int index;
    private final String name;
    private final Form<T> form;
    private final String tags;
    private final String meaning;

    Column(int index, String name, Form<T> form, String tags, String meaning) {
        this.index = index;
        this.name = name;
        this.form = form;
        this.tags = tags;
        this.meaning = meaning;
    }

    int index() {
        return index;
    }

    /** Its name, which is that of the method of a row. */
    @NotNull
    public String name() {
        return name;
    }

    /** How its texts read. */
    @NotNull
    public Form<T> form() {
        return form;
    }

    /** The tags of the reply that it is made of, with blanks between. */
    @NotNull
    public String tags() {
        return tags;
    }

    /** What it means. */
    @NotNull
    public String meaning() {
        return meaning;
    }

    @Override
    public String toString() {
        return name;
    }
}
