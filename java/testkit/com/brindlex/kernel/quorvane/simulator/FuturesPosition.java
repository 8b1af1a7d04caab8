package com.brindlex.kernel.quorvane.simulator;

import java.math.BigDecimal;
import java.math.RoundingMode;
import java.time.LocalDate;

/** An open position: one leg or a pair, its contracts and average prices. */
final class FuturesPosition {
    private static final String TAIWAN_DOLLAR = "1";

    private final FuturesLeg leg1;
    private final FuturesLeg leg2;
    private final LocalDate since;
    private long contracts;
    private BigDecimal price1;
    private BigDecimal price2;

    FuturesPosition(FuturesFill fill, long contracts) {
        leg1 = fill.order.leg1;
        leg2 = fill.order.leg2;
        since = fill.at.toLocalDate();
        this.contracts = contracts;
        price1 = fill.price1;
        price2 = fill.price2;
    }

    long contracts() {
        return contracts;
    }

    boolean sameSide(FuturesFill fill) {
        return matches(fill.order.leg1, fill.order.leg2);
    }

    boolean opposite(FuturesFill fill) {
        FuturesLeg second = fill.order.leg2;
        return matches(fill.order.leg1.opposite(), second == null ? null : second.opposite());
    }

    private boolean matches(FuturesLeg first, FuturesLeg second) {
        return same(leg1, first)
                && (leg2 == null ? second == null : second != null && same(leg2, second));
    }

    private static boolean same(FuturesLeg own, FuturesLeg other) {
        return own.sameContract(other) && own.side == other.side;
    }

    /** Adds contracts at their prices to the average. */
    void grow(FuturesFill fill, long more) {
        price1 = average(price1, fill.price1, more);
        price2 = average(price2, fill.price2, more);
        contracts += more;
    }

    private BigDecimal average(BigDecimal old, BigDecimal added, long more) {
        return old.multiply(BigDecimal.valueOf(contracts))
                .add(added.multiply(BigDecimal.valueOf(more)))
                .divide(BigDecimal.valueOf(contracts + more), 4, RoundingMode.HALF_UP);
    }

    /** Takes contracts off and returns how many were left to take. */
    long shrink(long wanted) {
        long taken = Math.min(wanted, contracts);
        contracts -= taken;
        return wanted - taken;
    }

    /** Margin that the position binds: futures and sold options do, a pair binds one leg's. */
    BigDecimal margin() {
        boolean binds = leg1.bindsMargin() || leg2 != null && leg2.bindsMargin();
        return BigDecimal.valueOf(binds ? contracts * leg1.product.margin : 0);
    }

    void write(Reply reply) {
        reply.record();
        leg1.write(reply, true);
        if (leg2 != null) {
            leg2.write(reply, false);
            reply.field("W5", price2.toPlainString());
        }
        reply.field("R8", contracts).field("48", price1.toPlainString())
                .field("50", Texts.date(since)).field("28", TAIWAN_DOLLAR).close();
    }
}
