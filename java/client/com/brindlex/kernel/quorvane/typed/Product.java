package com.brindlex.kernel.quorvane.typed;

/**
 * What a futures order or position is made of. Spreads stand as Y in the order book and among the
 * positions; the list of fills writes every two-leg product as X.
 */
public enum Product implements Named {
    FUTURES("F", "futures"),
    OPTION("O", "option"),
    OPTION_COMBINATION("X", "combination"),
    FUTURES_SPREAD("Y", "futures spread");

    private final String code;
    private final String label;

    Product(String code, String label) {
        this.code = code;
        this.label = label;
    }

    @Override
    public String code() {
        return code;
    }

    @Override
    public String label() {
        return label;
    }
}
