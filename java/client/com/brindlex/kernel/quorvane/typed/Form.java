package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;

/**
 * How the text of a column reads. An empty text reads as {@code null} in every form but {@link
 * #TEXT}.
 *
 * @param <T> what it reads as
 */
public abstract class Form<T> {
    /** As it stands. */
    public static final Form<String> TEXT = new Form<String>("text") {
        @Override
        String parse(String text) {
            return text;
        }
    };

    /** A whole number. */
    public static final Form<Long> COUNT = new Form<Long>("whole number") {
        @Override
        Long parse(String text) {
            return Numbers.integer(text);
        }
    };

    /** A number as the gateway wrote it. */
    public static final Form<BigDecimal> DECIMAL = new Form<BigDecimal>("number as written") {
        @Override
        BigDecimal parse(String text) {
            return Numbers.decimal(text);
        }
    };

    /** An integer with two implied decimals. */
    public static final Form<BigDecimal> HUNDREDTHS =
            new Form<BigDecimal>("number, 2 implied decimals") {
                @Override
                BigDecimal parse(String text) {
                    return Numbers.scaled(text, 2);
                }
            };

    /** An integer with four implied decimals. */
    public static final Form<BigDecimal> TEN_THOUSANDTHS =
            new Form<BigDecimal>("number, 4 implied decimals") {
                @Override
                BigDecimal parse(String text) {
                    return Numbers.scaled(text, 4);
                }
            };

    /** A price with two implied decimals, or a word. */
    public static final Form<Price> PRICE_HUNDREDTHS =
            new Form<Price>("price, 2 implied decimals, or a word") {
                @Override
                Price parse(String text) {
                    return Price.parse(text, 2);
                }
            };

    /** A price with four implied decimals, or a word. */
    public static final Form<Price> PRICE_TEN_THOUSANDTHS =
            new Form<Price>("price, 4 implied decimals, or a word") {
                @Override
                Price parse(String text) {
                    return Price.parse(text, 4);
                }
            };

    /** A Western date of eight digits or a Republic of China date of seven or six. */
    public static final Form<TradeDate> DATE = new Form<TradeDate>("date") {
        @Override
        TradeDate parse(String text) {
            return TradeDate.parse(text);
        }
    };

    /** A time of six digits. */
    public static final Form<TradeTime> TIME = new Form<TradeTime>("time HHMMSS") {
        @Override
        TradeTime parse(String text) {
            return TradeTime.parse(text);
        }
    };

    /** A contract month; among the positions it carries a day 00, which is left out here. */
    public static final Form<String> MONTH = new Form<String>("contract month") {
        @Override
        String parse(String text) {
            boolean day = text.length() == 8 && text.endsWith("00");
            return day ? text.substring(0, 6) : text;
        }
    };

    /** An amount with four implied decimals; a text that holds {@code &} stays as it is. */
    public static final Form<BigDecimal> AMOUNT_OR_TEXT =
            new Form<BigDecimal>("number, 4 implied decimals, or a text with '&'") {
                @Override
                BigDecimal parse(String text) {
                    return Numbers.scaled(text, 4);
                }

                @Override
                public boolean accepts(String text) {
                    return text.indexOf('&') >= 0 || super.accepts(text);
                }
            };

    private final String name;

    private Form(String name) {
        this.name = name;
    }

    /** A code with named values; one that is not known stays readable as text. */
    static <E extends Enum<E> & Named> Form<Code<E>> code(String name, final E[] values) {
        return new CodeForm<E>(name, values);
    }

    /** Reads a text that is not empty, or gives null. */
    abstract T parse(String text);

    /** Reads a text; null when it is empty (unless it is a text column) or no such value. */
    public final T read(String text) {
        return text.isEmpty() && this != TEXT ? null : parse(text);
    }

    /** Whether a text may stand in such a column: it is empty, or can be read. */
    public boolean accepts(String text) {
        return text.isEmpty() || parse(text) != null;
    }

    /** What a value of this form is, in a few words. */
    public String name() {
        return name;
    }

    /** The codes of this form that have names; none for a form without codes. */
    public Named[] codes() {
        return new Named[0];
    }

    /** A form whose values are codes. */
    private static final class CodeForm<E extends Enum<E> & Named> extends Form<Code<E>> {
        private final E[] values;

        CodeForm(String name, E[] values) {
            super(name);
            this.values = values;
        }

        @Override
        Code<E> parse(String text) {
            return Code.of(values, text);
        }

        @Override
        public Named[] codes() {
            return values.clone();
        }
    }
}
