package com.brindlex.kernel.quorvane.testkit;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.client.Failure;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Reply;
import com.brindlex.kernel.quorvane.simulator.Disturbance;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import com.brindlex.kernel.quorvane.simulator.Line;
import java.time.Duration;
import java.util.concurrent.CompletableFuture;
import java.util.concurrent.TimeUnit;
import org.junit.jupiter.api.Test;

/** What can happen to a request and its reply on the way. */
class DisturbanceTest {
    private static final Duration LATE = Duration.ofMillis(300);

    private final Gateway gateway = Gateway.open();
    private final Device device = new Device(gateway);

    @Test
    void anOrderWhoseReplyDoesNotComeStands() {
        gateway.disturbNext(Disturbance.empty());
        assertTrue(device.buy("2330", 1, "995").isOnItsWay());
        assertEquals(1, device.orders());
    }

    @Test
    void anOrderThatIsLostDoesNot() {
        gateway.disturbNext(Disturbance.lost());
        assertTrue(device.buy("2330", 1, "995").isOnItsWay());
        assertEquals(0, device.orders());
    }

    @Test
    void markersPagesAndTextsComeInThePlaceOfTheReply() {
        gateway.disturbNext(Disturbance.marker(Line.BROKER_TIMEOUT));
        gateway.disturbNext(Disturbance.page());
        gateway.disturbNext(Disturbance.text("?"));
        Reply<?> marker = device.ask(device.requests.bankBalance());
        assertEquals(Failure.Source.BROKER, marker.failure().source());
        assertTrue(device.ask(device.requests.bankBalance()).isFailure());
        assertTrue(device.ask(device.requests.login()).isFailure());
        assertTrue(device.ask(device.requests.login()).isResult());
        assertTrue(gateway.requests().get(1).reply().startsWith("<!DOCTYPE html>"));
        assertThrows(IllegalArgumentException.class, () -> Disturbance.marker(Line.UP));
    }

    @Test
    void aReplyIsCutWhereAsked() {
        String whole = gateway.answer(device.requests.login().text());
        for (int length : new int[] {0, 1, whole.length() - 1, whole.length(), whole.length() + 1}) {
            gateway.disturbNext(Disturbance.cut(length));
            String cut = gateway.answer(device.requests.login().text());
            assertEquals(Math.min(length, whole.length()), cut.length());
        }
        assertThrows(IllegalArgumentException.class, () -> Disturbance.cut(-1));
    }

    @Test
    void aReplyThatIsLateHoldsUpNoOther() throws Exception {
        gateway.disturbNext(Operation.AUTH_ENCODE, Disturbance.empty().delayed(LATE));
        long begun = System.nanoTime();
        CompletableFuture<String> late = CompletableFuture.supplyAsync(
                () -> gateway.answer(device.requests.login().text()));
        while (gateway.requests().isEmpty()) {
            Thread.onSpinWait();
        }
        device.buy("2330", 1, "995").orThrow();
        assertFalse(late.isDone());
        assertEquals("", late.get(1, TimeUnit.MINUTES));
        assertTrue(System.nanoTime() - begun >= LATE.toNanos());
    }

    @Test
    void whoIsInterruptedGetsNothing() throws Exception {
        gateway.disturbNext(Disturbance.delay(Duration.ofHours(1)));
        CompletableFuture<String> answered = new CompletableFuture<>();
        Thread app = new Thread(() -> {
            String reply = gateway.answer(device.requests.login().text());
            answered.complete(reply + Thread.currentThread().isInterrupted());
        });
        app.start();
        app.interrupt();
        assertEquals("true", answered.get(1, TimeUnit.MINUTES));
        assertThrows(IllegalArgumentException.class,
                () -> Disturbance.delay(Duration.ofMillis(-1)));
    }

    @Test
    void whatWaitsForAnOperationComesFirstAndWhatStandsLast() {
        gateway.disturbAll(Disturbance.text("always"));
        gateway.disturbNext(Disturbance.text("next"));
        gateway.disturbNext(Operation.AUTH_ENCODE, Disturbance.text("login 1"));
        gateway.disturbNext(Operation.AUTH_ENCODE, Disturbance.text("login 2"));
        String login = device.requests.login().text();
        for (String wanted : new String[] {"login 1", "login 2", "next", "always", "always"}) {
            assertEquals(wanted, gateway.answer(login));
        }
        gateway.disturbNext(Operation.AUTH_ENCODE, Disturbance.empty());
        gateway.disturbNext(Disturbance.empty());
        gateway.calm();
        assertTrue(device.ask(device.requests.login()).isResult());
    }

    @Test
    void whatWaitsGoesOnWaitingWhileTheLineIsDown() {
        gateway.disturbNext(Disturbance.text("once"));
        gateway.setLine(Line.GATEWAY_DOWN);
        assertEquals("[GATEWAY]error", gateway.answer(device.requests.login().text()));
        gateway.setLine(Line.UP);
        assertEquals("once", gateway.answer(device.requests.login().text()));
    }
}
