package com.brindlex.kernel.quorvane.typed;

/** Something in a result that is not as it should be, and where. */
public final class Fault {
    private final int offset;
    private final String text;
    private final boolean shape;

    /** A value that is wrong. */
    Fault(int offset, String text) {
        this(offset, text, false);
    }

    /** A value that is wrong, or a whole record or list that has another shape. */
    Fault(int offset, String text, boolean shape) {
        this.offset = offset;
        this.text = text;
        this.shape = shape;
    }

    /** Characters before the place. */
    public int offset() {
        return offset;
    }

    /** What is wrong there. */
    public String text() {
        return text;
    }

    /** Whether a record or list has another shape than its table; else a value is wrong. */
    public boolean isShape() {
        return shape;
    }

    @Override
    public String toString() {
        return "at character " + (offset + 1) + ": " + text;
    }
}
