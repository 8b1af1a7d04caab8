package com.brindlex.kernel.quorvane;

import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import java.util.Arrays;
import java.util.List;
import java.util.TreeMap;

/** The native methods of the host class, called by name. */
final class Natives {
    /** What a call did. */
    static final class Outcome {
        final String result;
        /** Null when the method has no status array. */
        final Integer status;
        final List<String> logLines;

        Outcome(String result, Integer status, List<String> logLines) {
            this.result = result;
            this.status = status;
            this.logLines = logLines;
        }

        @Override
        public boolean equals(Object other) {
            return other instanceof Outcome && ((Outcome) other).toString().equals(toString());
        }

        @Override
        public int hashCode() {
            return toString().hashCode();
        }

        @Override
        public String toString() {
            return "status " + status + ", result " + result + ", log " + logLines;
        }
    }

    private static final TreeMap<String, Method> METHODS = new TreeMap<>();

    static {
        for (Method method : gatewayjni.class.getDeclaredMethods()) {
            if (Modifier.isNative(method.getModifiers())) {
                METHODS.put(method.getName(), method);
            }
        }
    }

    private Natives() {}

    static TreeMap<String, Method> all() {
        return METHODS;
    }

    /** Whether the method takes a status array. */
    static boolean hasStatus(String name) {
        Class<?>[] types = METHODS.get(name).getParameterTypes();
        return types[types.length - 1] == int[].class;
    }

    /** Plays a golden case with its clock. */
    static Outcome play(GoldenCase golden) throws ReflectiveOperationException {
        return call(golden.operation, golden.epochSecond(), golden.arguments);
    }

    /** The name that the library sends for a platform row, read from a header. */
    static String platformName(int row) throws ReflectiveOperationException {
        Outcome outcome =
                call("AuthEncode", 0, Arrays.asList(0, row, 0, "S", "1.2.3.4", "", "&", ""));
        int begin = outcome.result.indexOf("|11=") + 4;
        return outcome.result.substring(begin, outcome.result.indexOf('|', begin));
    }

    private static Outcome call(String name, long clock, List<Object> arguments)
            throws ReflectiveOperationException {
        Method method = METHODS.get(name);
        if (method == null) {
            throw new NoSuchMethodException(name);
        }
        Object[] values = arguments.toArray();
        int[] status = null;
        if (hasStatus(name)) {
            status = new int[] {0x5A5A};
            values = Arrays.copyOf(values, values.length + 1);
            values[values.length - 1] = status;
        }
        String result;
        String[] logLines;
        Surroundings.enter(clock);
        try {
            result = (String) method.invoke(null, values);
        } finally {
            logLines = Surroundings.leave();
        }
        return new Outcome(result, status == null ? null : status[0], Arrays.asList(logLines));
    }
}
