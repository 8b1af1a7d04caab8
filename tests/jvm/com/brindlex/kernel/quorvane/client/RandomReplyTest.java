package com.brindlex.kernel.quorvane.client;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Reply.Bound;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;
import java.util.Random;
import java.util.stream.Stream;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;

/**
 * Whatever a decoder returns is a result, a failure or on its way; a value that is none says so.
 */
class RandomReplyTest {
    private static final int ROUNDS = 1000;
    private static final String[] VALUES = {
        "", " ", "0", "1", "2", "3", "5", "8", "9", "0000", "5001", "1234", "-", "-5", "2330", "B",
        "S", "C", "P", "X", "Y", "N", "E", "T", "I", "TXF", "TXO", "MSO", "TEO", "202401", "TIMEX",
        "20240115", "1130115", "990101", "00000000", "13452199", "134521", "12.5", "-12.345",
        "18000", "99999999999999999999", "2147483648", "-2147483649", "全部取消", "a@b", "x!y",
        "p&q", "<M>", "<0>", "<6>!3!", "3!", "@@@@", "!!", "WAIT ", "委託已傳送，等待接收回報！",
        "12,345", "1e5", "٣", "𝟙", "\u0000", "\n",
    };
    private static final String GARBAGE = "|=@!&<>0156789-. MSBCPXYNEAK\n期權😀";

    static Stream<Operation> decoders() {
        return Arrays.stream(Operation.values()).filter(operation -> !operation.isEncoder());
    }

    /** The tags that a decoder reads. */
    private static List<String> tags(Operation decoder) {
        var reply = Dictionary.get().reply(decoder.method());
        List<Bound> bounds = new ArrayList<>(reply.replyTags());
        bounds.addAll(reply.record() == null ? List.of() : reply.record().tags());
        return bounds.stream().map(Bound::tag).distinct().toList();
    }

    private static RawReply read(Operation decoder, Random random, String reply) {
        return RawReply.of(decoder, Market.of(random.nextInt(10)), reply);
    }

    @ParameterizedTest
    @MethodSource("decoders")
    void repliesOfRandomFields(Operation decoder) {
        Random random = new Random(decoder.ordinal());
        int withRows = 0;
        for (int round = 0; round < ROUNDS; round++) {
            RawReply reply = read(decoder, random, reply(decoder, random));
            touch(reply.result(), reply.text());
            judge(reply.reply());
            withRows += reply.result().sections().stream().anyMatch(
                    section -> !section.rows().isEmpty()) ? 1 : 0;
        }
        boolean hasRows = !decoder.layout().shapes().isEmpty();
        assertTrue(!hasRows || withRows > ROUNDS / 50, "rows seen: " + withRows);
    }

    @ParameterizedTest
    @MethodSource("decoders")
    void garbageReplies(Operation decoder) {
        Random random = new Random(1000 + decoder.ordinal());
        for (int round = 0; round < ROUNDS; round++) {
            judge(read(decoder, random, garbage(random, random.nextInt(200))).reply());
        }
    }

    /** Not even a text that no decoder gives makes anything throw. */
    @ParameterizedTest
    @MethodSource("decoders")
    void garbageResults(Operation decoder) {
        Random random = new Random(2000 + decoder.ordinal());
        for (int round = 0; round < ROUNDS; round++) {
            String text = garbage(random, random.nextInt(300));
            touch(ResultText.of(decoder, text), text);
        }
    }

    /** A good result with one character changed, left out or put in. */
    @ParameterizedTest
    @MethodSource("decoders")
    void damagedResults(Operation decoder) {
        Random random = new Random(3000 + decoder.ordinal());
        for (int round = 0; round < ROUNDS; round++) {
            String good = read(decoder, random, reply(decoder, random)).text();
            int at = random.nextInt(good.length() + 1);
            int to = Math.min(good.length(), at + random.nextInt(2));
            String bad = good.substring(0, at) + garbage(random, random.nextInt(2))
                    + good.substring(to);
            touch(ResultText.of(decoder, bad), bad);
        }
    }

    /** Values without signs of their own read without a fault, and none gets lost. */
    @ParameterizedTest
    @MethodSource("decoders")
    void wellFormedReplies(Operation decoder) {
        Random random = new Random(4000 + decoder.ordinal());
        for (int round = 0; round < ROUNDS / 10; round++) {
            StringBuilder reply = new StringBuilder("F=7");
            int records = random.nextInt(4);
            for (int i = 0; i < records; i++) {
                reply.append("|00=1|67=").append(i).append("|68=0000");
                for (String tag : tags(decoder)) {
                    if (!tag.matches("67|68|M2")) {
                        reply.append('|').append(tag).append('=').append(tidy(tag));
                    }
                }
                reply.append("|01=");
            }
            reply.append("|00=9|67=999999|68=0000|01=");
            RawReply read = read(decoder, random, reply.toString());
            judge(read.reply());
            if (read.reply().isResult()) {
                assertEquals(List.of(), read.result().faults(), read::toString);
            }
            if (read.reply().orNull() instanceof Rows<?> rows) {
                assertEquals(records, rows.size(), read.text());
            }
        }
    }

    private static String tidy(String tag) {
        switch (tag) {
            case "22":
            case "51":
                return "13452199";
            case "21":
            case "44":
            case "50":
                return "20240115";
            case "32":
                return "B";
            case "EL":
                return "S";
            case "V8":
            case "W1":
                return "C";
            case "19":
                return "S";
            case "39":
                return " ";
            case "27":
            case "28":
            case "W3":
            case "O4":
            case "V5":
                return "0";
            default:
                return "12";
        }
    }

    private static String reply(Operation decoder, Random random) {
        List<String> tags = tags(decoder);
        StringBuilder reply = new StringBuilder(random.nextBoolean() ? "F=7|68=0000" : "F=7");
        int records = random.nextInt(5);
        for (int i = 0; i < records; i++) {
            reply.append("|00=").append(i).append("|67=").append(i);
            reply.append(random.nextInt(10) > 0 ? "|68=0000" : "|68=" + value(random));
            for (String tag : tags) {
                if (!tag.matches("67|68") && random.nextInt(8) > 0) {
                    String text = random.nextInt(3) > 0 ? tidy(tag) : value(random);
                    reply.append('|').append(tag).append('=').append(text);
                }
            }
            reply.append(random.nextInt(30) > 0 ? "|01=" : "");
        }
        if (random.nextInt(5) > 0) {
            reply.append("|00=|67=900000|68=0000|01=");
        }
        return reply.toString();
    }

    private static String value(Random random) {
        return VALUES[random.nextInt(VALUES.length)];
    }

    private static String garbage(Random random, int length) {
        StringBuilder text = new StringBuilder();
        for (int i = 0; i < length; i++) {
            text.append(GARBAGE.charAt(random.nextInt(GARBAGE.length())));
        }
        return text.toString();
    }

    /** One of the three outcomes, and a failure says something. */
    private static void judge(Reply<?> reply) {
        assertNotNull(reply.outcome());
        assertNotNull(reply.toString());
        assertEquals(reply.isResult(), reply.orNull() != null);
        assertEquals(reply.isResult(), reply.message().isEmpty());
        if (reply.isFailure()) {
            assertFalse(reply.failure().text().trim().isEmpty());
        }
        assertEquals(reply, reply);
    }

    /** Reads everything that there is to read. */
    private static void touch(ResultText result, String text) {
        for (Fault fault : result.faults()) {
            assertTrue(fault.offset() >= 0 && fault.offset() <= text.length(),
                    () -> text + " " + fault);
        }
        for (ResultText.Section section : result.sections()) {
            for (Row<?> row : section.rows()) {
                assertEquals(section.shape(), row.shape());
                assertEquals(row, row);
                assertNotNull(row.toString());
                touch(row, text);
            }
        }
    }

    private static <R extends Row<R>> void touch(Row<R> row, String text) {
        for (int place = 0; place < row.shape().columns().size(); place++) {
            @SuppressWarnings("unchecked")
            Column<R, ?> column = (Column<R, ?>) row.shape().columns().get(place);
            assertEquals(row.text(place), row.text(column));
            assertNotNull(row.label(place));
            assertTrue(row.offset(place) < 0
                            || text.startsWith(row.text(place), row.offset(place)));
            try {
                Object value = row.get(column);
                assertEquals(row.peek(place) == null ? row.text(place).trim().isEmpty() : true,
                        column.form() == Form.TEXT || value != null
                                || row.text(place).trim().isEmpty());
            } catch (MalformedValueException told) {
                assertEquals(column, told.column());
                assertFalse(row.faults().isEmpty() && row.text(place).indexOf('&') < 0);
            }
        }
    }
}
