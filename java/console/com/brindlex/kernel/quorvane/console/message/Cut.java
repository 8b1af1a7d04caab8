package com.brindlex.kernel.quorvane.console.message;

import java.util.ArrayList;
import java.util.List;

/** Cuts a message at its bars. */
final class Cut {
    /** The tag of a signature payload, which has none of its own. */
    static final String PAYLOAD = Payload.MARK;

    private static final int LONGEST_TAG = 7;

    /**
     * A field as it stands.
     *
     * @param tag the tag; empty when the field has none
     * @param offset characters of the message before the field
     * @param at characters of the message before the value
     */
    record Piece(String tag, String value, int offset, int at) {}

    private Cut() {}

    /** The fields of a reply: bars alone separate. */
    static List<Piece> reply(String text) {
        List<Piece> pieces = new ArrayList<>(32);
        int begin = 0;
        while (begin <= text.length()) {
            int bar = text.indexOf('|', begin);
            int end = bar < 0 ? text.length() : bar;
            if (end > begin) {
                pieces.add(piece(text, begin, end));
            }
            begin = end + 1;
        }
        return pieces;
    }

    /**
     * The fields of a request. A doubled bar makes a field without tag and value; some headers
     * write tag 15 straight behind the letter of tag 14; a payload runs to the end.
     */
    static List<Piece> request(String text) {
        List<Piece> pieces = new ArrayList<>(48);
        int mark = Payload.find(text);
        int limit = mark < 0 ? text.length() : mark;
        int begin = 0;
        while (begin <= limit) {
            int bar = text.indexOf('|', begin);
            int end = bar < 0 || bar > limit ? limit : bar;
            Piece piece = piece(text, begin, end);
            int glued = piece.tag().equals("14") ? piece.value().indexOf("15=") : -1;
            if (glued > 0) {
                pieces.add(piece(text, begin, piece.at() + glued));
                pieces.add(piece(text, piece.at() + glued, end));
            } else {
                pieces.add(piece);
            }
            begin = end + 1;
        }
        if (mark >= 0) {
            int at = mark + PAYLOAD.length();
            pieces.add(new Piece(PAYLOAD, text.substring(at), mark, at));
        }
        return pieces;
    }

    private static Piece piece(String text, int begin, int end) {
        int sign = tagEnd(text, begin, end);
        if (sign < 0) {
            return new Piece("", text.substring(begin, end), begin, begin);
        }
        return new Piece(text.substring(begin, sign), text.substring(sign + 1, end), begin,
                sign + 1);
    }

    /** Where the tag of a field ends, before its equals sign; -1 when the field has none. */
    private static int tagEnd(String text, int begin, int end) {
        int last = Math.min(end - 1, begin + LONGEST_TAG);
        for (int i = begin; i <= last; i++) {
            char c = text.charAt(i);
            if (c == '=') {
                return i > begin ? i : -1;
            }
            if (!(c >= '0' && c <= '9' || c >= 'A' && c <= 'Z')) {
                return -1;
            }
        }
        return -1;
    }

    /** The tags of fields in order, as one text to compare by. */
    static String tags(List<Piece> pieces) {
        StringBuilder out = new StringBuilder(pieces.size() * 4);
        for (Piece piece : pieces) {
            out.append(piece.tag()).append('|');
        }
        return out.toString();
    }

    /** The value of the first field with a tag; empty when there is none. */
    static String value(List<Piece> pieces, String tag) {
        for (Piece piece : pieces) {
            if (piece.tag().equals(tag)) {
                return piece.value();
            }
        }
        return "";
    }
}
