package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;

/**
 * The open positions in futures and options; the columns of the contract stand in {@link
 * Contracts}.
 */
public final class FuturesPositions {
    /** Side of leg 1. */
    public static final Column<Code<Side>> SIDE =
            Column.code("side", "32", Side.values(), "side of leg 1");

    /** Side of leg 2. */
    public static final Column<Code<Side>> SIDE_2 =
            Column.code("side2", "EL", Side.values(), "side of leg 2");

    /** Contracts held. */
    public static final Column<Long> CONTRACTS =
            Column.of("contracts", "R8", Form.COUNT, "contracts held");

    /** Price of leg 1. */
    public static final Column<BigDecimal> PRICE =
            Column.of("price", "48", Form.TEN_THOUSANDTHS, "price of leg 1");

    /** Price of leg 2. */
    public static final Column<BigDecimal> PRICE_2 =
            Column.of("price2", "W5", Form.TEN_THOUSANDTHS, "price of leg 2");

    /** Date of the position. */
    public static final Column<TradeDate> DATE =
            Column.of("date", "50", Form.DATE, "date of the position");

    /** Currency. */
    public static final Column<Code<Currency>> CURRENCY =
            Column.code("currency", "28", Currency.values(), "currency");

    /** Futures and futures spreads. */
    public static final Table FUTURES = Table.of("futures position")
                                                .add(SIDE, SIDE_2)
                                                .join(Contracts.FUTURES)
                                                .add(CONTRACTS)
                                                .add(PRICE, PRICE_2)
                                                .add(DATE)
                                                .add(CURRENCY)
                                                .build();

    /** Options and their combinations. */
    public static final Table OPTIONS = Table.of("options position")
                                                .add(SIDE, SIDE_2)
                                                .join(Contracts.ALL)
                                                .add(CONTRACTS)
                                                .add(PRICE, PRICE_2)
                                                .add(DATE)
                                                .build();

    private FuturesPositions() {}
}
