package com.brindlex.kernel.quorvane.console.log;

import java.util.regex.Matcher;
import java.util.regex.Pattern;

/** Finds a message within a text that an app wrote around it: its own prefix, quotes. */
final class Unwrap {
    /** The first field of a request or a reply, with no letter or digit right before it. */
    private static final Pattern BEGIN = Pattern.compile(
            "(?<![A-Za-z0-9|])(?:F=[17]\\||\\|(?:F|00|68|39)=|\\[GATEWAY\\]error"
                    + "|\\[BROKER\\]timeout)");
    private static final Pattern RESULT = Pattern.compile("(?<=[\"'])(?:[0-9]{1,9}|<[0-9]>)!");

    /** What the patterns cannot do without: most texts hold none of it, and need no search. */
    private static final String[] MARKS = {
        "F=1|", "F=7|", "|00=", "|68=", "|39=", "|F=", "[GATEWAY]error", "[BROKER]timeout"};
    private static final String[] QUOTES = {"\"", "'"};

    /** What may stand right before a message, and what then ends it. */
    private static final String OPENING = "\"'`([{<“‘「『";
    private static final String CLOSING = "\"'`)]}>”’」』";

    private static final Pattern TIME = Pattern.compile("(?<![0-9])((?:[0-9]{4}[-/])?[0-9]{2}[-/]"
            + "[0-9]{2}[T ])?([0-9]{2}:[0-9]{2}:[0-9]{2}(?:[.,][0-9]{3,9})?)(?![0-9])");

    private Unwrap() {}

    /**
     * Where the message stands: its begin and its end; null for a text without one.
     */
    static int[] find(String text) {
        if (text.startsWith("F=1|") || text.startsWith("F=7|")) {
            return new int[] {0, text.length()};
        }
        if (text.indexOf('|') < 0 && text.indexOf('[') < 0 && text.indexOf('!') < 0) {
            return null;
        }
        Matcher begin = find(BEGIN, text, MARKS);
        begin = begin == null ? find(RESULT, text, QUOTES) : begin;
        if (begin == null) {
            return null;
        }
        int from = begin.start();
        int opened = from > 0 ? OPENING.indexOf(text.charAt(from - 1)) : -1;
        return new int[] {from, opened < 0 ? text.length() : end(text, from, opened)};
    }

    /** Where what was opened before a message is closed, behind its last field or record. */
    private static int end(String text, int from, int opened) {
        char open = OPENING.charAt(opened);
        char close = CLOSING.charAt(opened);
        int last = Math.max(from, text.lastIndexOf('|') > from ? text.lastIndexOf('|')
                                                               : text.lastIndexOf('!'));
        int depth = 0;
        for (int at = last; at < text.length(); at++) {
            char c = text.charAt(at);
            if (c == close && depth == 0) {
                return text.startsWith("\\n", at - 2) ? at - 2 : at;
            }
            depth += c == close ? -1 : c == open ? 1 : 0;
        }
        return text.length();
    }

    /** The time that an app wrote before its message, as logs write it; empty when it did not. */
    static String time(String before) {
        Matcher found = TIME.matcher(before);
        if (!found.find()) {
            return "";
        }
        String day = found.group(1) == null ? ""
                                            : found.group(1).replace('/', '-').replace('T', ' ');
        return day + found.group(2).replace(',', '.');
    }

    private static Matcher find(Pattern pattern, String text, String[] needed) {
        for (String each : needed) {
            if (text.contains(each)) {
                Matcher matcher = pattern.matcher(text);
                return matcher.find() ? matcher : null;
            }
        }
        return null;
    }
}
