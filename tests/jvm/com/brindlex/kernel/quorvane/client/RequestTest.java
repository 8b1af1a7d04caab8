package com.brindlex.kernel.quorvane.client;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.gatewayjni;
import java.util.EnumSet;
import java.util.Set;
import org.junit.jupiter.api.AfterAll;
import org.junit.jupiter.api.Test;

/** A request by name is the very text that the native gives for the same values by position. */
class RequestTest {
    private static final Session SESSION = Session.of("SN0001", "10.0.0.1").withSequence(7);
    private static final String ID = "A123456789&1234567";
    private static final TradeDate DAY = TradeDate.of(2024, 1, 15);
    private static final TradeDate NEXT = TradeDate.of(2024, 1, 16);
    private static final Set<Operation> SEEN = EnumSet.noneOf(Operation.class);

    private final int[] status = {0};
    private final Requests ask = Requests.of(
            SESSION, Credentials.of("9A01", "A123456789", "1234567", "secret"));

    /** The time of the call goes into a request, and so does its number. */
    private static String timeless(String request) {
        return request.replaceAll("\\|(65|21|22|23)=[0-9]+", "|$1=").replaceAll(
                ",10.0.0.1,[0-9]{8},", ",10.0.0.1,,");
    }

    private static void same(Request<?> request, String direct) {
        assertEquals(timeless(direct), timeless(request.text()));
        SEEN.add(request.operation());
    }

    @AfterAll
    static void everyEncoderHasARequest() {
        for (Operation operation : Operation.values()) {
            assertTrue(!operation.isEncoder() || SEEN.contains(operation), operation.method());
        }
    }

    @Test
    void accounts() {
        same(ask.login(), gatewayjni.AuthEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                status));
        same(ask.accounts(), gatewayjni.GetTotalAccountEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01",
                ID, "secret", status));
        same(ask.openAccount("王小明", "台北市", "0912", ContactTime.of(200), AccountItem.of(3)),
                gatewayjni.OpenAccountEncode(1, 0, 7, "SN0001", "10.0.0.1", "", ID, "", "王小明",
                        "台北市", "0912", (byte) 200, (byte) 3, status));
        same(ask.changePassword("other"), gatewayjni.ChangePasswordEncode(1, 0, 7, "SN0001",
                "10.0.0.1", "9A01", ID, "secret", "other", status));
        same(ask.bankBalance(), gatewayjni.QueryBankRemainEncode(1, 0, 7, "SN0001", "10.0.0.1",
                "9A01", ID, "secret", status));
    }

    @Test
    void certificates() {
        same(ask.registerCertificate("abc"),
                gatewayjni.RegisterCertEncode(1, 0, 7, "SN0001", "10.0.0.1", "abc", status));
        same(ask.fetchCertificate("abc"),
                gatewayjni.GetCertEncode(1, 0, 7, "SN0001", "10.0.0.1", "abc", status));
        same(ask.fetchCertificateLogged("abc"),
                gatewayjni.GetCertEncode2(1, 0, 7, "SN0001", "10.0.0.1", "abc", status));
        same(ask.certificateStatus("abc"),
                gatewayjni.GetCertStatusEncode(1, 0, 7, "SN0001", "10.0.0.1", "abc", status));
        same(ask.certificateInstalled("abc"),
                gatewayjni.InstallCertOKEncode(1, 0, 7, "SN0001", "10.0.0.1", "abc", status));
        same(ask.certificateOpened("abc"),
                gatewayjni.OpenCertEncode(1, 0, 7, "SN0001", "10.0.0.1", "abc", status));
        same(ask.applyForCertificate("19800101", "abc"), gatewayjni.ApplyCertEncode(1, 0, 7,
                "SN0001", "10.0.0.1", "9A01", ID, "secret", "19800101", "abc", status));
        same(ask.renewCertificate("19800101", "abc"), gatewayjni.ReNewCertEncode(1, 0, 7,
                "SN0001", "10.0.0.1", "9A01", ID, "secret", "19800101", "abc", status));
        same(ask.revokeCertificate("19800101", "abc"), gatewayjni.RevokeCertEncode(1, 0, 7,
                "SN0001", "10.0.0.1", "9A01", ID, "secret", "19800101", "abc", status));
    }

    @Test
    void stockOrders() {
        same(ask.stockOrder().buy("2330").orderDate(DAY).quantity(Quantity.lots(2))
                        .price(Price.of("600.5")).flag13('1').orderKind(OrderKind.of(3))
                        .handling(Handling.of(200)).build(),
                gatewayjni.SubmitOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "1130115", 2, 1000, 60050, (byte) 'B', (byte) '1', (byte) 3,
                        (byte) 0, (byte) 0, (byte) 200, status));
        same(ask.stockOrder().sell("2330").quantity(Quantity.oddLotShares(37))
                        .price(Price.LIMIT_UP).reservation().signature(Signature.TAG_PL).build(),
                gatewayjni.SubmitOrderEncode1(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "", 37, 1000, 0, (byte) 'S', (byte) '0', (byte) 0, (byte) 9,
                        (byte) 2, (byte) 0, status));
        same(ask.stockNotice(StockFunction.CANCEL, TradeType.ODD_LOT),
                gatewayjni.SubmitOrderEncode2(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        (byte) 'D', (byte) 2));
    }

    private StockOrder listed() {
        return ask.stockOrders(DAY).read("|00=1|68=0000|67=1|46=G1|36=A0001|27=0|28=0|32=B|29=2330"
                + "|70=3000|37=0|41=1000|47=0|39= |K1=|N6=1|31=600.5|M8=0|22=090000|21=20240115"
                + "|44=20240115|JV=Y|01=|00=2|67=900000|68=0000|01=").orThrow().get(0);
    }

    @Test
    void stockAmendments() {
        same(ask.cancel(listed()).flag13('1').build(),
                gatewayjni.CancelOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "1130115", "A0001&G1", 0, 1000, 60050, (byte) 'B', (byte) '1',
                        (byte) 0, (byte) 0, (byte) 0, (byte) 1, status));
        same(ask.cancel(listed()).sharesPerLot(500).signature(Signature.TAG_PL).build(),
                gatewayjni.CancelOrderEncode1(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "1130115", "A0001&G1", 4, 500, 60050, (byte) 'B', (byte) '1',
                        (byte) 0, (byte) 0, (byte) 0, (byte) 1, status));
        same(ask.changeQuantity(listed(), Quantity.lots(1)).flag13('1').build(),
                gatewayjni.ChangeOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "1130115", "A0001&G1", 1, 1000, 60050, (byte) 'B', (byte) '1',
                        (byte) 0, (byte) 0, (byte) 0, (byte) 1, status));
        same(ask.changeQuantity(listed(), Quantity.lots(1)).signature(Signature.TAG_PL).build(),
                gatewayjni.ChangeOrderEncode1(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID, "secret",
                        "2330", "1130115", "A0001&G1", 1, 1000, 60050, (byte) 'B', (byte) '1',
                        (byte) 0, (byte) 0, (byte) 0, (byte) 1, status));
    }

    @Test
    void stockQueries() {
        same(ask.stockOrders(DAY, TradeType.ODD_LOT), gatewayjni.QueryOrderEncode(1, 0, 7, "SN0001",
                "10.0.0.1", "9A01", ID, "secret", "1130115", 2, status));
        same(ask.stockFills(DAY, NEXT), gatewayjni.QueryReplyEncode(1, 0, 7, "SN0001", "10.0.0.1",
                "9A01", ID, "secret", "1130115", "1130116", status));
        same(ask.stockPositions(), gatewayjni.QueryInventoryEncode(1, 0, 7, "SN0001", "10.0.0.1",
                "9A01", ID, "secret", status));
        same(ask.creditFigures("2330"), gatewayjni.QueryCreditInfoEncode(1, 0, 7, "SN0001",
                "10.0.0.1", "9A01", ID, "secret", "2330", status));
        same(ask.settlement(SettlementPeriod.of(3)), gatewayjni.PaymentEncode(1, 0, 7, "SN0001",
                "10.0.0.1", "9A01", ID, "secret", "3", "", status));
        same(ask.settlement(DAY, NEXT), gatewayjni.PaymentEncode(1, 0, 7, "SN0001", "10.0.0.1",
                "9A01", ID, "secret", "1130115", "1130116", status));
    }

    @Test
    void futuresOrders() {
        same(ask.futuresOrder().buy(Contract.futures("TXF", "202401")).quantity(2)
                        .price(Price.of("18000")).timeInForce(TimeInForce.FILL_OR_KILL)
                        .flagW3('0').orderDate(DAY).live().build(),
                gatewayjni.FutSubmitOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "", "1130115", "TXF", "", "202401", "", "", "", "", "", (byte) 1,
                        (byte) 1, (byte) 2, 'I', '0', 'F', ' ', 'B', ' ', 2, 0, 180000000, status));
        same(ask.futuresOrder().buy(Contract.option("TXO", "202401", CallPut.CALL, "18000.0"))
                        .sell(Contract.option("TXO", "202402", CallPut.PUT, "17000")).quantity(1)
                        .price(Price.MARKET).signature(Signature.TAG_PL).reservation().build(),
                gatewayjni.FutSubmitOrderEncode1(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "", "", "TXO", "TXO", "202401", "202402", "18000",
                        "17000", "C", "P", (byte) 0, (byte) 3, (byte) 1, 'I', ' ', 'R', ' ', 'B',
                        'S', 1, 0, 0, status));
        same(ask.futuresOrder().buy(Contract.futures("TXF", "202401"))
                        .sell(Contract.futures("MXF", "202402")).quantity(1).price(Price.of("0"))
                        .reservation().build(),
                gatewayjni.FutSubmitOrderEncode(1, 0, 7, "SN0001", "10.0.0.1", "9A01", ID,
                        "secret", "", "", "TXF", "MXF", "202401", "202402", "", "", "", "",
                        (byte) 0, (byte) 4, (byte) 2, 'I', ' ', 'R', ' ', 'B', 'S', 1, 0, 0,
                        status));
    }

    @Test
    void futuresQueries() {
        same(ask.futuresOrders(DAY, OrderSelection.of(1)), gatewayjni.FutQueryOrderEncode(1, 0, 7,
                "SN0001", "10.0.0.1", "9A01", ID, "secret", "1130115", 1, status));
        same(ask.futuresFills(DAY, NEXT), gatewayjni.FutQueryReplyEncode(1, 0, 7, "SN0001",
                "10.0.0.1", "9A01", ID, "secret", "1130115", "1130116", status));
        same(ask.futuresPositions(), gatewayjni.FutQueryInventoryEncode(1, 0, 7, "SN0001",
                "10.0.0.1", "9A01", ID, "secret", status));
        same(ask.margin(MarginQuery.of(3)), gatewayjni.QueryFinanceEncode(1, 0, 7, "SN0001",
                "10.0.0.1", "9A01", ID, "secret", 3, status));
    }
}
