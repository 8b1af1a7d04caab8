package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Operation;
import java.util.ArrayList;
import java.util.HashMap;
import java.util.List;
import java.util.Map;

/** Takes requests apart. */
final class RequestReader {
    private static final String REFUSED = "[CLIENT]";

    private RequestReader() {}

    static Message read(String text, boolean full) {
        String request = stripped(text);
        int refused = request.indexOf(REFUSED);
        String body = refused > 0 ? request.substring(0, refused) : request;
        List<Cut.Piece> pieces = Cut.request(body);
        String tags = Cut.tags(pieces);
        RequestForms forms = RequestForms.get();
        List<Template> alike = forms.withTags(tags);
        if (alike.isEmpty() && (refused > 0 || forms.isHeader(tags))) {
            return header(text, request, pieces, refused, full);
        }
        List<Template> same = new ArrayList<>(alike);
        same.removeIf(each -> !each.hasConstants(pieces));
        List<Binding> best = Binding.best(same, pieces, tags, request);
        if (best.isEmpty() || !best.get(0).fits()) {
            List<Template> all = new ArrayList<>(alike);
            all.addAll(forms.closest(pieces));
            best = Binding.best(all, pieces, tags, request);
        }
        Binding binding = best.get(0);
        List<String> operations = best.size() == 1 ? List.of(binding.template.operation.name())
                : best.stream().map(each -> each.template.operation.name()).distinct().toList();
        return new Message(Kind.REQUEST, operations, RequestWords.of(binding), text,
                full ? groups(binding, pieces) : List.of(), binding.faults, facts(binding, pieces));
    }

    /** Without the line feed that ends some requests. */
    private static String stripped(String text) {
        int end = text.length();
        while (end > 0 && (text.charAt(end - 1) == '\n' || text.charAt(end - 1) == '\r')) {
            end--;
        }
        return text.substring(0, end);
    }

    private static Message header(String text, String request, List<Cut.Piece> pieces,
            int refused, boolean full) {
        Map<String, String> facts = headerFacts(pieces);
        List<Group> fields = full ? List.of(new Group("fields", named(pieces, "account")))
                                  : List.of();
        if (refused <= 0) {
            return new Message(Kind.HEADER, List.of(), "header of a request", text, fields,
                    List.of(), facts);
        }
        String said = request.substring(refused);
        String english = Dictionary.get().english(said);
        facts.put("outcome", "refused");
        List<Group> groups = new ArrayList<>(fields);
        groups.add(new Group("message", List.of(new Field(refused, "", said,
                "message of the library", english))));
        return new Message(Kind.MESSAGE, List.of(), "refused by the library: "
                        + (english.isEmpty() ? said : english), text, groups, List.of(), facts);
    }

    private static List<Field> named(List<Cut.Piece> pieces, String scene) {
        Map<String, Dictionary.Tag> tags = Dictionary.get().tags(scene);
        Map<String, Dictionary.Tag> orders = Dictionary.get().tags("stockOrder");
        List<Field> fields = new ArrayList<>();
        for (Cut.Piece piece : pieces) {
            Dictionary.Tag tag = tags.getOrDefault(piece.tag(), orders.get(piece.tag()));
            if (!piece.tag().isEmpty() || !piece.value().isEmpty()) {
                fields.add(new Field(piece.offset(), piece.tag(), piece.value(),
                        tag == null ? null : tag.label(), ""));
            }
        }
        return fields;
    }

    private static List<Group> groups(Binding binding, List<Cut.Piece> pieces) {
        Map<String, Binding.Bound> byField = new HashMap<>();
        binding.bound.values().forEach(each -> byField.putIfAbsent(each.tag(), each));
        Map<String, Dictionary.Tag> tags =
                Dictionary.get().tags(binding.template.operation.scene());
        List<Field> fields = new ArrayList<>(pieces.size());
        List<Field> signed = new ArrayList<>();
        for (Cut.Piece piece : pieces) {
            if (piece.tag().equals(Cut.PAYLOAD)) {
                signed = payload(binding, piece);
            } else if (!piece.tag().isEmpty() || !piece.value().isEmpty()) {
                Dictionary.Tag tag = tags.get(piece.tag());
                Binding.Bound bound = byField.get(piece.tag());
                fields.add(new Field(piece.offset(), piece.tag(), piece.value(),
                        tag == null ? null : tag.label(),
                        bound != null ? Meaning.of(binding, bound) : tag == null ? ""
                                : Meaning.ofTag(binding.template.operation, tag.name(),
                                        piece.value())));
            }
        }
        return signed.isEmpty() ? List.of(new Group("fields", fields))
                : List.of(new Group("fields", fields), new Group("signature payload", signed));
    }

    /** The places of a signature payload, named as the form names them. */
    private static List<Field> payload(Binding binding, Cut.Piece piece) {
        String separator = binding.template.separator;
        List<List<Template.Part>> places = binding.template.signed;
        List<Field> fields = new ArrayList<>();
        int offset = piece.at();
        int at = 0;
        for (String value : piece.value().split(separator, -1)) {
            if (at >= places.size() || !places.get(at).isEmpty() || !value.isEmpty()) {
                fields.add(new Field(offset, String.valueOf(at), value,
                        at < places.size() ? name(binding, places.get(at)) : null, ""));
            }
            offset += value.length() + separator.length();
            at++;
        }
        return fields;
    }

    private static String name(Binding binding, List<Template.Part> parts) {
        StringBuilder name = new StringBuilder();
        for (Template.Part part : parts) {
            if (part.name() != null) {
                name.append(name.length() == 0 ? "" : " and ").append(binding.label(part));
            }
        }
        return name.length() == 0 ? "always so" : name.toString();
    }

    private static Map<String, String> headerFacts(List<Cut.Piece> pieces) {
        Map<String, String> facts = new HashMap<>();
        put(facts, "requestId", Cut.value(pieces, "65"));
        put(facts, "branch", Cut.value(pieces, "BHNO"));
        put(facts, "account", Cut.value(pieces, "ACNO"));
        put(facts, "idNumber", Cut.value(pieces, "IDNO"));
        return facts;
    }

    private static Map<String, String> facts(Binding binding, List<Cut.Piece> pieces) {
        Map<String, String> facts = headerFacts(pieces);
        Operation operation = binding.template.operation;
        String instrument = binding.wire("stockCode");
        put(facts, "instrument", instrument.isEmpty() ? binding.wire("commodity1") : instrument);
        put(facts, "order", binding.wire("orderReference|first"));
        put(facts, "title", operation.title());
        return facts;
    }

    private static void put(Map<String, String> facts, String name, String value) {
        if (!value.isEmpty()) {
            facts.put(name, value);
        }
    }
}
