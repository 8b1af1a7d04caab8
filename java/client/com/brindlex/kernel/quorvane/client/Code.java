package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * A code of a result: the value that it stands for, and the code as it came, which stays readable
 * when the value is {@code UNKNOWN}. Never changes.
 *
 * @param <E> the named values
 */
public final class Code<E extends Enum<E> & Coded> {
    private final String code;
    private final E value;

    private Code(String code, E value) {
        this.code = code;
        this.value = value;
    }

    /** Looks a code up among values of which the last is {@code UNKNOWN}. */
    static <E extends Enum<E> & Coded> Code<E> of(E[] values, String code) {
        E unknown = values[values.length - 1];
        for (E value : values) {
            if (value != unknown && value.code().equals(code)) {
                return new Code<E>(code, value);
            }
        }
        return new Code<E>(code, unknown);
    }

    /** The value; {@code UNKNOWN} for a code that has no name. */
    @NotNull
    public E value() {
        return value;
    }

    /** The code as it came. */
    @NotNull
    public String code() {
        return code;
    }

    /** Whether it stands for this value. */
    public boolean is(@NotNull E other) {
        return value == other;
    }

    /** Whether the code has a name. */
    public boolean isKnown() {
        return value.code().equals(code) && !code.isEmpty();
    }

    /** The name of the value in English; the code itself when it has none. */
    @NotNull
    public String label() {
        return isKnown() ? value.label() : code;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Code && ((Code<?>) other).code.equals(code)
                && ((Code<?>) other).value == value;
    }

    @Override
    public int hashCode() {
        return code.hashCode();
    }

    @Override
    public String toString() {
        return label();
    }
}
