import com.brindlex.kernel.quorvane.client.*;
import java.util.function.UnaryOperator;

/** The part of an app that is tested: places an order and says what the screen shows. */
final class OrderTicket {
    private final UnaryOperator<String> connection;
    private final Requests requests;

    OrderTicket(UnaryOperator<String> connection, Credentials user) {
        this.connection = connection;
        this.requests = Requests.of(Session.of("SN0001", "10.0.0.1"), user);
    }

    /** Buys lots of a stock. */
    String buy(String stock, int lots, String price) {
        Request<StockOrderReceipt> order = requests.stockOrder().buy(stock)
                .quantity(Quantity.lots(lots)).price(Price.of(price)).live().build();
        Reply<StockOrderReceipt> reply = order.read(connection.apply(order.text()));
        switch (reply.outcome()) {
            case RESULT:
                return "Taken: " + reply.orThrow().gatewayNumber();
            case ON_ITS_WAY:
                return "Not answered: look into the order book";
            default:
                return "Refused: " + reply.failure().text();
        }
    }
}
