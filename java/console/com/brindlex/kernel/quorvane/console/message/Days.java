package com.brindlex.kernel.quorvane.console.message;

import java.time.DateTimeException;
import java.time.LocalDate;

/** Dates and times of day as the wire writes them. */
final class Days {
    private static final int ROC = 1911;

    private Days() {}

    /**
     * A date: YYYYMMDD, or the year of the Republic of China with MMDD; null when it is none, or
     * none that there ever was.
     */
    static LocalDate date(String text) {
        if (!Digits.all(text, 6, 8)) {
            return null;
        }
        int number = Integer.parseInt(text);
        int year = number / 10000 + (text.length() == 8 ? 0 : ROC);
        try {
            return LocalDate.of(year, number / 100 % 100, number % 100);
        } catch (DateTimeException never) {
            return null;
        }
    }

    /** Whether the first six characters are a time of day, HHMMSS. */
    static boolean isTime(String text) {
        if (!Digits.begin(text, 6)) {
            return false;
        }
        int number = Integer.parseInt(text, 0, 6, 10);
        return number / 10000 < 24 && number / 100 % 100 < 60 && number % 100 < 61;
    }

    /** 13:45:21 for 134521; the text itself when it is no time. */
    static String time(String text) {
        return isTime(text) ? text.substring(0, 2) + ":" + text.substring(2, 4) + ":"
                        + text.substring(4, 6) : text;
    }

    /** 2024-01-15 for 20240115 and 1130115; the text itself when it is no date. */
    static String day(String text) {
        LocalDate date = date(text);
        return date == null ? text : date.toString();
    }

    /** Whether a text is a contract month, YYYYMM. */
    static boolean isMonth(String text) {
        return Digits.begin(text, 6) && date(text.substring(0, 6) + "01") != null;
    }
}
