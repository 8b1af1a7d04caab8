package com.brindlex.kernel.quorvane.simulator;

import org.jetbrains.annotations.NotNull;

/** A futures or options product, and the margin that one contract needs. */
public final class ListedProduct {
    final String commodity;
    final boolean option;
    final long margin;

    private ListedProduct(String commodity, boolean option, long margin) {
        if (!commodity.matches("[0-9A-Z]{1,7}")) {
            throw new IllegalArgumentException("The code of a product is digits and capital letters,"
                    + " such as \"TXF\", not \"" + commodity + "\".");
        }
        this.commodity = commodity;
        this.option = option;
        this.margin = margin;
    }

    /**
     * A futures product.
     *
     * @param margin what one contract binds, in whole units
     */
    @NotNull
    public static ListedProduct futures(@NotNull String commodity, long margin) {
        return new ListedProduct(commodity, false, margin);
    }

    /**
     * An options product.
     *
     * @param margin what one sold contract binds, in whole units
     */
    @NotNull
    public static ListedProduct options(@NotNull String commodity, long margin) {
        return new ListedProduct(commodity, true, margin);
    }
}
