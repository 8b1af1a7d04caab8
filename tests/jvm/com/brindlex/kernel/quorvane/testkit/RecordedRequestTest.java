package com.brindlex.kernel.quorvane.testkit;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Price;
import com.brindlex.kernel.quorvane.client.Quantity;
import com.brindlex.kernel.quorvane.client.Request;
import com.brindlex.kernel.quorvane.client.Signature;
import com.brindlex.kernel.quorvane.simulator.Disturbance;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import com.brindlex.kernel.quorvane.simulator.RecordedRequest;
import java.util.ArrayList;
import java.util.List;
import java.util.NoSuchElementException;
import org.junit.jupiter.api.Test;

/** What came to the gateway, by the names of the dictionary. */
class RecordedRequestTest {
    private final Gateway gateway = Gateway.open();
    private final Device device = new Device(gateway);

    @Test
    void anOrderIsAskedAboutByName() {
        Request<?> request = device.requests.stockOrder().buy("2330").quantity(Quantity.lots(2))
                .price(Price.of("995.5")).live().signature(Signature.TAG_PL).build();
        String reply = gateway.answer(request.text());
        RecordedRequest order = gateway.lastRequest(Operation.SUBMIT_ORDER_ENCODE1);
        assertEquals(Operation.SUBMIT_ORDER_ENCODE1, order.operation());
        assertEquals(request.text(), order.text());
        assertEquals(reply, order.reply());
        assertEquals("2330", order.value("stockCode"));
        assertEquals("2000", order.value("quantity"));
        assertEquals("995.50", order.value("price"));
        assertEquals("pass1234", order.value("password"));
        assertEquals("S", order.value("signature"));
        assertTrue(order.value("signaturePayload").startsWith("SN0001,10.0.0.1,"));
        assertTrue(order.has("emptyV4"));
        assertFalse(order.has("signaturepayload"));
        assertFalse(order.toString().contains("pass1234"), order::toString);
        assertTrue(order.toString().contains("stockCode=2330"), order::toString);
    }

    @Test
    void requestsStandInTheirOrder() {
        device.ask(device.requests.login());
        device.buy("2330", 1, "995");
        gateway.disturbNext(Disturbance.lost());
        device.buy("2317", 1, "200");
        gateway.answer("?");
        List<String> all = new ArrayList<>();
        gateway.requests().forEach(each -> all.add(String.valueOf(each.operation())));
        assertEquals(List.of("AuthEncode", "SubmitOrderEncode", "SubmitOrderEncode", "null"), all);
        List<RecordedRequest> orders = gateway.requests(Operation.named("SubmitOrderEncode"));
        assertEquals(2, orders.size());
        assertEquals("2317", orders.get(1).value("stockCode"));
        assertTrue(orders.get(1).toString().endsWith(", request lost"), orders.get(1)::toString);
        assertNull(gateway.requests().get(3).operation());
        assertEquals("not understood: ?", gateway.requests().get(3).toString());
    }

    @Test
    void aCertificateIsFetchedByEitherEncoder() {
        device.ask(device.requests.fetchCertificate("A123456789"));
        device.ask(device.requests.fetchCertificateLogged("A123456789"));
        assertEquals(2, gateway.requests(Operation.GET_CERT_ENCODE).size());
        assertEquals(2, gateway.requests(Operation.GET_CERT_ENCODE2).size());
    }

    @Test
    void whatIsNotThereIsToldInASentence() {
        assertEquals("No request of AuthEncode came; what came: nothing.",
                assertThrows(NoSuchElementException.class,
                        () -> gateway.lastRequest(Operation.AUTH_ENCODE)).getMessage());
        gateway.answer("?");
        device.ask(device.requests.accounts());
        assertEquals("No request of AuthEncode came; what came: a text that is no request,"
                        + " GetTotalAccountEncode.",
                assertThrows(NoSuchElementException.class,
                        () -> gateway.lastRequest(Operation.AUTH_ENCODE)).getMessage());
        RecordedRequest list = gateway.lastRequest(Operation.GET_TOTAL_ACCOUNT_ENCODE);
        String said = assertThrows(IllegalArgumentException.class,
                () -> list.value("quantty")).getMessage();
        assertTrue(said.startsWith("A request of GetTotalAccountEncode has no field \"quantty\";"
                + " it has requestFamily, requestKind, branch, "), said);
        assertTrue(assertThrows(IllegalArgumentException.class,
                () -> gateway.requests(Operation.AUTH_DECODE)).getMessage()
                .startsWith("AuthDecode reads replies"));
        assertTrue(assertThrows(IllegalArgumentException.class,
                () -> gateway.requests().get(0).value("price")).getMessage()
                .startsWith("The gateway did not understand this request"));
    }
}
