package com.brindlex.kernel.quorvane.client;

import java.util.Calendar;
import java.util.GregorianCalendar;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/** A calendar day. (Android knows java.time only from API 26 on.) Never changes. */
public final class TradeDate implements Comparable<TradeDate> {
    private static final int ROC_OFFSET = 1911;

    private final int year;
    private final int month;
    private final int day;

    private TradeDate(int year, int month, int day) {
        this.year = year;
        this.month = month;
        this.day = day;
    }

    /**
     * A day of the Western calendar.
     *
     * @throws IllegalArgumentException when there is no such day
     */
    @NotNull
    public static TradeDate of(int year, int month, int day) {
        if (year < 1 || year > 9999 || month < 1 || month > 12 || day < 1
                || day > daysOf(year, month)) {
            throw new IllegalArgumentException("no such day: " + year + "-" + month + "-" + day);
        }
        return new TradeDate(year, month, day);
    }

    /**
     * Reads eight digits as a Western date (20240115), seven or six as a date of the Republic of
     * China calendar (1130115).
     *
     * @return the day, or null when the text is none
     */
    @Nullable
    public static TradeDate parse(@Nullable String text) {
        int length = text == null ? 0 : text.length();
        if (length < 6 || length > 8 || !Numbers.isDigits(text)) {
            return null;
        }
        int number = Integer.parseInt(text);
        int year = number / 10000 + (length == 8 ? 0 : ROC_OFFSET);
        int month = number / 100 % 100;
        int day = number % 100;
        boolean valid =
                year >= 1 && month >= 1 && month <= 12 && day >= 1 && day <= daysOf(year, month);
        return valid ? new TradeDate(year, month, day) : null;
    }

    /** Today, in the time zone of the device. */
    @NotNull
    public static TradeDate today() {
        return of(new GregorianCalendar());
    }

    /** The day that a calendar shows in its own time zone. */
    @NotNull
    public static TradeDate of(@NotNull Calendar calendar) {
        GregorianCalendar day = new GregorianCalendar(calendar.getTimeZone());
        day.setTimeInMillis(calendar.getTimeInMillis());
        return of(day.get(Calendar.YEAR), day.get(Calendar.MONTH) + 1,
                day.get(Calendar.DAY_OF_MONTH));
    }

    /** Midnight at the beginning of the day, in the time zone of the device. */
    @NotNull
    public Calendar toCalendar() {
        return new GregorianCalendar(year, month - 1, day);
    }

    private static int daysOf(int year, int month) {
        if (month == 2) {
            return year % 4 == 0 && (year % 100 != 0 || year % 400 == 0) ? 29 : 28;
        }
        return month == 4 || month == 6 || month == 9 || month == 11 ? 30 : 31;
    }

    /** Year of the Western calendar. */
    public int year() {
        return year;
    }

    /** Month, 1 to 12. */
    public int month() {
        return month;
    }

    /** Day of the month, 1 to 31. */
    public int day() {
        return day;
    }

    /** The date as one number, 20240115. */
    public int yyyymmdd() {
        return (year * 100 + month) * 100 + day;
    }

    /** The date in the Republic of China calendar as requests take it, 1130115. */
    @NotNull
    public String rocText() {
        return Numbers.padded(year - ROC_OFFSET, 3) + Numbers.padded(month * 100 + day, 4);
    }

    @Override
    public int compareTo(@NotNull TradeDate other) {
        return yyyymmdd() - other.yyyymmdd();
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof TradeDate && ((TradeDate) other).yyyymmdd() == yyyymmdd();
    }

    @Override
    public int hashCode() {
        return yyyymmdd();
    }

    /** The date as 2024-01-15. */
    @Override
    public String toString() {
        return Numbers.padded(year, 4) + "-" + Numbers.padded(month, 2) + "-"
                + Numbers.padded(day, 2);
    }
}
