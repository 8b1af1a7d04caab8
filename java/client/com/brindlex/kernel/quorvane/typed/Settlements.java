package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;

/** The settled trades of a period. */
public final class Settlements {
    /** Date of the trade. */
    public static final Column<TradeDate> DATE =
            Column.of("date", "50", Form.DATE, "date of the trade");

    /** Type of the trade. */
    public static final Column<Code<SettlementType>> TYPE =
            Column.code("type", "27 28 32", SettlementType.values(), "type of the trade");

    /** Type of the trade at brokerage JZG. */
    public static final Column<String> BROKER_TYPE =
            Column.of("brokerType", "KT", Form.TEXT, "type of the trade at brokerage JZG");

    /** Stock code. */
    public static final Column<String> STOCK_CODE =
            Column.of("stockCode", "29", Form.TEXT, "stock code");

    /** Quantity. */
    public static final Column<BigDecimal> QUANTITY =
            Column.of("quantity", "47", Form.DECIMAL, "quantity");

    /** Price. */
    public static final Column<BigDecimal> PRICE =
            Column.of("price", "48", Form.HUNDREDTHS, "price");

    /** Amount. */
    public static final Column<BigDecimal> AMOUNT =
            Column.of("amount", "49", Form.DECIMAL, "amount");

    /** Amount 79 (fee). */
    public static final Column<BigDecimal> AMOUNT_79 =
            Column.of("amount79", "79", Form.DECIMAL, "amount 79 (fee)");

    /** Amount 78 (tax). */
    public static final Column<BigDecimal> AMOUNT_78 =
            Column.of("amount78", "78", Form.DECIMAL, "amount 78 (tax)");

    /** Amount 84. */
    public static final Column<BigDecimal> AMOUNT_84 =
            Column.of("amount84", "84", Form.DECIMAL, "amount 84");

    /** Margin amount 81 or short-sale amount 85. */
    public static final Column<BigDecimal> CREDIT_AMOUNT = Column.of(
            "creditAmount", "81 85", Form.DECIMAL, "margin amount 81 or short-sale amount 85");

    /** Margin amount 82 or short-sale amount 87. */
    public static final Column<BigDecimal> SECOND_CREDIT_AMOUNT = Column.of("secondCreditAmount",
            "82 87", Form.DECIMAL, "margin amount 82 or short-sale amount 87");

    /** Amount 86. */
    public static final Column<BigDecimal> AMOUNT_86 =
            Column.of("amount86", "86", Form.DECIMAL, "amount 86");

    /** Amount 89. */
    public static final Column<BigDecimal> AMOUNT_89 =
            Column.of("amount89", "89", Form.DECIMAL, "amount 89");

    /** Amount 88. */
    public static final Column<BigDecimal> AMOUNT_88 =
            Column.of("amount88", "88", Form.DECIMAL, "amount 88");

    /** Sign of the net amount: - or empty. */
    public static final Column<String> SIGN =
            Column.of("sign", "96", Form.TEXT, "sign of the net amount: - or empty");

    /** Net amount without its sign. */
    public static final Column<BigDecimal> NET_AMOUNT =
            Column.of("netAmount", "97", Form.DECIMAL, "net amount without its sign");

    /** One row per trade. */
    public static final Table TABLE = table("settled trade", TYPE);

    /** One row per trade, at brokerage JZG. */
    public static final Table TABLE_JZG = table("settled trade (JZG)", BROKER_TYPE);

    private static Table table(String name, Column<?> type) {
        return Table.of(name)
                .add(DATE)
                .skip(1)
                .add(type)
                .add(STOCK_CODE)
                .add(QUANTITY)
                .add(PRICE)
                .add(AMOUNT)
                .add(AMOUNT_79)
                .add(AMOUNT_78)
                .add(AMOUNT_84)
                .add(CREDIT_AMOUNT)
                .add(SECOND_CREDIT_AMOUNT)
                .add(AMOUNT_86)
                .add(AMOUNT_89)
                .add(AMOUNT_88)
                .add(SIGN)
                .add(NET_AMOUNT)
                .build();
    }

    private Settlements() {}
}
