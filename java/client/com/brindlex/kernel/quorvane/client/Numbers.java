package com.brindlex.kernel.quorvane.client;

import java.math.BigDecimal;
import java.math.BigInteger;
import org.jetbrains.annotations.Nullable;

/** Reads the numbers of results; null where there is none. */
final class Numbers {
    /** Longer than any number that the library prints; keeps hostile texts cheap. */
    private static final int MAX_DIGITS = 40;

    private static final int LONG_DIGITS = 18;

    private Numbers() {}

    static boolean isDigits(String text) {
        return isDigits(text, 0);
    }

    private static boolean isDigits(String text, int from) {
        for (int i = from; i < text.length(); i++) {
            if (text.charAt(i) < '0' || text.charAt(i) > '9') {
                return false;
            }
        }
        return from < text.length();
    }

    private static boolean isInteger(String text) {
        return text.length() <= MAX_DIGITS && isDigits(text, text.startsWith("-") ? 1 : 0);
    }

    @Nullable
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
    @Nullable
    static BigDecimal scaled(String text, int decimals) {
        if (!isInteger(text)) {
            return null;
        }
        return text.length() <= LONG_DIGITS
                ? BigDecimal.valueOf(Long.parseLong(text), decimals)
                : new BigDecimal(new BigInteger(text), decimals);
    }

    /** A number as people and gateways write it: digits, at most one point, perhaps a sign. */
    @Nullable
    static BigDecimal decimal(String text) {
        String digits = text.startsWith("-") || text.startsWith("+") ? text.substring(1) : text;
        int point = digits.indexOf('.');
        String bare = point < 0 ? digits : digits.substring(0, point) + digits.substring(point + 1);
        return isDigits(bare) && bare.length() <= MAX_DIGITS ? new BigDecimal(text) : null;
    }

    /** The same number without zeros behind the point. */
    static BigDecimal plain(BigDecimal number) {
        BigDecimal bare = number.signum() == 0 ? BigDecimal.ZERO : number.stripTrailingZeros();
        return bare.scale() < 0 ? bare.setScale(0) : bare;
    }

    static String padded(int number, int width) {
        StringBuilder text = new StringBuilder(String.valueOf(number));
        while (text.length() < width) {
            text.insert(0, '0');
        }
        return text.toString();
    }
}
