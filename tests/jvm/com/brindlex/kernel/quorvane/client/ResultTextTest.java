package com.brindlex.kernel.quorvane.client;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.math.BigDecimal;
import java.util.GregorianCalendar;
import java.util.List;
import java.util.TimeZone;
import org.junit.jupiter.api.Test;

/** Results by hand: what a row says, and what the quirks of the layouts do to it. */
class ResultTextTest {
    private static final String ORDER =
            "G7@A0001@3@2330@5000@委託失敗&交易所 退單@0@0@60050@134521@20240115@1130115@1@2!";
    private static final String FUTURES_ORDER =
            "F1@A1@53|54@TIMEX&X&TXO|TXO&202401|202402&C|P&180000000|170000000@5@已成交@5@0@1500000"
            + "@134521@1130115@1130115@1@1@I@ !";

    private static ResultText clean(Operation decoder, String text) {
        ResultText result = ResultText.of(decoder, text);
        assertEquals(List.of(), result.faults(), text);
        return result;
    }

    private static StockOrder stockOrder(String text) {
        return (StockOrder) clean(Operation.QUERY_ORDER_DECODE, "1!" + text).sections().get(0)
                .rows().get(0);
    }

    private static FuturesOrder futuresOrder(String text) {
        return (FuturesOrder) clean(Operation.FUT_QUERY_ORDER_DECODE, "1!" + text).sections().get(0)
                .rows().get(0);
    }

    private static String faults(Operation decoder, String text) {
        return ResultText.of(decoder, text).faults().toString();
    }

    @Test
    void aStockOrder() {
        StockOrder order = stockOrder(ORDER);
        assertEquals("A0001", order.orderNumber());
        assertEquals(OrderType.KIND_1_3_BUY, order.type().value());
        assertEquals(5000L, order.orderedQuantity());
        assertTrue(order.state().is(OrderStatus.FAILED));
        assertEquals("交易所 退單", order.gatewayText());
        assertEquals(Price.of("600.5"), order.price());
        assertEquals("13:45:21", order.entryTime().toString());
        assertEquals(TradeDate.of(2024, 1, 15), order.entryDate());
        assertEquals(TradeDate.of(2024, 1, 15), order.orderDate());
        assertEquals("2", order.changeable().code());
    }

    @Test
    void codesWithoutNamesStayReadable() {
        StockOrder order =
                stockOrder(ORDER.replace("@3@", "@99@").replace("委託失敗&交易所 退單", "新狀態"));
        assertFalse(order.type().isKnown());
        assertEquals(OrderType.UNKNOWN, order.type().value());
        assertEquals("99", order.type().label());
        assertEquals("新狀態", order.state().code());
        assertEquals("", order.gatewayText());
        assertEquals(Price.LIMIT_UP, stockOrder(ORDER.replace("60050", "漲停價")).price());
    }

    @Test
    void anOptionCombination() {
        FuturesOrder order = futuresOrder(FUTURES_ORDER);
        assertEquals(LegCode.BUY_W3_0, order.legCode1().value());
        assertEquals(LegCode.SELL_W3_0, order.legCode2().value());
        assertEquals(Product.OPTION_COMBINATION, order.product().value());
        assertEquals("202402", order.month2());
        assertEquals(CallPut.PUT, order.callPut2().value());
        assertEquals(0, new BigDecimal("17000").compareTo(order.strike2()));
        assertEquals(Price.of("150"), order.price());
        assertEquals(TimeInForce.IMMEDIATE_OR_CANCEL, order.timeInForce().value());
    }

    @Test
    void aNoticeIsFreeText() {
        ResultText login = clean(Operation.AUTH_DECODE,
                "2!<S>@台北@1234567@9A01@1!<M>@系統維護! user@example 12@!");
        assertEquals(1, login.sections().get(0).rows().size());
        Notice notice = (Notice) login.sections().get(1).rows().get(0);
        assertEquals("系統維護! user@example 12@", notice.notice());
    }

    @Test
    void theMarginAccount() {
        String text = "1!TWD@@1250@@a&b@10000@125000@20000@@30000@@40000@@@@@50000@40000@@@@@60000"
                + "@@@@@1@2@3@4@!";
        MarginAccount margin = (MarginAccount) clean(Operation.QUERY_FINANCE_DECODE, text)
                .sections().get(0).rows().get(0);
        assertEquals(new BigDecimal("12.50"), margin.figureLOHundredths());
        assertEquals(new BigDecimal("12.5000"), margin.figureLO());
        assertEquals("a&b", margin.text(MarginAccount.FIGURE_PN));
        assertThrows(MalformedValueException.class, margin::figurePN);
        assertEquals(new BigDecimal("0.0004"), margin.figureF3());
    }

    @Test
    void messagesAreTakenApart() {
        assertEquals("[GATEWAY]密碼錯誤(1234)", Failure.of("[GATEWAY]密碼錯誤(1234)").toString());
        assertEquals("1234", Failure.of("[GATEWAY]密碼錯誤(1234)").code());
        assertEquals("E001", Failure.of("[CERT]E001 abc def").code());
        assertEquals("abc def", Failure.of("[CERT]E001 abc def").text());
        assertEquals("日期輸入錯誤", Failure.of("[CLIENT] 日期輸入錯誤").text());
        assertEquals(Failure.Source.UNKNOWN, Failure.of("密碼錯誤").source());
    }

    @Test
    void damageHasAPlace() {
        assertEquals("[at character 1: 2 records announced, 1 there]",
                faults(Operation.QUERY_ORDER_DECODE, "2!" + ORDER));
        assertEquals("[at character 3: a record of 13 fields; stock order has 14]",
                faults(Operation.QUERY_ORDER_DECODE, "1!" + ORDER.replace("@2!", "!")));
        assertEquals("[at character 19: orderedQuantity is no whole number]",
                faults(Operation.QUERY_ORDER_DECODE, "1!" + ORDER.replace("5000", "5O00")));
        assertTrue(faults(Operation.QUERY_ORDER_DECODE,
                "1!" + ORDER.substring(0, ORDER.length() - 1)).contains("is not closed by '!'"));
        assertEquals("[at character 1: no count]", faults(Operation.QUERY_REPLY_DECODE, ""));
        assertTrue(faults(Operation.QUERY_INVENTORY_DECODE, "<0>!0!<1>!0!<3>!0!")
                        .contains("no section <2>"));
        assertEquals("[at character 1: a text where none belongs]",
                faults(Operation.OPEN_ACCOUNT_DECODE, "?"));
        assertEquals("[at character 5: a text where the field is always empty]",
                faults(Operation.SUBMIT_ORDER_DECODE, "G1@@x@1!"));
    }

    @Test
    void datesAndTimes() {
        assertEquals("2010-01-01", TradeDate.parse("990101").toString());
        assertEquals("2024-02-29", TradeDate.parse("1130229").toString());
        assertNull(TradeDate.parse("1120229"));
        assertNull(TradeDate.parse("00000000"));
        assertNull(TradeDate.parse("2024-1-1"));
        assertEquals("0990101", TradeDate.of(2010, 1, 1).rocText());
        assertThrows(IllegalArgumentException.class, () -> TradeDate.of(2023, 2, 29));
        assertNull(TradeTime.parse("246000"));
        assertEquals("23:59:59", TradeTime.parse("235959").toString());
        assertThrows(IllegalArgumentException.class, () -> TradeTime.of(24, 0, 0));
        TradeDate day = TradeDate.of(2024, 2, 29);
        assertEquals(day, TradeDate.of(day.toCalendar()));
        GregorianCalendar moment = new GregorianCalendar(TimeZone.getTimeZone("GMT+08:00"));
        moment.setTimeInMillis(0);
        assertEquals(TradeDate.of(1970, 1, 1), TradeDate.of(moment));
        assertEquals(day, TradeDate.of(TradeTime.of(23, 59, 59).on(day)));
        assertEquals(29, TradeTime.of(13, 29, 1).on(day).get(GregorianCalendar.MINUTE));
        assertTrue(TradeDate.today().year() > 2000);
    }
}
