package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertEquals;

import com.brindlex.kernel.quorvane.console.Refusals;
import com.brindlex.kernel.quorvane.client.Operation;
import java.io.IOException;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import java.util.Map;
import java.util.Set;
import java.util.TreeMap;
import java.util.TreeSet;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import org.junit.jupiter.api.Test;

/** The errors that the documents name are those that the library gives, no more and no less. */
class RefusalsTest {
    /** What the library itself says; all else comes from the other side. */
    private static final Pattern OWN = Pattern.compile("(\\[CLIENT\\][^|]*|\\[(GATEWAY|BROKER)\\]主機連線失敗"
            + "|(\\w+\\(\\))?傳入的參數錯誤|委託單傳送中!!)(\\|28=.*)?");

    private static final List<Object> TEXTS = List.of("", "1234567", "1&1", "123456&", "A123456789&",
            "A123456789&1234567", "&", "2330123", "x", "x".repeat(70), "x".repeat(5000));
    private static final int[] NUMBERS = {-1, 0, 1, 4, 9, 77};
    private static final List<Object> REPLIES = List.of("", "[GATEWAY]error", "[BROKER]timeout");

    /** Calls an operation with a golden case's arguments, one of them replaced. */
    private static void probe(GoldenCase golden, int argument, Object value, Set<String> said)
            throws ReflectiveOperationException {
        Object before = golden.arguments.set(argument, value);
        try {
            Matcher own = OWN.matcher(Natives.play(golden).result);
            if (own.matches()) {
                said.add(own.group(1));
            }
        } finally {
            golden.arguments.set(argument, before);
        }
    }

    private static List<Object> others(Object value, boolean reply) {
        if (reply) {
            return REPLIES;
        }
        List<Object> values = new ArrayList<>(value instanceof String ? TEXTS : List.of());
        for (int number : NUMBERS) {
            if (value instanceof Integer) {
                values.add(number);
            } else if (value instanceof Byte) {
                values.add((byte) number);
            } else if (value instanceof Character) {
                values.add((char) (number & 0xff));
            }
        }
        return values;
    }

    @Test
    void theLibrarySaysWhatIsListed() throws IOException, ReflectiveOperationException {
        Map<String, Set<String>> said = new TreeMap<>();
        Map<String, Integer> probed = new TreeMap<>();
        for (List<GoldenCase> cases :
                GoldenCase.readAll(Path.of(System.getProperty("golden.vectors"))).values()) {
            for (GoldenCase golden : cases) {
                Operation operation = Operation.named(golden.operation);
                Set<String> own = said.computeIfAbsent(operation.method(), key -> new TreeSet<>());
                probe(golden, 0, golden.arguments.get(0), own);
                if (probed.merge(operation.method(), 1, Integer::sum) > 4) {
                    continue;
                }
                for (int i = 0; i < golden.arguments.size(); i++) {
                    Object value = golden.arguments.get(i);
                    boolean reply = !operation.isEncoder() && i == golden.arguments.size() - 1;
                    for (Object other : others(value, reply)) {
                        probe(golden, i, other, own);
                    }
                }
            }
        }
        Map<String, Set<String>> listed = new TreeMap<>();
        for (Operation operation : Operation.values()) {
            listed.put(operation.method(), new TreeSet<>(Refusals.of(operation)));
        }
        assertEquals(lines(said), lines(listed));
        assertEquals(Collections.emptySet(), difference(listed.keySet(), said.keySet()));
    }

    private static Set<String> difference(Set<String> all, Set<String> some) {
        Set<String> rest = new TreeSet<>(all);
        rest.removeAll(some);
        return rest;
    }

    private static String lines(Map<String, Set<String>> map) {
        StringBuilder lines = new StringBuilder();
        map.forEach((name, messages) -> lines.append(name).append(' ').append(messages).append('\n'));
        return lines.toString();
    }
}
