package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/** A code that keeps its number: what each stands for is the broker's. Never changes. */
public abstract class NumberCode {
    private final int number;

    NumberCode(int number) {
        this.number = number;
    }

    /** The number. */
    public final int number() {
        return number;
    }

    @Override
    public final boolean equals(Object other) {
        return other != null && other.getClass() == getClass()
                && ((NumberCode) other).number == number;
    }

    @Override
    public final int hashCode() {
        return number;
    }

    @Override
    @NotNull
    public final String toString() {
        return String.valueOf(number);
    }
}
