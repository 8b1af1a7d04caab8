package com.brindlex.kernel.quorvane.simulator;

import java.time.LocalTime;

/** When a market takes orders: from one time of day to another, over midnight where that is earlier. */
final class Hours {
    static final Hours ALWAYS = new Hours(LocalTime.MIN, LocalTime.MAX);

    private final LocalTime from;
    private final LocalTime to;

    Hours(LocalTime from, LocalTime to) {
        this.from = from;
        this.to = to;
    }

    /** Refuses what reaches the exchange while it is closed; a reservation waits at the broker. */
    void check(boolean reservation, LocalTime now) throws Refusal {
        boolean open = from.isAfter(to) ? !now.isBefore(from) || !now.isAfter(to)
                                        : !now.isBefore(from) && !now.isAfter(to);
        if (!open && !reservation) {
            throw Refusal.rejected("非交易時間");
        }
    }
}
