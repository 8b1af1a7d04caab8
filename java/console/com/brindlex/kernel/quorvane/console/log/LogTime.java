package com.brindlex.kernel.quorvane.console.log;

import java.time.DateTimeException;
import java.time.LocalDateTime;
import java.time.ZoneOffset;
import java.util.regex.Matcher;
import java.util.regex.Pattern;

/** Times as logs write them, to take one from the other. */
public final class LogTime {
    /** No time. */
    public static final long NONE = Long.MIN_VALUE;

    private static final Pattern CLOCK = Pattern.compile(
            "(?:(?:(\\d{4})-)?(\\d\\d)-(\\d\\d) )?(\\d\\d):(\\d\\d):(\\d\\d)\\.(\\d{3})\\d*(?: [+-]\\d{4})?");
    private static final Pattern SECONDS = Pattern.compile("(\\d{1,15})\\.(\\d{3})\\d*");
    private static final int LEAP_YEAR = 2000;

    private LogTime() {}

    /** Milliseconds since a moment that is the same for all times of a log; {@link #NONE}. */
    public static long millis(String time) {
        Matcher seconds = SECONDS.matcher(time);
        if (seconds.matches()) {
            return Long.parseLong(seconds.group(1)) * 1000 + Long.parseLong(seconds.group(2));
        }
        Matcher clock = CLOCK.matcher(time);
        if (!clock.matches()) {
            return NONE;
        }
        try {
            return LocalDateTime.of(number(clock, 1, LEAP_YEAR), number(clock, 2, 1),
                            number(clock, 3, 1), number(clock, 4, 0), number(clock, 5, 0),
                            number(clock, 6, 0)).toEpochSecond(ZoneOffset.UTC) * 1000
                    + number(clock, 7, 0);
        } catch (DateTimeException never) {
            return NONE;
        }
    }

    private static int number(Matcher found, int group, int otherwise) {
        return found.group(group) == null ? otherwise : Integer.parseInt(found.group(group));
    }
}
