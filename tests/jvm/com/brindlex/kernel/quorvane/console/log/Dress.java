package com.brindlex.kernel.quorvane.console.log;

import java.time.LocalDateTime;
import java.time.format.DateTimeFormatter;
import java.util.List;

/** The same messages as each format of logcat and Android Studio writes them. */
public enum Dress {
    HOST("D/gatewayjni: ", "", true),
    BRIEF("D/gatewayjni( 1234): ", "", false),
    BRIEF_UID("D/gatewayjni(10123: 1234): ", "", false),
    PROCESS("D( 1234) ", "  (gatewayjni)", false),
    PROCESS_UID("D(u0_a1: 1234) ", "  (gatewayjni)", false),
    TAG("D/gatewayjni: ", "", false),
    THREAD("D( 1234: 5678) ", "", false),
    THREAD_UID("D(10123: 1234: 5678) ", "", false),
    RAW("", "", false),
    TIME("{MM-dd HH:mm:ss.SSS} D/gatewayjni( 1234): ", "", false),
    TIME_UID("{MM-dd HH:mm:ss.SSS} D/gatewayjni(10123: 1234): ", "", false),
    TIME_YEAR_ZONE("{yyyy-MM-dd HH:mm:ss.SSS} +0800 D/gatewayjni( 1234): ", "", false),
    TIME_EPOCH("         {epoch}000 D/gatewayjni( 1234): ", "", false),
    TIME_OLD_STUDIO("{MM-dd HH:mm:ss.SSS}: D/gatewayjni(1234): ", "", false),
    THREADTIME("{MM-dd HH:mm:ss.SSS}  1234  5678 D gatewayjni: ", "", false),
    THREADTIME_PADDED("{MM-dd HH:mm:ss.SSS}  1234  5678 D gatewayjni  : ", "", false),
    THREADTIME_UID("{MM-dd HH:mm:ss.SSS} 10123  1234  5678 D gatewayjni: ", "", false),
    THREADTIME_USER("{MM-dd HH:mm:ss.SSS}  u0_a1  1234  5678 D gatewayjni: ", "", false),
    YEAR("{yyyy-MM-dd HH:mm:ss.SSS}  1234  5678 D gatewayjni: ", "", false),
    YEAR_ZONE("{yyyy-MM-dd HH:mm:ss.SSS} +0800  1234  5678 D gatewayjni: ", "", false),
    MICROSECONDS("{MM-dd HH:mm:ss.SSS}000  1234  5678 D gatewayjni: ", "", false),
    NANOSECONDS("{MM-dd HH:mm:ss.SSS}000000  1234  5678 D gatewayjni: ", "", false),
    EPOCH("         {epoch}  1234  5678 D gatewayjni: ", "", false),
    MONOTONIC("  {monotonic}  1234  5678 D gatewayjni: ", "", false),
    COLOUR("\u001B[38;5;231m{MM-dd HH:mm:ss.SSS}  1234  5678 D gatewayjni: ", "\u001B[0m", false),
    COLOUR_OLD("\u001B[34mD/gatewayjni( 1234): ", "\u001B[0m", false),
    COLOUR_THREAD("\u001B[38;5;40mD( 1234: 5678) ", "\u001B[0m", false),
    PRINTABLE("{MM-dd HH:mm:ss.SSS}  1234  5678 D gatewayjni: ", "", false),
    PRINTABLE_RAW("", "", false),
    PRINTABLE_PROCESS("D( 1234) ", "  (gatewayjni)", false),
    LONG("[ {MM-dd HH:mm:ss.SSS}  1234: 5678 D/gatewayjni ]\n", "\n", true),
    LONG_UID("[ {MM-dd HH:mm:ss.SSS} u0_a1: 1234: 5678 D/gatewayjni ]\n", "\n", true),
    LONG_YEAR("[ {yyyy-MM-dd HH:mm:ss.SSS} +0800  1234: 5678 D/gatewayjni ]\n", "\n", true),
    LONG_EPOCH("[          {epoch}000  1234: 5678 D/gatewayjni ]\n", "\n", true),
    STUDIO("{yyyy-MM-dd HH:mm:ss.SSS}  1234-5678  gatewayjni              "
            + "com.example.app                      D  ", "", true),
    STUDIO_OLD("{yyyy-MM-dd HH:mm:ss.SSS} 1234-5678/com.example.app D/gatewayjni: ", "", true),
    STUDIO_COMPACT("{HH:mm:ss.SSS}  D  ", "", true);

    private static final LocalDateTime BEGIN = LocalDateTime.of(2024, 1, 15, 13, 45, 21);
    private static final int STEP = 7;

    private final String head;
    private final String foot;
    private final boolean whole;

    /** {@code whole}: further lines of a message have no head of their own. */
    Dress(String head, String foot, boolean whole) {
        this.head = head;
        this.foot = foot;
        this.whole = whole;
    }

    /** Android Studio writes further lines below the text of the first one. */
    private boolean isPadded() {
        return this == STUDIO || this == STUDIO_COMPACT;
    }

    /** Whether it writes when a message was logged. */
    public boolean hasTime() {
        return head.contains("{");
    }

    /** The log of these messages, seven milliseconds from one to the next. */
    public String log(List<String> messages) {
        StringBuilder out = new StringBuilder("--------- beginning of main\n");
        for (int i = 0; i < messages.size(); i++) {
            String head = head(i);
            String text = messages.get(i);
            // the line feed at the end of a message makes no line of its own, but on the host
            boolean feed = this != HOST && text.endsWith("\n");
            text = feed ? text.substring(0, text.length() - 1) : text;
            text = name().startsWith("PRINTABLE") ? printable(text) : text;
            String more = whole ? isPadded() ? " ".repeat(head.length()) : "" : foot + head;
            String gap = whole ? "\n" + more : foot + "\n" + head;
            out.append(head).append(text.replace("\n", gap)).append(foot).append('\n');
        }
        return out.toString();
    }

    /** A text as {@code -v printable} writes it: tabs and line feeds alone stay as they are. */
    private static String printable(String text) {
        return text.replace("\\", "\\\\").replace("\r", "\\r");
    }

    private String head(int number) {
        int open = head.indexOf('{');
        if (open < 0) {
            return head;
        }
        int close = head.indexOf('}');
        long millis = 1_705_297_521_000L + (long) number * STEP;
        String pattern = head.substring(open + 1, close);
        String time = pattern.equals("epoch") ? millis / 1000 + String.format(".%03d", millis % 1000)
                : pattern.equals("monotonic")
                ? (millis / 1000 % 10000) + String.format(".%03d", millis % 1000)
                : BEGIN.plusNanos((long) number * STEP * 1_000_000)
                          .format(DateTimeFormatter.ofPattern(pattern));
        return head.substring(0, open) + time + head.substring(close + 1);
    }
}
