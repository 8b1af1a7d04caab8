package com.brindlex.kernel.quorvane.console;

import java.math.BigDecimal;
import java.math.RoundingMode;
import java.util.regex.Matcher;
import java.util.regex.Pattern;

/** Turns the compact values of a result into what a user would write. */
public final class Readable {
    private static final Pattern INTEGER = Pattern.compile("-?[0-9]+");

    private static final String[] STOCK_TYPES = {
        "", "buy", "sell", "margin buy", "margin sell", "short cover", "short sell",
        "odd-lot buy", "odd-lot sell", "fixed-price buy", "fixed-price sell",
        "fixed margin buy", "fixed margin sell", "fixed short cover", "fixed short sell",
    };

    private static final int FUTURES_BASE = 51;
    private static final int FUTURES_END = 58;

    /** How a column is to be read. */
    public enum Form {
        /** As it stands. */
        PLAIN,
        /** An integer with two implied decimals; texts such as 市價 stay. */
        TWO_DECIMALS,
        /** An integer with four implied decimals. */
        FOUR_DECIMALS,
        /** An order-type code, or two joined by a bar. */
        ORDER_TYPE,
        /** A futures or options contract. */
        CONTRACT,
        /** A date of seven (Republic of China) or eight digits, or two. */
        DATE,
        /** A time of six digits, or two. */
        TIME;

        /** The readable form of a value; a value of another form comes back unchanged. */
        public String read(String value) {
            switch (this) {
                case TWO_DECIMALS:
                    return scaled(value, 2);
                case FOUR_DECIMALS:
                    return scaled(value, 4);
                case ORDER_TYPE:
                    return orderTypes(value);
                case CONTRACT:
                    return contract(value);
                case DATE:
                    return value.replaceAll(
                            "([0-9]{3,4})([0-9]{2})([0-9]{2})(?![0-9])", "$1/$2/$3");
                case TIME:
                    return value.replaceAll("([0-9]{2})([0-9]{2})([0-9]{2})(?![0-9])", "$1:$2:$3");
                default:
                    return value;
            }
        }
    }

    private Readable() {}

    private static String scaled(String value, int decimals) {
        Matcher integer = INTEGER.matcher(value);
        return integer.replaceAll(number -> {
            BigDecimal scaled = new BigDecimal(number.group()).movePointLeft(decimals);
            // two decimals always, four only where they say something
            return decimals == 2 || scaled.signum() == 0
                    ? scaled.setScale(decimals == 2 ? 2 : 0, RoundingMode.UNNECESSARY)
                              .toPlainString()
                    : scaled.stripTrailingZeros().toPlainString();
        });
    }

    private static String orderTypes(String value) {
        return INTEGER.matcher(value).replaceAll(code -> orderType(Integer.parseInt(code.group())));
    }

    private static String orderType(int code) {
        if (code >= FUTURES_BASE && code <= FUTURES_END) {
            return (code - FUTURES_BASE) % 2 == 0 ? "buy" : "sell";
        }
        return code > 0 && code < STOCK_TYPES.length ? STOCK_TYPES[code] : String.valueOf(code);
    }

    /**
     * {@code TIMEX&O&TXO&202401&C&180000000} reads TXO 202401 C 18000; two legs stand side by
     * side.
     */
    private static String contract(String value) {
        String[] parts = value.split("&", -1);
        if (parts.length < 4) {
            return value;
        }
        String text = leg(parts, 0);
        return parts[1].matches("[XY]") ? text + " / " + leg(parts, 1) : text;
    }

    private static String leg(String[] parts, int index) {
        // positions write a month as a date without a day
        String month = pick(parts[3], index).replaceFirst("^([0-9]{6})00$", "$1");
        StringBuilder text = new StringBuilder(pick(parts[2], index)).append(' ').append(month);
        boolean option = parts[1].matches("[OX]") && parts.length > 5;
        if (option) {
            text.append(' ')
                    .append(pick(parts[4], index))
                    .append(' ')
                    .append(scaled(pick(parts[5], index), 4));
        }
        return text.toString();
    }

    private static String pick(String pair, int index) {
        String[] halves = pair.split("\\|", -1);
        return index < halves.length ? halves[index] : halves[0];
    }
}
