package com.brindlex.kernel.quorvane.console.log;

import java.time.DateTimeException;
import java.time.LocalDate;
import java.time.LocalTime;

/** Times as logs write them, to take one from the other. */
public final class LogTime {
    /** No time. */
    public static final long NONE = Long.MIN_VALUE;

    private static final long MILLIS_OF_DAY = 86_400_000;
    private static final int CLOCK_LENGTH = "13:45:21".length();
    private static final int DATE_LENGTH = "01-15 ".length();
    private static final int LEAP_YEAR = 2000;
    private static final long NO_YEAR =
            LocalDate.of(LEAP_YEAR, 1, 1).toEpochDay() * MILLIS_OF_DAY;
    private static final long YEAR = 366 * MILLIS_OF_DAY;

    private LogTime() {}

    /**
     * Milliseconds since a moment that is the same for all times of a log; {@link #NONE}.
     *
     * @param time as a log writes it: with a date and a year or without them, or seconds; a zone
     *         and what is less than a millisecond are not read
     */
    public static long millis(String time) {
        int point = time.indexOf('.');
        if (point < 0) {
            return NONE;
        }
        try {
            long millis = number(time, point + 1, point + 4);
            int clock = point - CLOCK_LENGTH;
            if (clock < 0 || time.charAt(clock + 2) != ':') {
                return Long.parseLong(time, 0, point, 10) * 1000 + millis;
            }
            int seconds = LocalTime.of(number(time, clock, clock + 2),
                    number(time, clock + 3, clock + 5), number(time, clock + 6, point))
                    .toSecondOfDay();
            return day(time, clock - DATE_LENGTH) * MILLIS_OF_DAY + seconds * 1000L + millis;
        } catch (DateTimeException | NumberFormatException | IndexOutOfBoundsException never) {
            return NONE;
        }
    }

    /**
     * The milliseconds from one time of a log to a later one; null where they are not known, or
     * where a clock was set back. A new day or year may have begun between them, where the log does
     * not write it.
     */
    public static Long between(long from, long to) {
        if (from == NONE || to == NONE) {
            return null;
        }
        long took = to - from;
        boolean hours = from < MILLIS_OF_DAY && to < MILLIS_OF_DAY;
        long round = hours ? MILLIS_OF_DAY : YEAR;
        boolean again = hours || isOfNoYear(from) && isOfNoYear(to);
        if (again && took < -round / 2) {
            took += round;
        }
        return took < 0 ? null : took;
    }

    private static boolean isOfNoYear(long millis) {
        return millis >= NO_YEAR && millis < NO_YEAR + YEAR;
    }

    /** The day that the month and the day of month at a place make, if there are any. */
    private static long day(String time, int at) {
        if (at < 0) {
            return 0;
        }
        int year = at == 0 ? LEAP_YEAR : number(time, 0, at - 1);
        return LocalDate.of(year, number(time, at, at + 2), number(time, at + 3, at + 5))
                .toEpochDay();
    }

    private static int number(String text, int begin, int end) {
        return Integer.parseInt(text, begin, end, 10);
    }
}
