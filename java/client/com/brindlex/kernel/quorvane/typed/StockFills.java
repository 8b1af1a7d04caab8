package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;

/** The fills of stock orders. */
public final class StockFills {
    /** Order number. */
    public static final Column<String> ORDER_NUMBER =
            Column.of("orderNumber", "36", Form.TEXT, "order number");

    /** Order type. */
    public static final Column<Code<OrderType>> TYPE =
            Column.code("type", "27 28 32", OrderType.values(), "order type");

    /** Stock code. */
    public static final Column<String> STOCK_CODE =
            Column.of("stockCode", "29", Form.TEXT, "stock code");

    /** Filled quantity. */
    public static final Column<Long> SHARES =
            Column.of("shares", "47", Form.COUNT, "filled quantity");

    /** Price of the fill. */
    public static final Column<BigDecimal> PRICE =
            Column.of("price", "48", Form.HUNDREDTHS, "price of the fill");

    /** Amount of the fill. */
    public static final Column<Long> AMOUNT =
            Column.of("amount", "49", Form.COUNT, "amount of the fill");

    /** Date of the fill. */
    public static final Column<TradeDate> DATE =
            Column.of("date", "50", Form.DATE, "date of the fill");

    /** Time of the fill. */
    public static final Column<TradeTime> TIME =
            Column.of("time", "51", Form.TIME, "time of the fill");

    /** One row per fill. */
    public static final Table TABLE = Table.of("stock fill")
            .add(ORDER_NUMBER).add(TYPE).add(STOCK_CODE).add(SHARES).add(PRICE).add(AMOUNT)
            .add(DATE).add(TIME)
            .build();

    private StockFills() {}
}
