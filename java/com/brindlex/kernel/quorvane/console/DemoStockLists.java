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
import java.time.LocalDate;
import java.util.List;

/** Order book, fills, positions, credit and settlement of the securities account. */
final class DemoStockLists {
    private static final String[] ORDER_STATES = {
        "部份成交", "已改量", "預約單", "已取消", "已取消", "委託失敗&交易所退單 ", "已成交",
    };
    private static final int STATE = 5;

    private static final ResultLayout[] SECTIONS = {
        ResultLayout.CASH_POSITIONS, ResultLayout.MARGIN_POSITIONS, ResultLayout.SHORT_POSITIONS,
        ResultLayout.OTHER_POSITIONS,
    };

    private DemoStockLists() {}

    static void play(Stage stage) {
        stage.screen.title("What became of the stock orders");
        orderBook(stage);
        fills(stage);
        String positions = stage.ask("Positions", positions(), gatewayjni::QueryInventoryDecode, 1);
        sections(stage, positions, 3, 1, 1, 1);
        String credit = stage.ask("Credit figures of 2330", credit("2330"), gatewayjni::QueryCreditInfoDecode, 1);
        stage.record(ResultLayout.CREDIT, ResultLayout.record(credit));
        stage.ask("Credit figures of a stock that has none", credit("6547"),
                gatewayjni::QueryCreditInfoDecode, 1, "@@@@@@@!");
        String settled = stage.ask("Settlement of today", settlement("1", ""), gatewayjni::PaymentDecode, 1);
        stage.table(ResultLayout.SETTLEMENT, ResultLayout.list(settled), 2);
        stage.refusedHere("Settlement without dates", settlement("", ""), "[CLIENT] 日期輸入錯誤");
        otherBrokerage(stage);
    }

    private static void orderBook(Stage stage) {
        String book = stage.ask("Order book of today",
                (sequence, status) -> gatewayjni.QueryOrderEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                        BRANCH, IDENTITY, PASSWORD, stage.today(), 0, status),
                (reply, status) -> gatewayjni.QueryOrderDecode(MARKET, reply, status), 1);
        List<List<String>> orders = ResultLayout.list(book);
        stage.table(ResultLayout.STOCK_ORDERS, orders, ORDER_STATES.length);
        for (int i = 0; i < ORDER_STATES.length; i++) {
            stage.field(orders, i, STATE, ORDER_STATES[i]);
        }
    }

    private static void fills(Stage stage) {
        String list = stage.ask("Fills of today", fillsOf(stage.today()), gatewayjni::QueryReplyDecode, 1);
        List<List<String>> fills = ResultLayout.list(list);
        stage.table(ResultLayout.STOCK_FILLS, fills, 2);
        stage.field(fills, 0, 4, "99450");
        stage.field(fills, 1, 5, "185050");
        String past = Stage.rocDate(LocalDate.now(stage.clock).minusDays(30));
        stage.ask("Fills of a day without any", fillsOf(past), gatewayjni::QueryReplyDecode, 1, "0!");
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

    private static void sections(Stage stage, String result, int... wanted) {
        for (ResultLayout.Section section : ResultLayout.sections(result)) {
            ResultLayout layout = SECTIONS[section.number()];
            stage.screen.line("  " + layout.name().toLowerCase(java.util.Locale.ROOT).replace('_', ' '));
            stage.table(layout, section.records(), wanted[section.number()]);
        }
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
                gatewayjni::SubmitOrderDecode, 1);
        stage.exchange("The exchange fills it.", () -> stage.gateway().fillStock("A0001", 1000, 20000));
        String positions = stage.ask("Positions", positions(), gatewayjni::QueryInventoryDecodeJZG, 1);
        sections(stage, positions, 2, 1, 1);
        String settled = stage.ask("Settlement of today", settlement("1", ""), gatewayjni::PaymentDecodeJZG, 1);
        List<List<String>> records = ResultLayout.list(settled);
        stage.table(ResultLayout.SETTLEMENT_JZG, records, 1);
        stage.field(records, 0, 2, "12");
        stage.use(standard);
    }
}
