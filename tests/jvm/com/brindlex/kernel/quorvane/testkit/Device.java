package com.brindlex.kernel.quorvane.testkit;

import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.Handling;
import com.brindlex.kernel.quorvane.client.Price;
import com.brindlex.kernel.quorvane.client.Quantity;
import com.brindlex.kernel.quorvane.client.Reply;
import com.brindlex.kernel.quorvane.client.Request;
import com.brindlex.kernel.quorvane.client.Requests;
import com.brindlex.kernel.quorvane.client.Session;
import com.brindlex.kernel.quorvane.client.StockOrder;
import com.brindlex.kernel.quorvane.client.StockOrderReceipt;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import com.brindlex.kernel.quorvane.simulator.ReadyMade;
import java.util.List;

/** A device of a user, whose requests go to a gateway. */
final class Device {
    final Gateway gateway;
    final Requests requests;

    Device(Gateway gateway, Credentials user) {
        this.gateway = gateway;
        this.requests = Requests.of(Session.of("SN0001", "10.0.0.1"), user);
    }

    Device(Gateway gateway) {
        this(gateway, ReadyMade.STOCK_USER);
    }

    <T> Reply<T> ask(Request<T> request) {
        return request.read(gateway.answer(request.text()));
    }

    Reply<StockOrderReceipt> buy(String stock, int lots, String price, Handling handling) {
        return ask(requests.stockOrder().buy(stock).quantity(Quantity.lots(lots))
                .price(Price.of(price)).handling(handling).build());
    }

    Reply<StockOrderReceipt> buy(String stock, int lots, String price) {
        return buy(stock, lots, price, Handling.LIVE);
    }

    StockOrder firstOrder() {
        return ask(requests.stockOrders(gateway.today())).orThrow().get(0);
    }

    /** How many orders stand in the book. */
    int orders() {
        Reply<?> book = ask(requests.stockOrders(gateway.today()));
        return book.isResult() ? ((List<?>) book.orThrow()).size() : 0;
    }
}
