package com.brindlex.kernel.quorvane.simulator;

/**
 * The kinds of requests on the wire and the shape of each.
 *
 * <p>A shape is the request with its values taken out: each tag with the bars that stand before it,
 * so that a doubled or missing bar shows. Here stands the part behind the header; in brackets what
 * only some requests of the kind have.
 */
public enum RequestKind {
    LOGIN('*', "0", "|FUNC|01"),
    CHANGE_PASSWORD('*', "1", "|FUNC|54|55|01", true),
    STOCK_ORDER_BOOK('S', "2", "||FUNC|SDATE|EDATE|28|01", true, "\n"),
    STOCK_FILLS('S', "3", "||FUNC|57|SDATE|EDATE|01", true, "\n"),
    STOCK_POSITIONS('S', "5", "||FUNC|01", true),
    STOCK_SETTLEMENT('S', "6", "||FUNC|H4|SDATE|EDATE|01", true),
    BANK_BALANCE('*', "7", "|FUNC|01", true),
    STOCK_CREDIT('S', "8", "||FUNC|29|01", true),
    OPEN_ACCOUNT('*', "9", "|FUNC|NAME|ADDRESS|TEL|TIME|ITEM|01"),
    REGISTER_CERTIFICATE('*', "10", "|FUNC|MSG|01"),
    GET_CERTIFICATE('*', "11", "|FUNC|MSG|01"),
    ACCOUNT_LIST('*', "12", "|FUNC|01"),
    APPLY_CERTIFICATE('*', "13", "|FUNC|MSG|BIRTH|01"),
    CERTIFICATE_STATUS('*', "14", "|FUNC|MSG|01"),
    RENEW_CERTIFICATE('*', "15", "|FUNC|MSG|BIRTH|01"),
    CERTIFICATE_INSTALLED('*', "16", "|FUNC|MSG|01"),
    CERTIFICATE_OPENED('*', "17", "|FUNC|MSG|01"),
    REVOKE_CERTIFICATE('*', "18", "|FUNC|MSG|BIRTH|01"),
    FUTURES_POSITIONS('F', "O", "|FUNC|01"),
    FUTURES_MARGIN('F', "P", "|FUNC|28|01", true),
    FUTURES_ORDER_BOOK('F', "x0", "|FUNC|FUNC1|SDATE||EDATE|28|01", true),
    FUTURES_FILLS('F', "x1", "|FUNC|FUNC1|SDATE|EDATE|01", true, "\n"),

    STOCK_NEW('S', 0, "|27|28|29|30|UT|13|N6|31|M8|32|33"),
    STOCK_NEW_1('S', 1, "|27|28|29|30|UT|13|N6|31|M8|32|33|PL"),
    STOCK_NOTICE('*', 2, "|28"),
    STOCK_CANCEL('S', 0, "|10|36|46|28|29|31|32|N6|27|UT|13"),
    STOCK_CANCEL_1('S', 1, "|10|36|46|28|29|31|32|37|N6|27|UT|PL"),
    STOCK_CHANGE('S', 0, "|10|36|46|28|29|31|32|37|N6|27|UT|13"),
    STOCK_CHANGE_1('S', 1, "|10|36|46|28|29|31|32|37|N6|27|UT|PL"),
    FUTURES_NEW('F', 0, "|27|28|29|30|31|M8|32|33|34|O4|V5|V6|V8[|EL|V9|W0|W1|W2|EM]|W3|N6"),
    FUTURES_NEW_1('F', 1, "|27|28|29|30|31|M8|32|33|34|O4|V5|V6|V8[|EL|V9|W0|W1|W2|EM]|W3|N6|PL"),
    FUTURES_CHANGE('F', 0, "|27|28|29|30|31|M8|32|33|34|O4|V5|V6|V8[|EL|V9|W0|W1|W2]|36|46|37|N6"),
    FUTURES_CHANGE_1(
            'F', 1, "|27|28|29|30|31|M8|32|33|34|O4|V5|V6|V8[|EL|V9|W0|W1|W2]|36|46|37|N6|PL");

    /** No order header: the request is a query. */
    static final int QUERY = -1;

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

    RequestKind(char market, String function, int variant, String shape, boolean escaped,
            String ending) {
        this.market = market;
        this.function = function;
        this.variant = variant;
        this.shape = shape;
        this.escaped = escaped;
        this.ending = ending;
    }

    RequestKind(char market, String function, String shape) {
        this(market, function, QUERY, shape, false, "");
    }

    RequestKind(char market, String function, String shape, boolean escaped) {
        this(market, function, QUERY, shape, escaped, "");
    }

    RequestKind(char market, String function, String shape, boolean escaped, String ending) {
        this(market, function, QUERY, shape, escaped, ending);
    }

    RequestKind(char market, int variant, String shape) {
        this(market, "", variant, shape, false, "");
    }

    /** Whether the request places, changes or cancels an order. */
    public boolean isOrder() {
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
