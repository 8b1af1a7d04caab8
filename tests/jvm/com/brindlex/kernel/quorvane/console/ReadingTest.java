package com.brindlex.kernel.quorvane.console;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.io.ByteArrayOutputStream;
import java.io.PrintStream;
import java.nio.charset.StandardCharsets;
import java.util.List;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;

/** Messages and results are taken apart and made readable. */
class ReadingTest {
    @ParameterizedTest(name = "{0} {1}")
    @CsvSource({
            "TWO_DECIMALS, 99500, 995.00",
            "TWO_DECIMALS, 5, 0.05",
            "TWO_DECIMALS, 市價, 市價",
            "FOUR_DECIMALS, 1205000, 120.5",
            "FOUR_DECIMALS, 0, 0",
            "FOUR_DECIMALS, 3100000|1300000, 310|130",
            "FOUR_DECIMALS, -15000, -1.5",
            "ORDER_TYPE, 1, buy",
            "ORDER_TYPE, 14, fixed short sell",
            "ORDER_TYPE, 53|54, buy|sell",
            "ORDER_TYPE, 38, 38",
            "CONTRACT, TIMEX&F&TXF&202402&&0, TXF 202402",
            "CONTRACT, TIMEX&O&TXO&202402&C&180000000, TXO 202402 C 18000",
            "CONTRACT, TIMEX&X&TXO|TXO&202402|202403&C|P&180000000|185000000, TXO 202402 C 18000 / TXO 202403 P 18500",
            "CONTRACT, TIMEX&Y&TXF&202402|202403&&0, TXF 202402 / TXF 202403",
            "CONTRACT, TIMEX&F&TXF&20240200, TXF 202402",
            "CONTRACT, what?, what?",
            "DATE, 1130115, 113/01/15",
            "DATE, 20240115&20240116, 2024/01/15&2024/01/16",
            "TIME, 091503, 09:15:03",
            "PLAIN, 091503, 091503",
    })
    void
    writesValuesAsAUserWould(Readable.Form form, String value, String readable) {
        assertEquals(readable, form.read(value));
    }

    @Test
    void takesListsAndSectionsApart() {
        assertEquals(List.of(List.of("a", "", "b"), List.of("c")), ResultLayout.list("2!a@@b!c!"));
        assertEquals(List.of(), ResultLayout.list("0!"));
        assertEquals(List.of(List.of("1", "2", "")), ResultLayout.record("1@2@!"));
        List<ResultLayout.Section> sections = ResultLayout.sections("<5>!1!a@b!<6>!0!");
        assertEquals(2, sections.size());
        assertEquals(new ResultLayout.Section(5, List.of(List.of("a", "b"))), sections.get(0));
        assertEquals(new ResultLayout.Section(6, List.of()), sections.get(1));
        assertEquals(List.of(), ResultLayout.sections("查無資料"));
    }

    @Test
    void cutsFieldsWithTheirBars() {
        assertEquals(List.of(
                new WireField(0, "F", "1"),
                new WireField(1, "14", "I"),
                new WireField(0, "15", "1"),
                new WireField(2, "21", ""),
                new WireField(1, "13", "0"),
                new WireField(0, FieldNames.PAYLOAD, "a_b")),
                WireField.cut("F=1|14=I15=1||21=|13=0!!a_b"));
        assertEquals(
                List.of(new WireField(0, "", "[GATEWAY]error")), WireField.cut("[GATEWAY]error"));
        assertEquals(List.of(), WireField.cut("||"));
    }

    @Test
    void namesATagByItsScene() {
        assertEquals("stock code", FieldNames.name(Scene.STOCK_ORDER, "29"));
        assertEquals("contract month, leg 1", FieldNames.name(Scene.FUTURES_ORDER, "29"));
        assertNull(FieldNames.name(Scene.ACCOUNT, "29"));
        assertEquals(Scene.FUTURES_ORDER, Scene.ofRequest(WireField.cut("F=1|KIND=F")));
        assertEquals(Scene.SETTLEMENT, Scene.ofRequest(WireField.cut("F=7|KIND=S|FUNC=6")));
    }

    @ParameterizedTest(name = "{0}")
    @CsvSource({
        "AuthEncode, ACCOUNT",
        "QueryBankRemainDecode, ACCOUNT",
        "ChangePasswordEncode, ACCOUNT",
        "GetCertEncode2, CERTIFICATE",
        "SubmitOrderEncode1, STOCK_ORDER",
        "CancelChangeOrderDecode, STOCK_ORDER",
        "QueryOrderDecode, STOCK_LIST",
        "QueryInventoryDecodeJZG, STOCK_POSITION",
        "QueryCreditInfoEncode, STOCK_POSITION",
        "PaymentDecodeJZG, SETTLEMENT",
        "FutSubmitOrderEncode, FUTURES_ORDER",
        "FutQueryInventoryDecode, FUTURES_LIST",
        "QueryFinanceDecode, MARGIN",
    })
    void knowsTheSceneOfAnOperation(String operation, Scene scene) {
        assertEquals(scene, Scene.ofOperation(operation));
    }

    @Test
    void alignsTablesWithWideCharacters() {
        ByteArrayOutputStream bytes = new ByteArrayOutputStream();
        Screen screen = new Screen(new PrintStream(bytes, true, StandardCharsets.UTF_8), false);
        screen.table(List.of("a", "empty", "b"),
                List.of(List.of("已成交", "", "1"), List.of("x", "", "20")));
        String text = bytes.toString(StandardCharsets.UTF_8);
        assertEquals(String.join(System.lineSeparator(),
                "  ┌────────┬────┐",
                "  │ a      │ b  │",
                "  ├────────┼────┤",
                "  │ 已成交 │  1 │",
                "  │ x      │ 20 │",
                "  └────────┴────┘",
                ""), text);
        assertTrue(text.indexOf('\033') < 0);
    }
}
