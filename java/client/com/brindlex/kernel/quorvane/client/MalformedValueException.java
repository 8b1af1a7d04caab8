package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/** A value of a result that is not what its column holds. */
public final class MalformedValueException extends RuntimeException {
    private static final long serialVersionUID = 1;

    private final transient Column<?, ?> column;
    private final String text;

    MalformedValueException(Column<?, ?> column, String text, String reason) {
        super(column + ": '" + text + "' " + reason);
        this.column = column;
        this.text = text;
    }

    /** The column. */
    @NotNull
    public Column<?, ?> column() {
        return column;
    }

    /** What stands there. */
    @NotNull
    public String text() {
        return text;
    }
}
