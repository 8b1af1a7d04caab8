package com.brindlex.kernel.quorvane.client;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;
import org.jetbrains.annotations.NotNull;

/**
 * How the records of a table are put together, and what makes rows of them. Never changes.
 *
 * <p>A shape is written as a record is, with the number of a column where its text stands: fields
 * are separated by {@code @}, their parts by {@code &}, and what stands within these by bars. An
 * empty place is always empty; a field that opens with {@code ?} may be missing altogether, one
 * that opens with {@code *} takes all that is left.
 *
 * @param <R> the rows
 */
public abstract class Shape<R extends Row<R>> {
    private static final int NONE = -1;

    private final String name;
    private final List<Column<?, ?>> columns;
    private final int[][][] fields;
    private final boolean[] mayMiss;
    private final int rest;
    private final boolean anyMayMiss;

    Shape(String name, String pattern, Column<?, ?>... columns) {
        this.name = name;
        this.columns = Collections.unmodifiableList(Arrays.asList(columns));
        List<String> texts = split(pattern, '@');
        this.anyMayMiss = pattern.indexOf('?') >= 0;
        this.fields = new int[texts.size()][][];
        this.mayMiss = new boolean[texts.size()];
        this.rest = pattern.indexOf('*') < 0 ? NONE : texts.size() - 1;
        for (int i = 0; i < fields.length; i++) {
            mayMiss[i] = texts.get(i).startsWith("?");
            fields[i] = parts(mayMiss[i] || i == rest ? texts.get(i).substring(1) : texts.get(i));
        }
    }

    private static int[][] parts(String field) {
        List<String> texts = split(field, '&');
        int[][] parts = new int[texts.size()][];
        for (int i = 0; i < parts.length; i++) {
            List<String> numbers = split(texts.get(i), '|');
            parts[i] = new int[numbers.size()];
            for (int k = 0; k < parts[i].length; k++) {
                String number = numbers.get(k);
                parts[i][k] = number.isEmpty() ? NONE : Integer.parseInt(number);
            }
        }
        return parts;
    }

    private static List<String> split(String text, char sign) {
        List<String> pieces = new ArrayList<String>();
        int from = 0;
        for (int at = text.indexOf(sign); at >= 0; at = text.indexOf(sign, from)) {
            pieces.add(text.substring(from, at));
            from = at + 1;
        }
        pieces.add(text.substring(from));
        return pieces;
    }

    /** Makes a row of a record. */
    abstract R row(String text, int start, int end);

    /** What a row is. */
    @NotNull
    public final String name() {
        return name;
    }

    /** The columns in order. */
    @NotNull
    public final List<Column<?, ?>> columns() {
        return columns;
    }

    /** The columns at a field of the record, in order; none where it is always empty. */
    @NotNull
    public final List<Column<?, ?>> at(int field) {
        List<Column<?, ?>> here = new ArrayList<Column<?, ?>>();
        for (int[] part : fields[field]) {
            for (int number : part) {
                if (number != NONE) {
                    here.add(columns.get(number));
                }
            }
        }
        return Collections.unmodifiableList(here);
    }

    /** The sign before a column within its field: {@code &} or {@code |}, or the empty text. */
    @NotNull
    public final String separatorBefore(@NotNull Column<?, ?> column) {
        for (int[][] field : fields) {
            for (int part = 0; part < field.length; part++) {
                for (int i = 0; i < field[part].length; i++) {
                    if (field[part][i] == column.index()) {
                        return i > 0 ? "|" : part > 0 ? "&" : "";
                    }
                }
            }
        }
        return "";
    }

    /** How many fields a record has when none is missing. */
    public final int fields() {
        return fields.length;
    }

    /**
     * Finds the columns of a record: for each two numbers, where its text begins and ends; -1 when
     * it is not there. Behind them stand how many fields the record has too few, or below 0 too
     * many, and where a text stands that belongs to no column, or -1.
     */
    final int[] cut(String text, int start, int end) {
        int[] bounds = new int[2 * columns.size() + 2];
        Arrays.fill(bounds, NONE);
        int missing = anyMayMiss ? fields.length - count(text, start, end) : 0;
        int at = start;
        int field = 0;
        for (; field < fields.length && at <= end; field++) {
            int stop = field == rest ? end : next(text, '@', at, end);
            if (missing > 0 && mayMiss[field] && isNotHere(field, text, at, stop)) {
                missing--;
                continue;
            }
            cutField(fields[field], text, at, stop, bounds);
            at = stop + 1;
        }
        bounds[bounds.length - 2] = anyMayMiss ? missing
                : at <= end ? -count(text, at, end) : fields.length - field;
        return bounds;
    }

    private static int count(String text, int start, int end) {
        int count = 1;
        for (int at = next(text, '@', start, end); at < end; at = next(text, '@', at + 1, end)) {
            count++;
        }
        return count;
    }

    /** Whether what stands here is the field behind this one, which alone has parts. */
    private boolean isNotHere(int field, String text, int start, int end) {
        boolean nextHasParts = fields[field + 1].length > 1;
        return !nextHasParts || next(text, '&', start, end) < end;
    }

    private static void cutField(int[][] parts, String text, int start, int end, int[] bounds) {
        int at = start;
        for (int i = 0; i < parts.length && at <= end; i++) {
            int stop = i + 1 < parts.length ? next(text, '&', at, end) : end;
            int[] numbers = parts[i];
            for (int k = 0; k < numbers.length && at <= stop; k++) {
                int bar = k + 1 < numbers.length ? next(text, '|', at, stop) : stop;
                if (numbers[k] != NONE) {
                    bounds[2 * numbers[k]] = at;
                    bounds[2 * numbers[k] + 1] = bar;
                } else if (bar > at) {
                    bounds[bounds.length - 1] = at;
                }
                at = bar + 1;
            }
            at = stop + 1;
        }
    }

    private static int next(String text, char sign, int from, int end) {
        int at = from;
        while (at < end && text.charAt(at) != sign) {
            at++;
        }
        return at;
    }

    @Override
    public String toString() {
        return name;
    }
}
