package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;

/**
 * The columns that name a futures or options contract; a second leg is empty when there is none.
 */
public final class Contracts {
    /** Word in front of a contract (TIMEX or TAIMEX). */
    public static final Column<String> EXCHANGE =
            Column.of("exchange", "", Form.TEXT, "word in front of a contract (TIMEX or TAIMEX)");

    /** What the contract is. */
    public static final Column<Code<Product>> PRODUCT =
            Column.code("product", "V8 EL V9", Product.values(), "what the contract is");

    /** Commodity. */
    public static final Column<String> COMMODITY =
            Column.of("commodity", "33", Form.TEXT, "commodity");

    /** Commodity of leg 2. */
    public static final Column<String> COMMODITY_2 =
            Column.of("commodity2", "V9", Form.TEXT, "commodity of leg 2");

    /** Contract month. */
    public static final Column<String> MONTH =
            Column.of("month", "29", Form.MONTH, "contract month");

    /** Contract month of leg 2. */
    public static final Column<String> MONTH_2 =
            Column.of("month2", "W0", Form.MONTH, "contract month of leg 2");

    /** Call or put. */
    public static final Column<Code<CallPut>> CALL_PUT =
            Column.code("callPut", "V8", CallPut.values(), "call or put");

    /** Call or put of leg 2. */
    public static final Column<Code<CallPut>> CALL_PUT_2 =
            Column.code("callPut2", "W1", CallPut.values(), "call or put of leg 2");

    /** Strike price. */
    public static final Column<BigDecimal> STRIKE =
            Column.of("strike", "34", Form.TEN_THOUSANDTHS, "strike price");

    /** Strike price of leg 2. */
    public static final Column<BigDecimal> STRIKE_2 =
            Column.of("strike2", "W2", Form.TEN_THOUSANDTHS, "strike price of leg 2");

    /** A whole contract, {@code TIMEX&O&TXO&202401&C&180000000}. */
    static final Column<?>[][] ALL = {
            {EXCHANGE},
            {PRODUCT},
            {COMMODITY, COMMODITY_2},
            {MONTH, MONTH_2},
            {CALL_PUT, CALL_PUT_2},
            {STRIKE, STRIKE_2},
    };

    /** A contract without an option in it. */
    static final Column<?>[][] FUTURES = {
            {EXCHANGE},
            {PRODUCT},
            {COMMODITY},
            {MONTH, MONTH_2},
    };

    private Contracts() {}
}
