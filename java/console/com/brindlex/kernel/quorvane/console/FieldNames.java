package com.brindlex.kernel.quorvane.console;

import java.util.EnumMap;
import java.util.HashMap;
import java.util.Map;

/**
 * What each tag of the wire is called: one table, by scene where a tag has more than one meaning.
 */
public final class FieldNames {
    /** Stands in place of a tag for a signature payload that has none. */
    public static final String PAYLOAD = "!!";

    private static final String[] EVERYWHERE = {
        "F", "request family (7 query, 1 order)",
        "KIND", "market (S securities, F futures)",
        "BHNO", "branch",
        "CB", "client channel",
        "IP", "device address",
        "11", "client edition",
        "VER", "protocol version",
        "65", "request id (HHMMSS, sequence)",
        "SN", "device serial number",
        "15", "identity form (0 account, 1 ID number)",
        "IDNO", "ID number",
        "ACNO", "account",
        "PWD", "password",
        "FUNC", "function",
        "FUNC1", "function, detail",
        "00", "record begins",
        "01", "record ends",
        "67", "record sequence",
        "68", "result code",
        "M2", "message",
        PAYLOAD, "signature payload",
        "PL", "signature",
    };

    private static final String[] ACCOUNT = {
        "07", "account class",
        "M5", "account label",
        "16", "branch of the account",
        "17", "account number, first part",
        "18", "account number, last part",
        "69", "account flag",
        "M3", "notice",
        "54", "password now",
        "55", "password wanted",
        "NAME", "applicant",
        "ADDRESS", "postal address",
        "TEL", "telephone",
        "TIME", "call-back time code",
        "ITEM", "account kind code",
        "PN", "bank balance",
    };

    private static final String[] CERTIFICATE = {
        "MSG", "certificate message, Base64",
        "BIRTH", "date of birth",
    };

    private static final String[] ORDER = {
        "14", "order function",
        "21", "date",
        "22", "time",
        "23", "request id, 8 digits",
        "24", "order origin",
        "V4", "(empty)",
        "44", "order date",
        "10", "order date",
        "36", "order number",
        "46", "gateway number",
        "32", "side",
        "31", "price",
        "M8", "price kind",
        "37", "quantity to take off",
        "N6", "handling flag",
        "39", "refusal mark",
        "19", "acceptance code",
        "K1", "text of the host",
        "MT", "MT flag",
    };

    private static final String[] STOCK_ORDER = {
        "27", "order kind",
        "28", "trade type",
        "29", "stock code",
        "30", "quantity, shares",
        "UT", "shares per lot",
        "13", "broker flag",
        "33", "signature",
    };

    private static final String[] FUTURES_LEGS = {
        "29", "contract month, leg 1",
        "33", "commodity, leg 1",
        "34", "strike price, leg 1",
        "V8", "call/put, leg 1",
        "32", "side, leg 1",
        "W0", "contract month, leg 2",
        "V9", "commodity, leg 2",
        "W2", "strike price, leg 2",
        "W1", "call/put, leg 2",
        "EL", "side, leg 2",
        "O4", "fill or kill",
        "V5", "immediate or cancel",
        "W3", "W3 flag",
    };

    private static final String[] FUTURES_ORDER = {
        "27", "price type",
        "28", "trade type",
        "30", "contracts",
        "V6", "combination code",
        "EM", "contracts, leg 2",
    };

    private static final String[] LIST = {
        "SDATE", "first day",
        "EDATE", "last day",
        "36", "order number",
        "46", "gateway number",
        "70", "ordered",
        "37", "taken off",
        "41", "cancelled",
        "47", "filled",
        "39", "record state (E failed)",
        "K1", "text of the host",
        "N6", "handling flag",
        "31", "order price",
        "22", "time",
        "21", "date of entry",
        "44", "order date",
        "JV", "changeable (Y, N)",
        "48", "fill price",
        "50", "fill date",
        "51", "fill time",
        "MT", "MT flag",
    };

    private static final String[] STOCK_LIST = {
        "27", "order kind",
        "28", "trade type",
        "29", "stock code",
        "32", "side",
        "M8", "price kind",
        "49", "amount",
        "57", "list form",
    };

    private static final String[] STOCK_POSITION = {
        "29", "stock code",
        "75", "cash, opening",
        "751", "cash, change",
        "752", "cash, second change",
        "76", "margin, opening or quota",
        "761", "margin, change",
        "762", "margin, second change",
        "77", "short, opening or quota",
        "771", "short, change",
        "772", "short, second change",
        "PS", "other holdings",
        "A0", "credit figure A0",
        "A1", "credit figure A1",
        "A2", "credit figure A2",
        "B8", "credit figure B8",
        "B9", "credit figure B9",
    };

    private static final String[] SETTLEMENT = {
        "H4", "settlement form",
        "KT", "type of the trade",
        "47", "quantity",
        "48", "price",
        "50", "date of the trade",
        "79", "amount 79 (fee)",
        "78", "amount 78 (tax)",
        "84", "amount 84",
        "81", "margin amount 81",
        "82", "margin amount 82",
        "85", "short-sale amount 85",
        "87", "short-sale amount 87",
        "86", "amount 86",
        "88", "amount 88",
        "89", "amount 89",
        "96", "sign",
        "97", "net amount",
    };

    private static final String[] FUTURES_LIST = {
        "27", "price type",
        "28", "order type or currency",
        "R8", "contracts held",
        "W5", "price, leg 2",
    };

    private static final String[] MARGIN = {
        "28", "kind of margin account",
        "LO", "margin amount LO",
        "PN", "margin amount PN",
        "RA", "margin amount RA",
        "QY", "margin amount QY",
        "QX", "margin amount QX",
        "U5", "margin amount U5",
        "U9", "margin amount U9",
        "RF", "margin figure RF",
        "F0", "margin amount F0",
        "F1", "margin amount F1",
        "F2", "margin amount F2",
        "F3", "margin amount F3",
    };

    private static final Map<Scene, Map<String, String>> NAMES = new EnumMap<>(Scene.class);

    static {
        enter(Scene.ACCOUNT, ACCOUNT);
        enter(Scene.CERTIFICATE, CERTIFICATE);
        enter(Scene.STOCK_ORDER, ORDER, STOCK_ORDER);
        enter(Scene.STOCK_LIST, LIST, STOCK_LIST);
        enter(Scene.STOCK_POSITION, STOCK_POSITION);
        enter(Scene.SETTLEMENT, LIST, STOCK_LIST, SETTLEMENT);
        enter(Scene.FUTURES_ORDER, ORDER, FUTURES_LEGS, FUTURES_ORDER);
        enter(Scene.FUTURES_LIST, LIST, FUTURES_LEGS, FUTURES_LIST);
        enter(Scene.MARGIN, MARGIN);
    }

    private FieldNames() {}

    /** Fills a scene's table; a later list overrides an earlier one. */
    private static void enter(Scene scene, String[]... lists) {
        Map<String, String> names = new HashMap<>();
        fill(names, EVERYWHERE);
        for (String[] list : lists) {
            fill(names, list);
        }
        NAMES.put(scene, names);
    }

    private static void fill(Map<String, String> names, String[] list) {
        for (int i = 0; i < list.length; i += 2) {
            names.put(list[i], list[i + 1]);
        }
    }

    /** The name of a tag in a scene, or null when it has none there. */
    public static String name(Scene scene, String tag) {
        return NAMES.get(scene).get(tag);
    }
}
