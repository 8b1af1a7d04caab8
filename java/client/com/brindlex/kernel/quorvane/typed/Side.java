package com.brindlex.kernel.quorvane.typed;

/** Buy or sell. */
public enum Side implements Named {
    BUY("B", "buy"),
    SELL("S", "sell");

    private final String code;
    private final String label;

    Side(String code, String label) {
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

    /** The letter as the wire carries it. */
    char letter() {
        return code.charAt(0);
    }
}
