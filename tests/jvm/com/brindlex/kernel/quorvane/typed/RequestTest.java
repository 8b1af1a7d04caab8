package com.brindlex.kernel.quorvane.typed;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.gatewayjni;
import org.junit.jupiter.api.Test;

/** Named setters must give the very text that the native gives for the same values by position. */
class RequestTest {
    private static final Session SESSION = Session.of(1, 0, "SN0001", "10.0.0.1").withSequence(7);
    private static final Credentials USER =
            Credentials.of("9A01", "A123456789", "1234567", "secret");
    private static final String ID = "A123456789&1234567";
    private static final TradeDate DAY = TradeDate.of(2024, 1, 15);
    private static final TradeDate NEXT = TradeDate.of(2024, 1, 16);

    /** The time of the call goes into a request. */
    private static String timeless(String request) {
        return request.replaceAll("\\|(65|21|22|23)=[0-9]+", "|$1=").replaceAll(
                ",10.0.0.1,[0-9]{8},", ",10.0.0.1,,");
    }

    private static void same(Encoded encoded, String direct, int[] status) {
        assertEquals(timeless(direct), timeless(encoded.text()));
        assertEquals(status[0], encoded.status());
        assertTrue(encoded.isSuccess(), encoded.text());
        assertNull(encoded.message());
    }

    @Test
    void login() {
        int[] status = {0};
        same(Requests.login(SESSION, USER).encode(),
                gatewayjni.AuthEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret", status),
                status);
    }

    @Test
    void openAccount() {
        int[] status = {0};
        same(Requests.openAccount(SESSION).applicant("A123456789", "1234567").name("王小明")
                        .address("台北市").telephone("0912").callBackTime(200).accountKind(3).encode(),
                gatewayjni.OpenAccountEncode(1, 0, 7, "SN0001", "10.0.0.1", "", ID, "", "王小明",
                        "台北市", "0912", (byte) 200, (byte) 3, status), status);
    }

    @Test
    void changePassword() {
        int[] status = {0};
        same(Requests.changePassword(SESSION, USER).newPassword("other").encode(),
                gatewayjni.ChangePasswordEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "other", status), status);
    }

    @Test
    void certificates() {
        int[] status = {0};
        same(Requests.certificate2(SESSION).certificateMessage("abc").encode(),
                gatewayjni.GetCertEncode2(1, 0, 7, "SN0001", "10.0.0.1", "abc", status), status);
        same(Requests.renewCertificate(SESSION, USER).birthDate("19800101")
                        .certificateMessage("abc").encode(),
                gatewayjni.ReNewCertEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "19800101", "abc", status), status);
    }

    @Test
    void stockOrders() {
        int[] status = {0};
        same(Requests.stockOrder(SESSION, USER).stockCode("2330").orderDate(DAY).quantityLots(2)
                        .priceHundredths(60050).side(Side.BUY).flag13('1').orderKind(3)
                        .handlingFlag(200).encode(),
                gatewayjni.SubmitOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "1130115", 2, 1000, 60050, (byte) 'B', (byte) '1', (byte) 3,
                        (byte) 0, (byte) 0, (byte) 200, status), status);
        same(Requests.stockOrder1(SESSION, USER).stockCode("2330").quantityOddLotShares(37)
                        .price(PriceWord.LIMIT_UP).side(Side.SELL).encode(),
                gatewayjni.SubmitOrderEncode1(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "", 37, 1000, 0, (byte) 'S', (byte) '0', (byte) 0, (byte) 9,
                        (byte) 2, (byte) 0, status), status);
        same(Requests.stockNotice(SESSION, USER).function('D').tradeType(2).encode(),
                gatewayjni.SubmitOrderEncode2(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        (byte) 'D', (byte) 2), new int[] {1});
    }

    @Test
    void stockChanges() {
        int[] status = {0};
        same(Requests.cancelStockOrder(SESSION, USER).order("A0001", "G1").stockCode("2330")
                        .orderDate(DAY).priceHundredths(100).side(Side.BUY).encode(),
                gatewayjni.CancelOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "1130115", "A0001&G1", 0, 1000, 100, (byte) 'B', (byte) '0',
                        (byte) 0, (byte) 0, (byte) 0, (byte) 0, status), status);
        same(Requests.changeStockOrder1(SESSION, USER).order("A0001", "G1").stockCode("2330")
                        .orderDate(DAY).quantityLots(1).sharesPerLot(100).side(Side.BUY).encode(),
                gatewayjni.ChangeOrderEncode1(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "1130115", "A0001&G1", 1, 100, 0, (byte) 'B', (byte) '0',
                        (byte) 0, (byte) 0, (byte) 0, (byte) 0, status), status);
    }

    @Test
    void stockQueries() {
        int[] status = {0};
        same(Requests.stockOrders(SESSION, USER).day(DAY).type(2).encode(),
                gatewayjni.QueryOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "1130115", 2, status), status);
        same(Requests.stockFills(SESSION, USER).from(DAY).to(NEXT).encode(),
                gatewayjni.QueryReplyEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "1130115", "1130116", status), status);
        same(Requests.creditFigures(SESSION, USER).stockCode("2330").encode(),
                gatewayjni.QueryCreditInfoEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "2330", status), status);
        same(Requests.settlement(SESSION, USER).period(3).encode(),
                gatewayjni.PaymentEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret", "3",
                        "", status), status);
        same(Requests.settlement(SESSION, USER).from(DAY).to(NEXT).encode(),
                gatewayjni.PaymentEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "1130115", "1130116", status), status);
    }

    @Test
    void futuresOrders() {
        int[] status = {0};
        same(Requests.futuresOrder(SESSION, USER).futures(Side.BUY, "TXF", "202401")
                        .quantityContracts(2).priceTenThousandths(180000000)
                        .timeInForce(TimeInForce.FILL_OR_KILL).flagW3('0').handlingFlag(1).encode(),
                gatewayjni.FutSubmitOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "", "", "TXF", "", "202401", "", "", "", "", "", (byte) 1,
                        (byte) 1, (byte) 2, 'I', '0', 'F', ' ', 'B', ' ', 2, 0, 180000000, status),
                status);
        same(Requests.futuresOrder1(SESSION, USER)
                        .option(Side.BUY, "TXO", "202401", CallPut.CALL, "18000")
                        .andOption(Side.SELL, "TXO", "202402", CallPut.PUT, "17000")
                        .quantityContracts(1).priceType(1).function('D').order("F1", "G2")
                        .orderDate(DAY).encode(),
                gatewayjni.FutSubmitOrderEncode1(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "F1&G2", "1130115", "TXO", "TXO", "202401", "202402", "18000",
                        "17000", "C", "P", (byte) 0, (byte) 3, (byte) 1, 'D', ' ', 'R', ' ', 'B',
                        'S', 1, 0, 0, status), status);
        same(Requests.futuresOrder(SESSION, USER).futures(Side.BUY, "TXF", "202401")
                        .andFutures(Side.SELL, "TXF", "202402").quantityContracts(1).encode(),
                gatewayjni.FutSubmitOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "", "", "TXF", "TXF", "202401", "202402", "", "", "", "",
                        (byte) 0, (byte) 4, (byte) 2, 'I', ' ', 'R', ' ', 'B', 'S', 1, 0, 0,
                        status), status);
    }

    @Test
    void futuresQueries() {
        int[] status = {0};
        same(Requests.futuresOrders(SESSION, USER).day(DAY).type(1).encode(),
                gatewayjni.FutQueryOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "1130115", 1, status), status);
        same(Requests.futuresFills(SESSION, USER).from(DAY).to(NEXT).encode(),
                gatewayjni.FutQueryReplyEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "1130115", "1130116", status), status);
        same(Requests.margin(SESSION, USER).kind(3).encode(),
                gatewayjni.QueryFinanceEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        3, status), status);
    }

    @Test
    void aRefusalIsAMessage() {
        Encoded none = Requests.login(SESSION.withLocalAddress(""), USER).encode();
        assertFalse(none.isSuccess());
        assertEquals(Message.Source.CLIENT, none.message().source());
        Credentials nobody = Credentials.of("9A01", "", "", "x");
        Encoded notice = Requests.stockNotice(SESSION, nobody).encode();
        assertFalse(notice.isSuccess());
        assertEquals(-1, notice.status());
    }
}
