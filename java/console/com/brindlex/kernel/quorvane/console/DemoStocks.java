package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoLogin.USER;

import com.brindlex.kernel.quorvane.client.OrderKind;
import com.brindlex.kernel.quorvane.client.Price;
import com.brindlex.kernel.quorvane.client.Quantity;
import com.brindlex.kernel.quorvane.client.Signature;
import com.brindlex.kernel.quorvane.client.StockFunction;
import com.brindlex.kernel.quorvane.client.StockOrder;
import com.brindlex.kernel.quorvane.client.StockOrderBuilder;
import com.brindlex.kernel.quorvane.client.StockOrders;
import com.brindlex.kernel.quorvane.client.TradeType;
import java.util.function.UnaryOperator;

/** Stock orders: placed, changed, cancelled and refused. */
final class DemoStocks {
    private static final int LOT = 1000;
    private static final OrderKind MARGIN = OrderKind.of(3);

    private final Stage stage;

    private DemoStocks(Stage stage) {
        this.stage = stage;
    }

    static void play(Stage stage) {
        stage.screen.title("Stock orders");
        DemoStocks demo = new DemoStocks(stage);
        demo.place();
        demo.refuse();
        demo.changeAndCancel();
        stage.ask("Announce a new order by the short notice",
                () -> stage.as(USER).stockNotice(StockFunction.NEW, TradeType.LOTS),
                "@" + stage.today().rocText() + "@@1!");
    }

    private StockOrderBuilder order() {
        return stage.as(USER).stockOrder().orderDate(stage.today()).live();
    }

    private void place() {
        submit("Buy two lots of 2330 at 995", 1, '1', order -> order.buy("2330")
                .quantity(Quantity.lots(2)).price(Price.of("995")));
        submit("Buy 37 shares of 0050 as an odd lot", 2, '1', order -> order.buy("0050")
                .quantity(Quantity.oddLotShares(37)).price(Price.of("184.5"))
                .signature(Signature.TAG_PL));
        submit("Reserve the sale of one lot of 2317 at the limit-up price", 3, '0',
                order -> order.sell("2317").quantity(Quantity.lots(1)).price(Price.LIMIT_UP)
                        .reservation());
        submit("Buy three lots of 2317, order kind 3", 4, '1', order -> order.buy("2317")
                .quantity(Quantity.lots(3)).price(Price.of("200")).orderKind(MARGIN));
        submit("Buy one lot of 0050 at no price of its own", 5, '1', order -> order.buy("0050")
                .quantity(Quantity.lots(1)).tradeType(TradeType.LOTS_WITHOUT_PRICE)
                .signature(Signature.TAG_PL));
        submit("Sell two lots of 2317", 6, '1', order -> order.sell("2317")
                .quantity(Quantity.lots(2)).price(Price.of("201")));
        submit("Sell one lot of 0050", 7, '1', order -> order.sell("0050")
                .quantity(Quantity.lots(1)).price(Price.of("185")));
        stage.exchange("The exchange fills a lot of A0001 and all of A0007, and refuses A0006.",
                () -> {
                    stage.gateway().fillStock("A0001", LOT, "994.50");
                    stage.gateway().fillStock("A0007", LOT, "185.05");
                    stage.gateway().failStock("A0006", "交易所退單!");
                });
    }

    private void submit(
            String title, int number, char answer, UnaryOperator<StockOrderBuilder> terms) {
        stage.ask(title, () -> terms.apply(order()).build(),
                String.format("%010d@%s@@%c!", number, stage.today().rocText(), answer));
    }

    private void refuse() {
        stage.fails("Buy above the day's limit", () -> order().buy("2330")
                .quantity(Quantity.lots(1)).price(Price.of("1200")).build(), "[GATEWAY]委託價格超過漲停價");
        stage.fails("Sell what is not held", () -> order().sell("6547")
                .quantity(Quantity.lots(1)).price(Price.of("50")).build(), "[GATEWAY]庫存不足");
        stage.refusedHere("An order for nothing, at a price with three decimals",
                () -> order().buy("2330").quantity(Quantity.lots(0)).price(Price.of("995.005"))
                        .build(), "quantity", "price");
        stage.refusedHere("A stock code of seven characters", () -> order().buy("2330123")
                .quantity(Quantity.lots(1)).price(Price.of("995")).build(), "stockCode");
    }

    private void changeAndCancel() {
        StockOrders book = book("Order book before the changes");
        StockOrder odd = book.get(1);
        StockOrder margin = book.get(3);
        stage.ask("Take one lot off the order of kind 3",
                () -> stage.as(USER).changeQuantity(margin, Quantity.lots(1)).orderKind(MARGIN)
                        .flag13('0').build(), "");
        stage.ask("Take seven shares off the odd lot",
                () -> stage.as(USER).changeQuantity(odd, Quantity.oddLotShares(7))
                        .signature(Signature.TAG_PL).build(), "");
        stage.refusedHere("Cancel without what the book does not show",
                () -> stage.as(USER).cancel(margin).build(), "flag13", "orderKind");
        StockOrder rest = book("Order book after them").get(3);
        stage.ask("Cancel the rest of the order of kind 3",
                () -> stage.as(USER).cancel(rest).orderKind(MARGIN).flag13('0').build(), "");
        stage.ask("Cancel the order without a price",
                () -> stage.as(USER).cancel(book.get(4)).sharesPerLot(LOT)
                        .signature(Signature.TAG_PL).build(), "");
        stage.fails("Cancel the order of kind 3 once more",
                () -> stage.as(USER).cancel(rest).orderKind(MARGIN).flag13('0').build(),
                "[GATEWAY]委託已無剩餘數量");
    }

    private StockOrders book(String title) {
        return stage.ask(title, () -> stage.as(USER).stockOrders(stage.today()));
    }
}
