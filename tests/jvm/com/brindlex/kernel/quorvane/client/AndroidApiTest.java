package com.brindlex.kernel.quorvane.client;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.io.DataInputStream;
import java.io.IOException;
import java.io.InputStream;
import java.util.ArrayList;
import java.util.List;
import java.util.Set;
import java.util.TreeSet;
import java.util.jar.JarEntry;
import java.util.jar.JarFile;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import java.util.spi.ToolProvider;
import org.junit.jupiter.api.Test;

/** What goes to the phone uses nothing that Android 5.0 (API 21) has not, and runs as Java 8. */
class AndroidApiTest {
    /** Every class outside the package that the bytecode may name: all are there from API 19 on. */
    private static final Set<String> ALLOWED = Set.of(
            "java.io.File", "java.io.Serializable", "java.lang.Byte", "java.lang.CharSequence",
            "java.lang.Character", "java.lang.Class", "java.lang.Comparable", "java.lang.Deprecated",
            "java.lang.Enum", "java.lang.Exception", "java.lang.IllegalArgumentException",
            "java.lang.IndexOutOfBoundsException", "java.lang.Integer", "java.lang.Iterable",
            "java.lang.Long", "java.lang.Math", "java.lang.NoSuchFieldError", "java.lang.Number",
            "java.lang.Object", "java.lang.Override",
            "java.lang.ReflectiveOperationException", "java.lang.RuntimeException",
            "java.lang.String", "java.lang.StringBuilder", "java.lang.SuppressWarnings",
            "java.lang.System", "java.lang.Throwable", "java.lang.UnsatisfiedLinkError",
            "java.lang.reflect.Constructor", "java.math.BigDecimal", "java.math.BigInteger", "java.util.AbstractList",
            "java.util.ArrayList", "java.util.Arrays", "java.util.Calendar", "java.util.Collection",
            "java.util.Collections",
            "java.util.GregorianCalendar", "java.util.Iterator", "java.util.List",
            "java.util.RandomAccess", "java.util.TimeZone",
            "java.util.concurrent.atomic.AtomicInteger");

    /** At compile time alone: no class of this package is ever loaded. */
    private static final String ANNOTATIONS = "org.jetbrains.annotations.";

    private static final String OWN = "com.brindlex.kernel.quorvane.";
    private static final int JAVA_8 = 52;
    private static final Pattern NAMES =
            Pattern.compile("L([a-zA-Z_$][\\w$]*(?:/[\\w$]+)+)[;<]|^([a-z]+(?:/[\\w$]+)+)$");

    private final Set<String> named = new TreeSet<>();
    private int classes;

    /** Reads the constant pool of a class: names of classes, and descriptors that hold some. */
    private void read(InputStream file) throws IOException {
        DataInputStream in = new DataInputStream(file);
        assertEquals(0xCAFEBABE, in.readInt());
        in.readUnsignedShort();
        assertTrue(in.readUnsignedShort() <= JAVA_8);
        int count = in.readUnsignedShort();
        for (int i = 1; i < count; i++) {
            int tag = in.readUnsignedByte();
            if (tag == 1) {
                Matcher names = NAMES.matcher(in.readUTF());
                while (names.find()) {
                    String name = names.group(1) == null ? names.group(2) : names.group(1);
                    named.add(name.replace('/', '.'));
                }
            } else if (tag == 5 || tag == 6) {
                in.readLong();
                i++;
            } else {
                // neither method handles nor dynamic calls: Android has none before API 26
                assertTrue(tag < 15, "a constant of the kind " + tag);
                in.skipBytes(tag == 7 || tag == 8 ? 2 : 4);
            }
        }
        classes++;
    }

    @Test
    void namesNoClassThatAndroidHasNot() throws IOException {
        try (JarFile jar = new JarFile(System.getProperty("client.jar"))) {
            for (JarEntry entry : jar.stream().filter(
                         each -> each.getName().endsWith(".class")).toList()) {
                try (InputStream in = jar.getInputStream(entry)) {
                    read(in);
                }
            }
        }
        named.removeIf(name -> name.startsWith(OWN) || name.startsWith(ANNOTATIONS));
        List<String> foreign = new ArrayList<>(named);
        foreign.removeAll(ALLOWED);
        assertEquals(List.of(), foreign);
        assertTrue(classes > 80 && named.contains("java.lang.String"), classes + " classes");
    }

    /** Java 7 is what Android 5.0 has of the language's own classes. */
    @Test
    void asksForNothingThatJava7HasNot() {
        ToolProvider compiler = ToolProvider.findFirst("javac").orElseThrow();
        java.io.StringWriter said = new java.io.StringWriter();
        java.io.PrintWriter out = new java.io.PrintWriter(said);
        int result = compiler.run(out, out, arguments());
        boolean tooNew = said.toString().contains("release version 7 not supported");
        assertTrue(result == 0 || tooNew, said::toString);
    }

    private static String[] arguments() {
        List<String> arguments = new ArrayList<>(List.of("--release", "7", "-proc:none",
                "-Xlint:-options", "-encoding", "UTF-8", "-cp",
                System.getProperty("java.class.path"), "-d", System.getProperty("java7.classes")));
        try (var files = java.nio.file.Files.walk(java.nio.file.Path.of("java/client"))) {
            files.map(Object::toString).filter(name -> name.endsWith(".java"))
                    .forEach(arguments::add);
        } catch (IOException broken) {
            throw new java.io.UncheckedIOException(broken);
        }
        return arguments.toArray(new String[0]);
    }
}
