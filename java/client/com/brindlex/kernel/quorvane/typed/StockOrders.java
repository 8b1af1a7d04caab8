package com.brindlex.kernel.quorvane.typed;

/** The stock order book. */
public final class StockOrders {
    /** Number of the order at the gateway. */
    public static final Column<String> GATEWAY_NUMBER =
            Column.of("gatewayNumber", "46", Form.TEXT, "number of the order at the gateway");

    /** Order number. */
    public static final Column<String> ORDER_NUMBER =
            Column.of("orderNumber", "36", Form.TEXT, "order number");

    /** Order type. */
    public static final Column<Code<OrderType>> TYPE =
            Column.code("type", "27 28 32", OrderType.values(), "order type");

    /** Stock code. */
    public static final Column<String> STOCK_CODE =
            Column.of("stockCode", "29", Form.TEXT, "stock code");

    /** Ordered quantity. */
    public static final Column<Long> ORDERED =
            Column.of("ordered", "70", Form.COUNT, "ordered quantity");

    /** State of the order. */
    public static final Column<Code<OrderStatus>> STATUS = Column.code(
            "status", "39 K1 70 47 37 41 N6", OrderStatus.values(), "state of the order");

    /** Why the order failed. */
    public static final Column<String> MESSAGE =
            Column.of("message", "K1", Form.TEXT, "why the order failed");

    /** Filled quantity. */
    public static final Column<Long> FILLED =
            Column.of("filled", "47", Form.COUNT, "filled quantity");

    /** Cancelled quantity. */
    public static final Column<Long> CANCELLED =
            Column.of("cancelled", "37 41", Form.COUNT, "cancelled quantity");

    /** Order price. */
    public static final Column<Price> PRICE =
            Column.of("price", "31 M8", Form.PRICE_HUNDREDTHS, "order price");

    /** Time of the order. */
    public static final Column<TradeTime> TIME =
            Column.of("time", "22", Form.TIME, "time of the order");

    /** Date of entry. */
    public static final Column<TradeDate> ENTRY_DATE =
            Column.of("entryDate", "21", Form.DATE, "date of entry");

    /** Date of the order. */
    public static final Column<TradeDate> ORDER_DATE =
            Column.of("orderDate", "44", Form.DATE, "date of the order");

    /** Handling flag of the broker. */
    public static final Column<String> HANDLING_FLAG =
            Column.of("handlingFlag", "N6", Form.TEXT, "handling flag of the broker");

    /** Whether the order can be changed. */
    public static final Column<Code<Amendable>> AMENDABLE =
            Column.code("amendable", "JV", Amendable.values(), "whether the order can be changed");

    /** One row per order. */
    public static final Table TABLE = Table.of("stock order")
                                              .add(GATEWAY_NUMBER)
                                              .add(ORDER_NUMBER)
                                              .add(TYPE)
                                              .add(STOCK_CODE)
                                              .add(ORDERED)
                                              .join(Table.part(STATUS), Table.part(MESSAGE))
                                              .add(FILLED)
                                              .add(CANCELLED)
                                              .add(PRICE)
                                              .add(TIME)
                                              .add(ENTRY_DATE)
                                              .add(ORDER_DATE)
                                              .add(HANDLING_FLAG)
                                              .add(AMENDABLE)
                                              .build();

    private StockOrders() {}
}
