package com.brindlex.kernel.quorvane.typed;

/**
 * The type of a stock order or fill: kind, session and side in one code. The kinds from 5 on are
 * the broker's own and are named by their number.
 */
public enum OrderType implements Named {
    CASH_BUY("1", "buy"),
    CASH_SELL("2", "sell"),
    MARGIN_BUY("3", "margin buy"),
    MARGIN_SELL("4", "margin sell"),
    SHORT_COVER("5", "short cover"),
    SHORT_SELL("6", "short sell"),
    ODD_LOT_BUY("7", "odd-lot buy"),
    ODD_LOT_SELL("8", "odd-lot sell"),
    FIXED_PRICE_BUY("9", "fixed-price buy"),
    FIXED_PRICE_SELL("10", "fixed-price sell"),
    FIXED_PRICE_MARGIN_BUY("11", "fixed-price margin buy"),
    FIXED_PRICE_MARGIN_SELL("12", "fixed-price margin sell"),
    FIXED_PRICE_SHORT_COVER("13", "fixed-price short cover"),
    FIXED_PRICE_SHORT_SELL("14", "fixed-price short sell"),
    KIND_6("30", "order kind 6"),
    KIND_7("31", "order kind 7"),
    KIND_8_BUY("33", "order kind 8, buy"),
    KIND_8_SELL("34", "order kind 8, sell"),
    KIND_5("38", "order kind 5"),
    KIND_8_FIXED_PRICE_BUY("40", "order kind 8, fixed-price buy"),
    KIND_8_FIXED_PRICE_SELL("41", "order kind 8, fixed-price sell");

    private final String code;
    private final String label;

    OrderType(String code, String label) {
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
