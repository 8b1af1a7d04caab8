package com.brindlex.kernel.quorvane.simulator;

import java.math.BigDecimal;
import java.time.DateTimeException;
import java.time.LocalDate;
import java.time.LocalTime;

/** The few notations of the wire: numbers, dates, times. */
final class Texts {
    private static final int ROC_OFFSET = 1911;

    private Texts() {}

    /**
     * A decimal number without sign, at most 18 digits; {@code tag} names the field in a refusal.
     */
    static long number(String text, String tag) throws Refusal {
        if (!text.matches("[0-9]{1,18}")) {
            throw Refusal.malformed(tag);
        }
        return Long.parseLong(text);
    }

    /** YYYYMMDD. */
    static String date(LocalDate date) {
        return String.format(
                "%04d%02d%02d", date.getYear(), date.getMonthValue(), date.getDayOfMonth());
    }

    /** HHMMSS. */
    static String time(LocalTime time) {
        return String.format("%02d%02d%02d", time.getHour(), time.getMinute(), time.getSecond());
    }

    /** A Western date of eight digits, or a Republic of China date of six or seven. */
    static LocalDate date(String text, String tag) throws Refusal {
        if (!text.matches("[0-9]{6,8}")) {
            throw Refusal.malformed(tag);
        }
        int monthDay = Integer.parseInt(text.substring(text.length() - 4));
        int year = Integer.parseInt(text.substring(0, text.length() - 4));
        try {
            return LocalDate.of(
                    text.length() == 8 ? year : year + ROC_OFFSET, monthDay / 100, monthDay % 100);
        } catch (DateTimeException wrong) {
            throw Refusal.malformed(tag);
        }
    }

    /** A time of day of six digits. */
    static LocalTime time(String text, String tag) throws Refusal {
        if (!text.matches("[0-9]{6}")) {
            throw Refusal.malformed(tag);
        }
        int number = Integer.parseInt(text);
        try {
            return LocalTime.of(number / 10000, number / 100 % 100, number % 100);
        } catch (DateTimeException wrong) {
            throw Refusal.malformed(tag);
        }
    }

    /** A price with exactly {@code decimals} digits behind the point and no sign. */
    static BigDecimal price(String text, int decimals, String tag) throws Refusal {
        if (!text.matches("(0|[1-9][0-9]{0,8})\\.[0-9]{" + decimals + "}")) {
            throw Refusal.malformed(tag);
        }
        return new BigDecimal(text);
    }
}
