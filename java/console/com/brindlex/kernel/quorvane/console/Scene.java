package com.brindlex.kernel.quorvane.console;

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
    /** Stock positions and credit figures. */
    STOCK_POSITION,
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
        if (operation.contains("Cert")) {
            return CERTIFICATE;
        }
        if (operation.startsWith("Fut")) {
            return operation.startsWith("FutSubmit") ? FUTURES_ORDER : FUTURES_LIST;
        }
        switch (operation.replaceFirst("(En|De)code.*", "")) {
            case "SubmitOrder":
            case "CancelOrder":
            case "ChangeOrder":
            case "CancelChangeOrder":
                return STOCK_ORDER;
            case "QueryOrder":
            case "QueryReply":
                return STOCK_LIST;
            case "QueryInventory":
            case "QueryCreditInfo":
                return STOCK_POSITION;
            case "Payment":
                return SETTLEMENT;
            case "QueryFinance":
                return MARGIN;
            default:
                return ACCOUNT;
        }
    }

    /** The scene of a request, by its header and function code. */
    public static Scene ofRequest(List<WireField> fields) {
        if (WireField.value(fields, "F").equals("1")) {
            return WireField.value(fields, "KIND").equals("F") ? FUTURES_ORDER : STOCK_ORDER;
        }
        switch (WireField.value(fields, "FUNC")) {
            case "2":
            case "3":
                return STOCK_LIST;
            case "5":
            case "8":
                return STOCK_POSITION;
            case "6":
                return SETTLEMENT;
            case "x":
            case "O":
                return FUTURES_LIST;
            case "P":
                return MARGIN;
            case "10":
            case "11":
            case "13":
            case "14":
            case "15":
            case "16":
            case "17":
            case "18":
                return CERTIFICATE;
            default:
                return ACCOUNT;
        }
    }
}
