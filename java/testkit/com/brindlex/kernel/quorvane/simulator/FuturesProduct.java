package com.brindlex.kernel.quorvane.simulator;

/** A futures or options product: what one point is worth and the margin that one contract needs. */
final class FuturesProduct {
    private static final FuturesProduct[] TRADED = {
        new FuturesProduct("TXF", false, 200, 322000),
        new FuturesProduct("MXF", false, 50, 80500),
        new FuturesProduct("TXO", true, 50, 82000),
        new FuturesProduct("TEO", true, 250, 60000),
    };

    final String commodity;
    final boolean option;
    final long pointValue;
    final long margin;

    private FuturesProduct(String commodity, boolean option, long pointValue, long margin) {
        this.commodity = commodity;
        this.option = option;
        this.pointValue = pointValue;
        this.margin = margin;
    }

    /** The product behind a commodity id, or null. */
    static FuturesProduct byId(String commodity) {
        for (FuturesProduct product : TRADED) {
            if (product.commodity.equals(commodity)) {
                return product;
            }
        }
        return null;
    }
}
