package com.brindlex.kernel.quorvane.client;

import static com.brindlex.kernel.quorvane.client.Fixtures.futures;
import static com.brindlex.kernel.quorvane.client.Fixtures.stocks;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.math.BigDecimal;
import java.util.List;
import org.junit.jupiter.api.Test;

/** Rows read what is asked for, and say what cannot be read. */
final class RowsTest {
    private static final String FILL = "|00=1|68=0000|67=1|36=W1|27=%s|28=0|32=B|29=2330|47=1000"
            + "|48=600.5|49=%s|50=20240115|51=%s|01=|00=2|67=900001|68=0000|01=";

    private static StockFill fill(String kind, String number, String time) {
        TradeDate day = TradeDate.of(2024, 1, 15);
        return stocks().stockFills(day, day).read(String.format(FILL, kind, number, time)).orThrow()
                .get(0);
    }

    @Test
    void valuesHaveTypes() {
        StockFill fill = fill("0", "600500", "134521");
        assertEquals("W1", fill.orderNumber());
        assertEquals(OrderType.KIND_0_BUY, fill.type().value());
        assertEquals(1000L, fill.filledQuantity());
        assertEquals(new BigDecimal("600.50"), fill.fillPrice());
        assertEquals(TradeDate.of(2024, 1, 15), fill.date50());
        assertEquals(TradeTime.of(13, 45, 21), fill.time51());
        assertEquals("1130115", fill.text(StockFill.DATE50));
        assertEquals(fill, fill("0", "600500", "134521"));
        assertNotEquals(fill, fill("0", "600500", "134522"));
        assertEquals("orderNumber=W1, type=kind 0, buy, stockCode=2330, filledQuantity=1000, "
                + "fillPrice=600.50, number49=600500, date50=2024-01-15, time51=13:45:21",
                fill.toString());
    }

    @Test
    void whatCannotBeReadIsToldAtTheValue() {
        StockFill fill = fill("0", "1", "134599");
        MalformedValueException fault =
                assertThrows(MalformedValueException.class, fill::time51);
        assertEquals("134599", fault.text());
        assertEquals(StockFill.TIME51, fault.column());
        assertEquals(TradeDate.of(2024, 1, 15), fill.date50());
        assertEquals(1, fill.faults().size());
        assertNull(fill("0", "1", "").time51());
        assertEquals(List.of(), fill("0", "1", "").faults());
    }

    @Test
    void aSignThatEndsAFieldIsToldAtEveryValueOfItsRecord() {
        StockFill fill = fill("0", "1", "1@2");
        MalformedValueException fault =
                assertThrows(MalformedValueException.class, fill::orderNumber);
        assertTrue(fault.text().startsWith("W1@1@2330@"));
        assertEquals(1, fill.faults().size());
    }

    @Test
    void aCodeWithoutANameKeepsItself() {
        Code<Currency> code = Code.of(Currency.values(), "EUR");
        assertEquals(Currency.UNKNOWN, code.value());
        assertEquals("EUR", code.code());
        assertEquals("EUR", code.label());
        assertNotEquals(code, Code.of(Currency.values(), "CHF"));
        assertNotEquals(Currency.UNKNOWN, Code.of(Currency.values(), "TWD").value());
        assertEquals(Currency.UNKNOWN, Code.of(Currency.values(), "").value());
    }

    @Test
    void aFieldThatIsLeftOutMovesNoOther() {
        String record = "|00=1|68=0000|67=1|46=G1|36=F1|33=TXF|29=202401|V8=|32=B%s|70=2|47=0|37=0"
                + "|41=0|N6=1%s|22=090000|21=20240115|44=20240115|JV=Y|O4=0|V5=0|01="
                + "|00=2|67=900001|68=0000|01=";
        Request<FuturesOrders> book = futures().futuresOrders(TradeDate.today());
        for (String legs : List.of("", "|EL=?")) {
            for (String price : List.of("|27=2|31=1.5", "")) {
                FuturesOrder order =
                        book.read(String.format(record, legs, price)).orThrow().get(0);
                assertEquals(legs.isEmpty() ? LegCode.BUY : null,
                        order.legCode1() == null ? null : order.legCode1().value());
                assertEquals("TXF", order.commodity1());
                assertEquals(price.isEmpty() ? null : Price.of("1.5"), order.price());
                assertEquals(TradeTime.of(9, 0, 0), order.entryTime());
                assertEquals(TimeInForce.REST_OF_DAY, order.timeInForce().value());
                assertEquals(List.of(), order.faults());
            }
        }
    }

    @Test
    void positionsStandInTheirSections() {
        String reply = "|00=1|68=0000|67=1|29=2330|75=1|751=2|752=5|76=3|761=0|77=0|771=0|PS=4|01="
                + "|00=2|67=900001|68=0000|01=";
        StockPositions usual = stocks().stockPositions().read(reply).orThrow();
        assertEquals(2L, usual.section0().get(0).quantity751());
        assertNull(usual.section0().get(0).quantity752());
        assertEquals(3L, usual.section1().get(0).quantity76());
        assertTrue(usual.section2().isEmpty());
        assertEquals(4L, usual.section3().get(0).quantityPS());
        StockPositions jzg = Requests.of(Fixtures.SESSION.withBrokerage(Brokerage.JZG),
                Fixtures.USER).stockPositions().read(reply).orThrow();
        assertEquals(5L, jzg.section0().get(0).quantity752());
        assertTrue(jzg.section3().isEmpty());
        assertEquals(List.of(), usual.section0().faults());
        assertEquals(List.of(), jzg.section3().faults());
    }
}
