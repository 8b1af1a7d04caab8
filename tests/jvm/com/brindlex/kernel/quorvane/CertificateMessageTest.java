package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.nio.charset.StandardCharsets;
import java.util.Base64;
import org.junit.jupiter.api.Test;

/** The certificate message as it is sent, against the Base64 of the JDK. */
class CertificateMessageTest {
    private static final int SHORTEST = 3; // below it none of the message is sent
    private static final int LONGEST = 10_000;

    @Test
    void everyLengthIsTheBase64OfTheJdkOnceTheLineEndsAreOut() {
        StringBuilder message = new StringBuilder("ab");
        for (int length = SHORTEST; length <= LONGEST; ++length) {
            message.append((char) (' ' + length * 7 % 95));
            assertSent(message.toString());
        }
    }

    @Test
    void bytesAboveAsciiAreUnsigned() {
        StringBuilder message = new StringBuilder();
        for (char c = 1; c < 0x800; ++c) {
            message.append(c);
        }
        assertSent(message.toString());
        assertSent("電子憑證申請書");
    }

    private static void assertSent(String message) {
        byte[] bytes = message.getBytes(StandardCharsets.UTF_8);
        String sent = sentMessage(message);
        assertEquals(Base64.getEncoder().encodeToString(bytes), sent.replace("\r\n", ""));
        // A line ends behind 256 whole groups, at the end too, but never behind padding.
        assertEquals(bytes.length / 3 / 256, sent.split("\r\n", -1).length - 1);
    }

    private static String sentMessage(String message) {
        int[] status = new int[1];
        String request =
            gatewayjni.RegisterCertEncode(0, 0, 7, "SN0001", "10.0.0.1", message, status);
        assertEquals(1, status[0]);
        int start = request.indexOf("|FUNC=10|MSG=");
        assertTrue(start > 0 && request.endsWith("|01="), request);
        return request.substring(start + "|FUNC=10|MSG=".length(), request.length() - 4);
    }
}
