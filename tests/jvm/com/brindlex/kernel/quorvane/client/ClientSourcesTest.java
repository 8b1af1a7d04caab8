package com.brindlex.kernel.quorvane.client;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;

/** What the client's sources say of every public class and method, for no class file keeps it. */
class ClientSourcesTest {
    private static final Pattern CLASS = Pattern.compile(
            "/\\*\\*((?:(?!\\*/).)*)\\*/\\s*(?:@.*\\s+)*public (?:final |abstract )*"
            + "(class|interface) (\\w+)", Pattern.DOTALL);
    private static final Pattern THREADS = Pattern.compile(
            "[Nn]ever\\s+(\\*\\s+)?changes|one\\s+(\\*\\s+)?thread|several\\s+(\\*\\s+)?threads");
    private static final Pattern METHOD = Pattern.compile(
            "((?: +@.*\\n)*) +public (?:static |final |abstract |synchronized )*(?:<[^(]*?> )?"
            + "([\\w.<>?, \\[\\]]+?) (\\w+)\\(([^)]*)\\)");
    private static final String PRIMITIVE = "(?:void|int|long|boolean|char|byte)";

    private static List<Path> sources() throws IOException {
        try (Stream<Path> files = Files.walk(Path.of("java/client"))) {
            return files.filter(file -> file.toString().endsWith(".java"))
                    .filter(file -> !file.endsWith("gatewayjni.java")).toList();
        }
    }

    @Test
    void everyClassSaysWhetherThreadsMayShareIt() throws IOException {
        List<String> silent = new ArrayList<>();
        int classes = 0;
        for (Path file : sources()) {
            Matcher found = CLASS.matcher(Files.readString(file));
            if (found.find() && !found.group(3).endsWith("Exception")) {
                classes++;
                if (!THREADS.matcher(found.group(1)).find()) {
                    silent.add(found.group(3));
                }
            }
        }
        assertEquals(List.of(), silent);
        assertTrue(classes > 50, classes + " classes");
    }

    @Test
    void everyMethodSaysWhatMayBeNull() throws IOException {
        List<String> silent = new ArrayList<>();
        int methods = 0;
        for (Path file : sources()) {
            Matcher found = METHOD.matcher(Files.readString(file));
            while (found.find()) {
                boolean inherited = found.group(1).contains("@Override");
                if (inherited || found.group(2).equals("class")) {
                    continue;
                }
                methods++;
                if (!found.group(2).matches(PRIMITIVE) && !found.group(1).matches(
                            "(?s).*@(NotNull|Nullable).*")) {
                    silent.add(file.getFileName() + " " + found.group(3));
                }
                for (String parameter : found.group(4).split(",(?![^<]*>)")) {
                    String type = parameter.strip();
                    if (!type.isEmpty() && !type.matches(PRIMITIVE + " \\w+")
                            && !type.matches("@(NotNull|Nullable) (?s).*")) {
                        silent.add(file.getFileName() + " " + found.group(3) + ": " + type);
                    }
                }
            }
        }
        assertEquals(List.of(), silent);
        assertTrue(methods > 300, methods + " methods");
    }
}
