package com.brindlex.kernel.quorvane.client;

import java.math.BigDecimal;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * How the texts of a column read. An empty text or a blank reads as null in every form but {@link
 * #TEXT}. Never changes.
 *
 * @param <T> what they read as
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
    public static final Form<BigDecimal> NUMBER = new Form<BigDecimal>("number as written") {
        @Override
        BigDecimal parse(String text) {
            return Numbers.decimal(text);
        }
    };

    /** A whole number with two implied decimals. */
    public static final Form<BigDecimal> HUNDREDTHS = scaled(2);

    /** A whole number with four implied decimals. */
    public static final Form<BigDecimal> TEN_THOUSANDTHS = scaled(4);

    /** A whole number with four implied decimals; a text that holds {@code &} is no amount. */
    public static final Form<BigDecimal> AMOUNT_OR_TEXT =
            new Form<BigDecimal>("number, 4 implied decimals, or a text with '&'") {
                @Override
                BigDecimal parse(String text) {
                    return Numbers.scaled(text, 4);
                }

                @Override
                boolean accepts(String text) {
                    return text.indexOf('&') >= 0 || super.accepts(text);
                }
            };

    /** A price with two implied decimals, or a word. */
    public static final Form<Price> PRICE_2 = price(2);

    /** A price with four implied decimals, or a word. */
    public static final Form<Price> PRICE_4 = price(4);

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

    /**
     * A strike price of the futures order book, which shows those of combinations of some
     * commodities divided by ten.
     */
    static final Form<BigDecimal> BOOK_STRIKE =
            new Form<BigDecimal>("number, 4 implied decimals") {
                @Override
                BigDecimal parse(String text) {
                    return Numbers.scaled(text, 4);
                }

                @Override
                BigDecimal in(Row<?> row, BigDecimal shown) {
                    boolean divided = !row.named("strike2").isEmpty()
                            && row.named("commodity1").matches("MSO|GTO|TEO");
                    return divided ? shown.multiply(BigDecimal.TEN) : shown;
                }
            };

    private final String name;

    private Form(String name) {
        this.name = name;
    }

    private static Form<BigDecimal> scaled(final int decimals) {
        return new Form<BigDecimal>("number, " + decimals + " implied decimals") {
            @Override
            BigDecimal parse(String text) {
                return Numbers.scaled(text, decimals);
            }
        };
    }

    private static Form<Price> price(final int decimals) {
        return new Form<Price>("price, " + decimals + " implied decimals, or a word") {
            @Override
            Price parse(String text) {
                return Price.parse(text, decimals);
            }
        };
    }

    /** A code; the last of the values is {@code UNKNOWN}. */
    static <E extends Enum<E> & Coded> Form<Code<E>> code(final E[] values) {
        return new Form<Code<E>>("code") {
            @Override
            Code<E> parse(String text) {
                return Code.of(values, text);
            }

            @Override
            public Coded[] codes() {
                return java.util.Arrays.copyOf(values, values.length - 1, Coded[].class);
            }
        };
    }

    /** Reads a text that is not blank; null when it is none of this form. */
    @Nullable
    abstract T parse(String text);

    boolean accepts(String text) {
        return isBlank(text) || parse(text) != null;
    }

    /** What a value means where the rest of its row says so. */
    T in(Row<?> row, T shown) {
        return shown;
    }

    /**
     * Reads the text of a column.
     *
     * @throws MalformedValueException when it is none of this form
     */
    @Nullable
    final T read(Row<?> row, Column<?, ?> column, String text) {
        if (this == TEXT) {
            return parse(text);
        }
        if (isBlank(text)) {
            return null;
        }
        T value = parse(text);
        if (value == null) {
            throw new MalformedValueException(column, text, "is no " + name);
        }
        return in(row, value);
    }

    /** Reads a text; null when it is blank or none of this form. */
    @Nullable
    final T peek(Row<?> row, String text) {
        T value = isBlank(text) ? null : parse(text);
        return value == null ? null : in(row, value);
    }

    private static boolean isBlank(String text) {
        return text.isEmpty() || text.equals(" ");
    }

    /** What a value of this form is, in a few words. */
    @NotNull
    public String name() {
        return name;
    }

    /** The codes that have names; none for a form without codes. */
    @NotNull
    public Coded[] codes() {
        return new Coded[0];
    }

    @Override
    public String toString() {
        return name;
    }
}
