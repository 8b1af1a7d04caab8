package com.brindlex.kernel.quorvane.console.page;

import com.brindlex.kernel.quorvane.console.dictionary.Argument;
import com.brindlex.kernel.quorvane.console.dictionary.CodeTable;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Operation;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** What the page's search finds: tags, operations, codes and messages, a line each. */
final class DictionaryPlace {
    private final Dictionary dictionary = Dictionary.get();

    /**
     * Something to find.
     *
     * @param kind tag, operation, code or message
     * @param key what it is looked up by
     * @param title what it is
     * @param more what else there is to say
     * @param where the scenes or the table that it belongs to
     */
    private record Entry(String kind, String key, String title, String more, String where) {}

    Map<String, PageServer.Place> places() {
        return Map.of("GET api/dictionary", question ->
                Answer.json(Map.of("version", dictionary.version(), "entries", entries())));
    }

    private List<Entry> entries() {
        List<Entry> all = new ArrayList<>();
        dictionary.operations().forEach(each -> all.add(operation(each)));
        all.addAll(tags());
        dictionary.codeTables().forEach(table ->
                table.values().forEach(code -> all.add(code(table, code))));
        dictionary.messages().forEach(each -> all.add(
                new Entry("message", each.text(), each.english(), "", each.source())));
        return all;
    }

    private static Entry operation(Operation each) {
        String arguments = String.join(", ",
                each.arguments().stream().map(Argument::name).toList());
        String answered = each.answeredBy().isEmpty() ? ""
                : "; read by " + String.join(", ", each.answeredBy());
        return new Entry("operation", each.name(), each.title(),
                arguments.isEmpty() ? "reads a reply" : arguments + answered, each.scene());
    }

    /** A tag once for each meaning, with all scenes that give it that meaning. */
    private List<Entry> tags() {
        Map<List<String>, List<String>> scenes = new LinkedHashMap<>();
        for (String scene : dictionary.scenes()) {
            dictionary.tags(scene).values().forEach(tag -> scenes.computeIfAbsent(
                    List.of(tag.tag(), tag.label(), tag.name(),
                            tag.note() == null ? "" : tag.note()),
                    each -> new ArrayList<>()).add(scene));
        }
        List<Entry> all = new ArrayList<>();
        scenes.forEach((tag, where) -> all.add(new Entry("tag", tag.get(0), tag.get(1),
                tag.get(3).isEmpty() ? tag.get(2) : tag.get(2) + ": " + tag.get(3),
                where.size() == dictionary.scenes().size() ? "everywhere"
                                                           : String.join(", ", where))));
        return all;
    }

    private static Entry code(CodeTable table, CodeTable.Code code) {
        String wire = code.wire() == null ? "" : "; the gateway sends " + code.wire();
        String name = code.name() == null ? "" : code.name();
        return new Entry("code", code.code().equals(" ") ? "(blank)" : code.code(), code.label(),
                name + wire, table.title());
    }
}
