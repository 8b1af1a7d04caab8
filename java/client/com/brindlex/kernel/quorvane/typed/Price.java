package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;

/** A price of an order: an amount, or a word such as the market price. */
public final class Price {
    private final BigDecimal amount;
    private final PriceWord word;

    private Price(BigDecimal amount, PriceWord word) {
        this.amount = amount;
        this.word = word;
    }

    static Price parse(String text, int decimals) {
        BigDecimal amount = Numbers.scaled(text, decimals);
        PriceWord word = Code.of(PriceWord.values(), text).value();
        return amount == null && word == null ? null : new Price(amount, word);
    }

    /** The amount, or null when a word stands in its place. */
    public BigDecimal amount() {
        return amount;
    }

    /** The word, or null when there is an amount. */
    public PriceWord word() {
        return word;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Price && ((Price) other).toString().equals(toString());
    }

    @Override
    public int hashCode() {
        return toString().hashCode();
    }

    @Override
    public String toString() {
        return amount == null ? word.label() : amount.toPlainString();
    }
}
