package com.brindlex.kernel.quorvane.typed;

/** A time of day to the second. */
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
    public static TradeTime parse(String text) {
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

    @Override
    public int compareTo(TradeTime other) {
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
