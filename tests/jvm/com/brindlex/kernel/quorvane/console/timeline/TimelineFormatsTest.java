package com.brindlex.kernel.quorvane.console.timeline;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.console.log.Dress;
import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.log.RecordedLog;
import java.io.IOException;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.List;
import org.junit.jupiter.api.Test;

/** One recorded session gives one timeline, however the log is written. */
class TimelineFormatsTest {
    static List<Row> rows(List<LogMessage> messages) {
        Timeline timeline = new Timeline();
        List<Row> rows = new ArrayList<>();
        for (LogMessage each : messages) {
            Event event = timeline.accept(each);
            if (event != null) {
                rows.add(event.row());
            }
        }
        return rows;
    }

    static List<Row> rows(String log) throws IOException {
        return rows(RecordedLog.read(log));
    }

    /** What a timeline says but for lines and times: the request is told by its place. */
    static List<String> said(List<Row> rows) {
        List<String> said = new ArrayList<>();
        for (Row row : rows) {
            int request = -1;
            for (int i = 0; i < rows.size(); i++) {
                request = rows.get(i).line() == row.requestLine() ? i : request;
            }
            said.add((row.isRequest() ? "> " : "< ") + row.operation() + " " + row.account() + " "
                    + row.instrument() + " " + row.words() + " " + row.status() + " of " + request
                    + " " + row.requestId() + " " + row.faults());
        }
        return said;
    }

    @Test
    void everyFormatGivesTheSameTimeline() throws IOException {
        List<String> wanted = said(rows(Dress.THREADTIME.log(RecordedLog.messages())));
        assertTrue(wanted.size() > 120, () -> wanted.size() + " rows");
        for (Dress dress : Dress.values()) {
            List<Row> rows = rows(dress.log(RecordedLog.messages()));
            assertEquals(String.join("\n", wanted), String.join("\n", said(rows)), dress.name());
            for (Row row : rows) {
                if (dress.hasTime() && row.requestLine() > 0) {
                    assertNotNull(row.millis(), dress + ": " + row);
                    assertTrue(row.millis() > 0 && row.millis() < 200, dress + ": " + row);
                }
            }
        }
    }

    @Test
    void everyAnswerHasItsRequest() throws IOException {
        for (Row row : rows(Dress.THREADTIME.log(RecordedLog.messages()))) {
            assertTrue(row.isRequest() || row.requestLine() > 0, row::toString);
            assertEquals(List.of(), row.faults(), row::toString);
        }
    }

    @Test
    void theCharsetDoesNotMatter() throws IOException {
        String log = Dress.THREADTIME.log(RecordedLog.messages());
        List<String> wanted = said(rows(log));
        Charset big5 = Charset.forName("Big5");
        assertEquals(wanted, said(rows(RecordedLog.read(RecordedLog.utf16(log),
                StandardCharsets.UTF_8))));
        assertEquals(wanted, said(rows(RecordedLog.read(log.getBytes(big5), big5))));
        assertEquals(wanted, said(rows("\uFEFF" + log)));
    }

    @Test
    void windowsLinesAndOtherLinesDoNotMatter() throws IOException {
        String log = Dress.THREADTIME.log(RecordedLog.messages());
        List<String> wanted = said(rows(log));
        assertEquals(wanted, said(rows(log.replace("\n", "\r\n"))));
        String others = "01-15 13:45:22.000   900   901 I ActivityManager: F=x|start|proc\n"
                + "01-15 13:45:22.000  1000  1200 I am_proc_start: [User=0,PID=77,UID=10123,"
                + "Process Name=com.example.app,Type=activity,Component=12!34@5!]\n"
                + "--------- switch to system\n"
                + "01-15 13:45:22.000  1234  9999 W OtherTag: 12!34@5!\n\n";
        assertEquals(wanted, said(rows(log.replace("D gatewayjni: ~CGatewayPub\n",
                "D gatewayjni: ~CGatewayPub\n" + others))));
    }
}
