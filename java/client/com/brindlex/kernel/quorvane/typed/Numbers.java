package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;
import java.math.BigInteger;

/** Reads the numbers of results; null where there is none. */
final class Numbers {
    /** Longer than any number that the library prints; keeps hostile texts cheap. */
    private static final int MAX_DIGITS = 40;

    private static final int LONG_DIGITS = 18;

    private Numbers() {}

    static boolean isDigits(String text) {
        for (int i = 0; i < text.length(); i++) {
            if (text.charAt(i) < '0' || text.charAt(i) > '9') {
                return false;
            }
        }
        return !text.isEmpty();
    }

    private static boolean isInteger(String text) {
        return text.length() <= MAX_DIGITS
                && isDigits(text.startsWith("-") ? text.substring(1) : text);
    }

    static Long integer(String text) {
        if (!isInteger(text)) {
            return null;
        }
        if (text.length() <= LONG_DIGITS) {
            return Long.valueOf(text);
        }
        BigInteger number = new BigInteger(text);
        return number.bitLength() < Long.SIZE ? Long.valueOf(number.longValue()) : null;
    }

    /** An integer with implied decimals. */
    static BigDecimal scaled(String text, int decimals) {
        return isInteger(text) ? new BigDecimal(new BigInteger(text), decimals) : null;
    }

    /** A number as the gateway wrote it: digits, at most one point, perhaps a sign. */
    static BigDecimal decimal(String text) {
        String digits = text.startsWith("-") || text.startsWith("+") ? text.substring(1) : text;
        int point = digits.indexOf('.');
        String bare = point < 0 ? digits : digits.substring(0, point) + digits.substring(point + 1);
        return isDigits(bare) && bare.length() <= MAX_DIGITS ? new BigDecimal(text) : null;
    }

    static String padded(int number, int width) {
        StringBuilder text = new StringBuilder(String.valueOf(number));
        while (text.length() < width) {
            text.insert(0, '0');
        }
        return text.toString();
    }
}
