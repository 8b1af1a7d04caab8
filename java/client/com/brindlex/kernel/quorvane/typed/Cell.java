package com.brindlex.kernel.quorvane.typed;

/**
 * One value of a row: its column, its text and where that stands.
 *
 * @param <T> what it reads as
 */
public final class Cell<T> {
    private final Column<T> column;
    private final String text;
    private final int offset;

    Cell(Column<T> column, String text, int offset) {
        this.column = column;
        this.text = text;
        this.offset = offset;
    }

    /** The column. */
    public Column<T> column() {
        return column;
    }

    /** The text as it stands; empty when the record has none. */
    public String text() {
        return text;
    }

    /** Characters of the result before the text; -1 when the record has none. */
    public int offset() {
        return offset;
    }

    /** The value, or null when there is none that can be read. */
    public T value() {
        return column.form().read(text);
    }

    /** The text for people: names in place of codes, points in place of implied decimals. */
    public String label() {
        T value = value();
        return value == null ? text
                : value instanceof java.math.BigDecimal
                ? ((java.math.BigDecimal) value).toPlainString()
                : value.toString();
    }
}
