package com.brindlex.kernel.quorvane.console.message;

/** Asks what a text is made of. */
final class Digits {
    private Digits() {}

    private static boolean isDigit(char c) {
        return c >= '0' && c <= '9';
    }

    /** Whether a text is digits alone, so many of them. */
    static boolean all(String text, int least, int most) {
        return text.length() >= least && text.length() <= most && begin(text, text.length());
    }

    /** Whether a text begins with so many digits. */
    static boolean begin(String text, int count) {
        if (text.length() < count) {
            return false;
        }
        for (int i = 0; i < count; i++) {
            if (!isDigit(text.charAt(i))) {
                return false;
            }
        }
        return true;
    }

    /** Whether a text is a whole number with a sign or without. */
    static boolean whole(String text, int most) {
        return text.startsWith("-") ? all(text.substring(1), 1, most) : all(text, 1, most);
    }

    /**
     * Whether a text is digits, a point and digits.
     *
     * @param decimals how many stand behind the point
     */
    static boolean decimal(String text, int decimals) {
        int point = text.length() - decimals - 1;
        return point > 0 && text.charAt(point) == '.' && all(text.substring(0, point), 1, 10)
                && all(text.substring(point + 1), decimals, decimals);
    }
}
