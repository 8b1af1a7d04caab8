package com.brindlex.kernel.quorvane.typed;

/**
 * The type of a settled trade: as {@link OrderType} up to 14; the kinds from 5 on have codes of
 * their own here.
 */
public enum SettlementType implements Named {
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
    KIND_5("19", "order kind 5"),
    KIND_6("20", "order kind 6"),
    KIND_7("21", "order kind 7"),
    KIND_8("22", "order kind 8"),
    KIND_9("23", "order kind 9"),
    KIND_10("24", "order kind 10"),
    KIND_11("25", "order kind 11"),
    KIND_12("26", "order kind 12"),
    KIND_13("27", "order kind 13"),
    KIND_14("28", "order kind 14"),
    KIND_15("29", "order kind 15"),
    KIND_16("30", "order kind 16"),
    KIND_17("31", "order kind 17"),
    KIND_20("32", "order kind 20"),
    KIND_21("33", "order kind 21"),
    KIND_22("34", "order kind 22"),
    KIND_23("35", "order kind 23"),
    KIND_24("36", "order kind 24"),
    KIND_25("37", "order kind 25"),
    KIND_26("39", "order kind 26");

    private final String code;
    private final String label;

    SettlementType(String code, String label) {
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
