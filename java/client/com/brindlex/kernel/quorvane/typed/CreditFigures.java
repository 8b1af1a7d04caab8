package com.brindlex.kernel.quorvane.typed;

/** The credit figures of one stock, as the gateway wrote them. */
public final class CreditFigures {
    /** Stock code. */
    public static final Column<String> STOCK_CODE =
            Column.of("stockCode", "29", Form.TEXT, "stock code");

    /** Margin figure (tag 76). */
    public static final Column<String> MARGIN =
            Column.of("margin", "76", Form.TEXT, "margin figure (tag 76)");

    /** Short-sale figure (tag 77). */
    public static final Column<String> SHORT_SALE =
            Column.of("shortSale", "77", Form.TEXT, "short-sale figure (tag 77)");

    /** Credit figure B8. */
    public static final Column<String> B8 = Column.of("b8", "B8", Form.TEXT, "credit figure B8");

    /** Credit figure B9. */
    public static final Column<String> B9 = Column.of("b9", "B9", Form.TEXT, "credit figure B9");

    /** Credit figure A0. */
    public static final Column<String> A0 = Column.of("a0", "A0", Form.TEXT, "credit figure A0");

    /** Credit figure A1. */
    public static final Column<String> A1 = Column.of("a1", "A1", Form.TEXT, "credit figure A1");

    /** Credit figure A2. */
    public static final Column<String> A2 = Column.of("a2", "A2", Form.TEXT, "credit figure A2");

    /** One row, or none when there are no figures. */
    public static final Table TABLE = Table.of("credit figures")
            .add(STOCK_CODE).add(MARGIN).add(SHORT_SALE).add(B8).add(B9).add(A0).add(A1).add(A2)
            .build();

    private CreditFigures() {}
}
