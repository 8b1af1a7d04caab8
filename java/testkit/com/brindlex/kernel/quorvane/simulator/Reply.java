package com.brindlex.kernel.quorvane.simulator;

/** Writes the text of a reply: header, fields, records and the mark that ends a list. */
final class Reply {
    private static final String GOOD = "0000";
    private static final int END_OF_LIST = 999999;

    private final StringBuilder text = new StringBuilder();
    private int records;

    private Reply(String kind) {
        text.append(kind);
    }

    /** Opens the reply to a query that succeeded. */
    static Reply query(Request request) {
        return header("F=7", request).field("68", GOOD);
    }

    /** Opens the reply to an order. */
    static Reply order(Request request) {
        return header("F=1", request);
    }

    private static Reply header(String kind, Request request) {
        return new Reply(kind)
                .field("KIND", request.get("KIND"))
                .field("65", request.get("65"));
    }

    /** The whole reply to a request that is refused; {@code order} picks the form. */
    static String refusal(boolean order, Refusal refusal) {
        if (order) {
            return new Reply("F=1")
                    .field("39", "E")
                    .field("19", "")
                    .field("K1", refusal.getMessage())
                    .text();
        }
        Reply reply =
                new Reply("F=7").field("68", refusal.code()).field("M2", refusal.getMessage());
        reply.open(refusal.code()).field("M2", refusal.getMessage()).close();
        return reply.end().text();
    }

    /** Appends a field; a bar inside a value would break the reply and goes out as '/'. */
    Reply field(String tag, Object value) {
        text.append('|').append(tag).append('=').append(value.toString().replace('|', '/'));
        return this;
    }

    /** Opens the next record, with its sequence number and a good result code. */
    Reply record() {
        return open(GOOD);
    }

    private Reply open(String code) {
        records++;
        return field("00", records).field("67", records).field("68", code);
    }

    /** Closes the record. */
    Reply close() {
        text.append("|01=");
        return this;
    }

    /** Ends the list. */
    Reply end() {
        return field("00", records + 1).field("67", END_OF_LIST).field("68", GOOD).close();
    }

    /** Ends the list; a list without records is a refusal: no data. */
    String list() throws Refusal {
        if (records == 0) {
            throw new Refusal(Refusal.Reason.NO_DATA);
        }
        return end().text();
    }

    String text() {
        return text.toString();
    }
}
