package com.brindlex.kernel.quorvane.typed;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.math.BigDecimal;
import java.util.Collections;
import java.util.List;
import org.junit.jupiter.api.Test;

/** Results by hand: what a row says, and what the quirks of the layouts do to it. */
class ResultTest {
    private static final String ORDER =
            "G7@A0001@3@2330@5000@委託失敗&交易所 退單@0@0@60050@134521@20240115@1130115@1@2!";
    private static final String FUTURES_ORDER =
            "F1@A1@53|54@TIMEX&X&TXO|TXO&202401|202402&C|P&180000000|170000000@5@已成交@5@0@1500000"
            + "@134521@1130115@1130115@1@1@I@ !";

    private static Result of(Operation decoder, String text) {
        return Result.of(decoder, 1, text);
    }

    private static Result clean(Operation decoder, String text) {
        Result result = of(decoder, text);
        assertEquals(Collections.emptyList(), result.faults(), text);
        assertNull(result.message());
        return result;
    }

    private static String faults(Operation decoder, String text) {
        return of(decoder, text).faults().toString();
    }

    @Test
    void stockOrder() {
        Row row = clean(Operation.QUERY_ORDER_DECODE, "1!" + ORDER).first();
        assertEquals("A0001", row.get(StockOrders.ORDER_NUMBER));
        assertEquals(OrderType.MARGIN_BUY, row.get(StockOrders.TYPE).value());
        assertEquals(5000L, row.get(StockOrders.ORDERED));
        assertTrue(row.get(StockOrders.STATUS).is(OrderStatus.FAILED));
        assertEquals("交易所 退單", row.get(StockOrders.MESSAGE));
        assertEquals(new BigDecimal("600.50"), row.get(StockOrders.PRICE).amount());
        assertEquals("13:45:21", row.get(StockOrders.TIME).toString());
        assertEquals(TradeDate.of(2024, 1, 15), row.get(StockOrders.ENTRY_DATE));
        assertEquals(TradeDate.of(2024, 1, 15), row.get(StockOrders.ORDER_DATE));
        assertEquals(Amendable.NO, row.get(StockOrders.AMENDABLE).value());
        assertThrows(IllegalArgumentException.class, () -> row.get(StockFills.PRICE));
    }

    @Test
    void unknownCodesStayReadable() {
        String text = "1!" + ORDER.replace("@3@", "@99@").replace("委託失敗&交易所 退單", "新狀態");
        Row row = clean(Operation.QUERY_ORDER_DECODE, text).first();
        assertFalse(row.get(StockOrders.TYPE).isKnown());
        assertNull(row.get(StockOrders.TYPE).value());
        assertEquals("99", row.get(StockOrders.TYPE).label());
        assertEquals("新狀態", row.get(StockOrders.STATUS).text());
        assertEquals("", row.get(StockOrders.MESSAGE));
    }

    @Test
    void pricesInWords() {
        Row row = clean(Operation.QUERY_ORDER_DECODE, "1!" + ORDER.replace("60050", "漲停價")).first();
        assertNull(row.get(StockOrders.PRICE).amount());
        assertEquals(PriceWord.LIMIT_UP, row.get(StockOrders.PRICE).word());
    }

    @Test
    void optionCombination() {
        Row row = clean(Operation.FUT_QUERY_ORDER_DECODE, "1!" + FUTURES_ORDER).first();
        assertEquals(Side.BUY, row.get(FuturesOrders.LEG).value().side());
        assertEquals(Side.SELL, row.get(FuturesOrders.LEG_2).value().side());
        assertEquals(Product.OPTION_COMBINATION, row.get(Contracts.PRODUCT).value());
        assertEquals("202402", row.get(Contracts.MONTH_2));
        assertEquals(CallPut.PUT, row.get(Contracts.CALL_PUT_2).value());
        assertEquals(0, new BigDecimal("17000").compareTo(row.get(Contracts.STRIKE_2)));
        assertEquals(0, new BigDecimal("150").compareTo(row.get(FuturesOrders.PRICE).amount()));
        assertEquals(TimeInForce.IMMEDIATE_OR_CANCEL,
                row.get(FuturesOrders.TIME_IN_FORCE).value());
    }

    @Test
    void anOrderWithoutPriceTypeKeepsItsColumns() {
        Row row = clean(Operation.FUT_QUERY_ORDER_DECODE,
                "1!" + FUTURES_ORDER.replace("@1500000", "")).first();
        assertNull(row.get(FuturesOrders.PRICE));
        assertEquals("13:45:21", row.get(FuturesOrders.TIME).toString());
        assertEquals(5L, row.get(FuturesOrders.FILLED));
    }

    @Test
    void legsOfUnknownSidesKeepTheColumns() {
        String legless = "1!" + FUTURES_ORDER.replace("@53|54", "");
        Row row = clean(Operation.FUT_QUERY_ORDER_DECODE, legless).first();
        assertNull(row.get(FuturesOrders.LEG));
        assertEquals("TXO", row.get(Contracts.COMMODITY));
        row = clean(Operation.FUT_QUERY_ORDER_DECODE, legless.replace("@1500000", "")).first();
        assertEquals("TXO", row.get(Contracts.COMMODITY));
        assertEquals("13:45:21", row.get(FuturesOrders.TIME).toString());
    }

    @Test
    void positionsBySection() {
        Result result = clean(Operation.QUERY_INVENTORY_DECODE,
                "<0>!1!2330@1000|-5!<1>!1!2317@2000|0@@@@@!<2>!0!<3>!1!0050@7|0|0!");
        assertEquals(-5L, result.first().get(StockPositions.CHANGE));
        assertEquals("2317", result.rows(StockPositions.MARGIN).get(0).text(
                StockPositions.STOCK_CODE));
        assertEquals(0, result.rows(StockPositions.SHORT_SALE).size());
        assertEquals(7L, result.rows(StockPositions.OTHER).get(0).get(StockPositions.QUANTITY));
        assertEquals(4, result.sections().size());
        Result jzg = clean(Operation.QUERY_INVENTORY_DECODE_JZG,
                "<0>!1!2330@1|2|3!<1>!0!<2>!0!");
        assertEquals(3L, jzg.first().get(StockPositions.SECOND_CHANGE));
    }

    @Test
    void futuresPositions() {
        Result result = clean(Operation.FUT_QUERY_INVENTORY_DECODE,
                "<5>!1!B|S@TIMEX&Y&TXF&20240100|20240200@2@180000000|181000000@20240115@TWD!<6>!1!"
                + "S@TIMEX&O&TXO&20240100&P&170000000@1@500000@!");
        Row spread = result.rows(FuturesPositions.FUTURES).get(0);
        assertEquals("202402", spread.get(Contracts.MONTH_2));
        assertEquals(Currency.TWD, spread.get(FuturesPositions.CURRENCY).value());
        Row option = result.rows(FuturesPositions.OPTIONS).get(0);
        assertEquals(Side.SELL, option.get(FuturesPositions.SIDE).value());
        assertNull(option.get(FuturesPositions.DATE));
        assertNull(option.get(FuturesPositions.PRICE_2));
    }

    @Test
    void loginWithNotice() {
        Result result = clean(Operation.AUTH_DECODE,
                "2!<S>@台北@1234567@9A01@1!<M>@系統維護! user@example 12@!");
        assertEquals(1, result.rows().size());
        assertEquals("系統維護! user@example 12@",
                result.rows(Accounts.NOTICES).get(0).get(Accounts.NOTICE));
    }

    @Test
    void smallResults() {
        assertEquals(new BigDecimal("12345"), clean(Operation.QUERY_BANK_REMAIN_DECODE,
                "1!@@@@12345@!").first().get(BankBalance.BALANCE));
        assertNull(clean(Operation.QUERY_CREDIT_INFO_DECODE, "@@@@@@@!").first());
        Row receipt = clean(Operation.FUT_SUBMIT_ORDER_DECODE, "G1@1130115@@0@1@!").first();
        assertEquals(Acceptance.NOT_ACCEPTED, receipt.get(OrderReceipts.ACCEPTED).value());
        Result onItsWay = of(Operation.FUT_SUBMIT_ORDER_DECODE, "委託單傳送中!!");
        assertTrue(onItsWay.isSuccess());
        assertEquals("委託單傳送中!!", onItsWay.message().text());
        assertEquals("abc", clean(Operation.GET_CERT_DECODE, "abc").text());
        assertEquals(0, clean(Operation.QUERY_REPLY_DECODE, "0!").rows().size());
    }

    @Test
    void marginAccount() {
        String text = "1!TWD@@1250@@a&b@10000@125000@20000@@30000@@40000@@@@@50000@40000@@@@@60000"
                + "@@@@@1@2@3@4@!";
        Row row = clean(Operation.QUERY_FINANCE_DECODE, text).first();
        assertEquals(new BigDecimal("12.50"), row.get(Margins.LO_HUNDREDTHS));
        assertEquals(new BigDecimal("12.5000"), row.get(Margins.LO));
        assertNull(row.get(Margins.PN));
        assertEquals("a&b", row.text(Margins.PN));
        assertEquals(new BigDecimal("0.0004"), row.get(Margins.F3));
    }

    @Test
    void messages() {
        Message message = Result.of(Operation.QUERY_ORDER_DECODE, -1, "[GATEWAY]密碼錯誤(1234)")
                .message();
        assertEquals(Message.Source.GATEWAY, message.source());
        assertEquals("密碼錯誤", message.text());
        assertEquals("1234", message.code());
        message = Result.of(Operation.GET_CERT_DECODE, -1, "[CERT]E001 abc def").message();
        assertEquals("E001", message.code());
        assertEquals("abc def", message.text());
        message = Result.of(Operation.GET_CERT_DECODE, -1, "[CLIENT] 日期輸入錯誤").message();
        assertEquals("日期輸入錯誤", message.text());
        assertEquals("", message.code());
        assertEquals(Message.Source.UNKNOWN,
                Result.of(Operation.AUTH_DECODE, -1, "密碼錯誤").message().source());
    }

    @Test
    void damageHasAPlace() {
        assertEquals("[at character 1: 2 records announced, 1 there]",
                faults(Operation.QUERY_ORDER_DECODE, "2!" + ORDER));
        assertEquals("[at character 3: a record of 13 fields; stock order has 14]",
                faults(Operation.QUERY_ORDER_DECODE, "1!" + ORDER.replace("@2!", "!")));
        assertEquals("[at character 19: ordered is no whole number]",
                faults(Operation.QUERY_ORDER_DECODE, "1!" + ORDER.replace("5000", "5O00")));
        List<Fault> cut = of(Operation.QUERY_ORDER_DECODE,
                "1!" + ORDER.substring(0, ORDER.length() - 1)).faults();
        assertEquals("the last record is not closed by '!'", cut.get(0).text());
        assertEquals("[at character 1: no count]", faults(Operation.QUERY_REPLY_DECODE, ""));
        assertTrue(faults(Operation.QUERY_INVENTORY_DECODE, "<0>!0!<1>!0!<3>!0!")
                        .contains("no section <2>"));
        assertEquals("[at character 1: a text where none belongs]",
                faults(Operation.OPEN_ACCOUNT_DECODE, "?"));
    }

    @Test
    void datesAndTimes() {
        assertEquals("2010-01-01", TradeDate.parse("990101").toString());
        assertEquals("2024-02-29", TradeDate.parse("1130229").toString());
        assertNull(TradeDate.parse("1120229"));
        assertNull(TradeDate.parse("00000000"));
        assertNull(TradeDate.parse("2024-1-1"));
        assertEquals("0990101", TradeDate.of(2010, 1, 1).rocText());
        assertNull(TradeTime.parse("246000"));
        assertEquals("23:59:59", TradeTime.parse("235959").toString());
        assertThrows(IllegalArgumentException.class, () -> TradeDate.of(2023, 2, 29));
    }
}
