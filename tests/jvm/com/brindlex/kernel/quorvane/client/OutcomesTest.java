package com.brindlex.kernel.quorvane.client;

import static com.brindlex.kernel.quorvane.client.Fixtures.SESSION;
import static com.brindlex.kernel.quorvane.client.Fixtures.USER;
import static com.brindlex.kernel.quorvane.client.Fixtures.futures;
import static com.brindlex.kernel.quorvane.client.Fixtures.futuresOrder;
import static com.brindlex.kernel.quorvane.client.Fixtures.stockOrder;
import static com.brindlex.kernel.quorvane.client.Fixtures.stocks;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.client.Failure.Source;
import java.math.BigDecimal;
import java.util.List;
import org.junit.jupiter.api.Test;

/** A reply is a result, a failure that says something, or an order on its way. */
final class OutcomesTest {
    private static final String PAGE = "<html><body>502 Bad Gateway</body></html>";
    private static final TradeDate DAY = TradeDate.of(2024, 1, 15);

    private static List<Request<?>> all() {
        Requests jzg = Requests.of(SESSION.withBrokerage(Brokerage.JZG), USER);
        return List.of(stocks().login(), stocks().accounts(),
                stocks().openAccount("n", "a", "t", ContactTime.of(0), AccountItem.of(0)),
                stocks().changePassword("x"), stocks().bankBalance(),
                stocks().registerCertificate("abc"), stocks().fetchCertificate("abc"),
                stocks().fetchCertificateLogged("abc"), stocks().certificateStatus("abc"),
                stocks().certificateInstalled("abc"), stocks().certificateOpened("abc"),
                stocks().applyForCertificate("b", "abc"), stocks().renewCertificate("b", "abc"),
                stocks().revokeCertificate("b", "abc"), stockOrder().build(),
                stocks().stockNotice(StockFunction.NEW, TradeType.LOTS), stocks().stockOrders(DAY),
                stocks().stockFills(DAY, DAY), stocks().stockPositions(), jzg.stockPositions(),
                stocks().creditFigures("2330"), stocks().settlement(DAY, DAY),
                jzg.settlement(SettlementPeriod.of(1)), futuresOrder().build(),
                futures().futuresOrders(DAY), futures().futuresFills(DAY, DAY),
                futures().futuresPositions(), futures().margin());
    }

    private static boolean isOrder(Request<?> request) {
        return request.text().startsWith("F=1|");
    }

    @Test
    void aFailureAlwaysSaysSomething() {
        for (Request<?> request : all()) {
            for (String reply : List.of("[GATEWAY]error", "[BROKER]timeout", PAGE, "x", "|", "||",
                         "|68=9999|", "|39=E|", "|39=E|19=|K1=|", "|00=1|68=9999|M2=|01=|",
                         "|00=1|68=|01=|", "|68=9999|M2=|00=1|68=9999|M2= |01=|")) {
                Failure failure = request.read(reply).failure();
                assertTrue(failure != null, request + " takes " + reply + " for a success");
                assertFalse(failure.text().trim().isEmpty(), request + " on " + reply);
                assertEquals(failure.text(), request.read(reply).message());
            }
        }
    }

    @Test
    void theLineIsNamedWhenItIsDown() {
        for (Request<?> request : all()) {
            Failure gateway = request.read("[GATEWAY]error").failure();
            assertEquals("[GATEWAY]主機連線失敗", gateway.toString(), request::toString);
            Failure broker = request.read("[BROKER]timeout").failure();
            assertEquals("[BROKER]主機連線失敗", broker.toString(), request::toString);
            Failure page = request.read(PAGE).failure();
            assertEquals(Source.CLIENT, page.source() == Source.UNKNOWN ? null : page.source(),
                    request + ": " + page);
        }
    }

    @Test
    void aRefusalKeepsItsCodeAndText() {
        for (Request<?> request : all()) {
            if (!isOrder(request)) {
                Failure failure = request.read("|68=1234|M2=不行|00=1|68=1234|M2=不行|01=|").failure();
                assertEquals("不行", failure.text(), request::toString);
                assertEquals("1234", failure.code(), request::toString);
            }
        }
        assertEquals("庫存不足", stockOrder().build().read("|39=E|19=|K1=庫存不足|").failure().text());
    }

    @Test
    void noReplyToAnOrderMeansThatItIsOnItsWay() {
        for (Request<?> request : all()) {
            for (String reply : new String[] {"", null}) {
                assertEquals(isOrder(request), request.read(reply).isOnItsWay(), request::toString);
                assertEquals(!isOrder(request), request.read(reply).isFailure());
                assertFalse(request.read(reply).isResult());
                assertFalse(request.read(reply).message().isEmpty());
            }
        }
        Reply<FuturesOrderReceipt> reply = futuresOrder().build().read("");
        assertEquals("委託單傳送中!!", reply.message());
        assertTrue(assertThrows(ReplyException.class, reply::orThrow).isOnItsWay());
        assertNull(reply.orNull());
        assertNull(reply.failure());
    }

    @Test
    void balanceAndMarginAreFoundWhereTheyAre() {
        Request<BankBalance> balance = stocks().bankBalance();
        assertEquals(new BigDecimal("12345"),
                balance.read("|00=1|PN=12345|01=").orThrow().bankBalance());
        assertEquals(new BigDecimal("1"),
                balance.read("|68=0000|00=1|68=0000|PN=1|01=").orThrow().bankBalance());
        MarginAccount margin = futures().margin().read("|68=0000|00=1|LO=12.5|01=").orThrow();
        assertEquals(new BigDecimal("12.50"), margin.figureLOHundredths());
        assertEquals(Currency.TWD, margin.currency().value());
        assertEquals("5001", balance.read("|68=5001|M2=|00=1|68=5001|01=").failure().code());
    }

    @Test
    void repliesAreValues() {
        Request<Accounts> login = stocks().login();
        String good = "|68=0000|00=1|68=0000|07=S|M5=Main|16=9A00|17=123|18=4567|69=1|67=1|01=";
        assertEquals(login.read(good), login.read(good));
        assertEquals(login.read(good).hashCode(), login.read(good).hashCode());
        assertNotEquals(login.read(good), login.read(""));
        assertEquals(login.read("[GATEWAY]error"), login.read("[GATEWAY]error"));
        assertThrows(ReplyException.class, () -> login.read("[GATEWAY]error").orThrow());
        assertTrue(login.read(good).toString().contains("account=1234567"));
        Accounts noticed = login.read(good.replace("|00=1", "|M3=a!b@c!|00=1")).orThrow();
        assertEquals("a!b@c!", noticed.notice());
        assertEquals(1, noticed.size());
        assertEquals(List.of(), noticed.faults());
        assertNotEquals(noticed, login.read(good).orThrow());
    }
}
