package com.brindlex.kernel.quorvane.console;

import java.util.Arrays;
import java.util.List;

/** Which part of the business a message belongs to: a tag's meaning depends on it. */
public enum Scene {
    /** Login, account list, account opening, password, bank balance. */
    ACCOUNT,
    /** The life of a certificate. */
    CERTIFICATE,
    /** Placing, changing and cancelling stock orders. */
    STOCK_ORDER,
    /** Stock order book and fills. */
    STOCK_LIST,
    /** Stock positions. */
    STOCK_POSITION,
    /** Credit figures of a stock. */
    STOCK_CREDIT,
    /** Stock settlement. */
    SETTLEMENT,
    /** Placing, changing and cancelling futures and options orders. */
    FUTURES_ORDER,
    /** Futures order book, fills, positions. */
    FUTURES_LIST,
    /** The margin account. */
    MARGIN;

    /** The scene of an operation, by the name of its native method. */
    public static Scene ofOperation(String operation) {
        return find(Dictionary.SCENES, operation);
    }

    /** The scene of a request, by its header and function code. */
    public static Scene ofRequest(List<WireField> fields) {
        if (WireField.value(fields, "F").equals("1")) {
            return WireField.value(fields, "KIND").equals("F") ? FUTURES_ORDER : STOCK_ORDER;
        }
        return find(Dictionary.QUERIES, WireField.value(fields, "FUNC"));
    }

    /** The scene whose row holds a text; that of accounts when none does. */
    private static Scene find(String[][] rows, String text) {
        for (String[] row : rows) {
            if (Arrays.asList(row).indexOf(text) > 0) {
                return valueOf(row[0]);
            }
        }
        return ACCOUNT;
    }
}
