package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * Whether an order is live or a reservation (tag N6). The order books show an untouched order with
 * 0 as a reservation (預約單) and with any other number as accepted (委託成功); what else the numbers
 * tell apart is the broker's. Never changes.
 */
public final class Handling extends NumberCode {
    /** A reservation: 0. */
    public static final Handling RESERVATION = new Handling(0);

    /** A live order: 1. */
    public static final Handling LIVE = new Handling(1);

    private Handling(int number) {
        super(number);
    }

    /** Any number of the broker: 0 is a reservation, every other a live order. */
    @NotNull
    public static Handling of(int number) {
        return new Handling(number);
    }

    /** Whether an order with it is a reservation. */
    public boolean isReservation() {
        return number() == 0;
    }
}
