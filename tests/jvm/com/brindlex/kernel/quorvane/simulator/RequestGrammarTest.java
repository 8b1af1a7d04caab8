package com.brindlex.kernel.quorvane.simulator;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.util.EnumSet;
import java.util.TreeSet;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.ValueSource;

/** The parser knows every request by its exact shape, and nothing else. */
class RequestGrammarTest {
    private static final Object[][] REQUESTS = {
            {RequestKind.LOGIN, Wire.QUERY + "FUNC=0|01="},
            {RequestKind.ACCOUNT_LIST, Wire.QUERY + "FUNC=12|01="},
            {RequestKind.CHANGE_PASSWORD, Wire.ESCAPED + "FUNC=1|54=pass1234|55=new%20one|01="},
            {RequestKind.BANK_BALANCE, Wire.ESCAPED + "FUNC=7|01="},
            {RequestKind.OPEN_ACCOUNT,
                    Wire.QUERY + "FUNC=9|NAME=n|ADDRESS=a b|TEL=1|TIME=255|ITEM=0|01="},
            {RequestKind.REGISTER_CERTIFICATE, Wire.ANONYMOUS + "FUNC=10|MSG=QUJD|01="},
            {RequestKind.GET_CERTIFICATE, Wire.ANONYMOUS + "FUNC=11|MSG=QUI=|01="},
            {RequestKind.APPLY_CERTIFICATE, Wire.QUERY + "FUNC=13|MSG=QUJD|BIRTH=19800101|01="},
            {RequestKind.CERTIFICATE_STATUS, Wire.ANONYMOUS + "FUNC=14|MSG=QUJD|01="},
            {RequestKind.RENEW_CERTIFICATE, Wire.QUERY + "FUNC=15|MSG=QUJD|BIRTH=|01="},
            {RequestKind.CERTIFICATE_INSTALLED, Wire.ANONYMOUS + "FUNC=16|MSG=QUJD|01="},
            {RequestKind.CERTIFICATE_OPENED, Wire.ANONYMOUS + "FUNC=17|MSG=QUJD|01="},
            {RequestKind.REVOKE_CERTIFICATE, Wire.QUERY + "FUNC=18|MSG=QUJD|BIRTH=19800101|01="},
            {RequestKind.STOCK_ORDER_BOOK,
                    Wire.ESCAPED + "|FUNC=2|SDATE=1130115|EDATE=1130115|28=0|01=\n"},
            {RequestKind.STOCK_FILLS,
                    Wire.ESCAPED + "|FUNC=3|57=2|SDATE=20240101|EDATE=20240115|01=\n"},
            {RequestKind.STOCK_POSITIONS, Wire.ESCAPED + "|FUNC=5|01="},
            {RequestKind.STOCK_CREDIT, Wire.ESCAPED + "|FUNC=8|29=2330|01="},
            {RequestKind.STOCK_SETTLEMENT, Wire.ESCAPED + "|FUNC=6|H4=1|SDATE=4|EDATE=|01="},
            {RequestKind.FUTURES_ORDER_BOOK,
                    Wire.FUTURES + "FUNC=x|FUNC1=0|SDATE=20240115||EDATE=20240115|28=0|01="},
            {RequestKind.FUTURES_FILLS,
                    Wire.FUTURES + "FUNC=x|FUNC1=1|SDATE=20240101|EDATE=20240115|01=\n"},
            {RequestKind.FUTURES_POSITIONS, Wire.FUTURES.replace("%20", " ") + "FUNC=O|01="},
            {RequestKind.FUTURES_MARGIN, Wire.FUTURES + "FUNC=P|28=3|01="},
            {RequestKind.STOCK_NEW, Wire.buyTwoLots()},
            {RequestKind.STOCK_NEW_1, Wire.buyTwoLots1()},
            {RequestKind.STOCK_CANCEL, Wire.cancel()},
            {RequestKind.STOCK_CANCEL_1, Wire.cancel1()},
            {RequestKind.STOCK_CHANGE, Wire.change()},
            {RequestKind.STOCK_CHANGE_1, Wire.change1()},
            {RequestKind.STOCK_NOTICE,
                    "F=1|KIND=S|CB=1|BHNO=9A01|VER=24369|SN=DEV1|11=NO DEFINE|65=0013452107|14=I"
                            + "|15=0|IDNO=A123456789|ACNO=1234567|PWD=pass1234|28=0"},
            {RequestKind.FUTURES_NEW, Wire.buyFutures()},
            {RequestKind.FUTURES_NEW, Wire.buyCallSpread()},
            {RequestKind.FUTURES_NEW_1, Wire.buyFutures1()},
            {RequestKind.FUTURES_NEW_1, Wire.buyCallSpread1()},
            {RequestKind.FUTURES_CHANGE, Wire.changeFutures('C')},
            {RequestKind.FUTURES_CHANGE_1, Wire.changeFutures1('A')},
    };

    @Test
    void knowsEveryKindOfRequest() throws Refusal {
        EnumSet<RequestKind> seen = EnumSet.noneOf(RequestKind.class);
        for (Object[] row : REQUESTS) {
            assertEquals(row[0], RequestParser.parse((String) row[1]).kind());
            seen.add((RequestKind) row[0]);
        }
        assertEquals(EnumSet.allOf(RequestKind.class), seen);
    }

    @Test
    void namesEveryFieldOfEveryKind() throws Refusal {
        for (Object[] row : REQUESTS) {
            Request request = RequestParser.parse((String) row[1]);
            assertFalse(FieldNames.named(request).containsKey(null), request.fields()::toString);
        }
    }

    @Test
    void refusesEveryRequestThatLacksABarOrAnEqualsSign() {
        for (Object[] row : REQUESTS) {
            String text = (String) row[1];
            // a bar or equals sign within a payload or a value says nothing about the shape
            int end = text.contains("!!") ? text.indexOf("!!") : text.indexOf("|MSG=") + 5;
            for (int i = 0; i < (end > 4 ? end : text.length()); i++) {
                if (text.charAt(i) == '|' || text.charAt(i) == '=') {
                    String damaged = text.substring(0, i) + text.substring(i + 1);
                    assertThrows(Refusal.class, () -> RequestParser.parse(damaged), damaged);
                }
            }
        }
    }

    @Test
    void refusesEveryRequestWithADoubledBar() {
        for (Object[] row : REQUESTS) {
            String text = (String) row[1];
            for (int i = 0; i < text.length(); i++) {
                if (text.charAt(i) == '|' && !(text.contains("!!") && i > text.indexOf("!!"))) {
                    String damaged = text.substring(0, i) + "|" + text.substring(i);
                    assertThrows(Refusal.class, () -> RequestParser.parse(damaged), damaged);
                }
            }
        }
    }

    @Test
    void refusesEveryRequestThatIsCutShort() {
        for (Object[] row : REQUESTS) {
            String text = (String) row[1];
            int end = text.contains("!!") ? text.indexOf("!!") : text.length();
            for (int i = 0; i < end - 2; i++) {
                String damaged = text.substring(0, i);
                assertThrows(Refusal.class, () -> {
                    Request request = RequestParser.parse(damaged);
                    StockRules.checkNew(request, Wire.gateway().world);
                }, damaged);
            }
        }
    }

    @ParameterizedTest(name = "{0}")
    @CsvSource({
        "'an identity of account and ID number', 15=1|IDNO=A123456789|ACNO=1234567|PWD=p||21=",
        "'an ID number alone', 15=1|IDNO=A123456789|PWD=p||21=",
    })
    void readsTheBlockThatRunsIntoTheFunctionLetter(String title, String block) throws Refusal {
        String text = Wire.buyTwoLots().replace(
                "|15=0|IDNO=A123456789|ACNO=1234567|PWD=pass1234|21=", block);
        assertNotEquals(Wire.buyTwoLots(), text);
        Request request = RequestParser.parse(text);
        assertEquals("I", request.get("14"));
        assertEquals("1", request.get("15"));
        assertEquals("A123456789", request.get("IDNO"));
    }

    @ParameterizedTest
    @ValueSource(strings = {
        "|15=1|IDNO=A123456789|PWD=p||21=",
        "15=1|IDNO=A123456789|PWD=p|21=",
        "15=0|IDNO=A123456789|ACNO=1234567|PWD=p|21=",
        "|15=0|IDNO=A123456789|PWD=p|21=",
        "|15=2|IDNO=A123456789|ACNO=1234567|PWD=p|21=",
    })
    void refusesIdentityBlocksOfOtherHeaders(String block) {
        String text = Wire.buyTwoLots().replace(
                "|15=0|IDNO=A123456789|ACNO=1234567|PWD=pass1234|21=", block);
        assertThrows(Refusal.class, () -> RequestParser.parse(text));
    }

    @Test
    void unescapesTheKindsThatAreEscapedAndNoOther() throws Refusal {
        assertEquals("NO DEFINE", RequestParser.parse(Wire.ESCAPED + "|FUNC=5|01=").get("11"));
        assertThrows(Refusal.class, () -> RequestParser.parse(Wire.QUERY + "|FUNC=5|01="));
        assertEquals("NO%20DEFINE", RequestParser.parse(Wire.ESCAPED + "FUNC=0|01=").get("11"));
    }

    @Test
    void wantsTheLineFeedWhereItBelongs() {
        String book = Wire.ESCAPED + "|FUNC=2|SDATE=1130115|EDATE=1130115|28=0|01=";
        assertThrows(Refusal.class, () -> RequestParser.parse(book));
        assertThrows(Refusal.class, () -> RequestParser.parse(Wire.ESCAPED + "|FUNC=5|01=\n"));
    }

    @Test
    void keepsThePayloadApart() throws Refusal {
        assertEquals("9A01_1234567_A123456789_D_A0001_B_2330__",
                RequestParser.parse(Wire.cancel()).payload());
        assertEquals("0", RequestParser.parse(Wire.cancel()).get("13"));
        assertEquals("", RequestParser.parse(Wire.buyTwoLots()).get("33"));
        assertTrue(RequestParser.parse(Wire.change1()).payload().endsWith(",,1000,,A0001"));
    }

    /** Of an order, only what the gateway cannot know may differ by a character. */
    @Test
    void seesAnyOtherCharacterInAnOrder() {
        String text = Wire.buyTwoLots();
        TreeSet<String> unseen = new TreeSet<>();
        for (int i = 0; i < text.length(); i++) {
            char other = text.charAt(i) == '7' ? '8' : '7';
            String damaged = text.substring(0, i) + other + text.substring(i + 1);
            if (Wire.gateway().build().answer(damaged).contains("|39= |")) {
                int bar = text.lastIndexOf('|', i);
                unseen.add(text.substring(bar + 1, text.indexOf('=', bar)));
            }
        }
        // flags, address, device; the order date may be another day
        assertEquals("[13, 44, IP, N6, SN]", unseen.toString());
    }
}
