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

    private Signature(Binding binding) {
        this.binding = binding;
    }

    static void check(Binding binding, Slot slot, Cut.Piece piece) {
        new Signature(binding).check(slot, piece);
    }

    private void check(Slot slot, Cut.Piece piece) {
        String separator = binding.template.separator;
        List<List<Part>> places = binding.template.signed;
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
        if (parts.size() == 1) {
            return rendered(parts.get(0));
        }
        StringBuilder out = new StringBuilder();
        for (Part part : parts) {
            String text = rendered(part);
            if (text == null) {
                return null;
            }
            out.append(text);
        }
        return out.toString();
    }

    private String rendered(Part part) {
        if (!part.isPlace()) {
            return part.literal();
        }
        Bound known = binding.bound.get(part.key());
        return known == null ? null : known.wire();
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
            String text = rendered(part);
            if (text == null) {
                return;
            }
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
