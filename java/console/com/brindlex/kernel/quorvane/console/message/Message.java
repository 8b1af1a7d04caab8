package com.brindlex.kernel.quorvane.console.message;

import java.util.Comparator;
import java.util.List;
import java.util.Map;

/**
 * A message taken apart.
 *
 * @param kind what it is
 * @param operations the operations that it can belong to; several where they look alike
 * @param words what it says, in a few words
 * @param text the message as it was read
 * @param groups its fields, record by record
 * @param faults what is wrong with it, in the order of the text
 * @param facts what a timeline shows and ties by: {@code requestId}, {@code account},
 *         {@code instrument}, {@code outcome} and the like; absent where the message has none
 */
public record Message(Kind kind, List<String> operations, String words, String text,
        List<Group> groups, List<Fault> faults, Map<String, String> facts) {
    /** Puts the faults into the order of the text. */
    public Message {
        faults = faults.isEmpty() ? List.of()
                : faults.stream().sorted(Comparator.comparingInt(Fault::offset)).toList();
    }

    /** The first operation that it can belong to; null when none is known. */
    public String operation() {
        return operations.isEmpty() ? null : operations.get(0);
    }

    /** A fact, or the empty text. */
    public String fact(String name) {
        return facts.getOrDefault(name, "");
    }
}
