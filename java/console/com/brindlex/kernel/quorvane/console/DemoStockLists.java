package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoLogin.USER;

import com.brindlex.kernel.quorvane.client.Brokerage;
import com.brindlex.kernel.quorvane.client.Column;
import com.brindlex.kernel.quorvane.client.OrderKind;
import com.brindlex.kernel.quorvane.client.Price;
import com.brindlex.kernel.quorvane.client.Quantity;
import com.brindlex.kernel.quorvane.client.SettledTrade;
import com.brindlex.kernel.quorvane.client.SettledTrades;
import com.brindlex.kernel.quorvane.client.SettlementPeriod;
import com.brindlex.kernel.quorvane.client.StockFills;
import com.brindlex.kernel.quorvane.client.StockOrder;
import com.brindlex.kernel.quorvane.client.StockOrders;
import com.brindlex.kernel.quorvane.client.StockPositions;
import com.brindlex.kernel.quorvane.client.TradeDate;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import java.math.BigDecimal;
import java.time.LocalDate;

/** Order book, fills, positions, credit and settlement of the securities account. */
final class DemoStockLists {
    private static final String[] STATES = {
        "部份成交", "已改量", "預約單", "已取消", "已取消", "委託失敗", "已成交",
    };
    private static final Column<?, ?>[] SETTLED = {
        SettledTrade.DATE50, SettledTrade.TYPE, SettledTrade.STOCK_CODE, SettledTrade.QUANTITY47,
        SettledTrade.PRICE48, SettledTrade.FIGURE49, SettledTrade.FIGURE79, SettledTrade.FIGURE78,
        SettledTrade.SIGN, SettledTrade.FIGURE97,
    };
    private static final Column<?, ?>[] SETTLED_JZG = SETTLED.clone();

    static {
        SETTLED_JZG[1] = SettledTrade.TYPE_TEXT;
    }

    private DemoStockLists() {}

    static void play(Stage stage) {
        stage.screen.title("What became of the stock orders");
        orderBook(stage);
        fills(stage);
        positions(stage, 3, 1, 1, 1);
        stage.record(stage.ask(
                "Credit figures of 2330", () -> stage.as(USER).creditFigures("2330")));
        stage.ask("Credit figures of a stock that has none",
                () -> stage.as(USER).creditFigures("6547"), "@@@@@@@!");
        stage.table(settlement(stage), 2, SETTLED);
        stage.refusedHere("Settlement of a period that there is not",
                () -> stage.as(USER).settlement(SettlementPeriod.of(7)), "periodOrStartDate");
        otherBrokerage(stage);
    }

    private static void orderBook(Stage stage) {
        StockOrders book = stage.ask(
                "Order book of today", () -> stage.as(USER).stockOrders(stage.today()));
        stage.table(book, STATES.length, StockOrder.ORDER_NUMBER, StockOrder.TYPE,
                StockOrder.STOCK_CODE, StockOrder.ORDERED_QUANTITY, StockOrder.STATE,
                StockOrder.FILLED_QUANTITY, StockOrder.CANCELLED_QUANTITY, StockOrder.PRICE,
                StockOrder.ENTRY_TIME);
        for (int i = 0; i < STATES.length; i++) {
            stage.value("state", STATES[i], book.get(i).text(StockOrder.STATE));
        }
        stage.value("why it failed", "交易所退單 ", book.get(5).gatewayText());
    }

    private static void fills(Stage stage) {
        TradeDate today = stage.today();
        StockFills fills =
                stage.ask("Fills of today", () -> stage.as(USER).stockFills(today, today));
        stage.table(fills, 2);
        stage.value("price", new BigDecimal("994.50"), fills.get(0).fillPrice());
        stage.value("number 49", 185050L, fills.get(1).number49());
        LocalDate past = LocalDate.now(stage.clock).minusDays(30);
        TradeDate day = TradeDate.of(past.getYear(), past.getMonthValue(), past.getDayOfMonth());
        stage.ask("Fills of a day without any", () -> stage.as(USER).stockFills(day, day), "0!");
    }

    private static void positions(Stage stage, int... wanted) {
        StockPositions positions =
                stage.ask("Positions", () -> stage.as(USER).stockPositions());
        stage.screen.line("  section 0");
        stage.table(positions.section0(), wanted[0]);
        stage.screen.line("  section 1");
        stage.table(positions.section1(), wanted[1]);
        stage.screen.line("  section 2");
        stage.table(positions.section2(), wanted[2]);
        stage.screen.line("  section 3");
        stage.table(positions.section3(), wanted[3]);
    }

    private static SettledTrades settlement(Stage stage) {
        return stage.ask("Settlement of period 1",
                () -> stage.as(USER).settlement(SettlementPeriod.of(1)));
    }

    /** The same lists in the reply layouts of brokerage JZG. */
    private static void otherBrokerage(Stage stage) {
        Gateway standard = stage.gateway();
        stage.use(stage.gateway(Brokerage.JZG), Brokerage.JZG);
        stage.screen.title("The same lists at brokerage JZG");
        stage.ask("Buy one lot of 2317, order kind 1",
                () -> stage.as(USER).stockOrder().buy("2317").quantity(Quantity.lots(1))
                        .price(Price.of("200")).orderKind(OrderKind.of(1)).live().build());
        stage.exchange("The exchange fills it.",
                () -> stage.gateway().fillStock("A0001", 1000, "200"));
        positions(stage, 2, 1, 1, 0);
        SettledTrades settled = settlement(stage);
        stage.table(settled, 1, SETTLED_JZG);
        stage.value("type", "12", settled.get(0).typeText());
        stage.use(standard, Brokerage.STANDARD);
    }
}
