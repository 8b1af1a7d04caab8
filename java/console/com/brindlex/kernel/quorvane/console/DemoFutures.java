package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.client.CallPut;
import com.brindlex.kernel.quorvane.client.Contract;
import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.FuturesFill;
import com.brindlex.kernel.quorvane.client.FuturesFills;
import com.brindlex.kernel.quorvane.client.FuturesOrder;
import com.brindlex.kernel.quorvane.client.FuturesOrderBuilder;
import com.brindlex.kernel.quorvane.client.FuturesOrders;
import com.brindlex.kernel.quorvane.client.FuturesPositions;
import com.brindlex.kernel.quorvane.client.Price;
import com.brindlex.kernel.quorvane.client.Signature;
import com.brindlex.kernel.quorvane.client.TimeInForce;
import com.brindlex.kernel.quorvane.client.TradeDate;
import java.time.LocalDate;
import java.util.function.UnaryOperator;

/** Futures and options: orders of one leg and two, and every list that shows them. */
final class DemoFutures {
    private static final Credentials USER =
            Credentials.of("F001", "A123456789", "7654321", "pass1234");
    private static final String[] STATES = {"部份成交", "撮合部份成交", "已成交", "已取消"};

    private final Stage stage;
    private final Contract near;
    private final Contract far;
    private final Contract low;
    private final Contract high;

    private DemoFutures(Stage stage) {
        this.stage = stage;
        String month = month(LocalDate.now(stage.clock).plusMonths(1));
        near = Contract.futures("TXF", month);
        far = Contract.futures("TXF", month(LocalDate.now(stage.clock).plusMonths(2)));
        low = Contract.option("TXO", month, CallPut.CALL, "23000");
        high = Contract.option("TXO", month, CallPut.CALL, "23500");
    }

    private static String month(LocalDate date) {
        return String.format("%04d%02d", date.getYear(), date.getMonthValue());
    }

    static void play(Stage stage) {
        DemoFutures demo = new DemoFutures(stage);
        stage.screen.title("Futures and options orders");
        demo.place();
        demo.changeAndCancel();
        stage.screen.title("What became of the futures and options orders");
        demo.lists();
    }

    private FuturesOrderBuilder order() {
        return stage.as(USER).futuresOrder().flagW3('0').live();
    }

    private void place() {
        submit("Buy two TXF futures at 22950", 1,
                order -> order.buy(near).quantity(2).price(Price.of("22950")));
        submit("Sell three calls at the market, immediate or cancel", 2,
                order -> order.sell(high).quantity(3).price(Price.MARKET)
                        .timeInForce(TimeInForce.IMMEDIATE_OR_CANCEL).signature(Signature.TAG_PL));
        submit("Buy a call spread: a combination of two options", 3,
                order -> order.buy(low).sell(high).quantity(1).price(Price.of("180"))
                        .timeInForce(TimeInForce.FILL_OR_KILL).signature(Signature.TAG_PL));
        submit("Buy the calendar spread of two futures", 4,
                order -> order.buy(near).sell(far).quantity(2).price(Price.of("25")));
        stage.exchange("The exchange fills one of F0001, two of F0002 and all of F0003.", () -> {
            stage.gateway().fillFutures("F0001", 1, "22948");
            stage.gateway().fillFutures("F0002", 2, "120.5");
            stage.gateway().fillFutures("F0003", 1, "310", "130");
        });
    }

    private void submit(String title, int number, UnaryOperator<FuturesOrderBuilder> terms) {
        stage.ask(title, () -> terms.apply(order()).build(), acknowledged(number));
    }

    private String acknowledged(int number) {
        return String.format("%010d@%s@@1@0@!", 5000000 + number, stage.today().rocText());
    }

    private void changeAndCancel() {
        stage.ask("Take one contract off the spread", () -> stage.as(USER)
                .changeQuantity(spread(), 1).secondCommodity("TXF").build(), acknowledged(4));
        stage.ask("Change the price of the spread", () -> stage.as(USER)
                .changePrice(spread(), Price.of("26")).secondCommodity("TXF").build(),
                acknowledged(4));
        stage.ask("Cancel the spread", () -> stage.as(USER).cancel(spread())
                .secondCommodity("TXF").signature(Signature.TAG_PL).build(), acknowledged(4));
        stage.fails("Buy more than the margin allows",
                () -> order().buy(near).quantity(50).price(Price.of("22950")).build(),
                "[GATEWAY]保證金不足");
        stage.refusedHere("An option together with a futures contract, at a negative price",
                () -> order().buy(low).sell(far).quantity(1).price(Price.of("-25.5")).build(),
                "legs", "price");
    }

    /** The spread as the book shows it now; the book is asked quietly. */
    private FuturesOrder spread() {
        FuturesOrders book = stage.quietly(stage.as(USER).futuresOrders(stage.today()));
        return book.get(3);
    }

    private void lists() {
        TradeDate today = stage.today();
        FuturesOrders book =
                stage.ask("Order book of today", () -> stage.as(USER).futuresOrders(today));
        stage.table(book, STATES.length, FuturesOrder.ORDER_NUMBER, FuturesOrder.LEG_CODE1,
                FuturesOrder.COMMODITY1, FuturesOrder.MONTH1, FuturesOrder.CALL_PUT1,
                FuturesOrder.STRIKE1, FuturesOrder.ORDERED_QUANTITY, FuturesOrder.STATE,
                FuturesOrder.FILLED_QUANTITY, FuturesOrder.CANCELLED_QUANTITY, FuturesOrder.PRICE);
        for (int i = 0; i < STATES.length; i++) {
            stage.value("state", STATES[i], book.get(i).text(FuturesOrder.STATE));
        }
        FuturesFills fills =
                stage.ask("Fills of today", () -> stage.as(USER).futuresFills(today, today));
        stage.table(fills, 3, FuturesFill.TIME51, FuturesFill.ORDER_NUMBER, FuturesFill.LEG_CODE1,
                FuturesFill.COMMODITY1, FuturesFill.MONTH1, FuturesFill.CALL_PUT1,
                FuturesFill.STRIKE1, FuturesFill.FILLED_QUANTITY, FuturesFill.PRICE,
                FuturesFill.PRICE48);
        FuturesPositions held =
                stage.ask("Open positions", () -> stage.as(USER).futuresPositions());
        stage.table(held.futures(), 1);
        stage.table(held.options(), 2);
        stage.record(stage.ask("Margin account", () -> stage.as(USER).margin()));
    }
}
