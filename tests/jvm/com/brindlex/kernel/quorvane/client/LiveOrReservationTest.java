package com.brindlex.kernel.quorvane.client;

import static com.brindlex.kernel.quorvane.client.Fixtures.ask;
import static com.brindlex.kernel.quorvane.client.Fixtures.futures;
import static com.brindlex.kernel.quorvane.client.Fixtures.futuresOrder;
import static com.brindlex.kernel.quorvane.client.Fixtures.gateway;
import static com.brindlex.kernel.quorvane.client.Fixtures.refused;
import static com.brindlex.kernel.quorvane.client.Fixtures.stockOrder;
import static com.brindlex.kernel.quorvane.client.Fixtures.stocks;
import static com.brindlex.kernel.quorvane.client.Fixtures.tag;
import static org.junit.jupiter.api.Assertions.assertEquals;

import com.brindlex.kernel.quorvane.simulator.Gateway;
import java.util.List;
import org.junit.jupiter.api.Test;

/** Whether an order is live is said in words, and the book shows what was said. */
final class LiveOrReservationTest {
    @Test
    void nobodyChoosesForTheUser() {
        assertEquals(List.of("handlingFlag"), refused(() -> stocks().stockOrder().buy("2330")
                .quantity(Quantity.lots(2)).price(Price.of("995")).build()));
        assertEquals(List.of("handlingFlag"), refused(() -> futures().futuresOrder()
                .buy(Contract.futures("TXF", "202401")).quantity(1).price(Price.MARKET).build()));
    }

    @Test
    void aLiveStockOrderIsAccepted() {
        Gateway gateway = gateway();
        Request<StockOrderReceipt> live = stockOrder().build();
        assertEquals("1", tag(live, "N6"));
        assertEquals(Acceptance.ANSWERED_S_T_Y, ask(gateway, live).acceptance().value());
        assertEquals(OrderStatus.ACCEPTED, book(gateway).get(0).state().value());
    }

    @Test
    void aReservedStockOrderIsAReservation() {
        Gateway gateway = gateway();
        Request<StockOrderReceipt> reservation = stockOrder().reservation().build();
        assertEquals("0", tag(reservation, "N6"));
        assertEquals(Acceptance.ANSWERED_X, ask(gateway, reservation).acceptance().value());
        assertEquals(OrderStatus.RESERVED, book(gateway).get(0).state().value());
    }

    @Test
    void futuresOrdersLikewise() {
        assertEquals("1", tag(futuresOrder().build(), "N6"));
        assertEquals("0", tag(futuresOrder().reservation().build(), "N6"));
        assertEquals("7", tag(futuresOrder().handling(Handling.of(7)).build(), "N6"));
        assertEquals(List.of("handlingFlag"),
                refused(() -> futuresOrder().handling(Handling.of(256)).build()));
    }

    private static StockOrders book(Gateway gateway) {
        return ask(gateway, stocks().stockOrders(TradeDate.today()));
    }
}
