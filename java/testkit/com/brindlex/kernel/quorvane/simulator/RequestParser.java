package com.brindlex.kernel.quorvane.simulator;

import java.util.LinkedHashMap;
import java.util.Map;

/**
 * Reads the text of a request: fields, bars, identity block, escapes and signature payload.
 *
 * <p>The grammar is checked by shape (see {@link RequestKind}): the tags in their order with the
 * bars before each. Values that belong to the header are judged by {@link HeaderCheck}.
 */
final class RequestParser {
    private static final String QUERY_HEADER = "F|KIND|BHNO|CB|IP|11|VER|65|SN";
    private static final String[] ORDER_HEADERS = {
        "F|KIND|BHNO|CB|IP|11|VER|SN|65|14",
        "F|KIND|BHNO|CB|IP|11|VER|SN|65|14",
        "F|KIND|CB|BHNO|VER|SN|11|65|14",
    };
    private static final String TIME_STAMP = "|21|22|23|24|V4";

    /** Free texts: no other value may hold an equals sign. */
    private static final String FREE_TEXTS = "PWD|54|55|NAME|ADDRESS|TEL|MSG";

    /** Stands in a shape where two fields run into each other without a bar. */
    private static final String NO_BAR = "~";

    private final Map<String, String> fields = new LinkedHashMap<>();
    private final StringBuilder shape = new StringBuilder();
    private String payload = "";

    private RequestParser() {}

    static Request parse(String text) throws Refusal {
        return new RequestParser().read(text);
    }

    private Request read(String text) throws Refusal {
        boolean order = text.startsWith("F=1|");
        if (!order && !text.startsWith("F=7|")) {
            throw Refusal.malformed("F");
        }
        split(order ? cutPayload(text) : text);
        RequestKind kind = order ? orderKind() : queryKind();
        String tail = shape.substring(order ? orderHeader(kind) : queryHeader());
        if (!kind.accepts(tail)) {
            throw Refusal.malformed("order of fields " + tail.replace('|', '/'));
        }
        if (kind.market != '*' && value("KIND").charAt(0) != kind.market) {
            throw Refusal.malformed("KIND");
        }
        if (!order && !value("01").equals(kind.ending)) {
            throw Refusal.malformed("01");
        }
        if (kind.escaped) {
            unescape(text);
        }
        return new Request(kind, fields, payload);
    }

    /** The payload stands behind the first "!!" of the last field. */
    private String cutPayload(String text) {
        int last = text.lastIndexOf('|');
        int mark = text.indexOf("!!", last);
        if (mark < 0) {
            return text;
        }
        payload = text.substring(mark + 2);
        return text.substring(0, mark);
    }

    private void split(String text) throws Refusal {
        int at = 0;
        while (at < text.length()) {
            int start = at;
            while (start < text.length() && text.charAt(start) == '|') {
                start++;
            }
            int end = text.indexOf('|', start);
            if (end < 0) {
                end = text.length();
            }
            addField(text.substring(at, start), text.substring(start, end));
            at = end;
        }
    }

    private void addField(String bars, String field) throws Refusal {
        int equals = field.indexOf('=');
        String tag = equals < 0 ? field : field.substring(0, equals);
        if (equals < 0 || !tag.matches("[A-Z0-9]{1,7}")) {
            throw Refusal.malformed(tag);
        }
        String value = field.substring(equals + 1);
        if (tag.equals("14") && value.startsWith("15=", 1)) {
            put(bars, tag, value.substring(0, 1));
            put(NO_BAR, "15", value.substring(4));
        } else if (value.indexOf('=') >= 0 && !tag.matches(FREE_TEXTS)) {
            throw Refusal.malformed(tag);
        } else {
            put(bars, tag, value);
        }
    }

    private void put(String bars, String tag, String value) throws Refusal {
        if (fields.putIfAbsent(tag, value) != null) {
            throw Refusal.malformed("twice " + tag);
        }
        shape.append(bars).append(tag);
    }

    private String value(String tag) {
        return fields.getOrDefault(tag, "");
    }

    private RequestKind queryKind() throws Refusal {
        return RequestKind.ofQuery(value("FUNC") + value("FUNC1"));
    }

    private RequestKind orderKind() throws Refusal {
        int variant = !fields.containsKey("IP") ? 2 : fields.containsKey("PL") ? 1 : 0;
        if (value("14").length() != 1 || value("KIND").length() != 1) {
            throw Refusal.malformed("14");
        }
        if (variant == 1 && !value("PL").equals("S")) {
            throw Refusal.malformed("PL");
        }
        return RequestKind.ofOrder(value("KIND").charAt(0), value("14").charAt(0), variant);
    }

    /** Length of the query header's part of the shape. */
    private int queryHeader() throws Refusal {
        String block = "";
        if (fields.containsKey("15")) {
            boolean account = fields.containsKey("ACNO");
            boolean idNumber = value("15").equals("1");
            block = "|15" + (idNumber ? "|IDNO" : "") + (account ? "|ACNO" : "") + "|PWD";
            if (!idNumber && !value("15").equals("0")
                    || account && !value("ACNO").matches("[0-9]{7}")) {
                throw Refusal.malformed("15");
            }
        }
        return expect(QUERY_HEADER + block);
    }

    /** Length of the order header's part of the shape: identity block and time stamp included. */
    private int orderHeader(RequestKind kind) throws Refusal {
        boolean byId = value("15").equals("1");
        if (!byId && !value("15").equals("0")) {
            throw Refusal.malformed("15");
        }
        boolean account = fields.containsKey("ACNO");
        if (!byId && !account) {
            throw Refusal.malformed("ACNO");
        }
        String block = (byId && kind.variant == 0 ? NO_BAR : "|") + "15|IDNO"
                + (account ? "|ACNO" : "")
                + "|PWD"
                // the blocks that lead with the ID number end with a bar of their own
                + (byId ? "|" : "");
        String stamp = kind.variant == 2 ? "" : TIME_STAMP;
        if (kind.variant == 0 && fields.containsKey("44")) {
            stamp += "|44";
        }
        return expect(ORDER_HEADERS[kind.variant] + block + stamp);
    }

    private int expect(String header) throws Refusal {
        if (shape.indexOf(header) != 0) {
            throw Refusal.malformed("header");
        }
        return header.length();
    }

    private void unescape(String text) throws Refusal {
        if (text.indexOf(' ') >= 0) {
            throw Refusal.malformed("blank");
        }
        fields.replaceAll((tag, value) -> value.replace("%20", " "));
    }
}
