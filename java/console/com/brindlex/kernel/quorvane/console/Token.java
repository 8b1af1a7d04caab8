package com.brindlex.kernel.quorvane.console;

import java.util.ArrayList;
import java.util.List;

/**
 * A field of a request or reply and where it stands.
 *
 * @param offset characters of the line before its bars
 * @param bars how many bars stand before it
 * @param tag the tag; empty when the text has no '='
 * @param value the value, or the whole text when there is no tag
 */
record Token(int offset, int bars, String tag, String value) {
    /** Characters of the line before the tag. */
    int start() {
        return offset + bars;
    }

    /** Cuts any text into its fields. */
    static List<Token> cut(String text) {
        List<Token> tokens = new ArrayList<>();
        int at = 0;
        for (WireField field : WireField.cut(text)) {
            int start = at + field.bars();
            tokens.add(new Token(at, field.bars(), field.tag(), field.value()));
            boolean payload = field.tag().equals(FieldNames.PAYLOAD);
            boolean tagged = !field.tag().isEmpty() || text.startsWith("=", start);
            at = start + (payload ? 2 : field.tag().length() + (tagged ? 1 : 0))
                    + field.value().length();
        }
        return tokens;
    }
}
