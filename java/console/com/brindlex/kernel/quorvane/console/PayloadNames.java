package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.console.Explanation.Item;
import java.util.ArrayList;
import java.util.List;

/** Names the values of a signature payload. */
final class PayloadNames {
    private PayloadNames() {}

    /**
     * The values of a payload, each with its name; the whole payload in one piece when a value of
     * it holds the sign that separates them.
     *
     * @param stocks whether the order is one of stocks
     * @param function letter of the order function
     * @param sign the sign between two values
     * @param payload the payload behind its "!!"
     * @param offset where it begins in the line
     */
    static List<Item> name(boolean stocks, char function, char sign, String payload, int offset) {
        String[] values = payload.split(String.valueOf(sign), -1);
        String market = stocks ? "S" : "F";
        for (String letter : new String[] {String.valueOf(function), "*"}) {
            for (String[] form : Dictionary.PAYLOADS) {
                if (form[0].equals(market + letter + sign) && form.length - 1 == values.length) {
                    return items(form, values, offset);
                }
            }
        }
        return List.of(new Item(offset, "!!", payload, "signature payload", ""));
    }

    private static List<Item> items(String[] form, String[] values, int offset) {
        List<Item> items = new ArrayList<>();
        int at = offset;
        for (int i = 0; i < values.length; i++) {
            items.add(new Item(at, "!!" + (i + 1), values[i], form[i + 1], ""));
            at += values[i].length() + 1;
        }
        return items;
    }
}
