package com.brindlex.kernel.quorvane.console.log;

import com.brindlex.kernel.quorvane.console.Utf8;
import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import java.util.ArrayList;
import java.util.List;
import java.util.regex.Pattern;

/** A message that is being put together from the lines of a log. */
final class Joining {
    private static final String LENGTH = "Len:";
    private static final int MOST_DIGITS = 9;
    private static final Pattern BASE64 = Pattern.compile("[A-Za-z0-9+/=]*\r?(?:\\|.*)?");

    /** What Android keeps of an entry: 4,068 bytes with its priority, its tag and two ends. */
    private static final int LONGEST_ENTRY = 4068;

    /** A text this long may go on in the next entry of an app that logs in pieces. */
    private static final int LIKELY_CUT = 900;
    private static final int ROUND_PIECES = 3000;

    private static final String RECORD_BEGIN = "|00=";
    private static final String RECORD_END = "|01=";

    private final List<LogEntry> entries = new ArrayList<>(1);
    private final List<Integer> splits = new ArrayList<>(0);
    private final String first;
    private final Kind kind;
    private final int expected;
    private StringBuilder joined;
    private int bytes;
    private boolean isOpenBase64;

    /** What the text says of its end, up to the character {@link #seen}. */
    private boolean isSigned;
    private int lastBegin = -1;
    private int lastEnd = -1;
    private int seen;

    /**
     * Begins with an entry.
     *
     * @param text the text of the entry
     * @param kind what that is
     * @param expected the bytes that a length line told of it; -1 when none did
     */
    Joining(LogEntry entry, String text, Kind kind, int expected) {
        entries.add(entry);
        this.first = text;
        this.kind = kind;
        boolean counts = kind == Kind.REPLY || kind == Kind.TEXT;
        this.bytes = counts || kind == Kind.REQUEST ? Utf8.length(first) : 0;
        boolean told = counts && expected > bytes;
        this.expected = told ? expected : -1;
        this.isOpenBase64 = kind == Kind.REQUEST && endsInBase64(first);
    }

    /** Whether nothing but Base64 and the ends of its lines stands behind the last tag MSG. */
    private static boolean endsInBase64(String text) {
        int at = text.lastIndexOf("|MSG=");
        if (at < 0) {
            return false;
        }
        for (int i = at + "|MSG=".length(); i < text.length(); i++) {
            char c = text.charAt(i);
            boolean letter = c >= 'A' && c <= 'Z' || c >= 'a' && c <= 'z' || c >= '0' && c <= '9';
            if (!letter && "+/=\r\n".indexOf(c) < 0) {
                return false;
            }
        }
        return true;
    }

    /** How long a length line says that the next text is; -1 when it is no length that can be. */
    static int length(String line) {
        String number = line.substring(line.lastIndexOf(LENGTH) + LENGTH.length());
        return number.length() <= MOST_DIGITS ? Integer.parseInt(number) : -1;
    }

    /** Whether nothing can follow. */
    boolean isComplete() {
        if (expected >= 0) {
            return bytes >= expected;
        }
        return !isOpenBase64 && !isCutRequest() && !isCutReply();
    }

    /** Requests end with 01, a payload or a trade type: a long one without them was cut. */
    private boolean isCutRequest() {
        if (kind != Kind.REQUEST || bytes < LIKELY_CUT) {
            return false;
        }
        look();
        return !isSigned && lastEnd < 0;
    }

    private boolean isCutReply() {
        if (kind != Kind.REPLY || bytes < LIKELY_CUT) {
            return false;
        }
        look();
        boolean ends = lastEnd == seen - RECORD_END.length();
        return lastBegin > lastEnd || isPiece() && !ends;
    }

    /** Looks at what was not seen yet: a message of many lines is read once. */
    private void look() {
        if (seen == length()) {
            return;
        }
        int from = Math.max(0, seen - RECORD_END.length() + 1);
        String fresh = joined == null ? first : joined.substring(from);
        isSigned |= fresh.contains("!!");
        int begin = fresh.lastIndexOf(RECORD_BEGIN);
        int end = fresh.lastIndexOf(RECORD_END);
        lastBegin = begin < 0 ? lastBegin : from + begin;
        lastEnd = end < 0 ? lastEnd : from + end;
        seen = from + fresh.length();
    }

    /** Takes a line that goes on with the message; whether it did. */
    boolean takes(LogEntry entry) {
        if (!entry.hasText() || !continues(entry)) {
            return false;
        }
        if (joined == null) {
            joined = new StringBuilder(first);
        }
        String more = entry.text();
        boolean feed = isFeed(more);
        if (feed && isOpenBase64 && joined.charAt(joined.length() - 1) != '\r') {
            joined.append('\r');  // lost on the way: the wire has both
        }
        joined.append(feed ? "\n" : "");
        splits.add(joined.length());
        joined.append(more);
        entries.add(entry);
        bytes += Utf8.length(more) + (feed ? 1 : 0);
        isOpenBase64 &= more.indexOf('|') < 0;
        return true;
    }

    private int length() {
        return joined == null ? first.length() : joined.length();
    }

    private boolean continues(LogEntry entry) {
        LogHeader begun = entries.get(0).header();
        LogHeader next = entry.header();
        if (next != null && (begun == null || !next.isOfSameSource(begun))) {
            return false;
        }
        String more = entry.text();
        if (isOpenBase64) {
            return BASE64.matcher(more).matches() && !begins(more)
                    && length() < LineReader.LONGEST;
        }
        Kind its = MessageReader.kind(more);
        boolean another = its == Kind.END || its == Kind.LENGTH || its == Kind.REQUEST
                || its == Kind.HEADER || its == Kind.MARK || its == Kind.RESULT
                || begins(more);
        return !another && length() < LineReader.LONGEST
                && (expected < 0 || bytes + Utf8.length(more) <= expected);
    }

    private static boolean begins(String text) {
        return text.startsWith("F=7|") || text.startsWith("F=1|");
    }

    /** Whether a line feed stood before a line; where a text is logged in pieces none did. */
    private boolean isFeed(String more) {
        boolean room = expected < 0 || bytes + Utf8.length(more) < expected;
        return isOpenBase64 || room && !isPiece();
    }

    /** Whether the last line is as long as pieces are: a round number, or what an entry holds. */
    private boolean isPiece() {
        String last = entries.get(entries.size() - 1).text();
        return Utf8.isAtLeast(last, ROUND_PIECES)
                || last.length() >= LIKELY_CUT && last.length() % 100 == 0;
    }

    LogMessage message() {
        List<LogMessage.Flaw> flaws = new ArrayList<>(0);
        String whole = joined == null ? first : joined.toString();
        if (expected > bytes) {
            flaws.add(new LogMessage.Flaw("cut-by-log", whole.length(), "the log holds "
                            + bytes + " of " + expected + " bytes"));
        } else if ((isOpenBase64 || isCutRequest() || isCutReply()) && isCutByAndroid()) {
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
        Kind its = joined == null ? kind : MessageReader.kind(whole);
        return new LogMessage(its, entries, whole, splits, flaws);
    }

    private boolean isCutByAndroid() {
        return Utf8.isAtLeast(entries.get(entries.size() - 1).text(), LONGEST_ENTRY - 80);
    }
}
