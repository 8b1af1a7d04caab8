package com.brindlex.kernel.quorvane.typed;

/** A value that stands as a code in a result. */
public interface Named {
    /** The code as it stands in the text. */
    String code();

    /** What it is called. */
    String label();
}
