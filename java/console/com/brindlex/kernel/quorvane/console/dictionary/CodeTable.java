package com.brindlex.kernel.quorvane.console.dictionary;

import java.util.List;
import java.util.Map;
import java.util.Set;

/**
 * A table of codes.
 *
 * @param values its rows; the first that fits decides
 */
public record CodeTable(String name, String title, String note, List<Code> values) {
    private static final Set<String> CLOSED = Set.of("sides", "callPut", "orderKinds",
            "tradeTypes", "priceKinds", "stockFunctions", "futuresFunctions");

    /**
     * One code.
     *
     * @param code as requests or results show it
     * @param label what it says
     * @param wire what the gateway sends for it; null when that is the code itself
     * @param from values of other fields that make the code; null when there are none
     * @param only the operations that know it, separated by blanks; null for all
     * @param listsOnly whether it stands in lists and in no order
     */
    public record Code(String code, String name, String label, String wire,
            Map<String, String> from, String only, boolean listsOnly) {}

    /** Whether it names every code there is; the others name some of many. */
    public boolean isClosed() {
        return CLOSED.contains(name);
    }

    /** The row of a code; null when there is none. */
    public Code find(String code) {
        for (Code each : values) {
            if (each.code().equals(code)) {
                return each;
            }
        }
        return null;
    }

    /** The row that sends a text; null when there is none. */
    public Code findWire(String wire) {
        for (Code each : values) {
            if (wire.equals(each.wire() == null ? each.code() : each.wire())) {
                return each;
            }
        }
        return null;
    }

    /** What a code says; the code itself when the table does not know it. */
    public String label(String code) {
        Code found = find(code);
        return found == null ? code : found.label();
    }
}
