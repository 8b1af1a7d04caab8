package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Operation;

/**
 * The kinds of requests on the wire and the shape of each.
 *
 * <p>A shape is the request with its values taken out: each tag with the bars that stand before it,
 * so that a doubled or missing bar shows. Here stands the part behind the header; in brackets what
 * only some requests of the kind have.
 */
enum RequestKind {
    LOGIN(Operation.AUTH_ENCODE, '*', "0", "|FUNC|01"),
    CHANGE_PASSWORD(Operation.CHANGE_PASSWORD_ENCODE, '*', "1", "|FUNC|54|55|01", true),
    STOCK_ORDER_BOOK(Operation.QUERY_ORDER_ENCODE, 'S', "2",
            "||FUNC|SDATE|EDATE|28|01", true, "\n"),
    STOCK_FILLS(Operation.QUERY_REPLY_ENCODE, 'S', "3", "||FUNC|57|SDATE|EDATE|01", true, "\n"),
    STOCK_POSITIONS(Operation.QUERY_INVENTORY_ENCODE, 'S', "5", "||FUNC|01", true),
    STOCK_SETTLEMENT(Operation.PAYMENT_ENCODE, 'S', "6", "||FUNC|H4|SDATE|EDATE|01", true),
    BANK_BALANCE(Operation.QUERY_BANK_REMAIN_ENCODE, '*', "7", "|FUNC|01", true),
    STOCK_CREDIT(Operation.QUERY_CREDIT_INFO_ENCODE, 'S', "8", "||FUNC|29|01", true),
    OPEN_ACCOUNT(Operation.OPEN_ACCOUNT_ENCODE, '*', "9", "|FUNC|NAME|ADDRESS|TEL|TIME|ITEM|01"),
    REGISTER_CERTIFICATE(Operation.REGISTER_CERT_ENCODE, '*', "10", "|FUNC|MSG|01"),
    GET_CERTIFICATE(Operation.GET_CERT_ENCODE, '*', "11", "|FUNC|MSG|01"),
    ACCOUNT_LIST(Operation.GET_TOTAL_ACCOUNT_ENCODE, '*', "12", "|FUNC|01"),
    APPLY_CERTIFICATE(Operation.APPLY_CERT_ENCODE, '*', "13", "|FUNC|MSG|BIRTH|01"),
    CERTIFICATE_STATUS(Operation.GET_CERT_STATUS_ENCODE, '*', "14", "|FUNC|MSG|01"),
    RENEW_CERTIFICATE(Operation.RE_NEW_CERT_ENCODE, '*', "15", "|FUNC|MSG|BIRTH|01"),
    CERTIFICATE_INSTALLED(Operation.INSTALL_CERT_OK_ENCODE, '*', "16", "|FUNC|MSG|01"),
    CERTIFICATE_OPENED(Operation.OPEN_CERT_ENCODE, '*', "17", "|FUNC|MSG|01"),
    REVOKE_CERTIFICATE(Operation.REVOKE_CERT_ENCODE, '*', "18", "|FUNC|MSG|BIRTH|01"),
    FUTURES_POSITIONS(Operation.FUT_QUERY_INVENTORY_ENCODE, 'F', "O", "|FUNC|01"),
    FUTURES_MARGIN(Operation.QUERY_FINANCE_ENCODE, 'F', "P", "|FUNC|28|01", true),
    FUTURES_ORDER_BOOK(Operation.FUT_QUERY_ORDER_ENCODE, 'F', "x0",
            "|FUNC|FUNC1|SDATE||EDATE|28|01", true),
    FUTURES_FILLS(Operation.FUT_QUERY_REPLY_ENCODE, 'F', "x1",
            "|FUNC|FUNC1|SDATE|EDATE|01", true, "\n"),

    STOCK_NEW(Operation.SUBMIT_ORDER_ENCODE, 'S', 0, "|27|28|29|30|UT|13|N6|31|M8|32|33"),
    STOCK_NEW_1(Operation.SUBMIT_ORDER_ENCODE1, 'S', 1, "|27|28|29|30|UT|13|N6|31|M8|32|33|PL"),
    STOCK_NOTICE(Operation.SUBMIT_ORDER_ENCODE2, '*', 2, "|28"),
    STOCK_CANCEL(Operation.CANCEL_ORDER_ENCODE, 'S', 0, "|10|36|46|28|29|31|32|N6|27|UT|13"),
    STOCK_CANCEL_1(Operation.CANCEL_ORDER_ENCODE1, 'S', 1, "|10|36|46|28|29|31|32|37|N6|27|UT|PL"),
    STOCK_CHANGE(Operation.CHANGE_ORDER_ENCODE, 'S', 0, "|10|36|46|28|29|31|32|37|N6|27|UT|13"),
    STOCK_CHANGE_1(Operation.CHANGE_ORDER_ENCODE1, 'S', 1, "|10|36|46|28|29|31|32|37|N6|27|UT|PL"),
    FUTURES_NEW(Operation.FUT_SUBMIT_ORDER_ENCODE, 'F', 0,
            "|27|28|29|30|31|M8|32|33|34|O4|V5|V6|V8[|EL|V9|W0|W1|W2|EM]|W3|N6"),
    FUTURES_NEW_1(Operation.FUT_SUBMIT_ORDER_ENCODE1, 'F', 1,
            "|27|28|29|30|31|M8|32|33|34|O4|V5|V6|V8[|EL|V9|W0|W1|W2|EM]|W3|N6|PL"),
    FUTURES_CHANGE(Operation.FUT_SUBMIT_ORDER_ENCODE, 'F', 0,
            "|27|28|29|30|31|M8|32|33|34|O4|V5|V6|V8[|EL|V9|W0|W1|W2]|36|46|37|N6"),
    FUTURES_CHANGE_1(Operation.FUT_SUBMIT_ORDER_ENCODE1, 'F', 1,
            "|27|28|29|30|31|M8|32|33|34|O4|V5|V6|V8[|EL|V9|W0|W1|W2]|36|46|37|N6|PL");

    /** No order header: the request is a query. */
    static final int QUERY = -1;

    /** The encoder that builds it; of two that build the same, the first. */
    final Operation operation;

    /** Market letter that the header must carry, or '*' for either. */
    final char market;

    /** Function code of a query (FUNC, with FUNC1 behind it); empty for orders. */
    final String function;

    /** Variant of the order header (0, 1 or 2), or {@link #QUERY}. */
    final int variant;

    /** Tags and bars behind the header. */
    final String shape;

    /** Every blank of the request travels as %20. */
    final boolean escaped;

    /** Value of the closing tag 01. */
    final String ending;

    RequestKind(Operation operation, char market, String function, int variant, String shape,
            boolean escaped, String ending) {
        this.operation = operation;
        this.market = market;
        this.function = function;
        this.variant = variant;
        this.shape = shape;
        this.escaped = escaped;
        this.ending = ending;
    }

    RequestKind(Operation operation, char market, String function, String shape) {
        this(operation, market, function, QUERY, shape, false, "");
    }

    RequestKind(Operation operation, char market, String function, String shape, boolean escaped) {
        this(operation, market, function, QUERY, shape, escaped, "");
    }

    RequestKind(Operation operation, char market, String function, String shape, boolean escaped, String ending) { // TOO LONG
        this(operation, market, function, QUERY, shape, escaped, ending);
    }

    RequestKind(Operation operation, char market, int variant, String shape) {
        this(operation, market, "", variant, shape, false, "");
    }

    /** Whether the request places, changes or cancels an order. */
    boolean isOrder() {
        return variant != QUERY;
    }

    /** The kind of a query, by its function code. */
    static RequestKind ofQuery(String function) throws Refusal {
        for (RequestKind kind : values()) {
            if (!kind.isOrder() && kind.function.equals(function)) {
                return kind;
            }
        }
        throw Refusal.malformed("FUNC");
    }

    /** The kind of an order, by market letter, function letter and header variant. */
    static RequestKind ofOrder(char market, char function, int variant) throws Refusal {
        if (variant == 2) {
            return STOCK_NOTICE;
        }
        String name = (market == 'F' ? "FUTURES_" : "STOCK_")
                + (function == 'I' ? "NEW" : market == 'F' || function == 'C' ? "CHANGE" : "CANCEL")
                + (variant == 1 ? "_1" : "");
        if (market == 'S' && "IDC".indexOf(function) < 0) {
            throw Refusal.malformed("14");
        }
        return valueOf(name);
    }

    /** Whether {@code tail}, the shape of what stands behind the header, is one of this kind. */
    boolean accepts(String tail) {
        int open = shape.indexOf('[');
        if (open < 0) {
            return shape.equals(tail);
        }
        int close = shape.indexOf(']');
        String before = shape.substring(0, open);
        String inside = shape.substring(open + 1, close);
        String after = shape.substring(close + 1);
        return tail.equals(before + after) || tail.equals(before + inside + after);
    }
}
