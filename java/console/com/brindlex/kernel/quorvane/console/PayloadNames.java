package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.console.Explanation.Item;
import java.util.ArrayList;
import java.util.List;

/** Names the values of a signature payload. */
final class PayloadNames {
    private static final String KEY =
            "branch|second part of the identity|first part|order function";
    private static final String KEY_1 = "serial number|device address|date|"
            + "branch and second part of the identity|first part|order function";
    private static final String CHANGE = "side|stock code|(order kind)|trade type|(price kind)|";
    private static final String LEG = "side, leg 1|commodity, leg 1|month, leg 1|strike, leg 1|"
            + "call/put, leg 1";
    private static final String LEG_2 = "side, leg 2|commodity, leg 2|month, leg 2|strike, leg 2|"
            + "call/put, leg 2";

    /** By market, function letter and sign; forms of one case differ in their number of values. */
    private static final String[][] FORMS = {
        {"SI_", "side|stock code|quantity|price, price kind or trade type"},
        {"SI,", "side|stock code|order kind|trade type|price kind|quantity|price|(end)"},
        {"SD_", "order number|side|stock code|(empty)|(empty)"},
        {"SD,", CHANGE + "(quantity)|(price)|order number"},
        {"SC_", "order number|side|stock code|quantity|(empty)"},
        {"SC,", CHANGE + "quantity|(price)|order number"},
        {"FI_", "time in force|" + LEG + "|quantity|price"},
        {"FI_", "time in force|" + LEG + "|" + LEG_2 + "|quantity|price"},
        {"FC_", "order number|quantity"},
        {"F*_", "order number"},
        {"F*,", "time in force|W3 flag|price type|" + LEG + "|" + LEG_2
                + "|quantity|price|order number of a change"},
    };

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
        for (String[] form : FORMS) {
            boolean market = form[0].charAt(0) == (stocks ? 'S' : 'F');
            boolean letter = form[0].charAt(1) == function || form[0].charAt(1) == '*';
            String[] names = ((sign == '_' ? KEY : KEY_1) + "|" + form[1]).split("\\|");
            if (market && letter && form[0].charAt(2) == sign && names.length == values.length) {
                return items(names, values, offset);
            }
        }
        return List.of(new Item(offset, "!!", payload, "signature payload", ""));
    }

    private static List<Item> items(String[] names, String[] values, int offset) {
        List<Item> items = new ArrayList<>();
        int at = offset;
        for (int i = 0; i < values.length; i++) {
            items.add(new Item(at, "!!" + (i + 1), values[i], names[i], ""));
            at += values[i].length() + 1;
        }
        return items;
    }
}
