package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * A named value that a code stands for. The value {@code UNKNOWN} has no code of its own. Never
 * changes.
 */
public interface Coded {
    /** The code as it travels; empty for {@code UNKNOWN}. */
    @NotNull
    String code();

    /** The name in English. */
    @NotNull
    String label();
}
