package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;

/**
 * The fills of futures and options orders; the columns of the contract stand in {@link Contracts}.
 */
public final class FuturesFills {
    /** Order number. */
    public static final Column<String> ORDER_NUMBER =
            Column.of("orderNumber", "36", Form.TEXT, "order number");

    /** Number of the order at the gateway. */
    public static final Column<String> GATEWAY_NUMBER =
            Column.of("gatewayNumber", "46", Form.TEXT, "number of the order at the gateway");

    /** Side of leg 1. */
    public static final Column<Code<LegCode>> LEG =
            Column.code("leg", "32 W3", LegCode.values(), "side of leg 1");

    /** Side of leg 2. */
    public static final Column<Code<LegCode>> LEG_2 =
            Column.code("leg2", "EL W3", LegCode.values(), "side of leg 2");

    /** Contracts that remain. */
    public static final Column<Long> REMAINING =
            Column.of("remaining", "70 37", Form.COUNT, "contracts that remain");

    /** Filled contracts. */
    public static final Column<Long> FILLED =
            Column.of("filled", "47", Form.COUNT, "filled contracts");

    /** Price of the order. */
    public static final Column<BigDecimal> ORDER_PRICE =
            Column.of("orderPrice", "31", Form.TEN_THOUSANDTHS, "price of the order");

    /** Price of the fill. */
    public static final Column<BigDecimal> PRICE =
            Column.of("price", "48", Form.TEN_THOUSANDTHS, "price of the fill");

    /** Time of the order. */
    public static final Column<TradeTime> ORDER_TIME =
            Column.of("orderTime", "22", Form.TIME, "time of the order");

    /** Time of the fill. */
    public static final Column<TradeTime> TIME =
            Column.of("time", "51", Form.TIME, "time of the fill");

    /** MT flag, a blank when there is none. */
    public static final Column<String> MT_FLAG =
            Column.of("mtFlag", "MT", Form.TEXT, "MT flag, a blank when there is none");

    /** Date of the order. */
    public static final Column<TradeDate> ORDER_DATE =
            Column.of("orderDate", "44", Form.DATE, "date of the order");

    /** Date of the fill. */
    public static final Column<TradeDate> DATE =
            Column.of("date", "50", Form.DATE, "date of the fill");

    /** One row per fill. */
    public static final Table TABLE =
            Table.of("futures fill")
                    .join(Table.part(ORDER_NUMBER), Table.part(GATEWAY_NUMBER))
                    .add(LEG, LEG_2)
                    .join(Contracts.ALL)
                    .join(Table.part(REMAINING), Table.part(FILLED))
                    .join(Table.part(ORDER_PRICE), Table.part(PRICE))
                    .skip(2)
                    .join(Table.part(ORDER_TIME), Table.part(TIME))
                    .add(MT_FLAG)
                    .join(Table.part(ORDER_DATE), Table.part(DATE))
                    .build();

    private FuturesFills() {}
}
