import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.simulator.*;
import java.time.*;
import org.junit.jupiter.api.Test;

class OrderTicketTest {
    private final Gateway gateway = Gateway.open();
    private final OrderTicket ticket = new OrderTicket(gateway::answer, ReadyMade.STOCK_USER);

    @Test
    void anOrderIsTaken() {
        assertEquals("Taken: 0000000001", ticket.buy("2330", 2, "995.5"));
        RecordedRequest sent = gateway.lastRequest(Operation.SUBMIT_ORDER_ENCODE);
        assertEquals("2000", sent.value("quantity"));
        assertEquals("995.50", sent.value("price"));
    }

    @Test
    void anOrderWithoutAnswerIsNotRepeated() {
        gateway.disturbNext(Disturbance.empty());
        assertEquals("Not answered: look into the order book", ticket.buy("2330", 2, "995.5"));
        assertEquals(1, gateway.requests(Operation.SUBMIT_ORDER_ENCODE).size());
    }

    @Test
    void whatTheLineSaysIsShown() {
        gateway.disturbNext(Disturbance.marker(Line.BROKER_TIMEOUT));
        assertEquals("Refused: 主機連線失敗", ticket.buy("2330", 2, "995.5"));
        gateway.disturbNext(Disturbance.page());
        assertTrue(ticket.buy("2330", 2, "995.5").startsWith("Refused: "));
    }

    @Test
    void outsideOpeningHoursNothingIsTaken() {
        Clock evening = Clock.fixed(Instant.parse("2024-01-15T12:00:00Z"), ZoneId.of("Asia/Taipei"));
        Gateway closed = Gateway.readyMade().clock(evening)
                .stockHours(LocalTime.of(9, 0), LocalTime.of(13, 30)).build();
        assertEquals("Refused: 非交易時間",
                new OrderTicket(closed::answer, ReadyMade.STOCK_USER).buy("2330", 2, "995.5"));
    }

    @Test
    void aWorldOfOnesOwn() {
        Gateway small = Gateway.builder()
                .customer(Customer.of("A123456789", "pass1234").account(
                        TradingAccount.securities("9A01", "1234567").buyingLimit(15_000)))
                .stock(ListedStock.of("1101", "40.00").limits("36.00", "44.00"))
                .maxLots(499)
                .build();
        OrderTicket own = new OrderTicket(small::answer, ReadyMade.STOCK_USER);
        assertEquals("Refused: 委託價格超過漲停價", own.buy("1101", 1, "44.05"));
        assertEquals("Refused: 超過買進額度", own.buy("1101", 1, "44"));
    }
}
