package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * How much of a stock: whole lots, or shares of an odd lot. Never changes. What is out of range is
 * told when the request is built.
 */
public final class Quantity {
    /** Shares of a lot, where a stock has no other number. */
    public static final int USUAL_LOT = 1000;

    private final boolean oddLot;
    private final int number;
    private final int sharesPerLot;

    private Quantity(boolean oddLot, int number, int sharesPerLot) {
        this.oddLot = oddLot;
        this.number = number;
        this.sharesPerLot = sharesPerLot;
    }

    /** Lots of 1,000 shares. */
    @NotNull
    public static Quantity lots(int number) {
        return lots(number, USUAL_LOT);
    }

    /** Lots of so many shares. */
    @NotNull
    public static Quantity lots(int number, int sharesPerLot) {
        return new Quantity(false, number, sharesPerLot);
    }

    /** Shares of an odd lot: fewer than the 1,000 of a lot. */
    @NotNull
    public static Quantity oddLotShares(int shares) {
        return oddLotShares(shares, USUAL_LOT);
    }

    /** Shares of an odd lot: fewer than a lot has. */
    @NotNull
    public static Quantity oddLotShares(int shares, int sharesPerLot) {
        return new Quantity(true, shares, sharesPerLot);
    }

    /** Whether it counts shares of an odd lot; else it counts lots. */
    public boolean isOddLot() {
        return oddLot;
    }

    /** Lots, or shares of an odd lot. */
    public int number() {
        return number;
    }

    /** How many shares a lot has. */
    public int sharesPerLot() {
        return sharesPerLot;
    }

    /** All of it in shares. */
    public long shares() {
        return oddLot ? number : (long) number * sharesPerLot;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Quantity && ((Quantity) other).oddLot == oddLot
                && ((Quantity) other).number == number
                && ((Quantity) other).sharesPerLot == sharesPerLot;
    }

    @Override
    public int hashCode() {
        return (number * 31 + sharesPerLot) * 2 + (oddLot ? 1 : 0);
    }

    @Override
    public String toString() {
        return number + (oddLot ? " shares" : " lots of " + sharesPerLot);
    }
}
