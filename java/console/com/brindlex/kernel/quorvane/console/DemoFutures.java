package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoLogin.ADDRESS;
import static com.brindlex.kernel.quorvane.console.DemoLogin.PASSWORD;
import static com.brindlex.kernel.quorvane.console.Stage.MARKET;
import static com.brindlex.kernel.quorvane.console.Stage.PLATFORM;
import static com.brindlex.kernel.quorvane.console.Stage.SERIAL;

import com.brindlex.kernel.quorvane.gatewayjni;
import com.brindlex.kernel.quorvane.typed.Contracts;
import com.brindlex.kernel.quorvane.typed.FuturesFills;
import com.brindlex.kernel.quorvane.typed.FuturesOrders;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Result;
import java.time.LocalDate;

/** Futures and options: orders of one leg and two, and every list that shows them. */
final class DemoFutures {
    private static final String BRANCH = "F001";
    private static final String IDENTITY = "A123456789&7654321";
    private static final String[] ORDER_STATES = {"部份成交", "撮合部份成交", "已成交", "已取消"};

    private final Stage stage;
    private final String month;
    private final String nextMonth;

    /** An order as the user fills it in. */
    private record Ticket(
            int kind, Leg leg1, Leg leg2, int priceType, char timeInForce, int quantity, int price) {
        Ticket with(int otherQuantity, int otherPrice) {
            return new Ticket(kind, leg1, leg2, priceType, timeInForce, otherQuantity, otherPrice);
        }
    }

    private record Leg(String commodity, String month, String strike, String callPut, char side) {}

    private static final Leg NO_LEG = new Leg("", "", "", "", ' ');

    private DemoFutures(Stage stage) {
        this.stage = stage;
        this.month = month(LocalDate.now(stage.clock).plusMonths(1));
        this.nextMonth = month(LocalDate.now(stage.clock).plusMonths(2));
    }

    private static String month(LocalDate date) {
        return String.format("%04d%02d", date.getYear(), date.getMonthValue());
    }

    static void play(Stage stage) {
        DemoFutures demo = new DemoFutures(stage);
        stage.screen.title("Futures and options orders");
        demo.orders();
        stage.screen.title("What became of the futures and options orders");
        demo.lists();
    }

    private void orders() {
        Leg future = new Leg("TXF", month, "", "", 'B');
        Leg far = new Leg("TXF", nextMonth, "", "", 'S');
        Leg low = new Leg("TXO", month, "23000", "C", 'B');
        Leg high = new Leg("TXO", month, "23500", "C", 'S');
        Ticket spread = new Ticket(4, future, far, 2, 'R', 2, 250000);

        submit("Buy two TXF futures at 22950", new Ticket(1, future, NO_LEG, 2, 'R', 2, 229500000), 1, false);
        submit("Sell three calls at the market, immediate or cancel",
                new Ticket(2, high, NO_LEG, 1, 'I', 3, 0), 2, true);
        submit("Buy a call spread: a combination of two options",
                new Ticket(3, low, high, 2, 'F', 1, 1800000), 3, true);
        submit("Buy the calendar spread of two futures", spread, 4, false);
        stage.exchange("The exchange fills one of F0001, two of F0002 and all of F0003.", () -> {
            stage.gateway().fillFutures("F0001", 1, "22948", "");
            stage.gateway().fillFutures("F0002", 2, "120.5", "");
            stage.gateway().fillFutures("F0003", 1, "310", "130");
        });

        stage.ask("Take one contract off the spread", order(spread.with(1, 250000), 'C', 4, false),
                Operation.FUT_SUBMIT_ORDER_DECODE, 1, acknowledged(4));
        stage.ask("Change the price of the spread", order(spread.with(1, 260000), 'A', 4, true),
                Operation.FUT_SUBMIT_ORDER_DECODE, 1, acknowledged(4));
        stage.ask("Cancel the spread", order(spread.with(1, 260000), 'D', 4, true),
                Operation.FUT_SUBMIT_ORDER_DECODE, 1, acknowledged(4));
        stage.ask("Buy more than the margin allows",
                order(new Ticket(1, future, NO_LEG, 2, 'R', 50, 229500000), 'I', 0, false),
                Operation.FUT_SUBMIT_ORDER_DECODE, -1, "保證金不足");
        stage.refusedHere("An option without a strike price",
                order(new Ticket(2, new Leg("TXO", month, "", "C", 'B'), NO_LEG, 1, 'R', 1, 0), 'I', 0, false),
                "[CLIENT]傳入的參數錯誤");
    }

    private void submit(String title, Ticket ticket, int number, boolean tagged) {
        stage.ask(title, order(ticket, 'I', 0, tagged), Operation.FUT_SUBMIT_ORDER_DECODE, 1, acknowledged(number));
    }

    private String acknowledged(int number) {
        return String.format("%010d@%s@@1@0@!", 5000000 + number, stage.today());
    }

    /** The request of one ticket; {@code tagged} chooses the form with the payload in a tag. */
    private Stage.Encoder order(Ticket t, char function, int number, boolean tagged) {
        String reference = number == 0 ? "" : String.format("F%04d&%010d", number, 5000000 + number);
        Leg a = t.leg1;
        Leg b = t.leg2;
        return (sequence, status) -> tagged
                ? gatewayjni.FutSubmitOrderEncode1(MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY,
                        PASSWORD, reference, stage.today(), a.commodity, b.commodity, a.month, b.month, a.strike,
                        b.strike, a.callPut, b.callPut, (byte) 1, (byte) t.kind, (byte) t.priceType, function,
                        '0', t.timeInForce, ' ', a.side, b.side, t.quantity, 0, t.price, status)
                : gatewayjni.FutSubmitOrderEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY,
                        PASSWORD, reference, stage.today(), a.commodity, b.commodity, a.month, b.month, a.strike,
                        b.strike, a.callPut, b.callPut, (byte) 1, (byte) t.kind, (byte) t.priceType, function,
                        '0', t.timeInForce, ' ', a.side, b.side, t.quantity, 0, t.price, status);
    }

    private void lists() {
        Result book = stage.ask("Order book of today",
                (sequence, status) -> gatewayjni.FutQueryOrderEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                        BRANCH, IDENTITY, PASSWORD, stage.today(), 0, status),
                Operation.FUT_QUERY_ORDER_DECODE, 1);
        stage.orders(book.rows(), FuturesOrders.STATUS, FuturesOrders.MESSAGE, ORDER_STATES,
                FuturesOrders.ORDER_NUMBER, FuturesOrders.LEG, Contracts.COMMODITY, Contracts.MONTH,
                Contracts.CALL_PUT, Contracts.STRIKE, FuturesOrders.ORDERED, FuturesOrders.STATUS,
                FuturesOrders.FILLED, FuturesOrders.CANCELLED, FuturesOrders.PRICE);
        Result fills = stage.ask("Fills of today",
                (sequence, status) -> gatewayjni.FutQueryReplyEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                        BRANCH, IDENTITY, PASSWORD, stage.today(), stage.today(), status),
                Operation.FUT_QUERY_REPLY_DECODE, 1);
        stage.table(fills.rows(), 3, FuturesFills.TIME, FuturesFills.ORDER_NUMBER, FuturesFills.LEG,
                Contracts.COMMODITY, Contracts.MONTH, Contracts.CALL_PUT, Contracts.STRIKE,
                FuturesFills.FILLED, FuturesFills.ORDER_PRICE, FuturesFills.PRICE);
        positions();
        Result margin = stage.ask("Margin account",
                (sequence, status) -> gatewayjni.QueryFinanceEncode(
                        MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, 0, status),
                Operation.QUERY_FINANCE_DECODE, 1);
        stage.record(margin.rows());
    }

    private void positions() {
        Result held = stage.ask("Open positions",
                (sequence, status) -> gatewayjni.FutQueryInventoryEncode(
                        MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, status),
                Operation.FUT_QUERY_INVENTORY_DECODE, 1);
        stage.sections(held, 1, 2);
    }
}
