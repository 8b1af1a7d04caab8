package com.brindlex.kernel.quorvane.console.timeline;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.console.log.LineReader;
import com.brindlex.kernel.quorvane.console.log.LogReader;
import java.io.ByteArrayInputStream;
import java.io.IOException;
import java.io.InputStream;
import java.io.SequenceInputStream;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.Enumeration;
import java.util.List;
import org.junit.jupiter.api.Test;

/** Which reply answers which request, and what a timeline says of it. */
class TimelineTest {
    private static String at(int millis, int thread, String text) {
        return String.format("01-15 13:45:%02d.%03d  1234  %d D gatewayjni: %s%n", millis / 1000,
                millis % 1000, thread, text);
    }

    private static String credit(String id, String stock) {
        return "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO%20DEFINE|VER=24369|65=00" + id
                + "|SN=SN0001|15=1|IDNO=A123456789|ACNO=1234567|PWD=pw||FUNC=8|29=" + stock
                + "|01=";
    }

    private static String login(String id) {
        return credit(id, "0").replace("||FUNC=8|29=0|", "|FUNC=0|").replace("%20", " ");
    }

    private static String order(String id, String stock) {
        return "F=1|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|SN=SN0001|65=00" + id
                + "|14=I|15=0|IDNO=A123456789|ACNO=1234567|PWD=pw|21=20240115|22="
                + id.substring(0, 6) + "|23=" + id + "|24=5|V4=|27=0|28=0|29=" + stock
                + "|30=2000|UT=1000|13=7|N6=1|31=600.00|M8=0|32=B|33=!!9A00_1234567_A123456789_I_B_"
                + stock + "_2000_600.00";
    }

    private static List<Row> rows(String... lines) throws IOException {
        return TimelineFormatsTest.rows(String.join("", lines));
    }

    @Test
    void theRequestIdTiesAReplyWhateverTheOrder() throws IOException {
        List<Row> rows = rows(at(0, 1, credit("13452101", "2330")),
                at(5, 2, credit("13452102", "2317")),
                at(90, 3, "F=7|65=0013452102|00=1|68=0000|29=2317|A0=1|01="),
                at(120, 3, "F=7|65=0013452101|00=1|68=E1|M2=無此股票|01="));
        assertEquals(2, rows.get(2).requestLine());
        assertEquals("2317", rows.get(2).instrument());
        assertEquals(85, rows.get(2).millis());
        assertEquals(1, rows.get(3).requestLine());
        assertEquals(120, rows.get(3).millis());
        assertEquals("refused: 無此股票 (E1)", rows.get(3).words());
        assertEquals("refused", rows.get(3).status());
        assertTrue(rows.get(3).isFailure());
    }

    @Test
    void withoutAnIdTheOldestFittingRequestIsAnswered() throws IOException {
        List<Row> rows = rows(at(0, 1, login("13452101")), at(5, 1, order("13452102", "2330")),
                at(9, 1, order("13452103", "2317")), at(30, 1, "|39= |19=S|46=G1|44=20240115|"),
                at(40, 1, "|39=E|19=|K1=庫存不足|"), at(50, 1, "F=7|68=0000|01="));
        assertEquals(List.of(2L, 3L, 1L), rows.subList(3, 6).stream().map(Row::requestLine).toList());
        assertEquals("accepted G1", rows.get(3).words());
        assertEquals("buy 2 lots 2330 at 600.00", rows.get(1).words());
        assertEquals("refused: 庫存不足", rows.get(4).words());
    }

    @Test
    void threadsDoNotDisturbEachOther() throws IOException {
        List<Row> rows = rows(at(0, 1, login("13452101")), at(1, 1, "~CGatewayPub"),
                at(2, 1, order("13452102", "2330")), at(3, 1, "~CGatewayStk"),
                at(4, 1, "~CGatewayPub"),
                at(5, 7, "AuthDecode: Len:33"), at(6, 8, "G0001@1130115@@1!"),
                at(7, 7, "F=7|65=0013452101|68=0000|01="), at(8, 8, "~CGatewayStk"),
                at(9, 7, "0!"), at(10, 8, "~CGatewayPub"), at(11, 7, "~CGatewayPub"));
        assertEquals(4, rows.size(), rows::toString);
        assertEquals("accepted G0001", rows.get(2).words());
        assertEquals(3, rows.get(2).requestLine());
        assertEquals("0 accounts", rows.get(3).words());
        assertEquals(1, rows.get(3).requestLine());
    }

    @Test
    void anEmptyResultOfTheStockClassAcceptsACancellation() throws IOException {
        String cancel = order("13452102", "2330").replace("14=I", "14=D").replaceFirst("\\|27=.*",
                "|10=20240115|36=W0001|46=G0002|28=0|29=2330|31=60000|32=B|N6=1|27=0|UT=1000|13=7"
                + "!!9A00_1234567_A123456789_D_W0001_B_2330__");
        List<Row> rows = rows(at(0, 1, cancel), at(1, 1, "~CGatewayStk"), at(2, 1, "~CGatewayPub"),
                at(20, 1, ""), at(21, 1, "~CGatewayStk"), at(22, 1, "~CGatewayPub"));
        assertEquals(2, rows.size(), rows::toString);
        assertEquals("cancel W0001 (buy 2330)", rows.get(0).words());
        assertEquals(List.of(), rows.get(0).faults());
        assertEquals("accepted", rows.get(1).words());
        assertEquals(20, rows.get(1).millis());
    }

    @Test
    void anAppThatLogsTheSameMessagesAddsNoRows() throws IOException {
        String app = "01-15 13:45:21.500  1234  1 I MyApp: send: ";
        List<Row> rows = rows(app + login("13452101") + "\n", at(1, 1, login("13452101")),
                app + "F=7|65=0013452101|68=0000|01=\n", at(9, 1, "F=7|65=0013452101|68=0000|01="));
        assertEquals(2, rows.size(), rows::toString);
    }

    @Test
    void aReplyThatIsDecodedTwiceIsOneRow() throws IOException {
        String refusal = "F=7|68=E002|M2=no|01=";
        List<Row> rows = rows(at(0, 1, login("13452101")), at(1, 1, "~CGatewayPub"),
                at(2, 1, refusal), at(3, 1, "no"), at(4, 1, "~CGatewayPub"),
                at(5, 1, refusal), at(6, 1, "no"), at(7, 1, "~CGatewayPub"),
                at(8, 1, login("13452102")), at(9, 1, "~CGatewayPub"),
                at(10, 1, refusal), at(11, 1, "no"), at(12, 1, "~CGatewayPub"));
        assertEquals(List.of(0L, 1L, 0L, 9L), rows.stream().map(Row::requestLine).toList());
        rows = rows(at(0, 1, order("13452102", "2330")), at(1, 1, "~CGatewayPub"),
                at(2, 1, "G1@1130115@@1!"), at(3, 1, "~CGatewayPub"), at(4, 1, "G1@1130115@@1!"),
                at(5, 1, "~CGatewayPub"));
        assertEquals(2, rows.size(), rows::toString);
    }

    @Test
    void whatIsDamagedOrUnansweredShows() throws IOException {
        List<Row> rows = rows(at(0, 1, order("13452102", "2330").replace("_2330_", "_2317_")),
                at(5, 1, "F=7|65=0099999999|68=0000|01="));
        assertTrue(rows.get(0).isFailure());
        assertEquals("signature-mismatch", rows.get(0).faults().get(0).kind());
        assertEquals(0, rows.get(1).requestLine());
    }

    /** A log of any length goes through the same memory, though most of its requests wait. */
    @Test
    void memoryDoesNotGrowWithTheLog() throws IOException {
        int unit = 10_000;
        List<Long> used = new ArrayList<>();
        try (LogReader reader = new LogReader(new LineReader(new SequenceInputStream(
                new LongLog()), StandardCharsets.UTF_8), LogReader.TAG)) {
            Timeline timeline = new Timeline();
            for (int read = 1; read <= 8 * unit; read++) {
                timeline.accept(reader.next(line -> { }));
                if (read % (2 * unit) == 0) {
                    System.gc();
                    used.add(Runtime.getRuntime().totalMemory()
                            - Runtime.getRuntime().freeMemory());
                }
            }
        }
        long grown = used.get(3) - used.get(0);
        assertTrue(grown < 2_000_000, () -> grown + " bytes more for 60,000 messages: " + used);
    }

    /** Two requests, of which one is answered, over and over: with ids and threads of their own. */
    private static final class LongLog implements Enumeration<InputStream> {
        private int count;

        @Override
        public boolean hasMoreElements() {
            return count < 20_000;
        }

        @Override
        public InputStream nextElement() {
            count++;
            String id = String.format("1345%04d", count % 10_000);
            String text = at(count % 50_000, count, login(id))
                    + at(count % 50_000, count, credit("14" + id.substring(2), "2330"))
                    + at(count % 50_000, count, "F=7|65=00" + id + "|68=E002|M2=" + count + "|")
                    + at(count % 50_000, count, "~CGatewayPub");
            return new ByteArrayInputStream(text.getBytes(StandardCharsets.UTF_8));
        }
    }

    /** An app's own log tells the time before its messages. */
    @Test
    void theTimeStandsInAnAppsOwnPrefix() throws IOException {
        for (String stamp : List.of("2026-01-15 13:45:21.%s", "[2026-01-15T13:45:21.%sZ] INFO",
                "13:45:21,%s [main]", "I/flutter ( 1234): 13:45:21.%s")) {
            List<Row> rows = rows(stamp.replace("%s", "100") + " send " + login("13452101") + "\n",
                    stamp.replace("%s", "350") + " recv F=7|65=0013452101|68=E1|M2=no|\n");
            assertTrue(rows.get(0).time().endsWith("13:45:21.100"), () -> rows.get(0).time());
            assertEquals(250, rows.get(1).millis(), stamp);
        }
        List<Row> seconds = rows("2026/01/15 13:45:21 send " + login("13452101") + "\n",
                "2026/01/15 13:45:22 recv F=7|65=0013452101|68=E1|M2=no|\n");
        assertEquals("2026-01-15 13:45:21", seconds.get(0).time());
        assertNull(seconds.get(1).millis());
    }

    @Test
    void anAnswerOfTheNextDayOrYearTookNoLongTime() throws IOException {
        String reply = "F=7|65=0013452101|68=E1|M2=no|\n";
        for (String head : List.of("12-31 23:59:59.900|01-01 00:00:00.100|  1  2 D gatewayjni: ",
                "2025-12-31 23:59:59.900|2026-01-01 00:00:00.100|  1  2 D gatewayjni: ",
                "23:59:59.900|00:00:00.100|  D  ")) {
            String[] part = head.split("\\|");
            List<Row> rows = rows(part[0] + part[2] + login("13452101") + "\n",
                    part[1] + part[2] + reply);
            assertEquals(200, rows.get(1).millis(), head);
        }
        List<Row> backwards = rows(at(500, 1, login("13452101")), at(300, 1, reply));
        assertNull(backwards.get(1).millis());
    }

    @Test
    void filtersChooseRows() throws IOException {
        List<Row> rows = rows(at(0, 1, credit("13452101", "2330")),
                at(90, 3, "F=7|65=0013452101|00=1|68=E1|M2=no|01="), at(95, 1, login("13452103")));
        assertEquals(2, count(rows, new RowFilter(null, "2330", null, false)));
        assertEquals(1, count(rows, new RowFilter(null, null, "login", false)));
        assertEquals(3, count(rows, new RowFilter("1234567", null, null, false)));
        assertEquals(3, count(rows, new RowFilter("A123456789", null, null, false)));
        assertEquals(0, count(rows, new RowFilter("7654321", null, null, false)));
        assertEquals(1, count(rows, new RowFilter(null, null, null, true)));
        assertEquals(2, count(rows, new RowFilter(null, null, "QueryCredit", false)));
        assertFalse(new RowFilter(null, "9999", null, true).takes(rows.get(0)));
    }

    private static long count(List<Row> rows, RowFilter filter) {
        return rows.stream().filter(filter::takes).count();
    }
}
