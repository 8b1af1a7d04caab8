package com.brindlex.kernel.quorvane.client;

import java.util.Calendar;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/** A time of day to the second. Never changes. */
public final class TradeTime implements Comparable<TradeTime> {
    private final int seconds;

    private TradeTime(int seconds) {
        this.seconds = seconds;
    }

    /**
     * Reads six digits (134521); up to three more for parts of a second are left out.
     *
     * @return the time, or null when the text is none
     */
    @Nullable
    public static TradeTime parse(@Nullable String text) {
        int length = text == null ? 0 : text.length();
        if (length < 6 || length > 9 || !Numbers.isDigits(text)) {
            return null;
        }
        int number = Integer.parseInt(text.substring(0, 6));
        int hour = number / 10000;
        int minute = number / 100 % 100;
        int second = number % 100;
        return hour < 24 && minute < 60 && second < 60
                ? new TradeTime((hour * 60 + minute) * 60 + second)
                : null;
    }

    /**
     * A time of day.
     *
     * @throws IllegalArgumentException when there is no such time
     */
    @NotNull
    public static TradeTime of(int hour, int minute, int second) {
        if (hour < 0 || hour > 23 || minute < 0 || minute > 59 || second < 0 || second > 59) {
            throw new IllegalArgumentException(
                    "no such time: " + hour + ":" + minute + ":" + second);
        }
        return new TradeTime((hour * 60 + minute) * 60 + second);
    }

    /** Hour, 0 to 23. */
    public int hour() {
        return seconds / 3600;
    }

    /** Minute, 0 to 59. */
    public int minute() {
        return seconds / 60 % 60;
    }

    /** Second, 0 to 59. */
    public int second() {
        return seconds % 60;
    }

    /** The time on a day as a calendar in the time zone of the device. */
    @NotNull
    public Calendar on(@NotNull TradeDate day) {
        Calendar moment = day.toCalendar();
        moment.set(Calendar.HOUR_OF_DAY, hour());
        moment.set(Calendar.MINUTE, minute());
        moment.set(Calendar.SECOND, second());
        return moment;
    }

    @Override
    public int compareTo(@NotNull TradeTime other) {
        return seconds - other.seconds;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof TradeTime && ((TradeTime) other).seconds == seconds;
    }

    @Override
    public int hashCode() {
        return seconds;
    }

    /** The time as 13:45:21. */
    @Override
    public String toString() {
        return Numbers.padded(hour(), 2) + ":" + Numbers.padded(minute(), 2) + ":"
                + Numbers.padded(second(), 2);
    }
}
