package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.Argument;
import com.brindlex.kernel.quorvane.console.dictionary.Header;
import com.brindlex.kernel.quorvane.console.dictionary.Operation;
import java.util.ArrayList;
import java.util.List;

/** One form that a request can have, cut into fields with places for what is filled in. */
final class Template {
    /** Stands for the bar of a place while the fields are cut. */
    private static final char BAR = '\u0001';

    /**
     * Fixed text, or a place.
     *
     * @param literal the fixed text; null for a place
     * @param name what fills the place, or what the fixed text is; null when it is nothing
     * @param conversion how it is written; null when it stands as it is
     * @param key name and conversion as one, interned: the rules look values up by literals
     * @param argument the argument of that name; null when the value is worked out
     */
    record Part(String literal, String name, String conversion, String key, Argument argument) {
        static Part fixed(String text) {
            return new Part(text, null, null, null, null);
        }

        boolean isPlace() {
            return literal == null;
        }
    }

    /** A field: its tag, and what its value is made of. */
    record Slot(String tag, List<Part> parts) {}

    final Operation operation;
    final Operation.Form form;
    final Header.Identity identity;
    final List<Slot> slots;
    final String tags;

    /** What stands between the places of the payload: commas in tag PL, else underscores. */
    final String separator;

    /** The places of the signature payload; empty when the form has none. */
    final List<List<Part>> signed;

    /** The fixed value of each field; null for one with a place. */
    private final String[] constants;

    Template(Operation operation, Operation.Form form, Header header, Header.Identity identity,
            String whole) {
        this.operation = operation;
        this.form = form;
        this.identity = identity;
        String text = whole.replace("{key}", header.key() == null ? "" : header.key());
        if (operation.function() != null) {
            text = text.replace("{function}", "{function=" + operation.function() + "}");
        }
        List<Cut.Piece> pieces = Cut.request(hideBars(text.strip()));
        this.slots = pieces.stream()
                .map(piece -> new Slot(piece.tag(), parts(piece.value()))).toList();
        this.tags = Cut.tags(pieces);
        this.separator = has("PL") ? "," : "_";
        this.signed = slots.stream().filter(slot -> slot.tag().equals(Cut.PAYLOAD)).findFirst()
                .map(slot -> Signature.places(slot.parts(), separator)).orElse(List.of());
        this.constants = slots.stream().map(Template::constant).toArray(String[]::new);
    }

    private static String constant(Slot slot) {
        return slot.parts().size() == 1 ? slot.parts().get(0).literal() : null;
    }

    private static String hideBars(String text) {
        StringBuilder out = new StringBuilder(text);
        int depth = 0;
        for (int i = 0; i < out.length(); i++) {
            char c = out.charAt(i);
            depth += c == '{' ? 1 : c == '}' ? -1 : 0;
            if (c == '|' && depth > 0) {
                out.setCharAt(i, BAR);
            }
        }
        return out.toString();
    }

    /** Fixed texts and places, one after the other. */
    private List<Part> parts(String text) {
        List<Part> parts = new ArrayList<>();
        int at = 0;
        while (at < text.length()) {
            int open = text.indexOf('{', at);
            if (open < 0) {
                parts.add(Part.fixed(text.substring(at)));
                break;
            }
            if (open > at) {
                parts.add(Part.fixed(text.substring(at, open)));
            }
            int close = text.indexOf('}', open);
            String inside = text.substring(open + 1, close);
            int fixed = inside.indexOf('=');
            if (fixed > 0) {
                parts.add(new Part(inside.substring(fixed + 1), inside.substring(0, fixed), null,
                        null, null));
                at = close + 1;
                continue;
            }
            String[] place = inside.split(String.valueOf(BAR));
            String conversion = place.length > 1 ? place[1].intern() : null;
            String key = conversion == null ? place[0] : place[0] + "|" + conversion;
            parts.add(new Part(null, place[0].intern(), conversion, key.intern(),
                    operation.argument(place[0])));
            at = close + 1;
        }
        return parts;
    }

    /** The fixed value of a field; null when it has a place or the field is not there. */
    String constant(String tag) {
        for (Slot slot : slots) {
            if (slot.tag().equals(tag)) {
                return slot.parts().isEmpty() ? ""
                        : slot.parts().size() == 1 ? slot.parts().get(0).literal() : null;
            }
        }
        return null;
    }

    /** Whether fields with these tags have the fixed values of this form, too. */
    boolean hasConstants(List<Cut.Piece> pieces) {
        for (int i = 0; i < constants.length; i++) {
            if (constants[i] != null && !constants[i].equals(pieces.get(i).value())) {
                return false;
            }
        }
        return true;
    }

    boolean has(String tag) {
        return slots.stream().anyMatch(slot -> slot.tag().equals(tag));
    }
}
