package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.TradeDate;
import com.brindlex.kernel.quorvane.typed.TradeTime;
import java.nio.ByteBuffer;
import java.nio.charset.CharacterCodingException;
import java.nio.charset.StandardCharsets;
import java.util.Base64;
import java.util.Map;

/** Reads the values of tags for people, and knows how some of them must look. */
final class TagReading {
    /** What a value must look like, where the wire leaves no choice. */
    private static final Map<String, String> SHAPES = Map.ofEntries(
            Map.entry("KIND", "[SF]"), Map.entry("65", "[0-9]{10}"), Map.entry("15", "[01]"),
            Map.entry("ACNO", "-?[0-9A-Za-z]{2,11}"), Map.entry("IDNO", "[^|]{2,39}"),
            Map.entry("21", "[0-9]{8,9}"), Map.entry("22", "[0-9]{6}"),
            Map.entry("23", "[0-9]{8}"), Map.entry("44", "-?[0-9]{7,10}"),
            Map.entry("10", "-?[0-9]{7,10}"), Map.entry("30", "-?[0-9]+"),
            Map.entry("UT", "-?[0-9]+"), Map.entry("37", "-?[0-9]+"), Map.entry("EM", "-?[0-9]+"),
            Map.entry("N6", "[0-9]{1,3}"), Map.entry("27", "[0-9]{1,3}"),
            Map.entry("28", "-?[0-9]+"), Map.entry("O4", "[01]"), Map.entry("V5", "[01]"),
            Map.entry("V6", "[1-7]?"), Map.entry("TIME", "[0-9]{1,3}"),
            Map.entry("ITEM", "[0-9]{1,3}"), Map.entry("M8", "[0-9]{0,3}"),
            Map.entry("MSG", "[A-Za-z0-9+/\r\n]*={0,4}"));

    private static final Map<String, String> CODES = Map.ofEntries(
            Map.entry("KIND=S", "securities"), Map.entry("KIND=F", "futures and options"),
            Map.entry("F=7", "query"), Map.entry("F=1", "order"),
            Map.entry("15=0", "account"), Map.entry("15=1", "ID number"),
            Map.entry("32=B", "buy"), Map.entry("32=S", "sell"), Map.entry("EL=B", "buy"),
            Map.entry("EL=S", "sell"), Map.entry("V8=C", "call"), Map.entry("V8=P", "put"),
            Map.entry("W1=C", "call"), Map.entry("W1=P", "put"), Map.entry("68=0000", "success"),
            Map.entry("68=5001", "no data"), Map.entry("14=I", "new order"),
            Map.entry("14=D", "cancel"), Map.entry("14=C", "change"),
            Map.entry("14=A", "price change"), Map.entry("39=E", "failed"),
            Map.entry("V6=1", "same month"), Map.entry("V6=2", "other month"),
            Map.entry("V6=3", "same side, same commodity"),
            Map.entry("V6=4", "same side, other commodity"), Map.entry("V6=5", "call against put"),
            Map.entry("V6=7", "futures spread"), Map.entry("O4=1", "fill or kill"),
            Map.entry("V5=1", "immediate or cancel"), Map.entry("JV=Y", "can be changed"),
            Map.entry("JV=N", "cannot be changed"));

    private static final Map<String, String> STOCK_CODES = Map.of("M8=0", "limit price", "M8=1",
            "limit down", "M8=5", "flat price", "M8=9", "limit up", "28=0", "board lots", "28=2",
            "odd lot", "28=3", "fixed price");

    private TagReading() {}

    /** Whether a request may carry such a value. */
    static boolean fits(String tag, String value) {
        String shape = SHAPES.get(tag);
        return shape == null || value.matches(shape);
    }

    /** The value for people; empty when there is nothing to add. */
    static String of(String tag, String value, Scene scene, Operation operation) {
        String code = CODES.get(tag + "=" + value);
        if (code == null && scene == Scene.STOCK_ORDER) {
            code = STOCK_CODES.get(tag + "=" + value);
        }
        if (code != null) {
            return code;
        }
        switch (tag) {
            case "65":
                return value.matches("[0-9]{10}") ? requestId(value) : "";
            case "FUNC":
                return operation == null ? "" : operation.summary();
            case "67":
                return value.matches("[0-9]{6}") && value.startsWith("9") ? "end of the list" : "";
            case "MSG":
                return decoded(value);
            case "10":
            case "21":
            case "44":
            case "50":
            case "SDATE":
            case "EDATE":
                TradeDate date = TradeDate.parse(value);
                return date == null ? "" : date.toString();
            case "22":
            case "51":
                TradeTime time = TradeTime.parse(value);
                return time == null ? "" : time.toString();
            default:
                return "";
        }
    }

    /** The id is the time of day and the request number, with two zeros in front. */
    private static String requestId(String value) {
        TradeTime time = TradeTime.parse(value.substring(2, 8));
        return time == null ? "" : time + ", request " + value.substring(8);
    }

    private static String decoded(String base64) {
        try {
            byte[] bytes = Base64.getMimeDecoder().decode(base64);
            String text =
                    StandardCharsets.UTF_8.newDecoder().decode(ByteBuffer.wrap(bytes)).toString();
            boolean plain = text.codePoints().noneMatch(Character::isISOControl);
            return plain ? text : bytes.length + " bytes";
        } catch (IllegalArgumentException | CharacterCodingException binary) {
            return "";
        }
    }
}
