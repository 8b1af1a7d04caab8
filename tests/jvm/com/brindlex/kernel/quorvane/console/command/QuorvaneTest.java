package com.brindlex.kernel.quorvane.console.command;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.console.message.DamagedMessagesTest;
import java.io.ByteArrayInputStream;
import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.PrintStream;
import java.io.PrintWriter;
import java.io.StringWriter;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import picocli.CommandLine;

/** The commands as a user runs them: what they write, and their exit codes. */
class QuorvaneTest {
    private static final String[] DEVICE = {"--serial-no", "SN1", "--local-ip", "10.0.0.1"};
    private static final String[] USER = {
        "--branch", "9A01", "--identity", "A123456789&1234567", "--password", "pass1234",
    };
    private static final String REPLY =
            "F=7|68=0000|00=1|67=1|68=0000|07=S|M5=王小明|16=9A00|17=123|18=4567|69=1|01=\n";

    /** What a command did. */
    private record Run(int code, String out, String err) {}

    private static Run run(String input, String... arguments) {
        InputStream in = System.in;
        PrintStream out = System.out;
        PrintStream err = System.err;
        ByteArrayOutputStream written = new ByteArrayOutputStream();
        ByteArrayOutputStream complained = new ByteArrayOutputStream();
        StringWriter usage = new StringWriter();
        StringWriter help = new StringWriter();
        System.setIn(new ByteArrayInputStream(input.getBytes(StandardCharsets.UTF_8)));
        System.setOut(new PrintStream(written, true, StandardCharsets.UTF_8));
        System.setErr(new PrintStream(complained, true, StandardCharsets.UTF_8));
        try {
            CommandLine command = Quorvane.commandLine();
            command.setErr(new PrintWriter(usage, true));
            command.setOut(new PrintWriter(help, true));
            int code = command.execute(arguments);
            return new Run(code, written.toString(StandardCharsets.UTF_8) + help,
                    complained.toString(StandardCharsets.UTF_8) + usage);
        } finally {
            System.setIn(in);
            System.setOut(out);
            System.setErr(err);
        }
    }

    private static String[] words(String first, String second, String[]... more) {
        List<String> all = new ArrayList<>(List.of(first, second));
        for (String[] some : more) {
            all.addAll(List.of(some));
        }
        return all.toArray(new String[0]);
    }

    @Test
    void listsAllOperations() {
        Run list = run("", "operations");
        Run json = run("", "operations", "--json");
        assertEquals(0, list.code);
        assertEquals(0, json.code);
        for (Operation operation : Operation.values()) {
            assertTrue(list.out.contains(operation.method()), operation.method());
            assertTrue(json.out.contains("\"" + operation.method() + "\""), operation.method());
        }
    }

    @Test
    void showsEachOperation() {
        for (Operation operation : Operation.values()) {
            Run shown = run("", "operations", operation.method().toLowerCase());
            assertEquals(0, shown.code, shown.err);
            for (Argument argument : Options.all(operation)) {
                assertTrue(shown.out.contains(argument.name()), shown.out);
            }
        }
    }

    @Test
    void encodesWhatItIsGiven() {
        Run login = run("", words("encode", "AuthEncode", DEVICE, USER));
        assertEquals(0, login.code, login.err);
        assertTrue(login.out.startsWith("F=7|KIND=S|BHNO=9A01|CB=1|IP=10.0.0.1|"), login.out);
        assertTrue(login.out.endsWith("|PWD=pass1234|FUNC=0|01=\n"), login.out);
    }

    private static Run order(String... more) {
        Map<String, String> options = new LinkedHashMap<>(
                Map.of("--stock-code", "2330", "--quantity", "2", "--side", "B"));
        for (int i = 0; i < more.length; i += 2) {
            options.put(more[i], more[i + 1]);
        }
        String[] all = options.entrySet().stream()
                               .flatMap(each -> Stream.of(each.getKey(), each.getValue()))
                               .toArray(String[]::new);
        return run("", words("encode", "SubmitOrderEncode", DEVICE, USER, all));
    }

    /** A request without what its time makes of it. */
    private static String untimed(Run run) {
        assertEquals(0, run.code, run.err);
        return run.out.replaceAll("(?<=\\|(?:65|22|23)=)[0-9]+", "").replaceAll("!!.*", "");
    }

    @Test
    void valuesAreWrittenAsPeopleWriteThem() {
        String plain = untimed(order("--price", "60050 hundredths", "--order-date", "1151121"));
        assertTrue(plain.contains("|31=600.50|"), plain);
        assertTrue(plain.contains("|32=B|"), plain);
        assertEquals(plain, untimed(order("--price", "600.5", "--order-date", "2026-11-21")));
        for (String side : new String[] {"BUY", "buy", "b", "B"}) {
            assertEquals(plain, untimed(order("--price", "600.50", "--order-date", "2026/11/21",
                    "--side", side, "--quantity", "2 lots")));
        }
        String sold = untimed(order("--price", "1005.0", "--side", "SELL", "--quantity", "1,000"));
        for (String price : new String[] {"1005", "1,005", "1005.00", "100500 hundredths"}) {
            assertEquals(sold, untimed(order("--price", price, "--side", "S", "--quantity",
                    "1000")), price);
        }
        String up = untimed(order("--price-kind", "LIMIT_UP"));
        assertEquals(untimed(order("--price-kind", "9")), up);
        String odd = untimed(order("--trade-type", "odd-lot", "--quantity", "500 shares"));
        assertEquals(untimed(order("--trade-type", "2", "--quantity", "500")), odd);
    }

    @Test
    void futuresPricesHaveFourDecimals() {
        String[] order = {"--commodity1", "TXF", "--month1", "202612", "--order-kind", "futures",
            "--side1", "sell", "--quantity", "2 contracts", "--price"};
        Run plain = run("", words("encode", "FutSubmitOrderEncode", DEVICE, USER, order,
                new String[] {"180005000 ten-thousandths"}));
        Run written = run("", words("encode", "FutSubmitOrderEncode", DEVICE, USER, order,
                new String[] {"18000.5"}));
        assertEquals(untimed(plain), untimed(written));
    }

    @Test
    void whatIsNotUnderstoodIsRefusedAtItsArgument() {
        String[][] wrong = {
            {"--side", "HOLD", "side must be B (BUY), S (SELL), not 'HOLD'"},
            {"--side", "X", "side must be B (BUY), S (SELL), not 'X'"},
            {"--price", "600.505", "price must have at most 2 decimals, not '600.505'"},
            {"--price", "cheap", "price must be an amount such as 600 or 600.5"},
            {"--price", "60050 ten-thousandths", "price must be an amount such as 600 or 600.5"},
            {"--price", "60050 lots", "price must be an amount such as 600 or 600.5"},
            {"--price", "6,00", "price must be an amount such as 600 or 600.5"},
            {"--order-date", "2026-02-30", "orderDate must be a day of the calendar"},
            {"--order-date", "1151341", "orderDate must be a day such as 2026-11-21"},
            {"--quantity", "500 shares", "quantity is counted in lots here, not '500 shares'"},
            {"--quantity", "many", "quantity must be a whole number, not 'many'"},
            {"--quantity", "99999999999", "quantity must be at most 2147483647, not '99999999999'"},
            {"--price", "-5", "price must not be negative, not '-5'"},
            {"--price", "21474836.48", "price must be at most 21474836.47, not '21474836.48'"},
            {"--price", "2147483648 hundredths", "price must be at most 21474836.47, not "},
            {"--price-kind", "MARKET", "priceKind must be 0 (LIMIT), 1 (LIMIT_DOWN)"},
        };
        for (String[] each : wrong) {
            Run refused = order(each[0], each[1]);
            assertEquals(2, refused.code, each[2]);
            assertTrue(refused.err.contains(each[2]), refused.err);
        }
    }

    /** A price is an amount, and the help of each request says so. */
    @Test
    void theHelpOfARequestSaysHowValuesAreWritten() {
        String help = run("", "encode", "SubmitOrderEncode", "--help").out.replaceAll("\\s+", " ");
        assertTrue(help.contains("--price=AMOUNT limit price"), help);
        assertFalse(help.contains("(hundredths)"), help);
        assertTrue(help.contains("B (BUY), S (SELL)"), help);
        assertTrue(help.contains("--price 600 or 600.5"), help);
        String futures = run("", "encode", "FutSubmitOrderEncode", "--help").out;
        assertFalse(futures.contains("(ten-thousandths)"), futures);
    }

    @Test
    void passwordsComeFromTheStandardInput() {
        String[] user = {"--branch", "9A01", "--identity", "A123456789&1234567"};
        Run read = run("secret1\nsecret2\n",
                words("encode", "ChangePasswordEncode", DEVICE, user));
        assertEquals(0, read.code, read.err);
        assertTrue(read.out.contains("secret1") && read.out.contains("secret2"), read.out);
        Run one = run("secret2\r\n", words("encode", "ChangePasswordEncode", DEVICE, USER,
                new String[] {"--new-password", "-"}));
        assertTrue(one.out.contains("=pass1234|") && one.out.contains("=secret2|"), one.out);
        Run none = run("", words("encode", "AuthEncode", DEVICE, user));
        assertEquals(2, none.code);
        assertTrue(none.err.contains("password must be given"), none.err);
    }

    @Test
    void everyEncoderHasItsHelp() {
        for (Operation operation : Operation.values()) {
            if (operation.isEncoder()) {
                Run help = run("", "encode", operation.method(), "--help");
                assertEquals(0, help.code);
                for (Argument argument : Options.all(operation)) {
                    assertTrue(help.out.contains("--" + Options.dashed(argument.name())), help.out);
                }
            }
        }
    }

    @Test
    void aRefusedRequestFails() {
        Run refused = run("", words("encode", "AuthEncode", USER,
                new String[] {"--serial-no", "SN1", "--local-ip", ""}));
        assertEquals(1, refused.code);
        assertEquals("", refused.out);
        assertTrue(refused.err.contains("localIP must be given"), refused.err);
        Run json = run("", words("encode", "AuthEncode", USER,
                new String[] {"--serial-no", "SN1", "--local-ip", "", "--json"}));
        assertEquals(1, json.code);
        assertTrue(json.out.contains("\"localIP must be given\""), json.out);
    }

    @Test
    void badUsageIsSaid() {
        String[][] wrong = {
            {}, {"nothing"}, {"encode"}, {"encode", "NoEncode"}, {"encode", "AuthEncode"},
            {"decode"}, {"decode", "NoDecode"}, {"decode", "AuthEncode"},
            {"decode", "AuthDecode", "/no/such/file"}, {"explain", "--operation", "None"},
            {"operations", "None"}, {"simulate", "--brokerage", "NONE"}, {"explain", ""},
            {"timeline", "--charset", "Klingon"}, {"page", "--charset", "Klingon"},
            words("encode", "AuthEncode", DEVICE, USER, new String[] {"--market", "one"}),
            words("encode", "AuthEncode", DEVICE, USER, new String[] {"--colour", "red"}),
        };
        for (String[] arguments : wrong) {
            Run bad = run("", arguments);
            assertEquals(2, bad.code, String.join(" ", arguments));
            assertFalse(bad.err.isBlank(), String.join(" ", arguments));
            assertFalse(bad.err.contains("Exception"), bad.err);
        }
    }

    @Test
    void decodesFromTheStandardInput() {
        Run shown = run(REPLY, "decode", "AuthDecode");
        assertEquals(0, shown.code, shown.err);
        assertTrue(shown.out.contains("王小明"), shown.out);
        Run raw = run(REPLY, "decode", "AuthDecode", "--raw", "-");
        assertEquals("1!<S>@王小明@1234567@9A00@1!\n", raw.out);
        Run json = run(REPLY, "--json", "decode", "AuthDecode");
        assertTrue(json.out.contains("\"account\": \"1234567\""), json.out);
        Run failed = run("F=7|68=9999|M2=密碼錯誤|", "decode", "OpenAccountDecode", "--json");
        assertEquals(1, failed.code);
        assertTrue(failed.out.contains("\"code\": \"9999\""), failed.out);
    }

    @Test
    void explainsSoundAndDamagedLines() {
        Run sound = run("D/gatewayjni(  77): " + REPLY, "explain");
        assertEquals(0, sound.code, sound.out);
        assertTrue(sound.out.contains("label of the account") || sound.out.contains("M5"));
        Run damaged = run(REPLY.replace("|01=", ""), "explain", "--json");
        assertEquals(1, damaged.code);
        assertTrue(damaged.out.contains("is not closed"), damaged.out);
        assertEquals(1, run("\n\n", "explain").code);
    }

    @Test
    void coloursOnlyWhenAsked() {
        assertFalse(run("2!x", "explain").out.contains("\033["));
        assertTrue(run("2!x", "explain", "--colour", "always").out.contains("\033["));
        assertFalse(run("2!x", "explain", "--colour", "always", "--json").out.contains("\033["));
    }

    @Test
    void playsASession() {
        Run session = run("AuthEncode\nSubmitOrder --stock-code 2330 --quantity 2 --price 995 "
                        + "--side B --handling-flag 1\nfill A0001 1000 994.50\nQueryReply\nquit\nbogus\n",
                "simulate");
        assertEquals(0, session.code, session.err);
        assertTrue(session.out.contains("台北證券"), session.out);
        assertTrue(session.out.contains("995.00"), session.out);
        assertTrue(session.out.contains("994.50"), session.out);
        Run wrong = run("AuthEncode --password wrong\nbogus\nset x y\nfill A\nfill A0009 1 1\n",
                "simulate");
        assertEquals(1, wrong.code);
        assertTrue(wrong.err.contains("bogus"), wrong.err);
    }

    @Test
    void aRequestOfTheConsoleExplainsItself() {
        Run login = run("", words("encode", "AuthEncode", DEVICE, USER));
        Run explained = run(login.out, "explain");
        assertEquals(0, explained.code, explained.out);
        assertTrue(explained.out.contains("request: login"), explained.out);
        Run damaged = run(login.out.replace("|IDNO=", "|IDNA="), "explain");
        assertEquals(1, damaged.code);
        assertTrue(damaged.out.contains("IDNO"), damaged.out);
        assertTrue(damaged.out.contains("AuthEncode"), damaged.out);
        assertTrue(damaged.out.contains("^"), damaged.out);
    }

    private static final String LOG = """
            01-15 13:45:21.000  1234  5678 D gatewayjni: F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1\
            |11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|15=1|IDNO=A123456789|ACNO=1234567\
            |PWD=pass1234|FUNC=0|01=
            01-15 13:45:21.080  1234  5678 D gatewayjni: F=7|65=0013452107|68=E002|M2=密碼錯誤|
            """;

    @Test
    void aTimelineIsALineAMessage() {
        Run shown = run(LOG, "timeline");
        assertEquals(0, shown.code, shown.err);
        assertEquals(2, shown.out.lines().count(), shown.out);
        assertTrue(shown.out.contains("refused: 密碼錯誤 (E002) (80 ms)"), shown.out);
        assertTrue(shown.err.contains("2 messages: 1 requests, 1 answers"), shown.err);
        assertEquals(1, run(LOG, "timeline", "--failures").out.lines().count());
        assertEquals(1, run(LOG, "timeline", "--stock", "2330").code);
        Run csv = run(LOG, "timeline", "--csv");
        assertTrue(csv.out.startsWith("line,time,direction,"), csv.out);
        assertTrue(csv.out.contains(",1234567,,login,sent,0013452107,,,\r\n"), csv.out);
        Run calculated = run(LOG.replace("ACNO=1234567", "ACNO==1+2"), "timeline", "--csv");
        assertTrue(calculated.out.contains(",'=1+2,"), calculated.out);
        Run both = run(LOG, "timeline", "--csv", "--json");
        assertEquals(2, both.code, both.out);
        assertTrue(both.err.contains("--csv and --json exclude each other"), both.err);
        Run json = run(LOG, "timeline", "--json");
        assertTrue(json.out.lines().allMatch(line -> line.startsWith("{\"line\":")), json.out);
        assertEquals(1, run("nothing\n", "timeline").code);
    }

    /** Of a log, where the line before a reply names its decoder. */
    @Test
    void checkNamesEveryDamage() {
        DamagedMessagesTest.all().forEach((kind, text) -> {
            String decoder = text.startsWith("|00=") ? "QueryOrderDecode: Len:"
                    + text.getBytes(StandardCharsets.UTF_8).length + "\n" : "";
            Run checked = run(decoder + text + "\n~CGatewayPub\n", "check");
            assertEquals(1, checked.code, kind);
            int line = decoder.isEmpty() ? 1 : 2;
            assertTrue(checked.out.startsWith("(input):" + line + ": " + kind + ": "),
                    () -> kind + ": " + text + "\n" + checked.out);
            assertEquals(1, checked.out.lines().count(), () -> text + "\n" + checked.out);
        });
    }

    @Test
    void checkTellsFaultsByTheirNames() {
        assertEquals(0, run(LOG, "check").code);
        Run damaged = run(LOG.replace("VER=24369", "VER=1"), "check");
        assertEquals(1, damaged.code);
        assertTrue(damaged.out.startsWith("(input):1: wrong-constant: "), damaged.out);
        Run json = run(LOG.replace("VER=24369", "VER=1"), "check", "--json");
        assertTrue(json.out.contains("\"kind\":\"wrong-constant\""), json.out);
        assertEquals(2, run("", "check", "/no/such/log").code);
    }

    @Test
    void maskKeepsTheLogReadable() {
        Run masked = run(LOG, "mask");
        assertEquals(0, masked.code, masked.err);
        assertFalse(masked.out.contains("A123456789") || masked.out.contains("pass1234"));
        assertEquals(0, run(masked.out, "check").code);
        assertTrue(run(LOG, "mask", "--keep", "id,account").out.contains("IDNO=A123456789"));
        assertEquals(2, run(LOG, "mask", "--keep", "password").code);
        Run foreign = run("A123456789 and other lines\n", "mask");
        assertEquals(1, foreign.code);
        assertEquals("", foreign.out);
        assertTrue(foreign.err.contains("--charset"), foreign.err);
    }

    @Test
    void maskLeavesTheLogItselfAlone(@TempDir Path folder) throws IOException {
        Path log = Files.writeString(folder.resolve("log.txt"), LOG);
        Path same = Files.createSymbolicLink(folder.resolve("same.txt"), log);
        assertEquals(2, run("", "mask", log.toString(), "-o", same.toString()).code);
        assertEquals(LOG, Files.readString(log));
        Path masked = folder.resolve("masked.txt");
        assertEquals(0, run("", "mask", log.toString(), "-o", masked.toString()).code);
        assertFalse(Files.readString(masked).contains("pass1234"));
    }

    @Test
    void aMessageCanBeAnArgument() {
        String message = LOG.lines().findFirst().orElseThrow().replaceFirst(".*gatewayjni: ", "");
        Run explained = run("", "explain", message);
        assertEquals(0, explained.code, explained.err);
        assertTrue(explained.out.startsWith("request: login"), explained.out);
        assertEquals(0, run("", "check", message).code);
    }

    @Test
    void versionAndCompletion() {
        assertTrue(run("", "--version").out.matches("(?s)quorvane .*[0-9]+\\.[0-9]+\\.[0-9]+\\s*"));
        Run completion = run("", "completion");
        assertTrue(completion.out.contains("complete -F _complete_quorvane"), completion.err);
        assertTrue(completion.out.contains("--failures"));
    }
}
