package com.brindlex.kernel.quorvane.client;

import java.math.BigDecimal;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * A futures contract or one option. Never changes; strike prices of 18000 and 18000.00 are equal.
 * What is out of range is told when a request is built.
 */
public final class Contract {
    private final String commodity;
    private final String month;
    private final CallPut callPut;
    private final BigDecimal strike;

    private Contract(String commodity, String month, CallPut callPut, BigDecimal strike) {
        this.commodity = commodity;
        this.month = month;
        this.callPut = callPut;
        this.strike = strike;
    }

    /**
     * A futures contract.
     *
     * @param commodity the commodity, {@code TXF}
     * @param month the contract month, YYYYMM, perhaps with a week, {@code 202401W2}
     */
    @NotNull
    public static Contract futures(@NotNull String commodity, @NotNull String month) {
        return new Contract(commodity, month, null, null);
    }

    /** An option. */
    @NotNull
    public static Contract option(@NotNull String commodity, @NotNull String month,
            @NotNull CallPut callPut, @NotNull BigDecimal strike) {
        return new Contract(commodity, month, callPut, Numbers.plain(strike));
    }

    /**
     * An option.
     *
     * @throws IllegalArgumentException when the strike price is no number
     */
    @NotNull
    public static Contract option(@NotNull String commodity, @NotNull String month,
            @NotNull CallPut callPut, @NotNull String strike) {
        BigDecimal number = Numbers.decimal(strike);
        if (number == null) {
            throw new IllegalArgumentException("no strike price: '" + strike + "'");
        }
        return option(commodity, month, callPut, number);
    }

    /** The commodity. */
    @NotNull
    public String commodity() {
        return commodity;
    }

    /** The contract month. */
    @NotNull
    public String month() {
        return month;
    }

    /** Whether it is an option. */
    public boolean isOption() {
        return callPut != null;
    }

    /** Call or put; null for a futures contract. */
    @Nullable
    public CallPut callPut() {
        return callPut;
    }

    /** The strike price; null for a futures contract. */
    @Nullable
    public BigDecimal strike() {
        return strike;
    }

    /** Writes the contract into leg 1 or 2 of a request. */
    void fill(Draft<?> draft, int leg) {
        if (commodity.isEmpty()) {
            draft.refuse("commodity" + leg, "must be given");
        }
        if (month.isEmpty()) {
            draft.refuse("month" + leg, "must be given");
        }
        if (isOption()
                && (strike.signum() <= 0 || strike.scale() > 4 || strike.precision() > 10)) {
            draft.refuse("strike" + leg, "must be above 0 with at most 4 decimals, not " + strike);
        }
        if (callPut == CallPut.UNKNOWN) {
            draft.refuse("callPut" + leg, "must be call or put");
        }
        draft.set("commodity" + leg, commodity).set("month" + leg, month);
        draft.set("callPut" + leg, isOption() ? callPut.code() : "");
        draft.set("strike" + leg, isOption() ? strike.toPlainString() : "");
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Contract && ((Contract) other).toString().equals(toString());
    }

    @Override
    public int hashCode() {
        return toString().hashCode();
    }

    /** The contract in words: TXF 202401, TXO 202401 call 18000. */
    @Override
    public String toString() {
        return commodity + " " + month
                + (isOption() ? " " + callPut.label() + " " + strike.toPlainString() : "");
    }
}
