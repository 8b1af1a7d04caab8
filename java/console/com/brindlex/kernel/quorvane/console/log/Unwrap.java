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
        int to = text.length();
        char quote = from > 0 ? text.charAt(from - 1) : ' ';
        if (quote == '"' || quote == '\'' || quote == '`') {
            int close = text.lastIndexOf(quote);
            to = close > from ? close : to;
            boolean feed = text.startsWith("\\n", to - 2);
            to -= feed ? 2 : 0;
        }
        return new int[] {from, to};
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
