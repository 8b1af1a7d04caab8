package app;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Price;
import com.brindlex.kernel.quorvane.client.Quantity;
import com.brindlex.kernel.quorvane.client.Reply;
import com.brindlex.kernel.quorvane.client.Request;
import com.brindlex.kernel.quorvane.client.Requests;
import com.brindlex.kernel.quorvane.client.Session;
import com.brindlex.kernel.quorvane.simulator.Disturbance;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import com.brindlex.kernel.quorvane.simulator.ReadyMade;
import org.junit.jupiter.api.Test;

class OrderTest {
    private final Gateway gateway = Gateway.open();
    private final Requests requests =
            Requests.of(Session.of("SN0001", "10.0.0.1"), ReadyMade.STOCK_USER);

    private <T> Reply<T> send(Request<T> request) {
        return request.read(gateway.answer(request.text()));
    }

    private Request<?> order() {
        return requests.stockOrder().buy("2330").quantity(Quantity.lots(2))
                .price(Price.of("995")).live().build();
    }

    @Test
    void anOrderIsTakenAndRecorded() {
        assertTrue(send(order()).isResult());
        assertEquals("2330",
                gateway.lastRequest(Operation.SUBMIT_ORDER_ENCODE).value("stockCode"));
    }

    @Test
    void aPageInPlaceOfAReplyIsNoResult() {
        gateway.disturbNext(Disturbance.page());
        assertFalse(send(requests.login()).isResult());
    }
}
