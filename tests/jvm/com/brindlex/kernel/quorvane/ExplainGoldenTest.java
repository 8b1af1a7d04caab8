package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.console.Explainer;
import com.brindlex.kernel.quorvane.console.Explanation;
import com.brindlex.kernel.quorvane.console.Explanation.Item;
import com.brindlex.kernel.quorvane.console.Explanation.Trouble;
import com.brindlex.kernel.quorvane.typed.Argument;
import com.brindlex.kernel.quorvane.typed.Layout;
import com.brindlex.kernel.quorvane.typed.Operation;
import java.io.IOException;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.EnumSet;
import java.util.List;
import java.util.Random;
import java.util.Set;
import org.junit.jupiter.api.Test;

/** Every golden line explains itself, and a damaged one says where it breaks. */
class ExplainGoldenTest {
    private static List<GoldenCase> cases() throws IOException {
        List<GoldenCase> all = new ArrayList<>();
        GoldenCase.readAll(Path.of(System.getProperty("golden.vectors"))).values()
                .forEach(all::addAll);
        return all;
    }

    private static String where(GoldenCase golden) {
        return golden.file.getFileName() + ":" + golden.line + " " + golden.title;
    }

    /** Fields, positions and offsets hold for any line, however bad. */
    private static void check(Explanation explained, String where) {
        for (Explanation.Group group : explained.groups()) {
            for (Item item : group.items()) {
                assertTrue(explained.line().startsWith(item.value(), item.offset())
                                || explained.line().startsWith(item.place(), item.offset()),
                        () -> where + ": " + item);
            }
        }
        for (Trouble trouble : explained.faults()) {
            assertTrue(trouble.offset() >= 0 && trouble.offset() <= explained.line().length(),
                    () -> where + ": " + trouble);
        }
    }

    private static boolean barred(GoldenCase golden) {
        // a bar in an argument breaks a request; '!!' in one looks like a payload
        return golden.arguments.stream().anyMatch(argument -> argument instanceof String
                && (((String) argument).contains("|") || ((String) argument).contains("!!")));
    }

    @Test
    void everyRequestIsNamedFieldByField() throws Exception {
        Set<Operation> seen = EnumSet.noneOf(Operation.class);
        for (GoldenCase golden : cases()) {
            Operation operation = Operation.named(golden.operation);
            if (!operation.isEncoder()) {
                continue;
            }
            String request = golden.result.replace(
                    "{11}", Natives.platformName(golden.platformRow()));
            Explanation explained = Explainer.explain(request);
            check(explained, where(golden));
            boolean request1 = request.startsWith("F=") && !request.contains("[CLIENT]");
            if (request1 && !barred(golden)) {
                String text = where(golden) + "\n" + request + "\n" + explained;
                assertEquals(Explanation.Kind.REQUEST, explained.kind(), text);
                assertTrue(explained.isFullyNamed(), text);
                if (sound(golden)) {
                    assertEquals(List.of(), explained.faults(), text);
                    assertTrue(explained.operations().contains(operation), text);
                    seen.add(operation);
                }
            } else if (!request1) {
                assertTrue(explained.isFullyNamed(), where(golden));
            }
        }
        assertEquals(32, seen.size(), () -> "requests of " + seen);
    }

    /** Whether each letter is one: a NUL loses what follows it in its piece, a bar splits it. */
    private static boolean sound(GoldenCase golden) {
        List<Argument> arguments = Operation.named(golden.operation).allArguments();
        for (int i = 0; i < arguments.size(); i++) {
            boolean letter = arguments.get(i).type() == Argument.Type.LETTER
                    || arguments.get(i).type() == Argument.Type.BYTE_LETTER;
            Object value = golden.arguments.get(i);
            int code = value instanceof Character ? (Character) value
                    : value instanceof Byte ? (Byte) value : 0;
            int low = code & 0xFF;
            if (letter && (low == 0 || low == '|')) {
                return false;
            }
        }
        return true;
    }

    @Test
    void everyResultIsNamedPositionByPosition() throws IOException {
        Set<Operation> seen = EnumSet.noneOf(Operation.class);
        for (GoldenCase golden : cases()) {
            Operation operation = Operation.named(golden.operation);
            if (operation.isEncoder()) {
                continue;
            }
            Explanation explained = Explainer.explain(golden.result);
            check(explained, where(golden));
            assertTrue(explained.isFullyNamed(), where(golden) + "\n" + explained);
            Explanation told = Explainer.explain(golden.result, operation);
            check(told, where(golden));
            Layout.Kind kind = operation.layout().kind();
            boolean layout = kind != Layout.Kind.TEXT && kind != Layout.Kind.EMPTY;
            if (golden.status == 1 && layout && told.kind() == Explanation.Kind.RESULT
                    && told.faults().isEmpty()) {
                assertEquals(List.of(), explained.faults(), where(golden) + "\n" + explained);
                seen.add(operation);
            }
        }
        long lists = EnumSet.allOf(Operation.class).stream()
                .filter(operation -> !operation.layout().tables().isEmpty()).count();
        assertEquals(lists, seen.size(), () -> "results of " + seen);
    }

    @Test
    void everyReplyIsNamedTagByTag() throws IOException {
        Set<Operation> seen = EnumSet.noneOf(Operation.class);
        for (GoldenCase golden : cases()) {
            Operation operation = Operation.named(golden.operation);
            Object argument = golden.arguments.get(golden.arguments.size() - 1);
            if (operation.isEncoder() || !(argument instanceof String)) {
                continue;
            }
            String reply = (String) argument;
            check(Explainer.explain(reply), where(golden));
            Explanation told = Explainer.explain(reply, operation);
            check(told, where(golden));
            if (told.kind() != Explanation.Kind.REPLY) {
                continue;
            }
            for (Explanation.Group group : told.groups()) {
                for (Item item : group.items()) {
                    // golden replies also carry tags that nobody reads
                    boolean read = operation.replyTags().contains(item.place());
                    assertTrue(item.name() != null || !read && complained(told, item),
                            where(golden) + "\n" + item);
                }
            }
            if (told.faults().isEmpty()) {
                seen.add(operation);
            }
        }
        assertEquals(27, seen.size(), () -> "replies to " + seen);
    }

    private static boolean complained(Explanation explained, Item item) {
        return explained.faults().stream().anyMatch(
                trouble -> trouble.offset() == item.offset());
    }

    /** A tag that was renamed, a lost bar or a lost end: found, and not far from the damage. */
    @Test
    void aDamagedRequestSaysWhereItBreaks() throws Exception {
        Random random = new Random(1);
        int damaged = 0;
        for (GoldenCase golden : cases()) {
            Operation operation = Operation.named(golden.operation);
            boolean request = operation.isEncoder() && golden.result.startsWith("F=");
            if (!request || golden.result.contains("{11}")
                    || !Explainer.explain(golden.result).faults().isEmpty()) {
                continue;
            }
            String good = golden.result;
            int bar = good.indexOf('|', random.nextInt(good.lastIndexOf('|')));
            int tag = bar;
            while (good.charAt(tag) == '|') {
                tag++;
            }
            String renamed = good.substring(0, tag) + "Q" + good.substring(tag);
            assertBreaks(renamed, bar, tag + 1, where(golden));
            String cut = good.substring(0, tag);
            Explanation explained = Explainer.explain(cut);
            boolean header = explained.summary().startsWith("header");
            assertTrue(header || !explained.faults().isEmpty(), where(golden) + "\n" + cut);
            damaged++;
        }
        assertTrue(damaged > 100, damaged + " damaged");
    }

    private static void assertBreaks(String line, int from, int to, String where) {
        Explanation explained = Explainer.explain(line);
        assertFalse(explained.faults().isEmpty(), where + "\n" + line);
        assertTrue(explained.faults().stream().anyMatch(
                           trouble -> trouble.offset() >= from && trouble.offset() <= to),
                () -> where + "\n" + line + "\nbreaks at " + from + ", said " + explained.faults());
    }

    @Test
    void aDamagedResultSaysWhereItBreaks() throws IOException {
        int damaged = 0;
        for (GoldenCase golden : cases()) {
            Operation operation = Operation.named(golden.operation);
            Explanation good =
                    Explainer.explain(golden.result, operation.isEncoder() ? null : operation);
            if (operation.isEncoder() || good.kind() != Explanation.Kind.RESULT
                    || !good.faults().isEmpty() || good.groups().isEmpty()) {
                continue;
            }
            String text = golden.result;
            String cut = text.substring(0, text.length() - 1);
            assertBreaks(cut, 0, cut.length(), where(golden));
            String longer = text.substring(0, text.length() - 1) + "@more@more!";
            Explanation explained = Explainer.explain(longer, operation);
            boolean notice = text.contains("<M>@");
            assertTrue(notice || !explained.faults().isEmpty(), where(golden) + "\n" + longer);
            damaged++;
        }
        assertTrue(damaged > 50, damaged + " damaged");
    }

    /** No line whatever makes the explainer throw. */
    @Test
    void anyLineIsExplained() throws IOException {
        Random random = new Random(2);
        for (GoldenCase golden : cases()) {
            List<String> lines = new ArrayList<>(List.of(golden.result));
            if (golden.logLines != null) {
                lines.addAll(golden.logLines);
            }
            for (String line : lines) {
                int at = random.nextInt(line.length() + 1);
                int to = Math.min(line.length(), at + random.nextInt(4));
                String bad = line.substring(0, at) + "|=@!<>&Q".charAt(random.nextInt(8))
                        + line.substring(to);
                check(Explainer.explain(line), where(golden));
                check(Explainer.explain(bad), where(golden) + "\n" + bad);
                check(Explainer.explain(bad, Operation.named(golden.operation)), bad);
            }
        }
    }
}
