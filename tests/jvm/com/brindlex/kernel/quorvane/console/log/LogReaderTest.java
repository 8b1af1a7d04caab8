package com.brindlex.kernel.quorvane.console.log;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.console.message.Message;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import java.io.IOException;
import java.io.InputStream;
import java.io.PipedInputStream;
import java.io.PipedOutputStream;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.Base64;
import java.util.List;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.Timeout;

/** Messages within logs: split, cut, wrapped, in any charset. */
class LogReaderTest {
    private static final String HEAD = "01-15 13:45:21.123  1234  5678 D gatewayjni: ";
    private static final String LOGIN = "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE"
            + "|VER=24369|65=0013452107|SN=SN0001|15=1|IDNO=A123456789|ACNO=1234567|PWD=pw"
            + "|FUNC=0|01=";
    private static final String REGISTER = "F=7|KIND=S|BHNO=|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369"
            + "|65=0013452107|SN=SN0001|FUNC=10|MSG=";

    private static List<String> texts(String log) throws IOException {
        return RecordedLog.read(log).stream().map(LogMessage::text).toList();
    }

    private static List<String> flaws(String log) throws IOException {
        List<String> kinds = new ArrayList<>();
        RecordedLog.read(log).forEach(each -> each.flaws().forEach(flaw -> kinds.add(flaw.kind())));
        return kinds;
    }

    /** A list of records, so many bytes long at least. */
    private static String reply(int bytes) {
        StringBuilder reply = new StringBuilder("F=7|65=0013452107|68=0000");
        for (int i = 1; reply.length() < bytes; i++) {
            reply.append("|00=").append(i).append("|67=").append(i)
                    .append("|68=0000|07=S|M5=台北|16=9A00|17=123|18=4567|69=1|01=");
        }
        return reply.append("|00=9|67=999999|68=0000|01=").toString();
    }

    private static int bytes(String text) {
        return text.getBytes(StandardCharsets.UTF_8).length;
    }

    @Test
    void certificatesOfSeveralLinesAreJoined() throws IOException {
        byte[] certificate = new byte[2500];
        String base64 = Base64.getMimeEncoder(1024, new byte[] {'\r', '\n'})
                .encodeToString(certificate) + "\r\n";
        String request = REGISTER + base64 + "|01=";
        for (String end : new String[] {"\r", ""}) {  // editors take the carriage return away
            String log = HEAD + request.replace("\r\n", end + "\n" + HEAD) + "\n" + HEAD
                    + "~CGatewayPub\n";
            assertEquals(List.of(request, "~CGatewayPub"), texts(log));
        }
        Message message = MessageReader.read(request);
        assertEquals(List.of(), message.faults());
        assertEquals("RegisterCertEncode", message.operation());
    }

    @Test
    void messagesOfSeveralLinesAreJoinedInEveryFormat() throws IOException {
        String base64 = Base64.getMimeEncoder(1024, new byte[] {'\r', '\n'})
                .encodeToString(new byte[2500]) + "\r\n";
        String notice = "F=7|68=0000|M3=one\n  two\n three|00=1|67=1|68=0000|01=";
        List<String> messages = List.of(REGISTER + base64 + "|01=", "~CGatewayPub",
                "AuthDecode: Len:" + bytes(notice), notice, "~CGatewayPub");
        for (Dress dress : Dress.values()) {
            for (String end : new String[] {"\n", "\r\n", "\r\r\n"}) {  // as Windows writes it
                assertEquals(messages, texts(dress.log(messages).replace("\n", end)),
                        () -> dress + " " + end.length());
            }
        }
    }

    @Test
    void aReplyOfSeveralLinesIsJoinedByItsLength() throws IOException {
        String reply = "F=7|68=0000|M3=one\ntwo\n\nfour|00=1|67=1|68=0000|01=";
        String log = HEAD + "AuthDecode: Len:" + bytes(reply) + "\n" + HEAD
                + reply.replace("\n", "\n" + HEAD) + "\n" + HEAD + "[strResult]0000\n";
        assertEquals(List.of("AuthDecode: Len:" + bytes(reply), reply, "[strResult]0000"),
                texts(log));
    }

    @Test
    void whatAnAppLogsInPiecesIsJoined() throws IOException {
        String reply = reply(9000);
        List<String> pieces = new ArrayList<>();
        for (int at = 0; at < reply.length(); at += 4000) {
            pieces.add(reply.substring(at, Math.min(reply.length(), at + 4000)));
        }
        String told = HEAD + "AuthDecode: Len:" + bytes(reply) + "\n" + HEAD
                + String.join("\n" + HEAD, pieces) + "\n" + HEAD + "~CGatewayPub\n";
        assertEquals(reply, texts(told).get(1));
        assertEquals(List.of(), flaws(told));
        String untold = HEAD + String.join("\n" + HEAD, pieces) + "\n" + HEAD + "~CGatewayPub\n";
        assertEquals(List.of(reply, "~CGatewayPub"), texts(untold));
    }

    @Test
    void whatAndroidCutIsTold() throws IOException {
        String reply = reply(9000);
        String cut = reply;
        while (bytes(cut) > 4055) {
            cut = cut.substring(0, cut.length() - 1);
        }
        String told = HEAD + "AuthDecode: Len:" + bytes(reply) + "\n" + HEAD + cut + "\n" + HEAD
                + "[strResult]0000\n";
        assertEquals(List.of("cut-by-log"), flaws(told));
        assertEquals(cut, texts(told).get(1));
        String untold = HEAD + cut + "\n" + HEAD + "~CGatewayPub\n";
        assertEquals(List.of("cut-by-log"), flaws(untold));
        String request = REGISTER + "A".repeat(4055 - REGISTER.length());
        assertEquals(List.of("cut-by-log"), flaws(HEAD + request + "\n" + HEAD + "~CGatewayPub\n"));
        assertEquals(List.of("cut-by-log"), flaws(HEAD + request + "\n"));
    }

    /** The header of the line before helps to read the next one, and never decides it. */
    @Test
    void blanksBehindAHeaderAreRead() throws IOException {
        String bare = HEAD.stripTrailing();
        for (String first : new String[] {bare, HEAD, HEAD + "x", HEAD + " x"}) {
            String text = first.substring(Math.min(first.length(), HEAD.length()));
            assertEquals(List.of(text, " y", "~CGatewayPub", "", "z"),
                    texts(first + "\n" + HEAD + " y\n" + HEAD + "~CGatewayPub\n" + bare + "\n"
                            + HEAD + "z\n"));
        }
        String studio = "2024-01-15 13:45:21.123  1234-5678  gatewayjni  com.example  D";
        assertEquals(List.of("", " y", "x", "z"), texts(studio + "\n" + studio + "   y\n" + studio
                + "  x\n" + studio + " z\n"));
        String other = HEAD.replace("5678", "5679").replace("21.123", "21.1234");
        List<LogMessage> read = RecordedLog.read(HEAD + "x\n" + other + "y\n" + HEAD + "z\n");
        assertEquals(List.of("5678", "5679", "5678"),
                read.stream().map(each -> each.header().thread()).toList());
        assertEquals("01-15 13:45:21.1234", read.get(1).header().time());
    }

    @Test
    void oneMessageDoesNotSwallowTheNext() throws IOException {
        String open = REGISTER + "QUJD";
        assertEquals(List.of(open, LOGIN), texts(HEAD + open + "\n" + HEAD + LOGIN + "\n"));
        String other = HEAD.replace("5678", "9999");
        assertEquals(List.of(open, "REVG"), texts(HEAD + open + "\n" + other + "REVG\n"));
    }

    @Test
    void aMessageIsFoundBehindAnyPrefix() throws IOException {
        for (String around : new String[] {
                "13:45:21 INFO [main] GatewayClient - send: %s", ">> %s", "request=\"%s\"",
                "{\"time\":1,\"sent\":\"%s\\n\"}", "'%s'", "{\"sent\":\"%s\",\"id\":\"a\"}",
                "send(%s) [main] (1)", "<%s> 12 bytes", "[%s] {x}", "{%s}", "“%s”", "「%s」。",
                "I/MyApp( 77): out %s",
                "01-15 13:45:21.123  1234  5678 I okhttp.OkHttpClient: %s", "[net] %s"}) {
            assertEquals(List.of(LOGIN), texts(around.replace("%s", LOGIN) + "\n"), around);
        }
        String refused = "F=1|39=E|19=|K1=餘額不足(E1) \"x\"";
        assertEquals(List.of(refused), texts("recv(" + refused + ") in 3 ms (ok)\n"));
        assertEquals(List.of("|00=1|68=0000|M2=x|01="),
                texts("recv -> |00=1|68=0000|M2=x|01=\n"));
        assertEquals(List.of(), texts("01-15 13:45:21.123  1234  5678 I App: started [12!x@y]\n"));
    }

    @Test
    void bytesThatAreNoCharacterAreTold() throws IOException {
        byte[] big5 = (HEAD + "F=7|68=1234|M2=密碼錯誤|\n").getBytes(Charset.forName("Big5"));
        List<LogMessage> wrong = RecordedLog.read(big5, StandardCharsets.UTF_8);
        assertEquals("broken-bytes", wrong.get(0).flaws().get(0).kind());
        List<LogMessage> right = RecordedLog.read(big5, Charset.forName("Big5"));
        assertEquals(List.of(), right.get(0).flaws());
        assertEquals("F=7|68=1234|M2=密碼錯誤|", right.get(0).text());
    }

    @Test
    void aLineIsKeptUpToABound() throws IOException {
        String line = REGISTER + "A".repeat(3 * LineReader.LONGEST) + "|01=";
        List<LogMessage> read = RecordedLog.read(line + "\n" + LOGIN + "\n");
        assertEquals(LineReader.LONGEST, read.get(0).text().length());
        assertTrue(read.get(0).flaws().stream().anyMatch(
                flaw -> flaw.kind().equals("line-too-long")));
        assertEquals(LOGIN, read.get(1).text());
    }

    /** A message is handed on before the next line is there. */
    @Test
    @Timeout(60)
    void messagesComeAsTheyAreLogged() throws IOException {
        PipedOutputStream logging = new PipedOutputStream();
        InputStream log = new PipedInputStream(logging, 65536);
        try (LogReader reader = new LogReader(new LineReader(log, StandardCharsets.UTF_8),
                LogReader.TAG)) {
            for (String text : List.of(LOGIN, "~CGatewayPub", "F=7|68=1234|M2=no|")) {
                logging.write((HEAD + text + "\n").getBytes(StandardCharsets.UTF_8));
                logging.flush();
                assertEquals(text, reader.next(line -> { }).text());
            }
            logging.close();
            assertNull(reader.next(line -> { }));
        }
    }
}
