package com.brindlex.kernel.quorvane.typed;

/** The two kinds of options. */
public enum CallPut implements Named {
    CALL("C", "call"),
    PUT("P", "put");

    private final String code;
    private final String label;

    CallPut(String code, String label) {
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
