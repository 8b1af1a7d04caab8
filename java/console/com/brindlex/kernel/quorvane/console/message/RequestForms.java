package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.Newest;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Header;
import com.brindlex.kernel.quorvane.console.dictionary.Operation;
import java.util.ArrayList;
import java.util.HashMap;
import java.util.HashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;

/** Every form that a request can have, found by the tags of a request in their order. */
final class RequestForms {
    /** What a request is for: values that weigh more than a field in common. */
    private static final List<String> TELLING = List.of("F", "FUNC", "FUNC1", "14", "KIND", "15");

    /** What a field in common weighs. */
    private static final int IN_COMMON = 4;

    /** So many kinds of damaged requests are remembered with the forms that come closest. */
    private static final int MOST_REMEMBERED = 256;
    private static final int LONGEST_REMEMBERED = 1000;

    private static final Header.Identity NOBODY = new Header.Identity("any", "any", "");

    private final List<Template> all = new ArrayList<>();
    private final Map<String, List<Template>> byTags = new HashMap<>();
    private final Set<String> headers = new HashSet<>();
    private final Map<List<String>, List<Template>> closest = new Newest<>(MOST_REMEMBERED);

    private static final class Holder {
        static final RequestForms INSTANCE = new RequestForms(Dictionary.get());
    }

    static RequestForms get() {
        return Holder.INSTANCE;
    }

    private RequestForms(Dictionary dictionary) {
        for (Operation operation : dictionary.operations()) {
            for (Operation.Form form : operation.forms()) {
                add(operation, form, dictionary.header(operation.header()));
            }
        }
    }

    private void add(Operation operation, Operation.Form form, Header header) {
        List<Header.Identity> identities = header.identity().isEmpty()
                ? List.of(NOBODY) : header.identity();
        for (Header.Identity identity : identities) {
            String head = header.begin() + identity.text()
                    + (header.end() == null ? "" : header.end());
            add(new Template(operation, form, header, identity, head + form.body()), head);
            if (header.orderDate() != null) {
                String dated = head + header.orderDate();
                add(new Template(operation, form, header, identity, dated + form.body()), dated);
            }
        }
    }

    private void add(Template template, String head) {
        all.add(template);
        byTags.computeIfAbsent(template.tags, tags -> new ArrayList<>(4)).add(template);
        headers.add(Cut.tags(Cut.request(head.replaceAll("\\{[^}]*\\}", "x"))));
    }

    /** The forms that have these tags in this order. */
    List<Template> withTags(String tags) {
        return byTags.getOrDefault(tags, List.of());
    }

    /** Whether these are the tags of a header, with nothing behind it. */
    boolean isHeader(String tags) {
        return headers.contains(tags);
    }

    /** The forms that come closest to the fields of a damaged request. */
    List<Template> closest(List<Cut.Piece> pieces) {
        List<String> telling = new ArrayList<>(TELLING.size() + 1);
        telling.add(Cut.tags(pieces));
        TELLING.forEach(tag -> telling.add(Cut.value(pieces, tag)));
        if (telling.stream().mapToInt(String::length).sum() > LONGEST_REMEMBERED) {
            return search(pieces);
        }
        synchronized (closest) {
            return closest.computeIfAbsent(telling, each -> search(pieces));
        }
    }

    private List<Template> search(List<Cut.Piece> pieces) {
        List<Template> best = new ArrayList<>();
        int most = Integer.MIN_VALUE;
        Set<String> tags = new HashSet<>();
        pieces.forEach(piece -> tags.add(piece.tag()));
        for (Template template : all) {
            int told = told(template, pieces);
            int shared = (int) template.slots.stream()
                    .filter(slot -> tags.contains(slot.tag())).count();
            if (told + IN_COMMON * shared < most) {
                continue;  // no order of the fields makes it come closest
            }
            int score = told + IN_COMMON * Alignment.common(template.slots, pieces);
            if (score > most) {
                best.clear();
                most = score;
            }
            if (score == most) {
                best.add(template);
            }
        }
        return best;
    }

    /** What the values say that tell what a request is for, and how many fields it has. */
    private static int told(Template template, List<Cut.Piece> pieces) {
        int score = 0;
        for (String tag : TELLING) {
            String constant = template.constant(tag);
            String value = Cut.value(pieces, tag);
            if (constant != null && !value.isEmpty()) {
                score += constant.equals(value) ? 12 : -12;
            }
        }
        boolean futures = Cut.value(pieces, "KIND").equals("F");
        if (Cut.value(pieces, "F").equals("1")) {
            score += template.operation.isFutures() == futures ? 12 : -12;
        }
        return score - 2 * Math.abs(template.slots.size() - pieces.size());
    }
}
