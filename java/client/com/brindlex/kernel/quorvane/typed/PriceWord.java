package com.brindlex.kernel.quorvane.typed;

/** What stands in place of a price that is not a number. */
public enum PriceWord implements Named {
    MARKET("市價", "market price"),
    RANGE_MARKET("範圍市價", "range market price"),
    FLAT("平盤價", "flat (reference) price"),
    LIMIT_UP("漲停價", "limit-up price"),
    LIMIT_DOWN("跌停價", "limit-down price");

    private final String code;
    private final String label;

    PriceWord(String code, String label) {
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
