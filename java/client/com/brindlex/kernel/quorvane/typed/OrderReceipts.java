package com.brindlex.kernel.quorvane.typed;

/** The acknowledgement of an order. */
public final class OrderReceipts {
    /** Number of the order at the gateway. */
    public static final Column<String> GATEWAY_NUMBER =
            Column.of("gatewayNumber", "46", Form.TEXT, "number of the order at the gateway");

    /** Date of the order. */
    public static final Column<TradeDate> ORDER_DATE =
            Column.of("orderDate", "44", Form.DATE, "date of the order");

    /** Whether the order was accepted. */
    public static final Column<Code<Acceptance>> ACCEPTED =
            Column.code("accepted", "19", Acceptance.values(), "whether the order was accepted");

    /** MT flag: 0, 1 or empty. */
    public static final Column<String> MT_FLAG =
            Column.of("mtFlag", "MT", Form.TEXT, "MT flag: 0, 1 or empty");

    /** The acknowledgement of a stock order: one row. */
    public static final Table STOCK = Table.of("stock order receipt")
            .add(GATEWAY_NUMBER).add(ORDER_DATE).skip(1).add(ACCEPTED)
            .build();

    /** The acknowledgement of a futures order: one row. */
    public static final Table FUTURES = Table.of("futures order receipt")
            .add(GATEWAY_NUMBER).add(ORDER_DATE).skip(1).add(ACCEPTED).add(MT_FLAG).skip(1)
            .build();

    private OrderReceipts() {}
}
