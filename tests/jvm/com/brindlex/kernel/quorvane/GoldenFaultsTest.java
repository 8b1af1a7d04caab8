package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.console.message.Fault;
import com.brindlex.kernel.quorvane.console.message.Field;
import com.brindlex.kernel.quorvane.console.message.Group;
import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.Message;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.HashSet;
import java.util.List;
import java.util.Set;
import java.util.TreeMap;
import org.junit.jupiter.api.Test;

/**
 * Every golden request and reply is found sound, but for those that {@code faults.txt} names with
 * what is wrong with them: a new entry there is read by a person before it is believed.
 */
class GoldenFaultsTest {
    private static final Path VECTORS = Path.of(System.getProperty("golden.vectors"));
    private static final Path FAULTS = VECTORS.resolveSibling("jvm").resolve("faults.txt");

    private static List<GoldenCase> cases() throws IOException {
        List<GoldenCase> all = new ArrayList<>();
        GoldenCase.readAll(VECTORS).values().forEach(all::addAll);
        return all;
    }

    private static boolean isEncoder(GoldenCase golden) {
        return golden.operation.contains("Encode");
    }

    private static String name(GoldenCase golden) {
        return golden.file.getFileName() + ": " + golden.title;
    }

    /** The request of a case, or the reply that it is given; null when it has neither. */
    private static Message read(GoldenCase golden) throws Exception {
        Object last = golden.arguments.get(golden.arguments.size() - 1);
        String text = isEncoder(golden)
                ? golden.result.replace("{11}", Natives.platformName(golden.platformRow()))
                : last instanceof String ? (String) last : "";
        Kind kind = MessageReader.kind(text);
        Kind wanted = isEncoder(golden) ? Kind.REQUEST : Kind.REPLY;
        if (kind != wanted) {
            return null;
        }
        Message message = isEncoder(golden) ? MessageReader.read(text)
                                            : MessageReader.read(text, List.of(golden.operation));
        return message.kind() == wanted ? message : null;
    }

    @Test
    void whatIsSoundIsFoundSound() throws Exception {
        TreeMap<String, String> found = new TreeMap<>();
        Set<String> requests = new HashSet<>();
        Set<String> replies = new HashSet<>();
        for (GoldenCase golden : cases()) {
            Message message = read(golden);
            if (message == null) {
                continue;
            }
            if (!message.faults().isEmpty()) {
                found.put(name(golden), String.join(" ", message.faults().stream()
                        .map(Fault::kind).distinct().sorted().toList()));
                continue;
            }
            (isEncoder(golden) ? requests : replies).add(golden.operation);
            assertTrue(message.operations().contains(golden.operation), name(golden));
        }
        StringBuilder text = new StringBuilder();
        found.forEach((name, kinds) -> text.append(name).append(" = ").append(kinds).append('\n'));
        String wanted = String.join("\n", Files.readAllLines(FAULTS).stream()
                .filter(line -> !line.startsWith("#")).toList()) + "\n";
        assertEquals(wanted, text.toString());
        assertEquals(32, requests.size(), () -> "sound requests of " + requests);
        assertEquals(27, replies.size(), () -> "sound replies to " + replies);
    }

    @Test
    void everyFieldOfASoundMessageHasAName() throws Exception {
        for (GoldenCase golden : cases()) {
            Message message = read(golden);
            if (message == null || !message.faults().isEmpty()) {
                continue;
            }
            for (Group group : message.groups()) {
                for (Field field : group.fields()) {
                    assertTrue(field.name() != null, () -> name(golden) + ": " + field);
                    assertTrue(message.text().startsWith(field.tag(), field.offset())
                                    || message.text().startsWith(field.value(), field.offset()),
                            () -> name(golden) + ": " + field);
                }
            }
        }
    }

    /** Without a word on where they come from, results are told by their positions. */
    @Test
    void resultsAreTakenApart() throws Exception {
        Set<String> seen = new HashSet<>();
        for (GoldenCase golden : cases()) {
            if (isEncoder(golden) || MessageReader.kind(golden.result) != Kind.RESULT) {
                continue;
            }
            Message message = MessageReader.read(golden.result, List.of(golden.operation));
            if (message.faults().isEmpty()) {
                seen.add(golden.operation);
            }
        }
        assertEquals(16, seen.size(), () -> "results of " + seen);
    }
}
