package com.brindlex.kernel.quorvane.typed;

/** What the gateway did with an order. */
public enum Acceptance implements Named {
    NOT_ACCEPTED("0", "answered X"),
    ACCEPTED("1", "accepted");

    private final String code;
    private final String label;

    Acceptance(String code, String label) {
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
