package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/** Something in a result that is not as it should be. Never changes. */
public final class Fault {
    private final int offset;
    private final String text;
    private final boolean shape;

    Fault(int offset, String text, boolean shape) {
        this.offset = offset;
        this.text = text;
        this.shape = shape;
    }

    /** Characters of the result before it. */
    public int offset() {
        return offset;
    }

    /** What is wrong, in English. */
    @NotNull
    public String text() {
        return text;
    }

    /** Whether records or fields are out of place; else one value is none of its column. */
    public boolean isShape() {
        return shape;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Fault && ((Fault) other).toString().equals(toString());
    }

    @Override
    public int hashCode() {
        return toString().hashCode();
    }

    @Override
    public String toString() {
        return "at character " + (offset + 1) + ": " + text;
    }
}
