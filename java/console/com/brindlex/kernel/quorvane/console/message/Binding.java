package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.message.Template.Part;
import com.brindlex.kernel.quorvane.console.message.Template.Slot;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;

/** A request laid over a form: what fills each place, and where the two do not fit. */
final class Binding {
    /**
     * What fills a place.
     *
     * @param wire as the request writes it
     * @param tag the field that it stands in first
     * @param offset characters of the message before it
     */
    record Bound(Part part, String wire, String tag, int offset) {}

    /** A condition of a form that does not hold weighs as much as several faults. */
    private static final int CONDITION = 3;

    final Template template;
    final Map<String, Bound> bound;
    final List<Fault> faults = new ArrayList<>();
    private final String text;
    private int conditions;

    private Binding(Template template, String text) {
        this.template = template;
        this.bound = new LinkedHashMap<>(2 * template.slots.size());
        this.text = text;
    }

    /**
     * Lays a request over the one of several forms that fits it best.
     *
     * @param tags the tags of the fields, as {@link Cut#tags} has them
     */
    static List<Binding> best(List<Template> templates, List<Cut.Piece> pieces, String tags,
            String text) {
        List<Binding> best = new ArrayList<>(2);
        for (Template template : templates) {
            Binding binding = new Binding(template, text);
            binding.bind(pieces, tags);
            int order = best.isEmpty() ? -1
                    : Integer.compare(binding.weight(), best.get(0).weight());
            if (order < 0) {
                best.clear();
            }
            if (order <= 0) {
                best.add(binding);
            }
        }
        return best;
    }

    /** Whether nothing is wrong with the form itself. */
    boolean fits() {
        return weight() == 0;
    }

    private int weight() {
        return faults.size() + conditions * CONDITION;
    }

    /** What fills a place; empty when nothing does. */
    String wire(String key) {
        Bound found = bound.get(key);
        return found == null ? "" : found.wire();
    }

    /** What fills the place of a name, however it is written; null when nothing does. */
    Bound named(String name) {
        for (Bound each : bound.values()) {
            if (each.part().name().equals(name)) {
                return each;
            }
        }
        return null;
    }

    private void bind(List<Cut.Piece> pieces, String tags) {
        if (template.tags.equals(tags)) {
            for (int i = 0; i < pieces.size(); i++) {
                bind(template.slots.get(i), pieces.get(i));
            }
        } else {
            List<Alignment.Pair> pairs = Alignment.pairs(template.slots, pieces);
            Structure.check(pairs, template, text, faults);
            for (Alignment.Pair pair : pairs) {
                if (pair.slot() != null && pair.piece() != null) {
                    bind(pair.slot(), pair.piece());
                }
            }
        }
        template.form.when().forEach((name, values) -> {
            Bound found = bound.get(name);
            conditions += found != null && !holds(values, found.wire()) ? 1 : 0;
        });
        Values.check(this);
    }

    /** Whether a value is one of those of a condition: {@code 0 2}, {@code not I A C}. */
    static boolean holds(String values, String value) {
        boolean not = values.startsWith("not ");
        boolean listed = (" " + (not ? values.substring(4) : values) + " ")
                .contains(" " + value + " ");
        return listed != not;
    }

    private void bind(Slot slot, Cut.Piece piece) {
        if (slot.tag().equals(Cut.PAYLOAD)) {
            Signature.check(this, slot, piece);
        } else if (slot.parts().isEmpty()) {
            if (!piece.value().isEmpty()) {
                fault(piece.at(), "not-empty", "tag " + piece.tag() + " is empty in this request; '"
                                + piece.value() + "' stands there");
            }
        } else if (!fill(slot.parts(), piece)) {
            fault(piece.at(), "wrong-constant", "tag " + piece.tag() + " carries '"
                            + shown(slot.parts()) + "' in this request, not '" + piece.value()
                            + "'");
        }
    }

    private static String shown(List<Part> parts) {
        StringBuilder out = new StringBuilder();
        for (Part part : parts) {
            out.append(part.isPlace() ? "..." : part.literal());
        }
        return out.toString();
    }

    /** Fills the places of a value; whether its fixed texts stand where they should. */
    private boolean fill(List<Part> parts, Cut.Piece piece) {
        String value = piece.value();
        int at = 0;
        for (int i = 0; i < parts.size(); i++) {
            Part part = parts.get(i);
            if (!part.isPlace()) {
                if (!value.startsWith(part.literal(), at)) {
                    return false;
                }
                at += part.literal().length();
                continue;
            }
            int end = i + 1 < parts.size() ? value.indexOf(parts.get(i + 1).literal(), at)
                                           : value.length();
            if (end < 0) {
                return false;
            }
            take(part, value.substring(at, end), piece.tag(), piece.at() + at);
            at = end;
        }
        return at == value.length();
    }

    private void take(Part part, String wire, String tag, int offset) {
        Bound known = bound.putIfAbsent(part.key(), new Bound(part, wire, tag, offset));
        if (known != null && !known.wire().equals(wire)) {
            fault(offset, "contradiction", "tag " + tag + " says " + quoted(wire) + ", tag "
                            + known.tag() + " says " + quoted(known.wire()));
        }
    }

    /** A value in a sentence; secrets stay out of it. */
    String quoted(String value) {
        return value.isEmpty() ? "nothing" : "'" + value + "'";
    }

    void fault(int offset, String kind, String said) {
        faults.add(new Fault(offset, kind, said));
    }

    /** What a part is, in words. */
    String label(Part part) {
        Bound known = part.isPlace() ? bound.get(part.key()) : null;
        if (known != null && !known.tag().equals(Cut.PAYLOAD)) {
            return label(known.tag());
        }
        Dictionary.Tag tag =
                Dictionary.get().tagNamed(template.operation.scene(), part.name());
        return tag == null ? part.name().replaceAll("(?=[A-Z])", " ").toLowerCase(Locale.ROOT)
                           : tag.label();
    }

    /** What a tag is, in words; the tag itself when nobody knows. */
    String label(String tag) {
        Dictionary.Tag known = Dictionary.get().tags(template.operation.scene()).get(tag);
        return known == null ? "tag " + tag : known.label();
    }
}
