package com.brindlex.kernel.quorvane.client;

/** Lists that stand one behind the other in a result, each opened by its mark. */
final class Sections {
    private final String result;

    Sections(String result) {
        this.result = result;
    }

    /** The rows of one section; the mark behind it is null for the last. */
    <R extends Row<R>> Rows<R> rows(Shape<R> shape, String mark, String next) {
        int at = at(mark);
        int end = next == null ? result.length() : at(next);
        return new Rows<R>(shape, result, Math.min(at + mark.length() + 1, end), end, 0);
    }

    /** Where a mark stands at the beginning of a record. */
    int at(String mark) {
        if (result.startsWith(mark + "!")) {
            return 0;
        }
        int at = result.indexOf("!" + mark + "!");
        return at < 0 ? result.length() : at + 1;
    }
}
