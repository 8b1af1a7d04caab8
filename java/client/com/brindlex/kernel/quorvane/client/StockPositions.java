package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * The positions in stocks, in four sections. A stock stands in those in which its quantities do not
 * add up to 0; brokerage JZG sends no section 3. Never changes.
 */
public final class StockPositions {
    private final String result;
    private final Rows<StockPosition0> section0;
    private final Rows<StockPosition1> section1;
    private final Rows<StockPosition2> section2;
    private final Rows<StockPosition3> section3;

    StockPositions(String result, boolean jzg) {
        Sections sections = new Sections(result);
        this.result = result;
        this.section0 = sections.rows(
                jzg ? StockPosition0.SHAPE_JZG : StockPosition0.SHAPE, "<0>", "<1>");
        this.section1 = sections.rows(
                jzg ? StockPosition1.SHAPE_JZG : StockPosition1.SHAPE, "<1>", "<2>");
        this.section2 = sections.rows(
                jzg ? StockPosition2.SHAPE_JZG : StockPosition2.SHAPE, "<2>", jzg ? null : "<3>");
        this.section3 = jzg ? new Rows<StockPosition3>(StockPosition3.SHAPE, "0!", 0, 2, 0)
                            : sections.rows(StockPosition3.SHAPE, "<3>", null);
    }

    /** The rows of section 0. */
    @NotNull
    public Rows<StockPosition0> section0() {
        return section0;
    }

    /** The rows of section 1. */
    @NotNull
    public Rows<StockPosition1> section1() {
        return section1;
    }

    /** The rows of section 2. */
    @NotNull
    public Rows<StockPosition2> section2() {
        return section2;
    }

    /** The rows of section 3; none at brokerage JZG. */
    @NotNull
    public Rows<StockPosition3> section3() {
        return section3;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof StockPositions && ((StockPositions) other).result.equals(result);
    }

    @Override
    public int hashCode() {
        return result.hashCode();
    }

    @Override
    public String toString() {
        return section0 + " " + section1 + " " + section2 + " " + section3;
    }
}
