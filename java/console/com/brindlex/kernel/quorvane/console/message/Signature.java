package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.message.Binding.Bound;
import com.brindlex.kernel.quorvane.console.message.Template.Part;
import com.brindlex.kernel.quorvane.console.message.Template.Slot;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/** Holds a signature payload, place by place, against the body that it signs. */
final class Signature {
    private final Binding binding;
    private final String separator;

    private Signature(Binding binding) {
        this.binding = binding;
        this.separator = separator(binding.template);
    }

    /** What stands between the places: commas in tag PL, underscores in a bare payload. */
    static String separator(Template template) {
        return template.has("PL") ? "," : "_";
    }

    static void check(Binding binding, Slot slot, Cut.Piece piece) {
        new Signature(binding).check(slot, piece);
    }

    private void check(Slot slot, Cut.Piece piece) {
        List<List<Part>> places = places(slot.parts(), separator);
        List<String> values = Arrays.asList(piece.value().split(separator, -1));
        if (places.size() != values.size()) {
            if (!piece.value().equals(rendered(slot.parts()))) {
                binding.fault(piece.at(), "signature-places", "the signature payload has "
                                + values.size() + " places, not " + places.size());
            }
            return;
        }
        int offset = piece.at();
        for (int i = 0; i < places.size(); i++) {
            checkPlace(places.get(i), values.get(i), offset);
            offset += values.get(i).length() + separator.length();
        }
    }

    /** The payload as the body makes it; an unknown place makes it none. */
    private String rendered(List<Part> parts) {
        StringBuilder out = new StringBuilder();
        for (Part part : parts) {
            Bound known = part.isPlace() ? binding.bound.get(part.key()) : null;
            if (part.isPlace() && known == null) {
                return null;
            }
            out.append(part.isPlace() ? known.wire() : part.literal());
        }
        return out.toString();
    }

    /** Cuts the parts of a payload at its separators. */
    static List<List<Part>> places(List<Part> parts, String separator) {
        List<List<Part>> places = new ArrayList<>();
        places.add(new ArrayList<>(2));
        for (Part part : parts) {
            if (part.isPlace()) {
                places.get(places.size() - 1).add(part);
                continue;
            }
            String[] pieces = part.literal().split(separator, -1);
            for (int i = 0; i < pieces.length; i++) {
                if (i > 0) {
                    places.add(new ArrayList<>(2));
                }
                if (!pieces[i].isEmpty()) {
                    places.get(places.size() - 1).add(new Part(pieces[i], part.name(), null, null,
                            null));
                }
            }
        }
        return places;
    }

    private void checkPlace(List<Part> parts, String value, int offset) {
        String expected = rendered(parts);
        if (value.equals(expected)) {
            return;
        }
        if (parts.size() == 1 && parts.get(0).isPlace() && expected == null) {
            Part part = parts.get(0);
            binding.bound.put(part.key(), new Bound(part, value, Cut.PAYLOAD, offset));
            return;
        }
        if (expected == null) {
            checkJoined(parts, value, offset);
            return;
        }
        Bound known = parts.size() == 1 && parts.get(0).isPlace()
                ? binding.bound.get(parts.get(0).key()) : null;
        binding.fault(offset, "signature-mismatch", known == null
                        ? "the signature says " + binding.quoted(value) + ", the body makes it "
                                + binding.quoted(expected)
                        : binding.label(known.tag()) + ": the signature says "
                                + binding.quoted(value) + ", tag " + known.tag() + " says "
                                + binding.quoted(known.wire()));
    }

    /** A place of several parts, of which the body does not know one. */
    private void checkJoined(List<Part> parts, String value, int offset) {
        int at = 0;
        for (Part part : parts) {
            Bound known = part.isPlace() ? binding.bound.get(part.key()) : null;
            if (part.isPlace() && known == null) {
                return;
            }
            String text = part.isPlace() ? known.wire() : part.literal();
            if (!value.startsWith(text, at)) {
                binding.fault(offset, "signature-mismatch", "the signature says "
                                + binding.quoted(value) + ", which does not begin with "
                                + binding.quoted(text));
                return;
            }
            at += text.length();
        }
    }
}
