package com.brindlex.kernel.quorvane.console;

import java.util.ArrayList;
import java.util.List;

/**
 * One field of a request or reply as it stands on the wire.
 *
 * @param bars how many bars stand before it
 * @param tag the tag; empty when the text has no '='
 * @param value the value, or the whole text when there is no tag
 */
public record WireField(int bars, String tag, String value) {
    /** Cuts a message into its fields. Nothing is judged here: any text can be cut. */
    public static List<WireField> cut(String message) {
        List<WireField> fields = new ArrayList<>();
        int at = 0;
        while (at < message.length()) {
            int start = at;
            while (start < message.length() && message.charAt(start) == '|') {
                start++;
            }
            int end = message.indexOf('|', start);
            if (end < 0) {
                end = message.length();
            }
            if (end > start) {
                add(fields, start - at, message.substring(start, end));
            }
            at = end;
        }
        return fields;
    }

    private static void add(List<WireField> fields, int bars, String text) {
        int equals = text.indexOf('=');
        String tag = equals < 0 ? "" : text.substring(0, equals);
        String value = text.substring(equals + 1);
        if (tag.equals("14") && value.startsWith("15=", 1)) {
            // the identity block of one order header follows without a bar
            fields.add(new WireField(bars, tag, value.substring(0, 1)));
            fields.add(new WireField(0, "15", value.substring(4)));
        } else {
            addWithPayload(fields, bars, tag, value);
        }
    }

    /** A bare signature payload follows the last value behind "!!". */
    private static void addWithPayload(List<WireField> fields, int bars, String tag, String value) {
        int payload = value.indexOf("!!");
        if (payload < 0 || tag.isEmpty()) {
            fields.add(new WireField(bars, tag, value));
        } else {
            fields.add(new WireField(bars, tag, value.substring(0, payload)));
            fields.add(new WireField(0, FieldNames.PAYLOAD, value.substring(payload + 2)));
        }
    }

    /** The value of the first field with this tag, or the empty text. */
    public static String value(List<WireField> fields, String tag) {
        for (WireField field : fields) {
            if (field.tag.equals(tag)) {
                return field.value;
            }
        }
        return "";
    }
}
