package com.brindlex.kernel.quorvane.console.log;

import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.List;
import java.util.regex.Matcher;
import java.util.regex.Pattern;

/** A message that is being put together from the lines of a log. */
final class Joining {
    private static final Pattern LENGTH = Pattern.compile("(?:\\w+: |regMsg )Len:([0-9]{1,9})");
    private static final Pattern BASE64 = Pattern.compile("[A-Za-z0-9+/=]*\r?(?:\\|.*)?");
    private static final Pattern OPEN_BASE64 = Pattern.compile("(?s).*\\|MSG=[A-Za-z0-9+/=\r\n]*");

    /** What Android keeps of an entry: 4,068 bytes with its priority, its tag and two ends. */
    private static final int LONGEST_ENTRY = 4068;

    /** A text this long may go on in the next entry of an app that logs in pieces. */
    private static final int LIKELY_CUT = 900;
    private static final int ROUND_PIECES = 3000;

    private final List<LogEntry> entries = new ArrayList<>(1);
    private final List<Integer> splits = new ArrayList<>(0);
    private final StringBuilder text = new StringBuilder();
    private final int expected;
    private final Kind kind;
    private int bytes;

    /**
     * Begins with an entry.
     *
     * @param expected the bytes that a length line told of it; -1 when none did
     */
    Joining(LogEntry first, int expected) {
        entries.add(first);
        text.append(first.text());
        this.kind = MessageReader.kind(first.text());
        this.bytes = bytes(first.text());
        boolean told = expected > bytes && (kind == Kind.REPLY || kind == Kind.TEXT);
        this.expected = told ? expected : -1;
    }

    /** How long the next text is, when this one says so; -1 otherwise. */
    static int length(String text) {
        Matcher matcher = text.contains("Len:") ? LENGTH.matcher(text) : null;
        return matcher != null && matcher.matches() ? Integer.parseInt(matcher.group(1)) : -1;
    }

    private static int bytes(String text) {
        return text.getBytes(StandardCharsets.UTF_8).length;
    }

    /** Whether nothing can follow. */
    boolean isComplete() {
        if (expected >= 0) {
            return bytes >= expected;
        }
        return !isOpenBase64() && !isCutRequest() && !isCutReply();
    }

    private boolean isOpenBase64() {
        return kind == Kind.REQUEST && text.indexOf("|MSG=") > 0
                && OPEN_BASE64.matcher(text).matches() && !text.toString().endsWith("|01=");
    }

    /** Requests end with 01, a payload or a trade type: a long one without them was cut. */
    private boolean isCutRequest() {
        return kind == Kind.REQUEST && bytes >= LIKELY_CUT && text.indexOf("!!") < 0
                && text.lastIndexOf("|01=") < 0;
    }

    private boolean isCutReply() {
        if (kind != Kind.REPLY || bytes < LIKELY_CUT) {
            return false;
        }
        int end = text.lastIndexOf("|01=");
        boolean ends = end == text.length() - "|01=".length();
        return text.lastIndexOf("|00=") > end || isPiece() && !ends;
    }

    /** Takes a line that goes on with the message; whether it did. */
    boolean takes(LogEntry entry) {
        if (!entry.hasText() || !continues(entry)) {
            return false;
        }
        String more = entry.text();
        boolean feed = isFeed(more);
        if (feed && isOpenBase64() && text.charAt(text.length() - 1) != '\r') {
            text.append('\r');  // lost on the way: the wire has both
        }
        text.append(feed ? "\n" : "");
        splits.add(text.length());
        text.append(more);
        entries.add(entry);
        bytes += bytes(more) + (feed ? 1 : 0);
        return true;
    }

    private boolean continues(LogEntry entry) {
        LogHeader first = entries.get(0).header();
        LogHeader next = entry.header();
        if (next != null && (first == null || !next.isOfSameSource(first))) {
            return false;
        }
        String more = entry.text();
        if (isOpenBase64()) {
            return BASE64.matcher(more).matches() && !begins(more)
                    && text.length() < LineReader.LONGEST;
        }
        Kind its = MessageReader.kind(more);
        boolean another = its == Kind.END || its == Kind.LENGTH || its == Kind.REQUEST
                || its == Kind.HEADER || its == Kind.MARK || its == Kind.RESULT
                || begins(more);
        return !another && text.length() < LineReader.LONGEST
                && (expected < 0 || bytes + bytes(more) <= expected);
    }

    private static boolean begins(String text) {
        return text.startsWith("F=7|") || text.startsWith("F=1|");
    }

    /** Whether a line feed stood before a line; where a text is logged in pieces none did. */
    private boolean isFeed(String more) {
        boolean room = expected < 0 || bytes + bytes(more) < expected;
        return isOpenBase64() || room && !isPiece();
    }

    /** Whether the last line is as long as pieces are: a round number, or what an entry holds. */
    private boolean isPiece() {
        String last = entries.get(entries.size() - 1).text();
        return bytes(last) >= ROUND_PIECES
                || last.length() >= LIKELY_CUT && last.length() % 100 == 0;
    }

    LogMessage message() {
        List<LogMessage.Flaw> flaws = new ArrayList<>(0);
        String whole = text.toString();
        if (expected > bytes) {
            flaws.add(new LogMessage.Flaw("cut-by-log", whole.length(), "the log holds "
                            + bytes + " of " + expected + " bytes"));
        } else if (isCutByAndroid() && (isOpenBase64() || isCutRequest() || isCutReply())) {
            flaws.add(new LogMessage.Flaw("cut-by-log", whole.length(),
                    "the log ends here: Android keeps 4,068 bytes of an entry"));
        }
        for (LogEntry entry : entries) {
            if (entry.line().isCut()) {
                flaws.add(new LogMessage.Flaw("line-too-long", whole.length(), "the line is longer "
                                + "than " + LineReader.LONGEST + " characters: the rest is lost"));
            }
        }
        int broken = whole.indexOf(LogLine.NO_CHARACTER);
        if (broken >= 0) {
            flaws.add(new LogMessage.Flaw("broken-bytes", broken, "bytes that are no character of "
                            + "the charset: is it another one (--charset)?"));
        }
        return new LogMessage(List.copyOf(entries), whole, List.copyOf(splits), flaws);
    }

    private boolean isCutByAndroid() {
        return bytes(entries.get(entries.size() - 1).text()) >= LONGEST_ENTRY - 80;
    }
}
