package com.brindlex.kernel.quorvane.simulator;

import java.math.BigDecimal;
import java.time.LocalDateTime;

/** One fill of a futures order: contracts and the price of each leg. */
final class FuturesFill {
    final FuturesOrder order;
    final long contracts;
    final BigDecimal price1;

    /** Price of leg 2; zero for one leg. */
    final BigDecimal price2;

    final LocalDateTime at;

    FuturesFill(FuturesOrder order, long contracts, BigDecimal price1, BigDecimal price2,
            LocalDateTime at) {
        this.order = order;
        this.contracts = contracts;
        this.price1 = price1;
        this.price2 = price2;
        this.at = at;
    }

    void write(Reply reply) {
        order.writeCommon(reply, order.ordered - order.open());
        reply.field("47", contracts)
                .field("48", price1.toPlainString())
                .field("50", Texts.date(at.toLocalDate()))
                .field("51", Texts.time(at.toLocalTime()));
        if (order.leg2 != null) {
            reply.field("W5", price2.toPlainString());
        }
        reply.close();
    }
}
