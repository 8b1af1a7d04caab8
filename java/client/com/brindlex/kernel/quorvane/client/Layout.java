package com.brindlex.kernel.quorvane.client;

import java.util.Arrays;
import java.util.Collections;
import java.util.List;
import org.jetbrains.annotations.NotNull;

/** How the result of a decoder is put together. Never changes. */
public final class Layout {
    /** The forms of a result. */
    public enum Kind {
        /** Nothing: the status says all. */
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

    private final Kind kind;
    private final int firstSection;
    private final List<Shape<?>> shapes;

    /** A layout; a second shape of a list is that of a last record that stands apart. */
    Layout(Kind kind, int firstSection, Shape<?>... shapes) {
        this.kind = kind;
        this.firstSection = firstSection;
        this.shapes = Collections.unmodifiableList(Arrays.asList(shapes));
    }

    /** The form. */
    @NotNull
    public Kind kind() {
        return kind;
    }

    /** The records, one shape for each section. */
    @NotNull
    public List<Shape<?>> shapes() {
        return shapes;
    }

    /** The mark that opens a section; empty where sections have none. */
    @NotNull
    public String mark(int section) {
        return kind == Kind.SECTIONS ? "<" + (firstSection + section) + ">" : "";
    }
}
