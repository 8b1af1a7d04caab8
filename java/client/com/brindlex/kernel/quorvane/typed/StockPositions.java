package com.brindlex.kernel.quorvane.typed;

/**
 * The positions in stocks, by section. A row is there only when its quantities add up to
 * something.
 */
public final class StockPositions {
    /** Stock code. */
    public static final Column<String> STOCK_CODE =
            Column.of("stockCode", "29", Form.TEXT, "stock code");

    /** Opening quantity. */
    public static final Column<Long> OPENING =
            Column.of("opening", "75 76 77", Form.COUNT, "opening quantity");

    /** Change of the day. */
    public static final Column<Long> CHANGE =
            Column.of("change", "751 761 771", Form.COUNT, "change of the day");

    /** Second change of the day. */
    public static final Column<Long> SECOND_CHANGE =
            Column.of("secondChange", "752 762 772", Form.COUNT, "second change of the day");

    /** Quantity of other holdings. */
    public static final Column<Long> QUANTITY =
            Column.of("quantity", "PS", Form.COUNT, "quantity of other holdings");

    /** Always 0. */
    public static final Column<Long> SPARE_1 = Column.of("spare1", "", Form.COUNT, "always 0");

    /** Always 0. */
    public static final Column<Long> SPARE_2 = Column.of("spare2", "", Form.COUNT, "always 0");

    /** Holdings paid in full. */
    public static final Table CASH =
            Table.of("cash position").add(STOCK_CODE).add(OPENING, CHANGE).build();

    /** Holdings bought on margin. */
    public static final Table MARGIN =
            Table.of("margin position").add(STOCK_CODE).add(OPENING, CHANGE).skip(5).build();

    /** Short sales. */
    public static final Table SHORT_SALE =
            Table.of("short-sale position").add(STOCK_CODE).add(OPENING, CHANGE).skip(4).build();

    /** Other holdings. */
    public static final Table OTHER =
            Table.of("other holding").add(STOCK_CODE).add(QUANTITY, SPARE_1, SPARE_2).build();

    /** Holdings paid in full, at brokerage JZG. */
    public static final Table CASH_JZG = Table.of("cash position (JZG)")
                                                 .add(STOCK_CODE)
                                                 .add(OPENING, CHANGE, SECOND_CHANGE)
                                                 .build();

    /** Holdings bought on margin, at brokerage JZG. */
    public static final Table MARGIN_JZG = Table.of("margin position (JZG)")
                                                   .add(STOCK_CODE)
                                                   .add(OPENING, CHANGE, SECOND_CHANGE)
                                                   .skip(5)
                                                   .build();

    /** Short sales, at brokerage JZG. */
    public static final Table SHORT_SALE_JZG = Table.of("short-sale position (JZG)")
                                                       .add(STOCK_CODE)
                                                       .add(OPENING, CHANGE, SECOND_CHANGE)
                                                       .skip(4)
                                                       .build();

    private StockPositions() {}
}
