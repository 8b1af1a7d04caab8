package com.brindlex.kernel.quorvane.console.log;

import java.util.regex.Matcher;
import java.util.regex.Pattern;

/** The ways in which logcat and Android Studio write a line, with all of logcat's modifiers. */
public enum LogFormat {
    /** {@code 01-15 13:45:21.123  1234  5678 D gatewayjni: text}, logcat's own. */
    THREADTIME(Part.TIME + " +(?:\\w+ +)??(?<process>\\d+) +(?<thread>\\d+) [VDIWEFAS] "
            + "(?<tag>.*?) *: ?"),
    /** {@code 2024-01-15 13:45:21.123  1234-5678  gatewayjni  com.example  D  text}. */
    STUDIO(Part.TIME + " +(?<process>\\d+)-(?<thread>\\d+) +(?<tag>\\S+) +\\S+ "
            + "+[VDIWEFA](?:  ?|$)"),
    /** {@code 2020-01-15 13:45:21.123 1234-5678/com.example D/gatewayjni: text}. */
    STUDIO_OLD(Part.TIME + ":? +(?<process>\\d+)-(?<thread>\\d+)/\\S+ [VDIWEFA]/(?<tag>.*?) *: ?"),
    /** {@code 01-15 13:45:21.123 D/gatewayjni( 1234): text}. */
    TIME(Part.TIME + ":? +[VDIWEFAS]/(?<tag>.*?) *\\( *" + Part.USER + "(?<process>\\d+)\\): ?"),
    /** {@code D/gatewayjni( 1234): text}. */
    BRIEF("[VDIWEFAS]/(?<tag>[^(:]*?) *\\( *" + Part.USER + "(?<process>\\d+)\\): ?"),
    /** {@code D( 1234) text  (gatewayjni)}. */
    PROCESS("[VDIWEFAS]\\( *" + Part.USER + "(?<process>\\d+)\\) "
            + "(?=(?s:.*)  \\((?<tag>[^()]*)\\)\\s*$)"),
    /** {@code D( 1234: 5678) text}. */
    THREAD("[VDIWEFAS]\\( *" + Part.USER + "(?<process>\\d+): *(?<thread>\\d+)\\) ?"),
    /** {@code D/gatewayjni: text}. */
    TAG("[VDIWEFAS]/(?<tag>[^ (:|=][^(:|=]*?) *: ?"),
    /** {@code [ 01-15 13:45:21.123  1234: 5678 D/gatewayjni ]}, the text below it. */
    LONG("\\[ +" + Part.TIME + " +" + Part.USER + "(?<process>\\d+): *(?<thread>\\d+) "
            + "[VDIWEFAS]/(?<tag>.*?) *\\]\\s*$"),
    /** {@code 13:45:21.123  D  text}, the compact view of Android Studio. */
    COMPACT("(?<time>\\d\\d:\\d\\d:\\d\\d\\.\\d{3}) +[VDIWEFA](?:  ?|$)");

    /** What several formats share. */
    private static final class Part {
        static final String TIME = "(?<time>(?:(?:\\d{4}-)?\\d\\d-\\d\\d )?"
                + "\\d\\d:\\d\\d:\\d\\d\\.\\d{3,9}"
                + "(?: [+-]\\d{4})?|\\d+\\.\\d{3,9})";
        static final String USER = "(?:[^\\s:()]+: *)?";
    }

    private final Pattern pattern;
    private final boolean hasTime;
    private final boolean hasThread;
    private final boolean hasTag;
    private final boolean hasProcess;

    LogFormat(String pattern) {
        this.pattern = Pattern.compile(" {0,12}" + pattern);
        this.hasTime = pattern.contains("(?<time>");
        this.hasProcess = pattern.contains("(?<process>");
        this.hasThread = pattern.contains("(?<thread>");
        this.hasTag = pattern.contains("(?<tag>");
    }

    /** Whether the text stands on the lines below. */
    boolean isAbove() {
        return this == LONG;
    }

    /** Whether the further lines of a text stand below its begin, behind blanks. */
    boolean isPadded() {
        return this == STUDIO || this == COMPACT;
    }

    /** Finds the format at the begin of a line; null when the line has another. */
    Matcher match(String line, int from) {
        Matcher matcher = pattern.matcher(line).region(from, line.length());
        return matcher.lookingAt() ? matcher : null;
    }

    /** The header that a line was found to have. */
    LogHeader header(Matcher found) {
        return new LogHeader(this, hasTime ? found.group("time") : "",
                hasProcess ? found.group("process") : "", hasThread ? found.group("thread") : "",
                hasTag ? found.group("tag") : null);
    }
}
