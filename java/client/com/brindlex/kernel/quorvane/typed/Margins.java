package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;

/** The margin account. */
public final class Margins {
    /** Currency, always TWD. */
    public static final Column<Code<Currency>> CURRENCY =
            Column.code("currency", "", Currency.values(), "currency, always TWD");

    /** Margin amount LO with two decimals. */
    public static final Column<BigDecimal> LO_HUNDREDTHS =
            Column.of("loHundredths", "LO", Form.HUNDREDTHS, "margin amount LO with two decimals");

    /** Margin amount PN. */
    public static final Column<BigDecimal> PN =
            Column.of("pn", "PN", Form.AMOUNT_OR_TEXT, "margin amount PN");

    /** Margin amount RA. */
    public static final Column<BigDecimal> RA =
            Column.of("ra", "RA", Form.TEN_THOUSANDTHS, "margin amount RA");

    /** Margin amount LO. */
    public static final Column<BigDecimal> LO =
            Column.of("lo", "LO", Form.TEN_THOUSANDTHS, "margin amount LO");

    /** Margin amount QY. */
    public static final Column<BigDecimal> QY =
            Column.of("qy", "QY", Form.TEN_THOUSANDTHS, "margin amount QY");

    /** Margin amount QX. */
    public static final Column<BigDecimal> QX =
            Column.of("qx", "QX", Form.TEN_THOUSANDTHS, "margin amount QX");

    /** Margin amount U5. */
    public static final Column<BigDecimal> U5 =
            Column.of("u5", "U5", Form.TEN_THOUSANDTHS, "margin amount U5");

    /** Margin amount U9. */
    public static final Column<BigDecimal> U9 =
            Column.of("u9", "U9", Form.TEN_THOUSANDTHS, "margin amount U9");

    /** Margin amount U5, a second time. */
    public static final Column<BigDecimal> U5_AGAIN =
            Column.of("u5Again", "U5", Form.TEN_THOUSANDTHS, "margin amount U5, a second time");

    /** Margin figure RF. */
    public static final Column<BigDecimal> RF =
            Column.of("rf", "RF", Form.TEN_THOUSANDTHS, "margin figure RF");

    /** Margin amount F0. */
    public static final Column<BigDecimal> F0 =
            Column.of("f0", "F0", Form.TEN_THOUSANDTHS, "margin amount F0");

    /** Margin amount F1. */
    public static final Column<BigDecimal> F1 =
            Column.of("f1", "F1", Form.TEN_THOUSANDTHS, "margin amount F1");

    /** Margin amount F2. */
    public static final Column<BigDecimal> F2 =
            Column.of("f2", "F2", Form.TEN_THOUSANDTHS, "margin amount F2");

    /** Margin amount F3. */
    public static final Column<BigDecimal> F3 =
            Column.of("f3", "F3", Form.TEN_THOUSANDTHS, "margin amount F3");

    /** One row. */
    public static final Table TABLE = Table.of("margin account")
                                              .add(CURRENCY)
                                              .skip(1)
                                              .add(LO_HUNDREDTHS)
                                              .skip(1)
                                              .add(PN)
                                              .add(RA)
                                              .add(LO)
                                              .add(QY)
                                              .skip(1)
                                              .add(QX)
                                              .skip(1)
                                              .add(U5)
                                              .skip(4)
                                              .add(U9)
                                              .add(U5_AGAIN)
                                              .skip(4)
                                              .add(RF)
                                              .skip(4)
                                              .add(F0)
                                              .add(F1)
                                              .add(F2)
                                              .add(F3)
                                              .skip(1)
                                              .build();

    private Margins() {}
}
