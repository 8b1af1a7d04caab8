package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoLogin.ADDRESS;
import static com.brindlex.kernel.quorvane.console.DemoLogin.BRANCH;
import static com.brindlex.kernel.quorvane.console.DemoLogin.IDENTITY;
import static com.brindlex.kernel.quorvane.console.DemoLogin.PASSWORD;
import static com.brindlex.kernel.quorvane.console.Stage.MARKET;
import static com.brindlex.kernel.quorvane.console.Stage.PLATFORM;
import static com.brindlex.kernel.quorvane.console.Stage.SERIAL;

import com.brindlex.kernel.quorvane.gatewayjni;
import com.brindlex.kernel.quorvane.simulator.Brokerage;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import com.brindlex.kernel.quorvane.typed.Column;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Result;
import com.brindlex.kernel.quorvane.typed.Settlements;
import com.brindlex.kernel.quorvane.typed.StockFills;
import com.brindlex.kernel.quorvane.typed.StockOrders;
import java.time.LocalDate;

/** Order book, fills, positions, credit and settlement of the securities account. */
final class DemoStockLists {
    private static final String[] ORDER_STATES = {
        "部份成交", "已改量", "預約單", "已取消", "已取消", "委託失敗&交易所退單 ", "已成交",
    };
    private static final Column<?>[] SETTLED = {
        Settlements.DATE, Settlements.TYPE, Settlements.STOCK_CODE, Settlements.QUANTITY,
        Settlements.PRICE, Settlements.AMOUNT, Settlements.AMOUNT_79, Settlements.AMOUNT_78,
        Settlements.SIGN, Settlements.NET_AMOUNT,
    };
    private static final Column<?>[] SETTLED_JZG = SETTLED.clone();

    static {
        SETTLED_JZG[1] = Settlements.BROKER_TYPE;
    }

    private DemoStockLists() {}

    static void play(Stage stage) {
        stage.screen.title("What became of the stock orders");
        orderBook(stage);
        fills(stage);
        Result positions = stage.ask("Positions", positions(), Operation.QUERY_INVENTORY_DECODE, 1);
        stage.sections(positions, 3, 1, 1, 1);
        Result credit = stage.ask("Credit figures of 2330", credit("2330"), Operation.QUERY_CREDIT_INFO_DECODE, 1);
        stage.record(credit.rows());
        stage.ask("Credit figures of a stock that has none", credit("6547"),
                Operation.QUERY_CREDIT_INFO_DECODE, 1, "@@@@@@@!");
        Result settled = stage.ask("Settlement of today", settlement("1", ""), Operation.PAYMENT_DECODE, 1);
        stage.table(settled.rows(), 2, SETTLED);
        stage.refusedHere("Settlement without dates", settlement("", ""), "[CLIENT] 日期輸入錯誤");
        otherBrokerage(stage);
    }

    private static void orderBook(Stage stage) {
        Result book = stage.ask("Order book of today",
                (sequence, status) -> gatewayjni.QueryOrderEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                        BRANCH, IDENTITY, PASSWORD, stage.today(), 0, status),
                Operation.QUERY_ORDER_DECODE, 1);
        stage.orders(book.rows(), StockOrders.STATUS, StockOrders.MESSAGE, ORDER_STATES,
                StockOrders.ORDER_NUMBER, StockOrders.TYPE, StockOrders.STOCK_CODE,
                StockOrders.ORDERED, StockOrders.STATUS, StockOrders.FILLED, StockOrders.CANCELLED,
                StockOrders.PRICE, StockOrders.TIME);
    }

    private static void fills(Stage stage) {
        Result fills = stage.ask("Fills of today", fillsOf(stage.today()), Operation.QUERY_REPLY_DECODE, 1);
        stage.table(fills.rows(), 2);
        stage.field(fills.rows(), 0, StockFills.PRICE, "99450");
        stage.field(fills.rows(), 1, StockFills.AMOUNT, "185050");
        String past = Stage.rocDate(LocalDate.now(stage.clock).minusDays(30));
        stage.ask("Fills of a day without any", fillsOf(past), Operation.QUERY_REPLY_DECODE, 1, "0!");
    }

    private static Stage.Encoder fillsOf(String day) {
        return (sequence, status) -> gatewayjni.QueryReplyEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                BRANCH, IDENTITY, PASSWORD, day, day, status);
    }

    private static Stage.Encoder positions() {
        return (sequence, status) -> gatewayjni.QueryInventoryEncode(
                MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, status);
    }

    private static Stage.Encoder credit(String stock) {
        return (sequence, status) -> gatewayjni.QueryCreditInfoEncode(
                MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, stock, status);
    }

    private static Stage.Encoder settlement(String first, String last) {
        return (sequence, status) -> gatewayjni.PaymentEncode(
                MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, first, last, status);
    }

    /** The same lists in the reply layouts of brokerage JZG. */
    private static void otherBrokerage(Stage stage) {
        Gateway standard = stage.gateway();
        stage.use(new Gateway(stage.clock, Brokerage.JZG));
        stage.screen.title("The same lists at brokerage JZG");
        stage.ask("Buy one lot of 2317 on margin",
                (sequence, status) -> gatewayjni.SubmitOrderEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                        BRANCH, IDENTITY, PASSWORD, "2317", stage.today(), 1, 1000, 20000, (byte) 'B', (byte) '0',
                        (byte) 1, (byte) 0, (byte) 0, (byte) 1, status),
                Operation.SUBMIT_ORDER_DECODE, 1);
        stage.exchange("The exchange fills it.", () -> stage.gateway().fillStock("A0001", 1000, 20000));
        Result positions = stage.ask("Positions", positions(), Operation.QUERY_INVENTORY_DECODE_JZG, 1);
        stage.sections(positions, 2, 1, 1);
        Result settled = stage.ask("Settlement of today", settlement("1", ""), Operation.PAYMENT_DECODE_JZG, 1);
        stage.table(settled.rows(), 1, SETTLED_JZG);
        stage.field(settled.rows(), 0, Settlements.BROKER_TYPE, "12");
        stage.use(standard);
    }
}
