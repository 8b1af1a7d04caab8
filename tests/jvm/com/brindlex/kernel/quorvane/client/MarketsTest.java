package com.brindlex.kernel.quorvane.client;

import static com.brindlex.kernel.quorvane.client.Fixtures.SESSION;
import static com.brindlex.kernel.quorvane.client.Fixtures.TRADER;
import static com.brindlex.kernel.quorvane.client.Fixtures.tag;
import static org.junit.jupiter.api.Assertions.assertEquals;

import java.util.List;
import org.junit.jupiter.api.Test;

/** A futures request goes out as futures and a stock request as securities, on every market. */
final class MarketsTest {
    @Test
    void everyRequestGoesToItsMarket() {
        TradeDate day = TradeDate.of(2024, 1, 15);
        for (int code = 0; code <= 200; code++) {
            Requests requests = Requests.of(SESSION.withMarket(Market.of(code)), TRADER);
            List<Request<?>> futures = List.of(requests.futuresOrders(day),
                    requests.futuresFills(day, day), requests.futuresPositions(), requests.margin(),
                    requests.futuresOrder().buy(Contract.futures("TXF", "202401")).quantity(1)
                            .price(Price.MARKET).live().build());
            List<Request<?>> stocks = List.of(requests.stockOrders(day),
                    requests.stockFills(day, day), requests.stockPositions(),
                    requests.creditFigures("2330"), requests.settlement(day, day),
                    requests.stockNotice(StockFunction.NEW, TradeType.LOTS),
                    requests.stockOrder().buy("2330").quantity(Quantity.lots(1))
                            .price(Price.FLAT).live().build());
            futures.forEach(request -> assertEquals("F", tag(request, "KIND"), request::toString));
            stocks.forEach(request -> assertEquals("S", tag(request, "KIND"), request::toString));
            assertEquals(code > 100 ? "F" : "S", tag(requests.login(), "KIND"));
        }
    }

    @Test
    void requestsAreCounted() {
        Requests requests = Requests.of(SESSION.withSequence(98), TRADER);
        for (String number : List.of("98", "99", "00", "01")) {
            assertEquals(number, tag(requests.login(), "65").substring(8));
        }
    }
}
