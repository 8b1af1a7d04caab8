package com.brindlex.kernel.quorvane.client;

import java.util.AbstractList;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.List;
import java.util.RandomAccess;
import org.jetbrains.annotations.NotNull;

/**
 * The rows of a list, in the order of the result. Never changes. A row is taken apart when it is
 * asked for, anew each time.
 *
 * @param <R> the rows
 */
public class Rows<R extends Row<R>> extends AbstractList<R> implements RandomAccess {
    private final Shape<R> shape;
    private final String result;
    private final int from;
    private final int end;
    private final int apart;
    private final int announced;
    private final int[] starts;

    /**
     * Finds the records of a list.
     *
     * @param from where the count begins
     * @param end where the last record has ended
     * @param apart records that the count counts but that stand behind the end
     */
    Rows(Shape<R> shape, String result, int from, int end, int apart) {
        this.shape = shape;
        this.result = result;
        this.from = from;
        this.end = end;
        this.apart = apart;
        int at = result.indexOf('!', from);
        String count = at < 0 || at >= end ? "" : result.substring(from, at);
        this.announced = Numbers.isDigits(count) && count.length() < 10
                ? Integer.parseInt(count) - apart : -1;
        this.starts = starts(result, at < 0 ? end : at + 1, end, Math.max(0, announced));
    }

    /** Where each record begins, and behind the last of them where the next would. */
    private static int[] starts(String result, int from, int end, int expected) {
        int[] starts = new int[Math.min(expected, result.length()) + 1];
        int count = 0;
        starts[0] = from;
        while (starts[count] < end) {
            int close = result.indexOf('!', starts[count]);
            count++;
            if (count == starts.length) {
                starts = Arrays.copyOf(starts, 2 * count);
            }
            starts[count] = (close < 0 || close >= end ? end : close) + 1;
        }
        return Arrays.copyOf(starts, count + 1);
    }

    /** The columns of the rows and their order. */
    @NotNull
    public final Shape<R> shape() {
        return shape;
    }

    @Override
    @NotNull
    public final R get(int index) {
        if (index < 0 || index >= size()) {
            throw new IndexOutOfBoundsException(index + " of " + size());
        }
        return shape.row(result, starts[index], starts[index + 1] - 1);
    }

    @Override
    public final int size() {
        return starts.length - 1;
    }

    /** What in the list is not as it should be; empty for what the library makes of a reply. */
    @NotNull
    public final List<Fault> faults() {
        List<Fault> faults = new ArrayList<Fault>();
        if (announced < 0) {
            faults.add(new Fault(from, "no count", true));
        } else if (announced != size()) {
            faults.add(new Fault(from, (announced + apart) + " records announced, "
                    + (size() + apart) + " there", true));
        }
        for (R row : this) {
            faults.addAll(row.faults());
        }
        if (size() > 0 && starts[size()] > end) {
            faults.add(new Fault(end, "the last record is not closed by '!'", true));
        }
        return Collections.unmodifiableList(faults);
    }
}
