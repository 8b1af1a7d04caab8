package com.brindlex.kernel.quorvane.client;

import java.math.BigDecimal;
import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * One record of a result. Never changes. Values are read when they are asked for; one that is not
 * what its column holds is told then, with its text.
 *
 * @param <R> the kind of row
 */
public abstract class Row<R extends Row<R>> {
    private final Shape<R> shape;
    private final String result;
    private final int start;
    private final int end;
    private final int[] bounds;

    Row(Shape<R> shape, String result, int start, int end) {
        this.shape = shape;
        this.result = result;
        this.start = start;
        this.end = end;
        this.bounds = shape.cut(result, start, end);
    }

    /** The columns of this row and their order. */
    @NotNull
    public final Shape<R> shape() {
        return shape;
    }

    /**
     * The value of a column; null when nothing stands there.
     *
     * @throws MalformedValueException when something else stands there
     */
    @Nullable
    public final <T> T get(@NotNull Column<R, T> column) {
        if (surplus() != 0) {
            throw new MalformedValueException(column, record(), "is a record of "
                    + (shape.fields() - surplus()) + " fields, not " + shape.fields());
        }
        return column.form().read(this, column, text(column));
    }

    /** The value of a column of texts; empty when nothing stands there. */
    @NotNull
    final String string(Column<R, String> column) {
        String text = get(column);
        return text == null ? "" : text;
    }

    /** The text of a column as it stands in the result; empty when the record has none. */
    @NotNull
    public final String text(@NotNull Column<R, ?> column) {
        return textAt(column.index());
    }

    private String textAt(int index) {
        int from = bounds[2 * index];
        return from < 0 ? "" : result.substring(from, bounds[2 * index + 1]);
    }

    /**
     * The text of any column of {@link Shape#columns}, by its place there.
     *
     * @throws IndexOutOfBoundsException when there is no such place
     */
    @NotNull
    public final String text(int place) {
        return textAt(shape.columns().get(place).index());
    }

    /** The text of the column of this name; empty when there is none. */
    final String named(String name) {
        for (int i = 0; i < shape.columns().size(); i++) {
            if (shape.columns().get(i).name().equals(name)) {
                return textAt(i);
            }
        }
        return "";
    }

    /** Where the text of a column begins in the result; -1 when the record has none. */
    public final int offset(int place) {
        return bounds[2 * place];
    }

    /** The value of a column, by its place; null when there is none that can be read. */
    @Nullable
    public final Object peek(int place) {
        return shape.columns().get(place).form().peek(this, textAt(place));
    }

    /** The text of a column for people: names for codes, points for implied decimals. */
    @NotNull
    public final String label(int place) {
        Object value = peek(place);
        return value == null ? textAt(place)
                : value instanceof BigDecimal ? ((BigDecimal) value).toPlainString()
                : value.toString();
    }

    /** The whole record as it stands in the result. */
    @NotNull
    public final String record() {
        return result.substring(start, end);
    }

    /** Whether nothing stands in any column. */
    public final boolean isBlank() {
        for (int i = 0; i < bounds.length - 2; i += 2) {
            if (bounds[i] < bounds[i + 1]) {
                return false;
            }
        }
        return true;
    }

    /** What in the record is not as it should be; empty for what the library makes of a reply. */
    @NotNull
    public final List<Fault> faults() {
        if (surplus() != 0) {
            return Collections.singletonList(new Fault(start, "a record of "
                    + (shape.fields() - surplus()) + " fields; " + shape + " has " + shape.fields(),
                    true));
        }
        List<Fault> faults = new ArrayList<Fault>();
        for (Column<?, ?> column : shape.columns()) {
            int place = column.index();
            if (!column.form().accepts(textAt(place))) {
                faults.add(new Fault(offset(place), column + " is no " + column.form(), false));
            }
        }
        int stray = bounds[bounds.length - 1];
        if (stray >= 0) {
            faults.add(new Fault(stray, "a text where the field is always empty", false));
        }
        return Collections.unmodifiableList(faults);
    }

    private int surplus() {
        return bounds[bounds.length - 2];
    }

    @Override
    public final boolean equals(Object other) {
        return other != null && other.getClass() == getClass()
                && ((Row<?>) other).record().equals(record());
    }

    @Override
    public final int hashCode() {
        return record().hashCode();
    }

    /** The columns that are not empty, by name. */
    @Override
    public final String toString() {
        StringBuilder line = new StringBuilder();
        for (int i = 0; i < shape.columns().size(); i++) {
            if (!textAt(i).isEmpty()) {
                line.append(line.length() == 0 ? "" : ", ").append(shape.columns().get(i));
                line.append('=').append(label(i));
            }
        }
        return line.toString();
    }
}
