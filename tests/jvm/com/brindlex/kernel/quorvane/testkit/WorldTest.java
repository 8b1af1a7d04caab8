package com.brindlex.kernel.quorvane.testkit;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.client.Contract;
import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.Handling;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Price;
import com.brindlex.kernel.quorvane.client.Quantity;
import com.brindlex.kernel.quorvane.client.Reply;
import com.brindlex.kernel.quorvane.client.TradeDate;
import com.brindlex.kernel.quorvane.simulator.Customer;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import com.brindlex.kernel.quorvane.simulator.GatewayBuilder;
import com.brindlex.kernel.quorvane.simulator.Holding;
import com.brindlex.kernel.quorvane.simulator.ListedProduct;
import com.brindlex.kernel.quorvane.simulator.ListedStock;
import com.brindlex.kernel.quorvane.simulator.ReadyMade;
import com.brindlex.kernel.quorvane.simulator.TradingAccount;
import java.math.BigDecimal;
import java.time.Clock;
import java.time.Duration;
import java.time.LocalDate;
import java.time.LocalDateTime;
import java.time.LocalTime;
import java.time.ZoneId;
import java.util.Collections;
import java.util.HashSet;
import java.util.List;
import java.util.Set;
import java.util.concurrent.ExecutorService;
import java.util.concurrent.Executors;
import java.util.concurrent.Future;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.function.Executable;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;

/** What the builder sets is what the gateway does. The library's own clock runs as it likes. */
class WorldTest {
    private static final Credentials USER = Credentials.of("7X", "C111222333", "42", "open.me");

    private static Clock clockAt(String time) {
        ZoneId zone = ZoneId.of("Asia/Taipei");
        LocalDateTime moment = LocalDateTime.of(LocalDate.of(2001, 2, 3), LocalTime.parse(time));
        return Clock.fixed(moment.atZone(zone).toInstant(), zone);
    }

    private static GatewayBuilder own(TradingAccount account) {
        return Gateway.builder().customer(Customer.of("C111222333", "open.me").account(account))
                .stock(ListedStock.of("8888", "10.00"))
                .product(ListedProduct.futures("ABC", 1000));
    }

    private static final TradingAccount STOCKS = TradingAccount.securities("7X", "42");
    private static final TradingAccount FUTURES = TradingAccount.futures("7X", "42");

    private static void assertRefused(String text, Reply<?> reply) {
        assertTrue(reply.isFailure(), reply::toString);
        assertEquals(text, reply.failure().text());
    }

    private static void assertSays(String part, Executable wrong) {
        String said = assertThrows(RuntimeException.class, wrong).getMessage();
        assertTrue(said.contains(part) && said.endsWith("."), said);
    }

    @Test
    void anyClockWillDo() {
        Device device = new Device(Gateway.readyMade().clock(clockAt("03:04:05")).build());
        assertTrue(device.ask(device.requests.login()).isResult());
        device.buy("2330", 1, "995").orThrow();
        assertEquals(TradeDate.of(2001, 2, 3), device.gateway.today());
        assertEquals("03:04:05", device.firstOrder().entryTime().toString());
        assertEquals(device.gateway.today(), device.firstOrder().entryDate());
        device.ask(device.requests.cancel(device.firstOrder()).flag13('0').build()).orThrow();
        device.gateway.fillStock(place(device), 1000, "995");
        assertEquals(1, device.ask(
                device.requests.stockFills(device.gateway.today(), device.gateway.today()))
                .orThrow().size());
    }

    private static String place(Device device) {
        device.buy("2330", 1, "995").orThrow();
        return "A0002";
    }

    @Test
    void aClockThatIsWrongIsRefusedWhereOneAsksForThat() {
        Clock system = Clock.systemDefaultZone();
        GatewayBuilder strict = Gateway.readyMade().tolerance(Duration.ofMinutes(10));
        Device good = new Device(strict.clock(system).build());
        assertTrue(good.ask(good.requests.login()).isResult());
        Device late = new Device(strict.clock(Clock.offset(system, Duration.ofHours(2))).build());
        assertRefused("電文時間不符", late.ask(late.requests.login()));
        // by the time of day alone this would do: an order carries its date
        Device nextWeek = new Device(strict.clock(Clock.offset(system, Duration.ofDays(7))).build());
        assertTrue(nextWeek.ask(nextWeek.requests.login()).isResult());
        assertRefused("電文時間不符", nextWeek.buy("2330", 1, "995"));
    }

    @Test
    void customersAreThoseThatWereSet() {
        Gateway gateway = own(STOCKS.label("一")).notice("小心").build();
        Device device = new Device(gateway, USER);
        assertEquals("一", device.ask(device.requests.login()).orThrow().get(0).accountFieldM5());
        assertEquals("小心", device.ask(device.requests.login()).orThrow().notice());
        assertRefused("密碼錯誤", new Device(gateway, USER.withPassword("other"))
                .ask(new Device(gateway, USER.withPassword("other")).requests.login()));
        Device stranger = new Device(gateway);
        assertRefused("查無此帳號", stranger.ask(stranger.requests.login()));
        Device blocked = new Device(own(STOCKS.blocked()).build(), USER);
        assertRefused("帳號已停用", blocked.buy("8888", 1, "10"));
    }

    @Test
    void moneyAndBirthDateAreThoseThatWereSet() {
        Device device = new Device(Gateway.builder().customer(Customer.of("C111222333", "open.me")
                .bankBalance(777).birthDate(LocalDate.of(1999, 12, 31)).account(STOCKS)).build(), USER);
        assertEquals(new BigDecimal(777),
                device.ask(device.requests.bankBalance()).orThrow().bankBalance());
        assertTrue(device.ask(device.requests.applyForCertificate(
                "19991231", "C111222333")).isResult());
        Device trader = new Device(own(FUTURES.balance(2500)).build(), USER);
        Contract contract = Contract.futures("ABC", "202401");
        assertRefused("保證金不足", trader.ask(trader.requests.futuresOrder().buy(contract)
                .quantity(3).price(Price.MARKET).live().build()));
        trader.ask(trader.requests.futuresOrder().buy(contract).quantity(2).price(Price.MARKET)
                .live().build()).orThrow();
    }

    @Test
    void holdingsCanBeSold() {
        Device device = new Device(
                own(STOCKS.holds(Holding.of("8888").cash(1000).margin(2000))).build(), USER);
        assertRefused("庫存不足", device.ask(device.requests.stockOrder().sell("8888")
                .quantity(Quantity.lots(2)).price(Price.of("10")).live().build()));
        device.ask(device.requests.stockOrder().sell("8888").quantity(Quantity.lots(1))
                .price(Price.of("10")).live().build()).orThrow();
        assertEquals(1, device.ask(device.requests.stockPositions()).orThrow().section1().size());
    }

    @ParameterizedTest(name = "{0} lots at {1}")
    @CsvSource({
        "1, 9.00, ''", "1, 8.99, 委託價格低於跌停價", "1, 11.00, ''", "1, 11.01, 委託價格超過漲停價",
        "5, 10.00, ''", "6, 9.00, 委託數量超過上限", "5, 10.01, 超過買進額度",
    })
    void limitsAreThoseThatWereSet(int lots, String price, String refusal) {
        Device device = new Device(
                own(STOCKS.buyingLimit(50000)).maxLots(5).build(), USER);
        Reply<?> reply = device.buy("8888", lots, price);
        assertEquals(refusal, reply.isFailure() ? reply.failure().text() : "");
    }

    @Test
    void aBuyingLimitCountsWhatStands() {
        Device device = new Device(own(STOCKS.buyingLimit(50000)).build(), USER);
        device.buy("8888", 3, "10").orThrow();
        device.gateway.fillStock("A0001", 1000, "10");
        assertRefused("超過買進額度", device.buy("8888", 3, "10"));
        device.ask(device.requests.cancel(device.firstOrder()).flag13('0').build()).orThrow();
        device.buy("8888", 3, "10").orThrow();
        assertRefused("超過買進額度", device.buy("8888", 2, "10"));
    }

    @Test
    void stocksAndProductsAreThoseThatWereSet() {
        Device device = new Device(own(STOCKS).stock(
                ListedStock.of("9999", "100").limits("99.5", "100.5").credit(7, 3)).build(), USER);
        assertRefused("無此股票代號", device.buy("2330", 1, "995"));
        assertRefused("委託價格超過漲停價", device.buy("9999", 1, "100.51"));
        device.buy("9999", 1, "99.5").orThrow();
        assertEquals("7", device.ask(device.requests.creditFigures("9999")).orThrow().figure76());
        Device trader = new Device(own(FUTURES).maxContracts(2).build(), USER);
        assertRefused("無此商品代號", trader.ask(trader.requests.futuresOrder()
                .buy(Contract.futures("TXF", "202401")).quantity(1).price(Price.MARKET).live()
                .build()));
        assertRefused("委託口數錯誤", trader.ask(trader.requests.futuresOrder()
                .buy(Contract.futures("ABC", "202401")).quantity(3).price(Price.MARKET).live()
                .build()));
    }

    @ParameterizedTest(name = "{0}")
    @CsvSource({
        "08:59:59, false, true", "09:00:00, true, true", "13:30:00, true, true",
        "13:30:01, false, false", "04:59:59, false, true", "05:00:01, false, false",
        "15:00:00, false, true", "23:59:59, false, true",
    })
    void marketsAreOpenWhenSet(String time, boolean stocksOpen, boolean futuresOpen) {
        boolean dayOfFutures = time.startsWith("08") || time.startsWith("09") || time.equals("13:30:00");
        Gateway gateway = Gateway.readyMade().clock(clockAt(time))
                .stockHours(LocalTime.of(9, 0), LocalTime.of(13, 30))
                .futuresHours(dayOfFutures ? LocalTime.of(8, 45) : LocalTime.of(15, 0),
                        dayOfFutures ? LocalTime.of(13, 45) : LocalTime.of(5, 0))
                .build();
        Device device = new Device(gateway);
        Reply<?> stock = device.buy("2330", 1, "995");
        assertEquals(stocksOpen, stock.isResult(), stock.toString());
        assertTrue(device.buy("2330", 1, "995", Handling.RESERVATION).isResult());
        Device trader = new Device(gateway, ReadyMade.FUTURES_USER);
        Reply<?> future = trader.ask(trader.requests.futuresOrder().buy(
                Contract.futures("MXF", "202401")).quantity(1).price(Price.MARKET).live().build());
        assertEquals(futuresOpen, future.isResult(), future.toString());
        if (!stocksOpen) {
            assertRefused("非交易時間", stock);
        }
    }

    @Test
    void threadsMayShareAGateway() throws Exception {
        Device device = new Device(Gateway.open());
        ExecutorService threads = Executors.newFixedThreadPool(8);
        List<Future<String>> numbers = threads.invokeAll(Collections.nCopies(200,
                () -> device.buy("2330", 1, "995").orThrow().gatewayNumber()));
        threads.shutdown();
        Set<String> all = new HashSet<>();
        for (Future<String> number : numbers) {
            all.add(number.get());
        }
        assertEquals(200, all.size());
        assertEquals(200, device.gateway.requests(Operation.SUBMIT_ORDER_ENCODE).size());
    }

    @Test
    void gatewaysOfOneBuilderShareNothing() {
        GatewayBuilder builder = Gateway.readyMade();
        Device one = new Device(builder.build());
        one.buy("2330", 1, "995").orThrow();
        one.ask(one.requests.changePassword("another1")).orThrow();
        Device other = new Device(builder.build());
        builder.maxLots(1);
        assertEquals(0, other.orders());
        assertTrue(other.buy("2330", 2, "995").isResult());
        assertTrue(one.ask(one.requests.login()).isFailure());
    }

    @Test
    void whatDoesNotGoTogetherIsRefusedInASentence() {
        assertSays("add one by customer(", () -> Gateway.builder().build());
        assertSays("add it by stock(ListedStock.of(\"2330\"",
                () -> own(STOCKS.holds(Holding.of("2330").cash(1))).build());
        assertSays("such as \"A123456789\", not \"abc\"", () -> Customer.of("abc", "p"));
        assertSays("such as \"1234567\", not \"12345678\"",
                () -> TradingAccount.securities("9A01", "12345678"));
        assertSays("such as \"9A01\", not \"\"", () -> TradingAccount.futures("", "12"));
        assertSays("has the account S 7X-0042 already", () -> Customer.of("A123456789", "p")
                .account(TradingAccount.securities("7X", "0042")).account(STOCKS));
        assertSays("give the holding of 2330 to a TradingAccount.securities",
                () -> FUTURES.holds(Holding.of("2330")));
        assertSays("cannot be below 0", () -> Holding.of("2330").cash(-1));
        assertSays("written as \"995.50\"", () -> ListedStock.of("2330", "995,50"));
        assertSays("lie around its reference price",
                () -> ListedStock.of("2330", "100").limits("101", "110"));
        assertSays("such as \"2330\", not \"\"", () -> ListedStock.of("", "1"));
        assertSays("such as \"TXF\", not \"txf\"", () -> ListedProduct.options("txf", 1));
    }

    @Test
    void whatTheExchangeCannotDoIsRefusedInASentence() {
        Device device = new Device(Gateway.open());
        assertSays("no order A0001 in the book, which has none yet",
                () -> device.gateway.fillStock("A0001", 1, "1"));
        device.buy("2330", 2, "995").orThrow();
        assertSays("has 2000 shares open: 1 to 2000 can be filled, not 2001",
                () -> device.gateway.fillStock("A0001", 2001, "995"));
        assertSays("worse than its limit, 995.00",
                () -> device.gateway.fillStock("A0001", 1000, "995.01"));
        assertSays("no order A0002 in the book, which has A0001",
                () -> device.gateway.failStock("A0002", "x"));
        device.gateway.failStock("A0001", "退單");
        assertSays("has 0 shares open", () -> device.gateway.fillStock("A0001", 1, "995"));
    }
}
