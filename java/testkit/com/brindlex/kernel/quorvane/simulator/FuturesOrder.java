package com.brindlex.kernel.quorvane.simulator;

import java.time.LocalDateTime;

/** A futures or options order, with one leg or two. Quantities are contracts. */
final class FuturesOrder extends BookedOrder {
    private static final int FIRST_GATEWAY_NUMBER = 5000000;
    private static final String NO_PRICE = "0.0000";

    final FuturesLeg leg1;

    /** The second leg, or null. */
    final FuturesLeg leg2;

    private final String n6;
    final String fillOrKill;
    String price;
    private final int priceType;
    private final String w3;
    private final String immediate;

    FuturesOrder(Request request, TradingAccount account, int sequence, World world)
            throws Refusal {
        super(account, 'F', sequence, FIRST_GATEWAY_NUMBER + sequence, request.number("30"),
                world.now());
        this.leg1 = new FuturesLeg(request, true, world);
        this.leg2 = request.has("EL") ? new FuturesLeg(request, false, world) : null;
        this.priceType = (int) request.number("27");
        this.w3 = request.get("W3");
        this.fillOrKill = request.get("O4");
        this.immediate = request.get("V5");
        this.n6 = request.get("N6");
        this.price = priceType == 1 || priceType == 3 ? NO_PRICE : request.get("31");
    }

    /** Whether it waits at the broker for the next session. */
    boolean isReservation() {
        return n6.equals("0");
    }

    /** Whether what is not filled at once is cancelled (immediate or cancel, fill or kill). */
    boolean atOnce() {
        return immediate.equals("1") || fillOrKill.equals("1");
    }

    /** Whether holding the order binds margin: futures and sold options do. */
    boolean bindsMargin() {
        return leg1.bindsMargin() || leg2 != null && leg2.bindsMargin();
    }

    /**
     * Writes the fields that order book and fills share.
     *
     * @param gone contracts to report in tag 37: those taken off for the order book, all that are
     *     no longer open for a fill
     */
    void writeCommon(Reply reply, long gone) {
        reply.record().field("46", gatewayNumber).field("36", number);
        leg1.write(reply, true);
        if (leg2 != null) {
            leg2.write(reply, false);
        }
        reply.field("W3", w3).field("70", ordered).field("37", gone).field("31", price)
                .field("21", Texts.date(entered.toLocalDate()))
                .field("22", Texts.time(entered.toLocalTime()))
                .field("44", Texts.date(entered.toLocalDate()))
                .field("MT", "0");
    }

    @Override
    void write(Reply reply) {
        writeCommon(reply, reduced);
        reply.field("O4", fillOrKill).field("V5", immediate)
                .field("41", cancelled).field("47", filled)
                .field("39", failed() ? "E" : " ").field("K1", failure())
                .field("27", priceType).field("N6", n6).field("JV", open() > 0 ? "Y" : "N")
                .close();
    }
}
