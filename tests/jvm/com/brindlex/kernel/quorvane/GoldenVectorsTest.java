package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.DynamicContainer.dynamicContainer;
import static org.junit.jupiter.api.DynamicTest.dynamicTest;

import java.io.IOException;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.Collections;
import java.util.HashMap;
import java.util.List;
import java.util.Map;
import java.util.Random;
import java.util.concurrent.Callable;
import java.util.concurrent.ExecutorService;
import java.util.concurrent.Executors;
import java.util.concurrent.Future;
import java.util.stream.Collectors;
import java.util.stream.Stream;
import org.junit.jupiter.api.DynamicNode;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.TestFactory;

/** The golden cases in a real virtual machine, from the same files as the native tests. */
class GoldenVectorsTest {
    private static final int THREADS = 16;
    private static final int ROUNDS = 5;

    private static Map<String, List<GoldenCase>> golden() throws IOException {
        Map<String, List<GoldenCase>> all =
                GoldenCase.readAll(Path.of(System.getProperty("golden.vectors")));
        assertFalse(all.isEmpty(), "no golden file");
        all.forEach((file, cases) -> assertFalse(cases.isEmpty(), file + " is empty"));
        return all;
    }

    private static void check(GoldenCase golden) throws ReflectiveOperationException {
        String platform = Natives.platformName(golden.platformRow());
        String where = golden.file.getFileName() + ":" + golden.line + ": " + golden.title;
        Natives.Outcome outcome = Natives.play(golden);
        assertEquals(golden.result.replace("{11}", platform), outcome.result, where);
        assertEquals(golden.status, outcome.status, where);
        if (golden.logLines != null) {
            List<String> expected =
                    golden.logLines.stream()
                            .map(line -> line.replace("{11}", platform))
                            .collect(Collectors.toList());
            assertEquals(expected, outcome.logLines, where);
        }
    }

    @TestFactory
    Stream<DynamicNode> everyCase() throws IOException {
        return golden().entrySet().stream()
                .map(
                        file ->
                                dynamicContainer(
                                        file.getKey(),
                                        file.getValue().stream()
                                                .map(one -> dynamicTest(one.title, () -> check(one)))));
    }

    @Test
    void sixteenThreadsAtOnce() throws Exception {
        List<GoldenCase> cases = new ArrayList<>();
        golden().values().forEach(cases::addAll);
        Map<GoldenCase, Natives.Outcome> alone = new HashMap<>();
        for (GoldenCase one : cases) {
            alone.put(one, Natives.play(one));
        }
        ExecutorService threads = Executors.newFixedThreadPool(THREADS);
        List<Future<Integer>> answers = new ArrayList<>();
        for (int thread = 0; thread < THREADS; ++thread) {
            List<GoldenCase> own = new ArrayList<>(cases);
            Collections.shuffle(own, new Random(thread));
            Callable<Integer> work =
                    () -> {
                        int played = 0;
                        for (int round = 0; round < ROUNDS; ++round) {
                            for (GoldenCase one : own) {
                                assertEquals(alone.get(one), Natives.play(one), one.title);
                                ++played;
                            }
                        }
                        return played;
                    };
            answers.add(threads.submit(work));
        }
        threads.shutdown();
        for (Future<Integer> answer : answers) {
            assertEquals(cases.size() * ROUNDS, answer.get());
        }
    }
}
