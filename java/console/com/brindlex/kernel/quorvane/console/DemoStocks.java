package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoLogin.ADDRESS;
import static com.brindlex.kernel.quorvane.console.DemoLogin.BRANCH;
import static com.brindlex.kernel.quorvane.console.DemoLogin.IDENTITY;
import static com.brindlex.kernel.quorvane.console.DemoLogin.PASSWORD;
import static com.brindlex.kernel.quorvane.console.Stage.MARKET;
import static com.brindlex.kernel.quorvane.console.Stage.PLATFORM;
import static com.brindlex.kernel.quorvane.console.Stage.SERIAL;

import com.brindlex.kernel.quorvane.gatewayjni;
import com.brindlex.kernel.quorvane.typed.Operation;

/** Stock orders: placed, changed, cancelled and refused. */
final class DemoStocks {
    private static final int LOT = 1000;
    private static final byte FLAG_13 = '0';
    private static final byte CASH = 0;
    private static final byte MARGIN = 3;
    private static final byte LIMIT = 0;
    private static final byte LIMIT_UP = 9;
    private static final byte LOTS = 0;
    private static final byte ODD_LOT = 2;
    private static final byte FIXED_PRICE = 3;
    private static final byte AT_ONCE = 1;
    private static final byte RESERVED = 0;

    private final Stage stage;

    private DemoStocks(Stage stage) {
        this.stage = stage;
    }

    /** An order as the user fills it in. */
    private record Ticket(
            String stock, char side, int quantity, int price, byte kind, byte priceKind, byte tradeType, byte n6) {}

    static void play(Stage stage) {
        stage.screen.title("Stock orders");
        DemoStocks demo = new DemoStocks(stage);
        demo.place();
        demo.refuse();
        demo.changeAndCancel();
        stage.ask("Announce a new order by the short notice",
                (sequence, status) -> {
                    status[0] = 1;
                    return gatewayjni.SubmitOrderEncode2(MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH,
                            IDENTITY, PASSWORD, (byte) 'I', LOTS);
                },
                Operation.SUBMIT_ORDER_DECODE, 1, "@" + stage.today() + "@@1!");
    }

    private void place() {
        submit("Buy two lots of 2330 at 995.00",
                new Ticket("2330", 'B', 2, 99500, CASH, LIMIT, LOTS, AT_ONCE), 1, '1');
        submit1("Buy 37 shares of 0050 as an odd lot",
                new Ticket("0050", 'B', 37, 18450, CASH, LIMIT, ODD_LOT, AT_ONCE), 2);
        submit("Reserve the sale of one lot of 2317 at the limit-up price",
                new Ticket("2317", 'S', 1, 0, CASH, LIMIT_UP, LOTS, RESERVED), 3, '0');
        submit("Buy three lots of 2317 on margin",
                new Ticket("2317", 'B', 3, 20000, MARGIN, LIMIT, LOTS, AT_ONCE), 4, '1');
        submit1("Buy one lot of 0050 at the session's fixed price",
                new Ticket("0050", 'B', 1, 18500, CASH, LIMIT, FIXED_PRICE, AT_ONCE), 5);
        submit("Sell two lots of 2317",
                new Ticket("2317", 'S', 2, 20100, CASH, LIMIT, LOTS, AT_ONCE), 6, '1');
        submit("Sell one lot of 0050",
                new Ticket("0050", 'S', 1, 18500, CASH, LIMIT, LOTS, AT_ONCE), 7, '1');
        stage.exchange("The exchange fills a lot of A0001 and all of A0007, and refuses A0006.", () -> {
            stage.gateway().fillStock("A0001", LOT, 99450);
            stage.gateway().fillStock("A0007", LOT, 18505);
            stage.gateway().failStock("A0006", "交易所退單!");
        });
    }

    private void submit(String title, Ticket t, int number, char accepted) {
        stage.ask(title, plain(t), Operation.SUBMIT_ORDER_DECODE, 1, acknowledged(number, accepted));
    }

    private void submit1(String title, Ticket t, int number) {
        stage.ask(title,
                (sequence, status) -> gatewayjni.SubmitOrderEncode1(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                        BRANCH, IDENTITY, PASSWORD, t.stock, stage.today(), t.quantity, LOT, t.price,
                        (byte) t.side, FLAG_13, t.kind, t.priceKind, t.tradeType, t.n6, status),
                Operation.SUBMIT_ORDER_DECODE, 1, acknowledged(number, '1'));
    }

    private Stage.Encoder plain(Ticket t) {
        return (sequence, status) -> gatewayjni.SubmitOrderEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                BRANCH, IDENTITY, PASSWORD, t.stock, stage.today(), t.quantity, LOT, t.price, (byte) t.side,
                FLAG_13, t.kind, t.priceKind, t.tradeType, t.n6, status);
    }

    private String acknowledged(int number, char accepted) {
        return String.format("%010d@%s@@%c!", number, stage.today(), accepted);
    }

    private void refuse() {
        stage.ask("Buy above the day's limit",
                plain(new Ticket("2330", 'B', 1, 120000, CASH, LIMIT, LOTS, AT_ONCE)),
                Operation.SUBMIT_ORDER_DECODE, -1, "委託價格超過漲停價");
        stage.ask("Sell what is not held",
                plain(new Ticket("6547", 'S', 1, 5000, CASH, LIMIT, LOTS, AT_ONCE)),
                Operation.SUBMIT_ORDER_DECODE, -1, "庫存不足");
        stage.refusedHere("An order for nothing",
                plain(new Ticket("2330", 'B', 0, 99500, CASH, LIMIT, LOTS, AT_ONCE)), "[CLIENT] 委託數量不可小於0");
        stage.refusedHere("A stock code of seven characters",
                plain(new Ticket("2330123", 'B', 1, 99500, CASH, LIMIT, LOTS, AT_ONCE)), "[CLIENT] 股票代號最多六碼");
    }

    private void changeAndCancel() {
        Ticket margin = new Ticket("2317", 'B', 1, 20000, MARGIN, LIMIT, LOTS, AT_ONCE);
        Ticket odd = new Ticket("0050", 'B', 7, 18450, CASH, LIMIT, ODD_LOT, AT_ONCE);
        Ticket fixed = new Ticket("0050", 'B', 1, 18500, CASH, LIMIT, FIXED_PRICE, AT_ONCE);
        stage.ask("Take one lot off the margin order",
                (sequence, status) -> gatewayjni.ChangeOrderEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                        BRANCH, IDENTITY, PASSWORD, margin.stock, stage.today(), reference(4), margin.quantity,
                        LOT, margin.price, (byte) margin.side, FLAG_13, margin.kind, LIMIT, margin.tradeType,
                        margin.n6, status),
                Operation.CANCEL_CHANGE_ORDER_DECODE, 1, "");
        stage.ask("Take seven shares off the odd lot",
                (sequence, status) -> gatewayjni.ChangeOrderEncode1(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                        BRANCH, IDENTITY, PASSWORD, odd.stock, stage.today(), reference(2), odd.quantity, LOT,
                        odd.price, (byte) odd.side, FLAG_13, odd.kind, LIMIT, odd.tradeType, odd.n6, status),
                Operation.CANCEL_CHANGE_ORDER_DECODE, 1, "");
        stage.ask("Cancel the rest of the margin order", cancel(margin, 4),
                Operation.CANCEL_CHANGE_ORDER_DECODE, 1, "");
        stage.ask("Cancel the fixed-price order",
                (sequence, status) -> gatewayjni.CancelOrderEncode1(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                        BRANCH, IDENTITY, PASSWORD, fixed.stock, stage.today(), reference(5), fixed.quantity,
                        LOT, fixed.price, (byte) fixed.side, FLAG_13, fixed.kind, LIMIT, fixed.tradeType,
                        fixed.n6, status),
                Operation.CANCEL_CHANGE_ORDER_DECODE, 1, "");
        stage.ask("Cancel the margin order once more", cancel(margin, 4),
                Operation.CANCEL_CHANGE_ORDER_DECODE, -1, "委託已無剩餘數量");
    }

    private Stage.Encoder cancel(Ticket t, int number) {
        return (sequence, status) -> gatewayjni.CancelOrderEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS,
                BRANCH, IDENTITY, PASSWORD, t.stock, stage.today(), reference(number), t.quantity, LOT, t.price,
                (byte) t.side, FLAG_13, t.kind, LIMIT, t.tradeType, t.n6, status);
    }

    private static String reference(int number) {
        return String.format("A%04d&%010d", number, number);
    }
}
