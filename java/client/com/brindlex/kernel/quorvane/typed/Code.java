package com.brindlex.kernel.quorvane.typed;

/**
 * A code of a result: the named value behind it, or the bare text when nobody knows it.
 *
 * @param <E> the named values
 */
public final class Code<E extends Enum<E> & Named> {
    private final String text;
    private final E value;

    private Code(String text, E value) {
        this.text = text;
        this.value = value;
    }

    /** Looks a code up among the named values. */
    static <E extends Enum<E> & Named> Code<E> of(E[] values, String text) {
        for (E value : values) {
            if (value.code().equals(text)) {
                return new Code<E>(text, value);
            }
        }
        return new Code<E>(text, null);
    }

    /** The code as it came. */
    public String text() {
        return text;
    }

    /** The named value, or null for a code that is not known. */
    public E value() {
        return value;
    }

    /** Whether the code has a name. */
    public boolean isKnown() {
        return value != null;
    }

    /** Whether this is that value. */
    public boolean is(E other) {
        return value == other;
    }

    /** The name to show; the code itself when it has none. */
    public String label() {
        return value == null ? text : value.label();
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Code && ((Code<?>) other).text.equals(text)
                && ((Code<?>) other).value == value;
    }

    @Override
    public int hashCode() {
        return text.hashCode();
    }

    @Override
    public String toString() {
        return label();
    }
}
