package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.simulator.Gateway;
import java.time.Clock;
import java.time.LocalDateTime;
import java.time.ZoneId;
import org.junit.jupiter.api.AfterEach;
import org.junit.jupiter.api.BeforeEach;
import org.junit.jupiter.api.Test;

/**
 * Every combination that the gateway knows is well formed and signed as the gateway signs it: what
 * the library writes and what the simulator reads were written apart.
 */
class GatewayAcceptsTest {
    private static final ZoneId ZONE = ZoneId.of("Asia/Taipei");
    private static final Clock CLOCK =
            Clock.fixed(LocalDateTime.of(2024, 1, 15, 13, 45, 21).atZone(ZONE).toInstant(), ZONE);

    /** Each way to say who one is in an order. */
    private static final String[] IDENTITIES = {
        "A123456789&1234567", "1234567&A123456789", "1234567", "A123456789", "&A123456789",
    };

    private static final String[] FUTURES_IDENTITIES = {
        "A123456789&7654321", "7654321&A123456789", "7654321", "A123456789", "X&A123456789",
    };

    private static final String[] SERIALS = {
            "", "DEV1", "12345678901234567890", "123456789012345678901"};
    private static final String[] ADDRESSES = {"10.0.0.1", "fe80::1%wlan0"};

    private final Gateway gateway = Gateway.readyMade().clock(CLOCK).build();
    private final int[] status = new int[1];
    private int asked;

    @BeforeEach
    void enter() {
        Surroundings.enter(CLOCK.instant().getEpochSecond());
    }

    @AfterEach
    void leave() {
        Surroundings.leave();
    }

    /** Neither malformed nor wrongly signed; the broker's own rules may still say no. */
    private void assertWellFormed(String request) {
        assertEquals(1, status[0], request);
        String reply = gateway.answer(request);
        assertFalse(reply.contains("E001") || reply.contains("電文格式錯誤"), request + "\n" + reply);
        assertFalse(reply.contains("簽章資料不符"), request + "\n" + reply);
        asked++;
    }

    @Test
    void stockOrders() {
        for (String identity : IDENTITIES) {
            for (String serial : SERIALS) {
                for (String address : ADDRESSES) {
                    for (byte tradeType : new byte[] {0, 2, 3}) {
                        for (byte priceKind : new byte[] {0, 1, 5, 9}) {
                            newStockOrder(identity, serial, address, tradeType, priceKind);
                        }
                    }
                }
            }
        }
        assertTrue(asked == 5 * 4 * 2 * 3 * 4 * 4, asked + " requests");
        assertTrue(gateway.answer(gatewayjni.QueryOrderEncode(0, 0, 0, "", "::1", "9A01",
                                          "A123456789&1234567", "pass1234", "1130115", 0, status))
                           .contains("|46=0000000002|"));
    }

    private void newStockOrder(
            String identity, String serial, String address, byte tradeType, byte priceKind) {
        for (char side : new char[] {'B', 'S'}) {
            assertWellFormed(gatewayjni.SubmitOrderEncode(0, 0, asked, serial, address, "9A01",
                    identity, "pass1234", "2330", "1130115", 1, 1000, 99550, (byte) side,
                    (byte) 'x', (byte) 0, priceKind, tradeType, (byte) 1, status));
            assertWellFormed(gatewayjni.SubmitOrderEncode1(0, 0, asked, serial, address, "9A01",
                    identity, "pass1234", "2330", "", 1, 1000, 99500, (byte) side, (byte) 'x',
                    (byte) 0, priceKind, tradeType, (byte) 255, status));
        }
    }

    @Test
    void stockChanges() {
        assertWellFormed(gatewayjni.SubmitOrderEncode(0, 0, 0, "", "::1", "9A01", IDENTITIES[0],
                "pass1234", "2330", "", 2, 1000, 99500, (byte) 'B', (byte) 'x', (byte) 0, (byte) 0,
                (byte) 0, (byte) 1, status));
        for (String identity : IDENTITIES) {
            for (String serial : SERIALS) {
                for (byte tradeType : new byte[] {0, 2, 3}) {
                    for (byte kind : new byte[] {0, 1, 2, 3, 4, 5, 8}) {
                        assertWellFormed(gatewayjni.CancelOrderEncode(0, 0, asked, serial, "::1",
                                "9A01", identity, "pass1234", "2330", "1130115", "A0001&0000000001",
                                1, 1000, 99500, (byte) 'B', (byte) 'x', kind, (byte) 0, tradeType,
                                (byte) 1, status));
                        assertWellFormed(gatewayjni.CancelOrderEncode1(0, 0, asked, serial, "::1",
                                "9A01", identity, "pass1234", "2330", "1130115", "A0001&0000000001",
                                1, 1000, 99500, (byte) 'B', (byte) 'x', kind, (byte) 0, tradeType,
                                (byte) 1, status));
                        assertWellFormed(gatewayjni.ChangeOrderEncode(0, 0, asked, serial, "::1",
                                "9A01", identity, "pass1234", "2330", "1130115", "A0001&0000000001",
                                1, 1000, 99500, (byte) 'B', (byte) 'x', kind, (byte) 0, tradeType,
                                (byte) 1, status));
                        assertWellFormed(gatewayjni.ChangeOrderEncode1(0, 0, asked, serial, "::1",
                                "9A01", identity, "pass1234", "2330", "1130115", "A0001&0000000001",
                                1, 1000, 99500, (byte) 'B', (byte) 'x', kind, (byte) 0, tradeType,
                                (byte) 1, status));
                    }
                }
            }
        }
    }

    @Test
    void futuresOrders() {
        for (String own : FUTURES_IDENTITIES) {
            for (char function : new char[] {'I', 'C', 'A', 'D'}) {
                for (char timeInForce : new char[] {'I', 'F', 'R', 'x'}) {
                    for (byte priceType = 0; priceType < 4; priceType++) {
                        futuresOrder(own, function, timeInForce, priceType, (byte) 1, "TXF", "",
                                "TXF", "");
                        futuresOrder(own, function, timeInForce, priceType, (byte) 2, "TXO", "C",
                                "TXO", "C");
                        futuresOrder(own, function, timeInForce, priceType, (byte) 3, "TXO", "C",
                                "TXO", "P");
                        futuresOrder(own, function, timeInForce, priceType, (byte) 3, "TXO", "C",
                                "TEO", "C");
                        futuresOrder(own, function, timeInForce, priceType, (byte) 4, "TXF", "",
                                "MXF", "");
                    }
                }
            }
        }
        assertEquals(5 * 4 * 4 * 4 * 5 * 4 * 2, asked);
    }

    private void futuresOrder(String identity, char function, char timeInForce, byte priceType,
            byte kind, String commodity1, String callPut1, String commodity2, String callPut2) {
        String strike = callPut1.isEmpty() ? "" : "18000";
        String reference = function == 'I' ? "" : "F0001&5000001";
        for (char side2 : new char[] {'B', 'S'}) {
            for (String month2 : new String[] {"202402", "202403"}) {
                assertWellFormed(gatewayjni.FutSubmitOrderEncode(1, 0, asked, "DEV1", "::1", "F001",
                        identity, "pass1234", reference, "1130115", commodity1, commodity2,
                        "202402", month2, strike, strike, callPut1, callPut2, (byte) 1, kind,
                        priceType, function, '0', timeInForce, '0', 'B', side2, 1, 0, 180005000,
                        status));
                assertWellFormed(gatewayjni.FutSubmitOrderEncode1(1, 0, asked, "DEV1", "::1",
                        "F001", identity, "pass1234", reference, "", commodity1, commodity2,
                        "202402", month2, strike, strike, callPut1, callPut2, (byte) 1, kind,
                        priceType, function, ' ', timeInForce, '0', 'B', side2, 1, 0, 180005000,
                        status));
            }
        }
    }
}
