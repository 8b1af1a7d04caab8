package com.brindlex.kernel.quorvane.client;

import static com.brindlex.kernel.quorvane.client.Fixtures.ID_NUMBER;
import static com.brindlex.kernel.quorvane.client.Fixtures.PASSWORD;
import static com.brindlex.kernel.quorvane.client.Fixtures.SESSION;
import static com.brindlex.kernel.quorvane.client.Fixtures.TRADER;
import static com.brindlex.kernel.quorvane.client.Fixtures.USER;
import static com.brindlex.kernel.quorvane.client.Fixtures.futures;
import static com.brindlex.kernel.quorvane.client.Fixtures.futuresOrder;
import static com.brindlex.kernel.quorvane.client.Fixtures.stocks;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.util.List;
import java.util.function.Supplier;
import org.junit.jupiter.api.Test;

/** No text that is shown to people carries a password, an ID number or the request. */
final class SecretsTest {
    private static void assertNoSecret(Object shown) {
        String text = shown.toString();
        for (String secret : List.of(PASSWORD, ID_NUMBER, "PWD=", "secret")) {
            assertFalse(text.contains(secret), text);
        }
    }

    @Test
    void nothingShowsThem() {
        assertNoSecret(USER);
        assertNoSecret(SESSION);
        assertNoSecret(stocks().login());
        assertNoSecret(stocks().login().read(""));
        assertNoSecret(stocks().registerCertificate("secret"));
        assertTrue(stocks().login().text().contains(PASSWORD));
    }

    @Test
    void norDoesARefusal() {
        for (Supplier<?> building : List.<Supplier<?>>of(
                     () -> futuresOrder().quantity(0).build(),
                     () -> futures().futuresOrder().build(),
                     () -> stocks().changePassword("secret|x"),
                     () -> Requests.of(SESSION, USER.withPassword("secret\n")).login(),
                     () -> Requests.of(SESSION, Credentials.of("9A01", ID_NUMBER + "1234", "",
                             PASSWORD)).login(),
                     () -> stocks().openAccount("n".repeat(256), "\u4e2d".repeat(85),
                             "1".repeat(32), ContactTime.of(256), AccountItem.of(1)),
                     () -> Requests.of(SESSION, TRADER.withPassword("p".repeat(257))).margin())) {
            InvalidRequestException refusal =
                    assertThrows(InvalidRequestException.class, building::get);
            assertNoSecret(refusal);
            refusal.problems().forEach(SecretsTest::assertNoSecret);
        }
    }

    @Test
    void aRequestThatDoesNotFitIsRefusedWithItsReasonAlone() {
        Draft<Confirmation> draft = new Draft<>(
                Operation.FUT_SUBMIT_ORDER_ENCODE, SESSION, ReplyTypes.OPEN_ACCOUNT);
        TRADER.fill(draft);
        draft.set("commodity1", "TXO").set("month1", "202401").set("orderKind", 2)
                .set("side1", 'B').set("quantity", 1);
        InvalidRequestException refusal =
                assertThrows(InvalidRequestException.class, draft::build);
        assertNoSecret(refusal);
        assertTrue(refusal.problems().get(0).reason().startsWith("[CLIENT]"));
    }
}
