package com.brindlex.kernel.quorvane.typed;

/** How long a futures order stands. */
public enum TimeInForce implements Named {
    REST_OF_DAY("R", "rest of day"),
    IMMEDIATE_OR_CANCEL("I", "immediate or cancel"),
    FILL_OR_KILL("F", "fill or kill");

    private final String code;
    private final String label;

    TimeInForce(String code, String label) {
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
