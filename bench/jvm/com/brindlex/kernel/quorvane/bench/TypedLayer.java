package com.brindlex.kernel.quorvane.bench;

import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.Request;
import com.brindlex.kernel.quorvane.client.Requests;
import com.brindlex.kernel.quorvane.client.Row;
import com.brindlex.kernel.quorvane.client.Rows;
import com.brindlex.kernel.quorvane.client.Session;
import com.brindlex.kernel.quorvane.client.StockOrder;
import com.brindlex.kernel.quorvane.client.StockOrders;
import com.brindlex.kernel.quorvane.client.TradeDate;
import java.util.function.Function;
import java.util.function.Supplier;

/** What the typed layer adds to a native call that lists a thousand orders. */
final class TypedLayer {
    private static final int SHOWN = 20;

    private TypedLayer() {}

    static void measure(
            RatioTable table, long warmUpNanos, String reply, Supplier<String> nativeCall) {
        Request<StockOrders> book = Requests.of(Session.of("SN0001", "10.0.0.1"),
                Credentials.of("9A01", "A123456789", "1234567", "secret"))
                .stockOrders(TradeDate.of(2024, 1, 15));
        Contest contest = new Contest(warmUpNanos)
                .add(nativeCall)
                .add(() -> book.read(reply).orThrow())
                .add(() -> read(book, reply, SHOWN, TypedLayer::texts))
                .add(() -> read(book, reply, Integer.MAX_VALUE, TypedLayer::texts))
                .add(() -> read(book, reply, Integer.MAX_VALUE, TypedLayer::values))
                .run();
        table.group("Stock order book in the typed layer, 1,000 records: typed / entry point");
        table.tell("reply read, no row shown", contest, 1, 0);
        table.atMost("20 rows, every column as text", contest, 2, 0, 1.2, 1.1);
        table.atMost("every row, every column as text", contest, 3, 0, 2, 1.5);
        table.atMost("every row, every column as a value", contest, 4, 0, 3, 2.5);
    }

    private static int read(
            Request<StockOrders> book, String reply, int most, Function<StockOrder, Integer> reading) {
        Rows<StockOrder> rows = book.read(reply).orThrow();
        int sum = 0;
        for (int i = 0; i < Math.min(rows.size(), most); i++) {
            sum += reading.apply(rows.get(i));
        }
        return sum;
    }

    private static int texts(Row<?> row) {
        int sum = 0;
        for (int place = 0; place < row.shape().columns().size(); place++) {
            sum += row.text(place).length();
        }
        return sum;
    }

    /** Takes each value, so that none can be left out. */
    private static int values(StockOrder order) {
        return count(order.gatewayNumber()) + count(order.orderNumber()) + count(order.type())
                + count(order.stockCode()) + count(order.orderedQuantity()) + count(order.state())
                + count(order.gatewayText()) + count(order.filledQuantity())
                + count(order.cancelledQuantity()) + count(order.price())
                + count(order.entryTime()) + count(order.entryDate()) + count(order.orderDate())
                + count(order.handlingFlag()) + count(order.changeable());
    }

    private static int count(Object value) {
        return value == null ? 0 : 1;
    }
}
