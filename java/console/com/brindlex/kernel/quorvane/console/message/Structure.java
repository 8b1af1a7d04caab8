package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.message.Alignment.Pair;
import java.util.HashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;

/** Says which fields a request lacks, and which it has too many of. */
final class Structure {
    private final List<Pair> pairs;
    private final Map<String, Dictionary.Tag> known;
    private final String text;
    private final List<Fault> faults;
    private final Set<String> moved = new HashSet<>();
    private final Set<String> paired = new HashSet<>();

    private Structure(List<Pair> pairs, Template template, String text, List<Fault> faults) {
        this.pairs = pairs;
        this.known = Dictionary.get().tags(template.operation.scene());
        this.text = text;
        this.faults = faults;
    }

    static void check(List<Pair> pairs, Template template, String text, List<Fault> faults) {
        new Structure(pairs, template, text, faults).check();
    }

    private void check() {
        Set<String> lacking = new HashSet<>();
        for (Pair pair : pairs) {
            if (pair.piece() == null) {
                lacking.add(pair.slot().tag());
            } else if (pair.slot() != null) {
                paired.add(pair.slot().tag());
            }
        }
        pairs.stream().filter(pair -> pair.slot() == null)
                .map(pair -> pair.piece().tag())
                .filter(tag -> lacking.contains(tag) && !tag.isEmpty()).forEach(moved::add);
        int end = endOfRequest();
        for (int i = 0; i < pairs.size(); i++) {
            Pair pair = pairs.get(i);
            if (pair.slot() == null) {
                tooMany(pair.piece());
            } else if (pair.piece() == null && i >= end) {
                boolean unsigned = pair.slot().tag().equals(Cut.PAYLOAD);
                add(text.length(), unsigned ? "no-signature" : "cut-short",
                        "the request ends where " + named(pair) + " should stand");
                return;
            } else if (pair.piece() == null) {
                missing(pair, i);
            }
        }
    }

    /** From where on every field is missing. */
    private int endOfRequest() {
        int end = pairs.size();
        while (end > 0 && pairs.get(end - 1).piece() == null) {
            end--;
        }
        return end;
    }

    private String named(Pair pair) {
        String tag = pair.slot().tag();
        if (tag.equals(Cut.PAYLOAD)) {
            return "the signature payload";
        }
        Dictionary.Tag name = known.get(tag);
        return tag.isEmpty() ? "a second '|'"
                : "tag " + tag + (name == null ? "" : " (" + name.label() + ")");
    }

    private void missing(Pair pair, int at) {
        if (moved.contains(pair.slot().tag())) {
            return;
        }
        int offset = text.length();
        for (int i = at; i < pairs.size(); i++) {
            if (pairs.get(i).piece() != null) {
                offset = pairs.get(i).piece().offset();
                break;
            }
        }
        boolean payload = pair.slot().tag().equals(Cut.PAYLOAD);
        boolean bar = pair.slot().tag().isEmpty();
        add(offset, payload ? "no-signature" : bar ? "missing-bar" : "missing-field",
                named(pair) + " is missing");
    }

    private void tooMany(Cut.Piece piece) {
        String tag = piece.tag();
        if (tag.equals(Cut.PAYLOAD)) {
            add(piece.offset(), "unexpected-signature", "this request has no signature payload");
        } else if (tag.isEmpty() && piece.value().isEmpty()) {
            add(piece.offset(), "doubled-bar", "a second '|' stands here");
        } else if (tag.isEmpty()) {
            add(piece.offset(), "no-tag", "'" + piece.value() + "' has no tag");
        } else if (moved.contains(tag)) {
            add(piece.offset(), "misplaced-field", "tag " + tag + " stands in the wrong place");
        } else if (paired.contains(tag)) {
            add(piece.offset(), "repeated-field", "tag " + tag + " stands twice");
        } else if (known.containsKey(tag)) {
            add(piece.offset(), "unexpected-field", "tag " + tag + " (" + known.get(tag).label()
                            + ") does not belong to this request");
        } else {
            add(piece.offset(), "unknown-tag", "nobody knows tag " + tag);
        }
    }

    private void add(int offset, String kind, String said) {
        faults.add(new Fault(offset, kind, said));
    }
}
