import com.brindlex.kernel.quorvane.client.*;
import com.brindlex.kernel.quorvane.simulator.*;
import java.time.Clock;
import java.time.Instant;
import java.time.ZoneId;
import java.util.function.UnaryOperator;

/**
 * A trading day as an app lives it, without a device and without a network: stocks, an option, a
 * certificate, and an order whose answer is lost.
 */
public final class TradingDay {
    private static final Session SESSION = Session.of("SN0001", "10.0.0.1");

    /** Where requests go: {@code gateway::answer} here, the app's own connection in an app. */
    private final UnaryOperator<String> connection;

    private TradingDay(UnaryOperator<String> connection) {
        this.connection = connection;
    }

    private <T> Reply<T> send(Request<T> request) {
        return request.read(connection.apply(request.text()));
    }

    /** Sends what must succeed here; an app shows {@code reply.message()} instead. */
    private <T> T ask(Request<T> request) {
        return send(request).orThrow();
    }

    private static void say(Object text) {
        System.out.println(text);
    }

    private void logIn(Requests requests) {
        Accounts accounts = ask(requests.login());
        say("notice: " + accounts.notice());
        for (Account account : accounts) {
            say("account " + account.account());
        }
    }

    private void tradeStocks(Requests requests, Gateway gateway) {
        StockOrderReceipt receipt = ask(requests.stockOrder().buy("2330")
                .quantity(Quantity.lots(3)).price(Price.of("995.5")).live().build());
        say("placed, gateway number " + receipt.gatewayNumber());

        StockOrder order = stockOrder(requests, gateway, 0);
        ask(requests.changeQuantity(order, Quantity.lots(1)).flag13('0').build());
        gateway.fillStock(order.orderNumber(), 1000, "995");  // the exchange acts
        show(stockOrder(requests, gateway, 0));
        ask(requests.cancel(order).flag13('0').build());
        show(stockOrder(requests, gateway, 0));

        for (StockFill fill : ask(requests.stockFills(gateway.today(), gateway.today()))) {
            say("filled " + fill.filledQuantity() + " of " + fill.stockCode() + " at "
                    + fill.fillPrice());
        }
        for (StockPosition0 held : ask(requests.stockPositions()).section0()) {
            say("position " + held.stockCode() + ": " + held.quantity75() + ", "
                    + held.quantity751());
        }
        for (SettledTrade trade : ask(requests.settlement(gateway.today(), gateway.today()))) {
            say("settlement of " + trade.stockCode() + ": figure 97 is " + trade.sign()
                    + trade.figure97());
        }
    }

    private StockOrder stockOrder(Requests requests, Gateway gateway, int place) {
        return ask(requests.stockOrders(gateway.today())).get(place);
    }

    private static void show(StockOrder order) {
        say(order.stockCode() + " at " + order.price() + ": " + order.state() + ", "
                + order.filledQuantity() + " of " + order.orderedQuantity() + " filled");
    }

    private void sellAnOption(Requests requests, Gateway gateway) {
        Contract call = Contract.option("TXO", "202402", CallPut.CALL, "18000");
        ask(requests.futuresOrder().sell(call).quantity(2).price(Price.of("120")).live().build());
        FuturesOrder order = ask(requests.futuresOrders(gateway.today())).get(0);
        gateway.fillFutures(order.orderNumber(), 2, "121");
        for (OptionsPosition held : ask(requests.futuresPositions()).options()) {
            say("option " + held.commodity1() + " " + held.strike1() + " " + held.callPut1() + ": "
                    + held.side1() + " " + held.quantityR8() + " at " + held.price48());
        }
        say("margin: figure RA is " + ask(requests.margin()).figureRA());
    }

    private void getACertificate(Requests requests) {
        String holder = "A123456789";
        say(ask(requests.applyForCertificate("19800101", holder)).text());
        ask(requests.certificateInstalled(holder));
        ask(requests.certificateOpened(holder));
        say(ask(requests.fetchCertificate(holder)).text());
    }

    /** What a test on a device hardly ever meets. */
    private void loseAnAnswer(Requests requests, Gateway gateway) {
        gateway.disturbNext(Operation.SUBMIT_ORDER_ENCODE, Disturbance.empty());
        Reply<StockOrderReceipt> reply = send(requests.stockOrder().sell("2317")
                .quantity(Quantity.lots(1)).price(Price.of("200")).live().build());
        if (reply.isOnItsWay()) {
            say(reply.message() + " It may stand: look into the book, do not repeat it.");
        }
        show(stockOrder(requests, gateway, 1));
        RecordedRequest sent = gateway.lastRequest(Operation.SUBMIT_ORDER_ENCODE);
        say("sent: " + sent.value("quantity") + " of " + sent.value("stockCode"));
    }

    public static void main(String[] arguments) {
        Clock tenInTheMorning =
                Clock.fixed(Instant.parse("2024-01-15T02:00:00Z"), ZoneId.of("Asia/Taipei"));
        Gateway gateway = Gateway.readyMade().clock(tenInTheMorning).build();
        Requests stocks = Requests.of(SESSION, ReadyMade.STOCK_USER);
        TradingDay day = new TradingDay(gateway::answer);

        day.logIn(stocks);
        day.tradeStocks(stocks, gateway);
        day.sellAnOption(Requests.of(SESSION, ReadyMade.FUTURES_USER), gateway);
        day.getACertificate(stocks);
        day.loseAnAnswer(stocks, gateway);
    }
}
