package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.Nullable;

/** What new and amended orders have in common. */
final class Terms {
    private Terms() {}

    /** Writes a side. */
    static void side(Draft<?> draft, String argument, @Nullable Side side) {
        if (side == Side.UNKNOWN) {
            draft.refuse(argument, "must be to buy or to sell");
        } else if (side != null) {
            draft.set(argument, side.code().charAt(0));
        }
    }

    /** Writes quantity and shares per lot, for a trade type that they must go with. */
    static void quantity(Draft<?> draft, @Nullable Quantity quantity, int tradeType) {
        if (quantity == null) {
            draft.refuse("quantity", "must be given: lots, or shares of an odd lot");
            return;
        }
        if (quantity.isOddLot() != (tradeType == 2)) {
            draft.refuse("quantity", "of trade type " + tradeType + " must count "
                    + (tradeType == 2 ? "shares of an odd lot" : "lots"));
        }
        if (quantity.number() < 1 || quantity.sharesPerLot() < 1) {
            draft.refuse("quantity", "must be above 0, not " + quantity);
        } else if (quantity.isOddLot() && quantity.number() >= quantity.sharesPerLot()) {
            draft.refuse("quantity", "of an odd lot must be less than " + quantity.sharesPerLot()
                    + " shares, not " + quantity.number());
        } else if (quantity.shares() > Integer.MAX_VALUE) {
            draft.refuse("quantity", "must not exceed " + Integer.MAX_VALUE + " shares, as "
                    + quantity + " do");
        } else {
            draft.set("quantity", quantity.number()).set("unit", quantity.sharesPerLot());
        }
    }

    /** Writes the amount of a price, with so many decimals implied. */
    static void amount(Draft<?> draft, Price price, int decimals, int least) {
        Integer scaled = price.scaled(decimals);
        if (scaled == null) {
            draft.refuse("price", "must have at most " + decimals + " decimals and not exceed "
                    + new java.math.BigDecimal(Integer.MAX_VALUE).movePointLeft(decimals) + ", not "
                    + price);
        } else if (scaled < least) {
            draft.refuse("price", "must " + (least == 0 ? "not be below" : "be above") + " 0, not "
                    + price);
        } else {
            draft.set("price", scaled);
        }
    }
}
