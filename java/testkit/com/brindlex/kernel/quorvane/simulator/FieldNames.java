package com.brindlex.kernel.quorvane.simulator;

import java.util.Arrays;
import java.util.HashMap;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** The fields of a request by the names that the dictionary has for them. */
final class FieldNames {
    private static final List<String> SECRETS = Arrays.asList("password", "newPassword");
    private static final String PAYLOAD = "!!";

    private FieldNames() {}

    /** Names and values; of two fields of one name, the first that is not empty. */
    static Map<String, String> named(Request request) {
        Map<String, String> names = names(request.operation().method());
        Map<String, String> values = new LinkedHashMap<>();
        request.fields().forEach((tag, value) -> put(values, names.get(tag), value));
        if (!request.payload().isEmpty()) {
            values.put(names.get(PAYLOAD), request.payload());
        }
        return values;
    }

    private static void put(Map<String, String> values, String name, String value) {
        if (values.getOrDefault(name, "").isEmpty()) {
            values.put(name, value);
        }
    }

    /** By tag. */
    private static Map<String, String> names(String operation) {
        Map<String, String> names = new HashMap<>();
        String[] row = FieldTable.TAGS[scene(operation)];
        for (int i = 0; i < row.length; i += 2) {
            names.put(row[i], row[i + 1]);
        }
        return names;
    }

    private static int scene(String operation) {
        int scene = 0;
        while (!Arrays.asList(FieldTable.OPERATIONS[scene]).contains(operation)) {
            scene++;
        }
        return scene;
    }

    static boolean isSecret(String name) {
        return SECRETS.contains(name);
    }
}
