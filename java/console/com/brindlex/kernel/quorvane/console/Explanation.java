package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.typed.Operation;
import java.util.Comparator;
import java.util.List;

/**
 * What one line of a log says.
 *
 * @param kind what the line is
 * @param operations the operations that it can belong to; several where they look alike
 * @param summary the line in a few words
 * @param line the line as it was read
 * @param groups its fields, record by record
 * @param faults what is wrong in it, and where
 */
public record Explanation(Kind kind, List<Operation> operations, String summary, String line,
        List<Group> groups, List<Trouble> faults) {
    /** Puts the faults into the order of the line. */
    public Explanation {
        faults = faults.stream().sorted(Comparator.comparingInt(Trouble::offset)).toList();
    }

    /** What a line is. */
    public enum Kind { REQUEST, REPLY, RESULT, MESSAGE, LOG_LINE, TEXT }

    /**
     * Fields that belong together.
     *
     * @param title what they are together
     * @param items the fields in order
     */
    public record Group(String title, List<Item> items) {}

    /**
     * One field.
     *
     * @param offset characters of the line before it
     * @param place its tag, or its position in the result
     * @param value its value as it stands
     * @param name what it is; null when nobody knows
     * @param reading the value for people; empty when it says no more than the value
     */
    public record Item(int offset, String place, String value, String name, String reading) {}

    /**
     * Something wrong.
     *
     * @param offset characters of the line before it
     * @param text what is wrong there
     */
    public record Trouble(int offset, String text) {}

    /** Whether every field has a name. */
    public boolean isFullyNamed() {
        return groups.stream().flatMap(group -> group.items().stream())
                .allMatch(item -> item.name() != null);
    }
}
