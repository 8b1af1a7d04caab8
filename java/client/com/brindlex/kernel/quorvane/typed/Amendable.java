package com.brindlex.kernel.quorvane.typed;

/** Whether an order can still be changed. */
public enum Amendable implements Named {
    YES("1", "can be changed"),
    NO("2", "cannot be changed");

    private final String code;
    private final String label;

    Amendable(String code, String label) {
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
