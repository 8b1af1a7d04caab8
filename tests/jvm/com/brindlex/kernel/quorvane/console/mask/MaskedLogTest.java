package com.brindlex.kernel.quorvane.console.mask;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.console.log.Dress;
import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.log.RecordedLog;
import com.brindlex.kernel.quorvane.console.timeline.Event;
import com.brindlex.kernel.quorvane.console.timeline.Row;
import com.brindlex.kernel.quorvane.console.timeline.Timeline;
import java.io.IOException;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.Base64;
import java.util.EnumSet;
import java.util.List;
import java.util.Set;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import org.junit.jupiter.api.Test;

/** A masked log holds no secret in any form, and says the same but for them. */
class MaskedLogTest {
    private static final String HEAD = "01-15 13:45:21.123  1234  5678 D gatewayjni: ";
    private static final String LOGIN = "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE"
            + "|VER=24369|65=0013452107|SN=SN0001|15=1|IDNO=A123456789|ACNO=1234567"
            + "|PWD=open sesame|FUNC=0|01=";
    private static final Pattern FIELD =
            Pattern.compile("\\|(?:PWD|54|55|IDNO|ACNO|NAME|ADDRESS|TEL|BIRTH)=([^|]{4,})");

    private static String mask(String log, Secret... kept) throws IOException {
        StringBuilder out = new StringBuilder();
        Set<Secret> keep = EnumSet.noneOf(Secret.class);
        keep.addAll(List.of(kept));
        new MaskedLog(keep).mask(() -> RecordedLog.reader(log.getBytes(StandardCharsets.UTF_8),
                StandardCharsets.UTF_8), out::append);
        return out.toString();
    }

    /** Every secret of the demonstration, told from its messages and not by the code that masks. */
    private static Set<String> secrets(List<String> messages) {
        Set<String> secrets = new java.util.HashSet<>();
        for (String message : messages) {
            Matcher field = FIELD.matcher(message);
            while (field.find()) {
                secrets.add(field.group(1));
                secrets.add(field.group(1).replace("%20", " "));
            }
            Matcher certificate = Pattern.compile("\\|MSG=([A-Za-z0-9+/=\r\n]+)").matcher(message);
            while (certificate.find()) {
                secrets.add(certificate.group(1).strip());
                secrets.add(new String(Base64.getMimeDecoder().decode(certificate.group(1)),
                        StandardCharsets.UTF_8).strip());
            }
            Matcher account = Pattern.compile("\\|17=([0-9]+)\\|18=([0-9]+)").matcher(message);
            while (account.find()) {
                secrets.add(account.group());
                secrets.add(String.format("%07d",
                        Integer.parseInt(account.group(1) + account.group(2))));
            }
        }
        return secrets;
    }

    private static List<Row> rows(String log) throws IOException {
        Timeline timeline = new Timeline();
        List<Row> rows = new ArrayList<>();
        for (LogMessage each : RecordedLog.read(log)) {
            Event event = timeline.accept(each);
            if (event != null) {
                rows.add(event.row());
            }
        }
        return rows;
    }

    private static String said(Row row) {
        return row.time() + row.isRequest() + row.operation() + row.instrument() + row.words()
                + row.status() + row.requestId() + row.millis() + row.faults();
    }

    @Test
    void theRecordedSessionHoldsNoSecretAnyMore() throws IOException {
        Set<String> secrets = secrets(RecordedLog.messages());
        assertTrue(secrets.size() > 15, secrets::toString);
        for (Dress dress : List.of(Dress.HOST, Dress.BRIEF, Dress.PROCESS, Dress.RAW,
                Dress.THREADTIME, Dress.COLOUR, Dress.PRINTABLE, Dress.LONG, Dress.STUDIO)) {
            String log = dress.log(RecordedLog.messages());
            String masked = mask(log);
            for (String secret : secrets) {
                assertFalse(masked.contains(secret), () -> dress + " holds " + secret);
                assertFalse(masked.contains(Base64.getEncoder().encodeToString(
                        secret.getBytes(StandardCharsets.UTF_8))), () -> dress + ": " + secret);
            }
            Matcher base64 = Pattern.compile("[A-Za-z0-9+/]{8,}={0,2}").matcher(masked);
            while (base64.find()) {
                assertNoSecret(decoded(base64.group()), secrets, dress + " " + base64.group());
            }
            assertNoSecret(masked.replace("%20", " "), secrets, dress.name());
            List<Row> before = rows(log);
            List<Row> after = rows(masked);
            assertEquals(before.stream().map(MaskedLogTest::said).toList(),
                    after.stream().map(MaskedLogTest::said).toList(), dress.name());
        }
    }

    private static void assertNoSecret(String text, Set<String> secrets, String where) {
        for (String secret : secrets) {
            assertFalse(text.contains(secret), () -> where + " holds " + secret);
        }
    }

    /** What a text is the Base64 of, if it is cut anywhere; nothing where it is none. */
    private static String decoded(String text) {
        try {
            String whole = text.replace("=", "");
            return new String(Base64.getDecoder().decode(
                    whole.substring(0, whole.length() - (whole.length() % 4 == 1 ? 1 : 0))),
                    StandardCharsets.UTF_8);
        } catch (IllegalArgumentException none) {
            return "";
        }
    }

    @Test
    void theSamePersonIsTheSameEverywhere() throws IOException {
        List<Row> before = rows(Dress.THREADTIME.log(RecordedLog.messages()));
        List<Row> after = rows(mask(Dress.THREADTIME.log(RecordedLog.messages())));
        java.util.Map<String, String> names = new java.util.HashMap<>();
        for (int i = 0; i < before.size(); i++) {
            String name = names.putIfAbsent(before.get(i).account(), after.get(i).account());
            assertTrue(name == null || name.equals(after.get(i).account()));
        }
        assertEquals(names.size(), new java.util.HashSet<>(names.values()).size());
    }

    @Test
    void maskingTwiceChangesNothingButNumbers() throws IOException {
        String masked = mask(Dress.BRIEF.log(RecordedLog.messages()));
        assertEquals(masked.lines().count(), mask(masked).lines().count());
        assertEquals(rows(masked).stream().map(MaskedLogTest::said).toList(),
                rows(mask(masked)).stream().map(MaskedLogTest::said).toList());
    }

    @Test
    void secretsGoWhereverTheyStand() throws IOException {
        String order = "F=1|KIND=S|PWD=open%20sesame|33=!!9A00_1234567_A123456789_I|PL=S!!SN,9A00-"
                + "1234567,A123456789,I";
        String log = "open sesame\nA123456789\n1234567\nA123456789&1234567\nlogin of A123456789 with "
                + "'open sesame'\n" + HEAD + LOGIN + "\n" + HEAD + order + "\n"
                + "I/App( 1): pw=open%20sesame id=QTEyMzQ1Njc4OQ==\n"
                + HEAD + "2!<S>@a@1234567@9A00@1!\n";
        String masked = mask(log);
        for (String secret : List.of("sesame", "A123456789", "1234567", "QTEyMzQ1Njc4OQ")) {
            assertFalse(masked.contains(secret), masked);
        }
        assertTrue(masked.startsWith("password1\nA000000001\n0000001\nA000000001&0000001\n"), masked);
        assertTrue(masked.contains("33=!!9A00_0000001_A000000001_I|PL=S!!SN,9A00-0000001,A000000001"));
    }

    @Test
    void oldAndNewPasswordsAreAlike() throws IOException {
        String change = LOGIN.replace("FUNC=0", "FUNC=1|54=open%20sesame|55=Xyz12345");
        String again = LOGIN.replace("open sesame", "Xyz12345");
        String masked = mask(HEAD + change + "\n" + HEAD + again + "\n");
        assertTrue(masked.contains("PWD=password1|FUNC=1|54=password1|55=password2|"), masked);
        assertTrue(masked.contains("PWD=password2|FUNC=0"), masked);
    }

    /** The mark of a signature payload may stand in a password, too. */
    @Test
    void aPasswordWithThePayloadsMarkGoes() throws IOException {
        for (String password : List.of("hi!!there", "!!x9z", "x9z!!", "a!!!b9")) {
            String order = "F=1|KIND=S|BHNO=9A00|CB=1|PWD=" + password
                    + "|32=B|33=!!9A00_1234567_A123456789_I";
            String change = LOGIN.replace("open sesame|FUNC=0", password + "|FUNC=1|54=" + password
                    + "|55=N" + password);
            String log = HEAD + change + "\n" + HEAD + order + "\n" + password + "\n";
            String masked = mask(log);
            assertFalse(masked.contains(password.replace("!", "")), masked);
            assertFalse(masked.contains(password), masked);
            assertTrue(masked.contains("PWD=password1|FUNC=1|54=password1|55=password2|"), masked);
            assertTrue(masked.contains("PWD=password1|32=B|33=!!9A00_0000001_A000000001_I"), masked);
            assertTrue(masked.endsWith("\npassword1\n"), masked);
        }
    }

    /** Passwords always go, also from the text of a certificate that is kept. */
    @Test
    void aKeptCertificateHoldsNoOtherSecret() throws IOException {
        String text = "CSR " + "x".repeat(800) + " of A123456789 with open sesame";
        String request = LOGIN.replace("FUNC=0", "FUNC=13|MSG=" + Base64.getMimeEncoder(1024,
                new byte[] {'\r', '\n'}).encodeToString(text.getBytes(StandardCharsets.UTF_8))
                + "|BIRTH=19800229");
        String masked = mask(HEAD + request.replace("\n", "\n" + HEAD) + "\n", Secret.SIGNATURE);
        String kept = RecordedLog.read(masked).get(0).text();
        String message = kept.substring(kept.indexOf("MSG=") + 4, kept.indexOf("|BIRTH"));
        assertEquals(text.replace("A123456789", "A000000001").replace("open sesame", "password1"),
                new String(Base64.getMimeDecoder().decode(message), StandardCharsets.UTF_8));
    }

    @Test
    void aPasswordGoesHoweverALinkWritesIt() throws IOException {
        String login = HEAD + LOGIN.replace("open sesame", "o'pen (se)~sam!") + "\n";
        for (String written : List.of("o%27pen+%28se%29%7Esam%21", "o%27pen%20%28se%29%7Esam%21",
                "o'pen%20(se)~sam!")) {
            assertTrue(mask(login + "https://x/?p=" + written + "\n")
                    .endsWith("https://x/?p=password1\n"), written);
        }
    }

    @Test
    void aLogThatNobodyUnderstandsIsNotWritten() throws IOException {
        assertEquals("", mask("A123456789\nsome lines\n"));
    }

    @Test
    void aShortPasswordIsReplacedInItsPlacesAlone() throws IOException {
        String masked = mask("7\n" + HEAD + LOGIN.replace("open sesame", "7") + "\n");
        assertTrue(masked.startsWith("password1\n"), masked);
        assertTrue(masked.contains("F=7|KIND"), masked);
        assertTrue(masked.contains("PWD=password1|"), masked);
    }

    @Test
    void whatIsKeptStays() throws IOException {
        String masked = mask(HEAD + LOGIN + "\n", Secret.ID, Secret.ACCOUNT);
        assertTrue(masked.contains("IDNO=A123456789|ACNO=1234567|PWD=password1|"), masked);
    }

    /** The length line still counts the bytes of the reply behind it. */
    @Test
    void lengthsAreCountedAnew() throws IOException {
        String reply = "F=7|65=0013452107|68=0000|00=1|67=1|68=0000|M2=CERTIFICATE\nOF "
                + "A123456789|01=";
        String log = HEAD + LOGIN + "\n" + HEAD + "GetCertDecode: Len:" + reply.length() + "\n" + HEAD
                + reply.replace("\n", "\n" + HEAD) + "\n" + HEAD + "~CGatewayPub\n";
        String masked = mask(log);
        assertFalse(masked.contains("CERTIFICATE") || masked.contains("A123456789"), masked);
        List<LogMessage> read = RecordedLog.read(masked);
        String length = read.get(1).text();
        assertEquals("GetCertDecode: Len:" + read.get(2).text().length(), length);
        assertEquals(List.of(), read.get(2).flaws());
    }

    @Test
    void everythingElseStaysAsItIs() throws IOException {
        String log = "--------- beginning of main\r\n\r\nno secret here\r\n" + HEAD
                + "F=7|68=0000|00=1|67=1|68=0000|29=2330|01=\r\nlast";
        assertEquals(log, mask(log));
    }
}
