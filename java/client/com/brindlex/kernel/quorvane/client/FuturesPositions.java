package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/** The open positions in futures and in options. Never changes. */
public final class FuturesPositions {
    private final String result;
    private final Rows<FuturesPosition> futures;
    private final Rows<OptionsPosition> options;

    FuturesPositions(String result) {
        Sections sections = new Sections(result);
        this.result = result;
        this.futures = sections.rows(FuturesPosition.SHAPE, "<5>", "<6>");
        this.options = sections.rows(OptionsPosition.SHAPE, "<6>", null);
    }

    /** The positions in futures. */
    @NotNull
    public Rows<FuturesPosition> futures() {
        return futures;
    }

    /** The positions in options. */
    @NotNull
    public Rows<OptionsPosition> options() {
        return options;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof FuturesPositions
                && ((FuturesPositions) other).result.equals(result);
    }

    @Override
    public int hashCode() {
        return result.hashCode();
    }

    @Override
    public String toString() {
        return futures + " " + options;
    }
}
