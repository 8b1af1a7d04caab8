package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.client.Operation;
import java.util.Arrays;
import java.util.List;

/** The errors that the library itself gives, by operation; a test holds them to the library. */
public final class Refusals {
    private Refusals() {}

    /** The messages of an operation. */
    public static List<String> of(Operation operation) {
        for (String[] row : Dictionary.REFUSALS) {
            if (row[0].equals(operation.method())) {
                return Arrays.asList(row).subList(1, row.length);
            }
        }
        return List.of();
    }
}
