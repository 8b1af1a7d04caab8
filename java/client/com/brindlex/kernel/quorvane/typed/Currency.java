package com.brindlex.kernel.quorvane.typed;

/** The currency of a futures position. */
public enum Currency implements Named {
    TWD("TWD", "New Taiwan dollar"),
    USD("USD", "US dollar"),
    RMB("RMB", "renminbi");

    private final String code;
    private final String label;

    Currency(String code, String label) {
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
