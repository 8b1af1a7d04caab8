package com.brindlex.kernel.quorvane.client;

import static com.brindlex.kernel.quorvane.client.Fixtures.SESSION;
import static com.brindlex.kernel.quorvane.client.Fixtures.USER;
import static com.brindlex.kernel.quorvane.client.Fixtures.futures;
import static com.brindlex.kernel.quorvane.client.Fixtures.futuresOrder;
import static com.brindlex.kernel.quorvane.client.Fixtures.refused;
import static com.brindlex.kernel.quorvane.client.Fixtures.stockOrder;
import static com.brindlex.kernel.quorvane.client.Fixtures.stocks;
import static com.brindlex.kernel.quorvane.client.Fixtures.tag;
import static org.junit.jupiter.api.Assertions.assertEquals;

import java.math.BigDecimal;
import java.util.List;
import org.junit.jupiter.api.Test;

/** An order goes out as it was meant, or is refused with every fault named. */
final class OrdersAsMeantTest {
    private static final Contract TXF = Contract.futures("TXF", "202401");
    private static final Contract CALL = Contract.option("TXO", "202401", CallPut.CALL, "23000");

    @Test
    void tellsAllFaultsAtOnce() {
        assertEquals(List.of("tradeType", "quantity", "price", "handlingFlag", "stockCode", "side"),
                refused(() -> stocks().stockOrder().tradeType(TradeType.of(7)).build()).stream()
                        .sorted(java.util.Comparator.comparing(
                                List.of("tradeType", "quantity", "price", "handlingFlag",
                                        "stockCode", "side")::indexOf))
                        .toList());
        assertEquals(List.of("legs", "price", "handlingFlag", "commodity1", "month1", "side1",
                             "quantity"),
                refused(() -> futures().futuresOrder().build()));
    }

    @Test
    void aPriceIsOneThing() {
        assertEquals("2.00", tag(stockOrder().price(Price.LIMIT_UP).price(Price.of("2")).build(),
                "31"));
        Request<?> word = stockOrder().price(Price.of("2")).price(Price.LIMIT_UP).build();
        assertEquals("0", tag(word, "31"));
        assertEquals("9", tag(word, "M8"));
        assertEquals("1", tag(stockOrder().price(Price.LIMIT_DOWN).build(), "M8"));
        assertEquals("5", tag(stockOrder().price(Price.FLAT).build(), "M8"));
        assertEquals("600.50", tag(stockOrder().price(Price.of(new BigDecimal("600.5000"))).build(),
                "31"));
        assertEquals("1", tag(futuresOrder().price(Price.MARKET).build(), "27"));
        assertEquals("3", tag(futuresOrder().price(Price.RANGE_MARKET).build(), "27"));
        assertEquals("22950.2500", tag(futuresOrder().price(Price.of("22950.25")).build(), "31"));
    }

    @Test
    void aPriceThatCannotBeSentIsRefused() {
        for (Price price : List.of(Price.of("0"), Price.of("0.00"), Price.of("-1"),
                     Price.of("1.005"), Price.of("21474836.48"), Price.MARKET, Price.RANGE_MARKET)) {
            assertEquals(List.of("price"), refused(() -> stockOrder().price(price).build()),
                    price::toString);
        }
        for (Price price : List.of(Price.of("0"), Price.of("-25.5"), Price.of("1.00005"),
                     Price.of("214748.3648"), Price.FLAT, Price.LIMIT_UP, Price.LIMIT_DOWN)) {
            assertEquals(List.of("price"), refused(() -> futuresOrder().price(price).build()),
                    price::toString);
        }
        assertEquals(List.of("price"), refused(() -> futuresOrder()
                .sell(Contract.futures("TXF", "202402")).price(Price.of("-25.5")).build()));
        assertEquals("0.0000", tag(futuresOrder().sell(Contract.futures("TXF", "202402"))
                .price(Price.of("0")).build(), "31"));
        assertEquals(List.of("price"), refused(
                () -> stockOrder().tradeType(TradeType.LOTS_WITHOUT_PRICE).build()));
    }

    @Test
    void aQuantityIsLotsOrSharesOfAnOddLot() {
        Request<?> odd = stockOrder().quantity(Quantity.oddLotShares(5)).build();
        assertEquals("5", tag(odd, "30"));
        assertEquals("2", tag(odd, "28"));
        Request<?> lots = stockOrder().quantity(Quantity.oddLotShares(5))
                .quantity(Quantity.lots(1)).build();
        assertEquals("1000", tag(lots, "30"));
        assertEquals("0", tag(lots, "28"));
        assertEquals("300", tag(stockOrder().quantity(Quantity.lots(3, 100)).build(), "30"));
        for (Quantity quantity : List.of(Quantity.lots(0), Quantity.lots(-1),
                     Quantity.lots(3_000_000), Quantity.lots(1, 0), Quantity.oddLotShares(0),
                     Quantity.oddLotShares(1000), Quantity.lots(Integer.MAX_VALUE))) {
            assertEquals(List.of("quantity"),
                    refused(() -> stockOrder().quantity(quantity).build()), quantity::toString);
        }
        assertEquals(List.of("quantity"), refused(() -> stockOrder()
                .quantity(Quantity.oddLotShares(5)).tradeType(TradeType.LOTS).build()));
        assertEquals(List.of("quantity"), refused(() -> futuresOrder().quantity(0).build()));
    }

    @Test
    void legsBelongTogether() {
        assertEquals(List.of("legs"), refused(() -> futuresOrder().sell(CALL).build()));
        assertEquals(List.of("legs"), refused(() -> futuresOrder().sell(TXF).sell(TXF).build()));
        assertEquals(List.of("side1"), refused(() -> futures().futuresOrder()
                .leg(Side.UNKNOWN, TXF).quantity(1).price(Price.MARKET).live().build())
                .subList(0, 1));
        assertEquals(List.of("callPut1"), refused(() -> futures().futuresOrder()
                .buy(Contract.option("TXO", "202401", CallPut.UNKNOWN, "100")).quantity(1)
                .price(Price.MARKET).live().build()));
        assertEquals(List.of("strike1"), refused(() -> futures().futuresOrder()
                .buy(Contract.option("TXO", "202401", CallPut.PUT, "0")).quantity(1)
                .price(Price.MARKET).live().build()));
    }

    @Test
    void nothingForgesFields() {
        for (String text : List.of("a|PWD=x", "a\0b", "a\nb", "\u007f", "\ud800", "a%20b")) {
            assertEquals(List.of("password"), refused(
                    () -> Requests.of(SESSION, USER.withPassword(text)).login()), text);
            assertEquals(List.of("name"), refused(() -> stocks().openAccount(
                    text, "address", "02", ContactTime.of(1), AccountItem.of(1))), text);
        }
        for (char letter : new char[] {0, '|', '\n', 0x7F, 0xE9, 0x4E2D}) {
            assertEquals(List.of("flag13"), refused(() -> stockOrder().flag13(letter).build()));
            assertEquals(List.of("flagW3"), refused(() -> futuresOrder().flagW3(letter).build()));
        }
    }

    @Test
    void whoAsksMustBeTold() {
        assertEquals(List.of("localIP"), refused(
                () -> Requests.of(SESSION.withLocalAddress(""), USER).login()));
        assertEquals(List.of("serialNo"), refused(
                () -> Requests.of(Session.of("S23456789012345678901", "10.0.0.1"), USER).login()));
        assertEquals(List.of("platform"), refused(
                () -> Requests.of(SESSION.withPlatform(Platform.of(15)), USER).login()));
        for (Credentials user : List.of(Credentials.of("9A01", "A1234567", "7", "x"),
                     Credentials.of("9A01", "A123456789", "12345678", "x"),
                     Credentials.of("9A01", "A123456789", "12a", "x"))) {
            assertEquals(List.of("account"), refused(() -> Requests.of(SESSION, user).login()));
        }
        assertEquals(List.of("idNumber"), refused(() -> Requests.of(
                SESSION, Credentials.of("9A01", "A1&345678", "1234567", "x")).login()));
        assertEquals(List.of("idNumber", "account"), refused(() -> Requests.of(
                SESSION, Credentials.of("9A01", "", "", "x")).login()));
        assertEquals(List.of("branch", "password"), refused(() -> Requests.of(
                SESSION, Credentials.ofIdNumber("", "A123456789", "")).login()));
    }

    @Test
    void codesThatTheGatewayDoesNotTakeAreRefused() {
        for (int kind : new int[] {-1, 6, 7, 9, 255, 256}) {
            assertEquals(List.of("orderKind"),
                    refused(() -> stockOrder().orderKind(OrderKind.of(kind)).build()));
        }
        assertEquals(List.of("tradeType"),
                refused(() -> stockOrder().tradeType(TradeType.of(1)).build()));
        assertEquals(List.of("periodOrStartDate"),
                refused(() -> stocks().settlement(SettlementPeriod.of(7))));
        assertEquals(List.of("endDate"), refused(() -> stocks().stockFills(
                TradeDate.of(2024, 1, 2), TradeDate.of(2024, 1, 1))));
        assertEquals(List.of("date"),
                refused(() -> stocks().stockOrders(TradeDate.of(1911, 12, 31))));
    }
}
