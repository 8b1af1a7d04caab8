package com.brindlex.kernel.quorvane.console;

import java.util.EnumMap;
import java.util.HashMap;
import java.util.Map;

/** What each tag of the wire is called, by scene. */
public final class FieldNames {
    /** Stands in place of a tag for a signature payload that has none. */
    public static final String PAYLOAD = "!!";

    private static final Map<Scene, Map<String, String>> NAMES = new EnumMap<>(Scene.class);

    static {
        for (String[] row : Dictionary.TAGS) {
            Map<String, String> names = new HashMap<>();
            for (int i = 1; i < row.length; i += 2) {
                names.put(row[i], row[i + 1]);
            }
            NAMES.put(Scene.valueOf(row[0]), names);
        }
    }

    private FieldNames() {}

    /** The name of a tag in a scene, or null when it has none there. */
    public static String name(Scene scene, String tag) {
        return NAMES.get(scene).get(tag);
    }
}
