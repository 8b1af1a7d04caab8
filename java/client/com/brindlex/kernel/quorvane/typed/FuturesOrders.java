package com.brindlex.kernel.quorvane.typed;

/** The futures and options order book; the columns of the contract stand in {@link Contracts}. */
public final class FuturesOrders {
    /** Number of the order at the gateway. */
    public static final Column<String> GATEWAY_NUMBER =
            Column.of("gatewayNumber", "46", Form.TEXT, "number of the order at the gateway");

    /** Order number. */
    public static final Column<String> ORDER_NUMBER =
            Column.of("orderNumber", "36", Form.TEXT, "order number");

    /** Side of leg 1. */
    public static final Column<Code<LegCode>> LEG =
            Column.code("leg", "32 W3", LegCode.values(), "side of leg 1");

    /** Side of leg 2. */
    public static final Column<Code<LegCode>> LEG_2 =
            Column.code("leg2", "EL W3", LegCode.values(), "side of leg 2");

    /** Ordered contracts. */
    public static final Column<Long> ORDERED =
            Column.of("ordered", "70", Form.COUNT, "ordered contracts");

    /** State of the order. */
    public static final Column<Code<OrderStatus>> STATUS = Column.code(
            "status", "39 K1 70 47 37 41 N6", OrderStatus.values(), "state of the order");

    /** Why the order failed. */
    public static final Column<String> MESSAGE =
            Column.of("message", "K1", Form.TEXT, "why the order failed");

    /** Filled contracts. */
    public static final Column<Long> FILLED =
            Column.of("filled", "47", Form.COUNT, "filled contracts");

    /** Cancelled contracts. */
    public static final Column<Long> CANCELLED =
            Column.of("cancelled", "37 41", Form.COUNT, "cancelled contracts");

    /** Order price. */
    public static final Column<Price> PRICE =
            Column.of("price", "27 31", Form.PRICE_TEN_THOUSANDTHS, "order price");

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

    /** Time in force. */
    public static final Column<Code<TimeInForce>> TIME_IN_FORCE =
            Column.code("timeInForce", "O4 V5", TimeInForce.values(), "time in force");

    /** MT flag, a blank when there is none. */
    public static final Column<String> MT_FLAG =
            Column.of("mtFlag", "MT", Form.TEXT, "MT flag, a blank when there is none");

    private static final int LEGS = 2;
    private static final int PRICES = 8;
    private static final int FIELDS = 16;

    /** One row per order. */
    public static final Table TABLE =
            Table.of("futures order")
                    .add(GATEWAY_NUMBER)
                    .add(ORDER_NUMBER)
                    .add(LEG, LEG_2)
                    .join(Contracts.ALL)
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
                    .add(TIME_IN_FORCE)
                    .add(MT_FLAG)
                    .gaps(new Table.Gaps() {
                        @Override
                        public void fill(java.util.List<String> fields) {
                            // two legs of unknown sides have no leg field, an order without a
                            // price type has no price field
                            if (fields.size() < FIELDS && fields.size() > LEGS
                                    && fields.get(LEGS).startsWith("TIMEX&")) {
                                fields.add(LEGS, null);
                            }
                            if (fields.size() == FIELDS - 1) {
                                fields.add(PRICES, null);
                            }
                        }
                    })
                    .build();

    private FuturesOrders() {}
}
