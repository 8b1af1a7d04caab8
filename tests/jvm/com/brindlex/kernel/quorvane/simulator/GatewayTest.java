package com.brindlex.kernel.quorvane.simulator;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.client.Brokerage;
import java.nio.charset.StandardCharsets;
import java.util.Base64;
import java.util.regex.Pattern;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;

/** What the gateway answers. */
class GatewayTest {
    private final Gateway gateway = Wire.gateway().build();

    private void assertAnswer(String request, String part) {
        String reply = gateway.answer(request);
        assertTrue(reply.contains(part), reply);
    }

    @Test
    void listsTheAccountsOfALogin() {
        gateway.setNotice("hello");
        assertEquals("F=7|KIND=S|65=0013452107|68=0000|M3=hello"
                + "|00=1|67=1|68=0000|07=S|M5=台北證券|16=9A01|17=12345|18=67|69=Y|01="
                + "|00=2|67=2|68=0000|07=S|M5=台北複委託|16=9A01|17=98|18=76|69=Y|01="
                + "|00=3|67=3|68=0000|07=F|M5=期貨|16=F001|17=76543|18=21|69=Y|01="
                + "|00=4|67=999999|68=0000|01=", gateway.answer(Wire.QUERY + "FUNC=0|01="));
    }

    @ParameterizedTest(name = "{0} to {1}")
    @CsvSource({
        "PWD=pass1234, PWD=pass1235, E002",
        "PWD=pass1234, PWD=, E002",
        "ACNO=1234567, ACNO=1234568, E003",
        "IDNO=A123456789, IDNO=A123456780, E003",
        "VER=24369, VER=24370, E001",
        "CB=1, CB=2, E001",
        "IP=10.0.0.1, IP=, E001",
        "11=NO DEFINE, 11=no define, E001",
        "65=0013452107, 65=0113452107, E001",
        "65=0013452107, 65=0013602107, E001",
        "65=0013452107, 65=0012452107, E005",
        "KIND=S, KIND=X, E001",
        "F=7, F=2, E001",
    })
    void refusesAWrongHeader(String right, String wrong, String code) {
        String request = Wire.QUERY + "FUNC=0|01=";
        assertTrue(request.contains(right));
        assertAnswer(request.replace(right, wrong), "|68=" + code + "|");
    }

    @Test
    void answersMarkersWhileTheLineIsDown() {
        gateway.setLine(Line.GATEWAY_DOWN);
        assertEquals("[GATEWAY]error", gateway.answer("anything"));
        gateway.setLine(Line.BROKER_TIMEOUT);
        assertEquals("[BROKER]timeout", gateway.answer("anything"));
        gateway.setLine(Line.SILENT);
        assertEquals("", gateway.answer("anything"));
        gateway.setLine(Line.UP);
        assertAnswer("anything", "|68=E001|M2=電文格式錯誤 F|");
    }

    @Test
    void changesThePassword() {
        assertAnswer(Wire.ESCAPED + "FUNC=1|54=pass1234|55=new%20one|01=", "|68=0000");
        assertAnswer(Wire.QUERY + "FUNC=0|01=", "|68=E002|");
        assertAnswer(Wire.QUERY.replace("pass1234", "new one") + "FUNC=0|01=", "|68=0000|");
        assertAnswer(Wire.ESCAPED.replace("pass1234", "new%20one") + "FUNC=7|01=", "|PN=1250000|");
    }

    @Test
    void opensAnAccountForSomebodyNew() {
        String header = Wire.QUERY.replace(
                "IDNO=A123456789|ACNO=1234567|PWD=pass1234", "IDNO=C211112222|PWD=");
        assertAnswer(header + "FUNC=9|NAME=n|ADDRESS=a|TEL=1|TIME=2|ITEM=255|01=", "|68=0000");
        assertAnswer(header + "FUNC=9|NAME=n|ADDRESS=a|TEL=1|TIME=256|ITEM=0|01=", "|68=E001");
        assertAnswer(header + "FUNC=9|NAME=|ADDRESS=a|TEL=1|TIME=2|ITEM=1|01=", "|68=E001");
        String customer = header.replace("C211112222", "A123456789");
        assertAnswer(customer + "FUNC=9|NAME=n|ADDRESS=a|TEL=1|TIME=2|ITEM=1|01=", "客戶已開戶");
    }

    private static String message(String text) {
        String base64 = Base64.getEncoder().encodeToString(text.getBytes(StandardCharsets.UTF_8));
        return "MSG=" + base64.replaceAll("(.{1024})", "$1\r\n") + "|";
    }

    @Test
    void leadsACertificateThroughItsLife() {
        String message = message("A123456789;" + "k".repeat(2000));
        String apply = Wire.QUERY + "FUNC=13|" + message + "BIRTH=19800101|01=";
        String fetch = Wire.ANONYMOUS + "FUNC=11|" + message + "01=";
        assertAnswer(fetch, "查無憑證");
        assertAnswer(apply.replace("19800101", "19800102"), "出生日期錯誤");
        assertAnswer(apply, "|M2=SN=00000001;STATE=已核發;UNTIL=20250114|");
        assertAnswer(apply, "憑證已存在");
        assertAnswer(fetch, "憑證狀態不符 已核發");
        assertAnswer(Wire.ANONYMOUS + "FUNC=17|" + message + "01=", "憑證狀態不符");
        assertAnswer(Wire.ANONYMOUS + "FUNC=16|" + message + "01=", "STATE=已安裝");
        assertAnswer(Wire.ANONYMOUS + "FUNC=17|" + message + "01=", "STATE=已開通");
        assertAnswer(fetch, "STATE=已開通");
        assertAnswer(Wire.ANONYMOUS + "FUNC=10|" + message + "01=", "STATE=已開通");
        assertAnswer(apply.replace("FUNC=13", "FUNC=15"), "UNTIL=20260114");
        assertAnswer(apply.replace("FUNC=13", "FUNC=18"), "STATE=已廢止");
        assertAnswer(Wire.ANONYMOUS + "FUNC=14|" + message + "01=", "STATE=已廢止");
        assertAnswer(apply, "SN=00000002");
    }

    @Test
    void refusesMessagesThatAreNotBase64() {
        assertAnswer(Wire.ANONYMOUS + "FUNC=11|MSG====|01=", "|68=E001|");
        assertAnswer(Wire.ANONYMOUS + "FUNC=11|MSG=QU\r\nJD|01=", "|68=E001|");
        assertAnswer(Wire.ANONYMOUS + "FUNC=11|" + message("Z999999999") + "01=", "|68=E003|");
    }

    @Test
    void takesStockOrdersOfBothFamilies() {
        assertEquals("F=1|KIND=S|65=0013452107|39= |19=S|46=0000000001|44=20240115|K1=",
                gateway.answer(Wire.buyTwoLots()));
        assertAnswer(Wire.buyTwoLots1(), "|46=0000000002|");
        assertAnswer(Wire.buyTwoLots().replace("N6=1", "N6=0"), "|19=X|");
    }

    @ParameterizedTest(name = "{0} to {1}")
    @CsvSource({
        "_995.00, _995.01, 簽章資料不符",
        "_I_B_2330, _I_S_2330, 簽章資料不符",
        "30=2000, 30=3000, 簽章資料不符",
        "UT=1000, UT=900, 委託數量須為整張",
        "2330, 9999, 無此股票代號",
        "995.00, 1100.01, 委託價格超過漲停價",
        "995.00, 899.99, 委託價格低於跌停價",
        "995.00, 995.0, 電文格式錯誤 31",
        "9A01, 9A02, 分公司代號錯誤",
        "pass1234, pass123, 密碼錯誤",
        "21=20240115, 21=20240213, 電文時間不符",
        "23=13452107, 23=13452108, 電文格式錯誤 23",
    })
    void refusesAWrongStockOrder(String right, String wrong, String text) {
        assertTrue(Wire.buyTwoLots().contains(right));
        assertAnswer(Wire.buyTwoLots().replace(right, wrong), "|39=E|19=|K1=" + text);
    }

    @Test
    void changesAndCancelsStockOrders() {
        gateway.answer(Wire.buyTwoLots());
        assertAnswer(Wire.change().replace("A0001", "A0009"), "查無此委託");
        assertAnswer(Wire.change().replace("37=1000", "37=3000").replace("_1000_", "_3000_"),
                "改量數量錯誤");
        assertAnswer(Wire.change().replace("29=2330", "29=2317").replace("_2330_", "_2317_"),
                "與原委託不符");
        assertAnswer(Wire.change(), "|39= |19=S|46=0000000001|");
        assertAnswer(Wire.cancel(), "|19=S|");
        assertAnswer(Wire.cancel1(), "委託已無剩餘數量");
        assertAnswer(Wire.ESCAPED + "|FUNC=2|SDATE=1130115|EDATE=1130115|28=0|01=\n",
                "|70=2000|41=1000|37=1000|47=0|39= |K1=委託成功|N6=1|31=995.00|M8=0|22=134521|21=20240115|44=20240115|JV=N|01=");
    }

    @Test
    void fillsStockOrders() {
        gateway.answer(Wire.buyTwoLots());
        assertThrows(IllegalArgumentException.class, () -> gateway.fillStock("A0001", 3000, "995"));
        assertThrows(IllegalArgumentException.class, () -> gateway.fillStock("A0001", 1000, "995.01"));
        gateway.fillStock("A0001", 1000, "994.50");
        assertAnswer(Wire.ESCAPED + "|FUNC=3|57=2|SDATE=20240101|EDATE=20240115|01=\n",
                "|29=2330|47=1000|48=994.50|49=994500|50=20240115|51=134521|01=");
        assertAnswer(
                Wire.ESCAPED + "|FUNC=3|57=2|SDATE=20240101|EDATE=20240114|01=\n", "|68=5001|");
        assertAnswer(Wire.ESCAPED + "|FUNC=5|01=",
                "|29=2330|75=0|751=1000|76=0|761=0|77=1000|771=0|PS=0|01=");
        assertAnswer(Wire.ESCAPED + "|FUNC=6|H4=1|SDATE=1|EDATE=|01=", "|79=1417|78=0|84=0|");
        assertAnswer(Wire.ESCAPED + "|FUNC=6|H4=1|SDATE=3|EDATE=|01=", "|68=E001|");
    }

    @Test
    void speaksTheLayoutOfTheOtherBrokerage() {
        Gateway other = Wire.gateway().brokerage(Brokerage.JZG).build();
        other.answer(Wire.buyTwoLots());
        other.fillStock("A0001", 1000, "995");
        String positions = other.answer(Wire.ESCAPED + "|FUNC=5|01=");
        assertTrue(positions.contains("|75=0|751=1000|752=0|"), positions);
        String settlement =
                other.answer(Wire.ESCAPED + "|FUNC=6|H4=1|SDATE=20240101|EDATE=1130115|01=");
        assertTrue(settlement.contains("|KT=0|"), settlement);
    }

    @Test
    void takesFuturesOrdersOfBothFamilies() {
        assertEquals("F=1|KIND=F|65=0013452107|39= |19=S|46=0005000001|44=20240115|MT=0|K1=",
                gateway.answer(Wire.buyFutures()));
        assertAnswer(Wire.buyFutures1(), "|46=0005000002|");
        assertAnswer(Wire.buyCallSpread(), "|46=0005000003|");
        assertAnswer(Wire.changeFutures('C'), "|19=S|");
        assertAnswer(Wire.changeFutures('A'), "|19=S|");
        assertAnswer(Wire.changeFutures1('A'), "|19=S|");
        assertAnswer(Wire.FUTURES + "FUNC=x|FUNC1=0|SDATE=20240115||EDATE=20240115|28=0|01=",
                "|70=2|37=1|31=18010.0000|");
        assertAnswer(Wire.changeFutures1('D'), "|19=S|");
        assertAnswer(Wire.changeFutures1('C'), "委託已無剩餘口數");
    }

    @ParameterizedTest(name = "{0} to {1}")
    @CsvSource({
        "V6=1, V6=2, 電文格式錯誤 V6",
        "W0=202402, W0=202403, 電文格式錯誤 V6",
        "EM=1, EM=2, 電文格式錯誤 EM",
        "V5=1, V5=0, 簽章資料不符",
        "_18500_C_, _18500_P_, 簽章資料不符",
        "31=00000000.000000, 31=0.0000, 電文格式錯誤 31",
        "33=TXO, 33=TXX, 電文格式錯誤",
        "O4=0, O4=1, 電文格式錯誤 V5",
    })
    void refusesAWrongCombination(String right, String wrong, String text) {
        String reply = gateway.answer(
                Wire.buyCallSpread().replaceFirst(Pattern.quote(right), wrong));
        assertTrue(reply.contains("|39=E|"), reply);
        assertTrue(text.endsWith("誤") || reply.contains("|K1=" + text), reply);
    }

    @Test
    void holdsFuturesPositionsAndMargin() {
        gateway.answer(Wire.buyFutures());
        gateway.fillFutures("F0001", 2, "18000");
        assertAnswer(Wire.FUTURES.replace("%20", " ") + "FUNC=O|01=",
                "|33=TXF|29=202402|V8=|34=|32=B|R8=2|48=18000|");
        assertAnswer(Wire.FUTURES + "FUNC=P|28=3|01=",
                "|LO=1500000.00|PN=1499900|RA=855900|QY=644000|QX=483000|U5=0|U9=100|RF=232|");
        gateway.answer(Wire.buyFutures().replace("32=B", "32=S").replace("_R_B_", "_R_S_"));
        gateway.fillFutures("F0002", 1, "18100");
        assertAnswer(Wire.FUTURES.replace("%20", " ") + "FUNC=O|01=", "|32=B|R8=1|");
        assertAnswer(Wire.buyFutures().replace("30=2|", "30=9|").replace("__2_", "__9_"), "保證金不足");
    }

    @Test
    void answersTheSameRequestsTheSameWay() {
        Gateway again = Wire.gateway().build();
        for (String request :
                new String[] {Wire.buyTwoLots(), Wire.change(), Wire.ESCAPED + "|FUNC=5|01="}) {
            assertEquals(gateway.answer(request), again.answer(request));
        }
    }
}
