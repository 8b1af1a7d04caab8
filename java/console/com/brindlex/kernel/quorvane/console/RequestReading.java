package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.console.Explanation.Group;
import com.brindlex.kernel.quorvane.console.Explanation.Item;
import com.brindlex.kernel.quorvane.console.Explanation.Kind;
import com.brindlex.kernel.quorvane.console.Explanation.Trouble;
import com.brindlex.kernel.quorvane.typed.Operation;
import java.util.ArrayList;
import java.util.List;

/** Explains requests. */
final class RequestReading {
    private static final String REFUSAL = "[CLIENT]";

    private RequestReading() {}

    static Explanation explain(String text, Operation hint) {
        RequestForm.Match match = RequestForm.match(text, hint);
        List<Trouble> faults = new ArrayList<>();
        String summary;
        int refused = text.indexOf(REFUSAL);
        if (refused > 0) {
            faults.add(new Trouble(refused, "the library refused to go on here: "
                            + Messages.english(text.substring(refused + REFUSAL.length()).trim())));
            summary = "request that the library refused";
        } else if (RequestForm.isHeader(text, match)) {
            summary = "header of a request, before the fields of its operation";
        } else {
            summary = match.operations().isEmpty() || match.reach() <= 0
                    ? "request" : "request: " + match.operations().get(0).summary();
            if (!match.isWhole()) {
                faults.add(new Trouble(match.reach(), broken(text, match)));
            }
        }
        List<Operation> operations = refused > 0 || summary.startsWith("header")
                ? List.of() : match.operations();
        List<Group> groups = groups(text, operations, faults);
        return new Explanation(Kind.REQUEST, operations, summary, text, groups, faults);
    }

    private static String broken(String text, RequestForm.Match match) {
        String wanted = match.expected().equals("the end")
                ? "the request should end" : "'" + match.expected() + "' should stand";
        if (match.reach() >= text.length()) {
            return "the line ends where " + wanted;
        }
        int bar = text.indexOf('|', match.reach() + 1);
        String there = text.substring(match.reach(), bar < 0 ? text.length() : bar);
        return "'" + there + "' stands where " + wanted;
    }

    private static List<Group> groups(
            String text, List<Operation> operations, List<Trouble> faults) {
        List<WireField> fields = WireField.cut(text);
        Operation operation = operations.isEmpty() ? null : operations.get(0);
        Scene scene = operation == null
                ? Scene.ofRequest(fields) : Scene.ofOperation(operation.method());
        List<Item> items = new ArrayList<>();
        List<Item> signed = new ArrayList<>();
        String function = WireField.value(fields, "14");
        String signature = "";
        for (Token token : Token.cut(text)) {
            String tag = token.tag();
            if (tag.equals(FieldNames.PAYLOAD)) {
                char sign = signature.equals("PL") ? ',' : '_';
                boolean stocks = scene != Scene.FUTURES_ORDER;
                char letter = function.isEmpty() ? '?' : function.charAt(0);
                signed.addAll(PayloadNames.name(
                        stocks, letter, sign, token.value(), token.start() + 2));
                continue;
            }
            signature = tag;
            String name = FieldNames.name(scene, tag);
            if (tag.isEmpty() && token.value().startsWith(REFUSAL)) {
                name = "message of the library";
            } else if (name == null) {
                faults.add(new Trouble(token.start(), tag.isEmpty()
                                ? "'" + token.value() + "' has no tag" : "unknown tag " + tag));
            } else if (!TagReading.fits(tag, token.value().trim())) {
                faults.add(new Trouble(token.start() + tag.length() + 1,
                        "'" + token.value() + "' is no value for tag " + tag));
            }
            String reading = TagReading.of(tag, token.value(), scene, operation);
            if (reading.isEmpty() && token.value().contains("%20")) {
                reading = token.value().replace("%20", " ");
            }
            items.add(new Item(token.start(), tag, token.value(), name, reading));
        }
        List<Group> groups = new ArrayList<>();
        groups.add(new Group("fields", items));
        if (!signed.isEmpty()) {
            groups.add(new Group("signature payload", signed));
        }
        return groups;
    }
}
