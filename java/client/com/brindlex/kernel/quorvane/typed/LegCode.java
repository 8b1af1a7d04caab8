package com.brindlex.kernel.quorvane.typed;

/** The side of one leg with the broker's W3 flag in one code: odd codes buy, even codes sell. */
public enum LegCode implements Named {
    BUY("51", "buy"),
    SELL("52", "sell"),
    BUY_W3_0("53", "buy, W3 0"),
    SELL_W3_0("54", "sell, W3 0"),
    BUY_W3_1("55", "buy, W3 1"),
    SELL_W3_1("56", "sell, W3 1"),
    BUY_W3_2("57", "buy, W3 2"),
    SELL_W3_2("58", "sell, W3 2");

    private final String code;
    private final String label;

    LegCode(String code, String label) {
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

    /** Buy or sell. */
    public Side side() {
        return ordinal() % 2 == 0 ? Side.BUY : Side.SELL;
    }
}
