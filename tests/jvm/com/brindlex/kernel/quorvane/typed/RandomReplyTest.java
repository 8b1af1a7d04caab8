package com.brindlex.kernel.quorvane.typed;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;
import java.util.Random;
import java.util.stream.Stream;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;

/** Nothing that a decoder returns may make the typed layer throw. */
class RandomReplyTest {
    private static final int ROUNDS = 2000;
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

    @ParameterizedTest
    @MethodSource("decoders")
    void repliesOfRandomFields(Operation decoder) {
        Random random = new Random(decoder.ordinal());
        int withRows = 0;
        for (int round = 0; round < ROUNDS; round++) {
            Result result = decoder.decode(random.nextInt(10), reply(decoder, random));
            touch(result);
            withRows += result.rows().isEmpty() ? 0 : 1;
        }
        boolean hasRows = !decoder.layout().tables().isEmpty();
        assertTrue(!hasRows || withRows > ROUNDS / 50, "rows seen: " + withRows);
    }

    @ParameterizedTest
    @MethodSource("decoders")
    void garbageReplies(Operation decoder) {
        Random random = new Random(1000 + decoder.ordinal());
        for (int round = 0; round < ROUNDS; round++) {
            touch(decoder.decode(garbage(random, random.nextInt(200))));
        }
    }

    /** Not even a text that no decoder gives. */
    @ParameterizedTest
    @MethodSource("decoders")
    void garbageResults(Operation decoder) {
        Random random = new Random(2000 + decoder.ordinal());
        for (int round = 0; round < ROUNDS; round++) {
            touch(Result.of(decoder, random.nextInt(3) - 1, garbage(random, random.nextInt(300))));
        }
    }

    /** A good result with one character changed, left out or put in. */
    @ParameterizedTest
    @MethodSource("decoders")
    void damagedResults(Operation decoder) {
        Random random = new Random(3000 + decoder.ordinal());
        for (int round = 0; round < ROUNDS; round++) {
            String good = decoder.decode(reply(decoder, random)).text();
            int at = random.nextInt(good.length() + 1);
            int to = Math.min(good.length(), at + random.nextInt(2));
            String middle = garbage(random, random.nextInt(2));
            touch(Result.of(decoder, 1, good.substring(0, at) + middle + good.substring(to)));
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
                for (String tag : decoder.replyTags()) {
                    if (!tag.matches("67|68|M2")) {
                        reply.append('|').append(tag).append('=').append(tidy(tag));
                    }
                }
                reply.append("|01=");
            }
            reply.append("|00=9|67=999999|68=0000|01=");
            Result result = decoder.decode(reply.toString());
            assertTrue(result.faults().isEmpty(), () -> result + " " + result.faults());
            if (decoder.layout().kind() == Layout.Kind.LIST && result.isSuccess()
                    && !decoder.method().matches("QueryBankRemain.*|QueryFinance.*")) {
                assertEquals(records, result.rows().size(), result.text());
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
        List<String> tags = new ArrayList<>(decoder.replyTags());
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

    /** Reads everything that there is to read. */
    private static void touch(Result result) {
        assertNotNull(result.toString());
        if (result.message() != null) {
            assertEquals(result.text(), result.message().full());
            assertNotNull(result.message().text() + result.message().code());
            assertNotNull(result.message().source());
        }
        for (Fault fault : result.faults()) {
            assertTrue(fault.offset() >= 0 && fault.offset() <= result.text().length(),
                    () -> result + " " + fault);
        }
        for (Section section : result.sections()) {
            assertEquals(section.rows(), result.rows(section.table()));
            for (Row row : section.rows()) {
                touch(result, row);
            }
        }
    }

    private static void touch(Result result, Row row) {
        assertNotNull(row.toString());
        int index = 0;
        for (Column<?> column : row.table().columns()) {
            Cell<?> cell = row.cells().get(index++);
            assertEquals(column, cell.column());
            assertEquals(cell.text(), row.text(column));
            assertEquals(cell.value(), row.get(column));
            assertNotNull(cell.label());
            if (cell.offset() >= 0) {
                assertTrue(result.text().startsWith(cell.text(), cell.offset()),
                        () -> result + " " + cell.column());
            }
        }
    }
}
