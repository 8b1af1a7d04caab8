package com.brindlex.kernel.quorvane.typed;

/** Something in a result that is not as it should be, and where. */
public final class Fault {
    private final int offset;
    private final String text;

    Fault(int offset, String text) {
        this.offset = offset;
        this.text = text;
    }

    /** Characters before the place. */
    public int offset() {
        return offset;
    }

    /** What is wrong there. */
    public String text() {
        return text;
    }

    @Override
    public String toString() {
        return "at character " + (offset + 1) + ": " + text;
    }
}
