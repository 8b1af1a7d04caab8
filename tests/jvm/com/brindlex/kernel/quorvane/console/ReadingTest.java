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

/** Messages are taken apart, named, and shown in tables. */
class ReadingTest {
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
        "QueryCreditInfoEncode, STOCK_CREDIT",
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
