package com.brindlex.kernel.quorvane.client;

import java.math.BigDecimal;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * A price of either market: an amount in the currency's unit, or a word of the exchange. How it
 * travels is the library's business. Never changes; 600.5 and 600.50 are equal.
 */
public final class Price {
    /** Whatever the market gives; futures and options alone take it. */
    public static final Price MARKET = new Price(null, PriceWord.MARKET);

    /** Whatever the market gives within a range; futures and options alone take it. */
    public static final Price RANGE_MARKET = new Price(null, PriceWord.RANGE_MARKET);

    /** The reference price of the day; stocks alone take it. */
    public static final Price FLAT = new Price(null, PriceWord.FLAT);

    /** The highest price of the day; stocks alone take it. */
    public static final Price LIMIT_UP = new Price(null, PriceWord.LIMIT_UP);

    /** The lowest price of the day; stocks alone take it. */
    public static final Price LIMIT_DOWN = new Price(null, PriceWord.LIMIT_DOWN);

    private final BigDecimal amount;
    private final PriceWord word;

    private Price(BigDecimal amount, PriceWord word) {
        this.amount = amount;
        this.word = word;
    }

    /** An amount. */
    @NotNull
    public static Price of(@NotNull BigDecimal amount) {
        return new Price(Numbers.plain(amount), null);
    }

    /**
     * An amount as digits, with a point or without: {@code 600.5}.
     *
     * @throws IllegalArgumentException when the text is no number
     */
    @NotNull
    public static Price of(@NotNull String digits) {
        BigDecimal amount = Numbers.decimal(digits);
        if (amount == null) {
            throw new IllegalArgumentException("no price: '" + digits + "'");
        }
        return of(amount);
    }

    /**
     * A word of the exchange.
     *
     * @throws IllegalArgumentException when the word is {@link PriceWord#UNKNOWN}
     */
    @NotNull
    public static Price of(@NotNull PriceWord word) {
        if (word == PriceWord.UNKNOWN) {
            throw new IllegalArgumentException("no word of the exchange");
        }
        return new Price(null, word);
    }

    /**
     * The price that stands in a result: a whole number with implied decimals or a word; or null.
     */
    @Nullable
    static Price parse(String text, int decimals) {
        BigDecimal amount = Numbers.scaled(text, decimals);
        if (amount != null) {
            return of(amount);
        }
        PriceWord word = Code.of(PriceWord.values(), text).value();
        return word == PriceWord.UNKNOWN ? null : new Price(null, word);
    }

    /** Whether it is a word of the exchange. */
    public boolean isWord() {
        return word != null;
    }

    /** The amount; null for a word. */
    @Nullable
    public BigDecimal amount() {
        return amount;
    }

    /** The word; null for an amount. */
    @Nullable
    public PriceWord word() {
        return word;
    }

    /** The amount as a whole number with so many decimals implied; null when it does not fit. */
    @Nullable
    Integer scaled(int decimals) {
        BigDecimal shifted = amount.movePointRight(decimals);
        boolean whole = shifted.signum() == 0 || shifted.stripTrailingZeros().scale() <= 0;
        boolean fits = shifted.abs().compareTo(BigDecimal.valueOf(Integer.MAX_VALUE)) <= 0;
        return whole && fits ? Integer.valueOf(shifted.intValue()) : null;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Price && ((Price) other).word == word
                && ((Price) other).toString().equals(toString());
    }

    @Override
    public int hashCode() {
        return toString().hashCode();
    }

    /** The amount in digits, or the word as the exchange writes it. */
    @Override
    public String toString() {
        return amount == null ? word.code() : amount.toPlainString();
    }
}
