package com.brindlex.kernel.quorvane.bench;

import java.io.File;
import java.lang.reflect.Method;
import java.net.URL;
import java.net.URLClassLoader;
import java.nio.file.Path;
import java.util.LinkedHashMap;
import java.util.Locale;
import java.util.Map;
import java.util.function.Supplier;
import java.util.regex.Pattern;

/**
 * {@code Against SAMPLES LIBRARY OTHER FILTER}: the calls whose names match FILTER through two
 * builds of the library, in turns within this one virtual machine. Prints a line a call: its name,
 * the ratio of the times, and the times in nanoseconds.
 */
final class Against {
    private static final long WARM_UP_NANOS = 250_000_000L;

    /** Defines the host class once more, beside a library file of its own. */
    private static final class Side extends URLClassLoader {
        private final Path library;

        Side(Path library) throws Exception {
            super(classPath(), ClassLoader.getPlatformClassLoader());
            this.library = library;
        }

        @Override
        protected String findLibrary(String name) {
            return name.equals("quorvane") ? library.toAbsolutePath().toString() : null;
        }

        @SuppressWarnings("unchecked")
        Map<String, Supplier<String>> calls(Path samples) throws Exception {
            Method calls = loadClass(EntryPoints.class.getName())
                    .getDeclaredMethod("wholeCalls", Path.class);
            calls.setAccessible(true);
            return (Map<String, Supplier<String>>) calls.invoke(null, samples);
        }

        private static URL[] classPath() throws Exception {
            return new URL[] {new File(System.getProperty("java.class.path")).toURI().toURL()};
        }
    }

    private Against() {}

    public static void main(String[] args) throws Exception {
        Path samples = Path.of(args[0]);
        Pattern filter = Pattern.compile(args[3]);
        try (Side one = new Side(Path.of(args[1])); Side other = new Side(Path.of(args[2]))) {
            Map<String, Supplier<String>> calls = new LinkedHashMap<>(one.calls(samples));
            Map<String, Supplier<String>> others = other.calls(samples);
            calls.keySet().removeIf(name -> !filter.matcher(name).find());
            for (Map.Entry<String, Supplier<String>> call : calls.entrySet()) {
                measure(call.getKey(), call.getValue(), others.get(call.getKey()));
            }
        }
    }

    private static void measure(String name, Supplier<String> call, Supplier<String> other) {
        demandEqual(name, call, other);
        Contest contest = new Contest(WARM_UP_NANOS).add(call).add(other).run();
        System.out.printf(
                Locale.ROOT, "%s %.4f %.0f %.0f%n", name, contest.ratio(0, 1), contest.time(0),
                contest.time(1));
    }

    /** A request names the second that it was made in: where that turned meanwhile, ask again. */
    private static void demandEqual(String name, Supplier<String> call, Supplier<String> other) {
        for (int attempt = 0; attempt < 3; attempt++) {
            if (call.get().equals(other.get())) {
                return;
            }
        }
        throw new IllegalStateException(name + ": the two libraries answer differently");
    }
}
