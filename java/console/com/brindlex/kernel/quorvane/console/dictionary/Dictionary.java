package com.brindlex.kernel.quorvane.console.dictionary;

import com.google.gson.Gson;
import com.google.gson.JsonArray;
import com.google.gson.JsonElement;
import com.google.gson.JsonObject;
import com.google.gson.JsonParser;
import java.io.IOException;
import java.io.InputStream;
import java.io.InputStreamReader;
import java.io.Reader;
import java.io.UncheckedIOException;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.Collection;
import java.util.HashMap;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** Every fact of the protocol, read once from the data files that the jar carries. */
public final class Dictionary {
    private static final Gson GSON = new Gson();

    private final String version;
    private final Map<String, Operation> operations = new LinkedHashMap<>();
    private final Map<String, Header> headers = new HashMap<>();
    private final Map<String, String> pieces = new HashMap<>();
    private final Map<String, CodeTable> codes = new LinkedHashMap<>();
    private final Map<String, Reply> replies = new HashMap<>();
    private final Map<String, Map<String, Tag>> scenes = new LinkedHashMap<>();
    private final List<Message> messages = new ArrayList<>();
    private final Map<String, String> english = new HashMap<>();

    /** A tag as a scene names it. */
    public record Tag(String tag, String name, String label, String note) {}

    /** A message that the library or the gateway writes. */
    public record Message(String id, String source, String text, String english) {}

    private record Piece(String name, String text) {}

    private record Group(String name, List<Tag> tags) {}

    private record Scene(String name, List<String> groups) {}

    private static final class Holder {
        static final Dictionary INSTANCE = new Dictionary();
    }

    /** The dictionary. */
    public static Dictionary get() {
        return Holder.INSTANCE;
    }

    private Dictionary() {
        JsonObject head = part("dictionary");
        version = head.get("version").getAsString();
        JsonObject all = new JsonObject();
        for (JsonElement name : head.getAsJsonArray("parts")) {
            part(name.getAsString()).entrySet().forEach(each ->
                    all.add(each.getKey(), each.getValue()));
        }
        rows(all, "headers", Header.class).forEach(each -> headers.put(each.name(), each));
        rows(all, "pieces", Piece.class).forEach(each -> pieces.put(each.name(), each.text()));
        rows(all, "tables", CodeTable.class).forEach(each -> codes.put(each.name(), each));
        rows(all, "replies", Reply.class).forEach(each -> replies.put(each.decoder(), whole(each)));
        messages.addAll(rows(all, "messages", Message.class));
        messages.forEach(each -> english.put(each.text().strip(), each.english()));
        readScenes(all);
        JsonObject sets = all.getAsJsonObject("argumentSets");
        for (JsonElement each : all.getAsJsonArray("operations")) {
            Operation operation = operation(each.getAsJsonObject(), sets);
            operations.put(operation.name(), operation);
        }
    }

    private static JsonObject part(String name) {
        InputStream in = Dictionary.class.getResourceAsStream(name + ".json");
        if (in == null) {
            throw new IllegalStateException("the console was built without " + name + ".json");
        }
        try (Reader reader = new InputStreamReader(in, StandardCharsets.UTF_8)) {
            return JsonParser.parseReader(reader).getAsJsonObject();
        } catch (IOException broken) {
            throw new UncheckedIOException(broken);
        }
    }

    private static <T> List<T> rows(JsonObject all, String name, Class<T> type) {
        List<T> rows = new ArrayList<>();
        for (JsonElement each : all.getAsJsonArray(name)) {
            rows.add(GSON.fromJson(each, type));
        }
        return rows;
    }

    /** A reply whose lists are there, if empty. */
    private static Reply whole(Reply reply) {
        return new Reply(reply.decoder(), reply.result(), orNone(reply.replyTags()), reply.record(),
                orNone(reply.tables()));
    }

    private static <T> List<T> orNone(List<T> list) {
        return list == null ? List.of() : list;
    }

    /** A later group of a scene has the last word on a tag. */
    private void readScenes(JsonObject all) {
        Map<String, Group> groups = new HashMap<>();
        rows(all, "groups", Group.class).forEach(each -> groups.put(each.name(), each));
        for (Scene scene : rows(all, "scenes", Scene.class)) {
            Map<String, Tag> tags = new LinkedHashMap<>();
            for (String group : scene.groups()) {
                groups.get(group).tags().forEach(tag -> tags.put(tag.tag(), tag));
            }
            scenes.put(scene.name(), tags);
        }
    }

    private Operation operation(JsonObject row, JsonObject sets) {
        List<Argument> arguments = new ArrayList<>();
        expand(row.getAsJsonArray("arguments"), sets, arguments);
        List<Operation.Form> forms = new ArrayList<>();
        if (row.has("forms")) {
            for (Operation.Form form : rows(row, "forms", Operation.Form.class)) {
                forms.add(new Operation.Form(form.when() == null ? Map.of() : form.when(),
                        withPieces(form.body())));
            }
        }
        return new Operation(text(row, "name"), text(row, "class"), text(row, "scene"),
                text(row, "title"), text(row, "header"), text(row, "function"),
                row.has("blanksEscaped") && row.get("blanksEscaped").getAsBoolean(),
                List.copyOf(arguments), List.copyOf(forms), texts(row, "answeredBy"),
                texts(row, "refusals"), text(row, "brokerage"));
    }

    private static void expand(JsonArray from, JsonObject sets, List<Argument> to) {
        for (JsonElement each : from) {
            if (each.isJsonPrimitive()) {
                expand(sets.getAsJsonArray(each.getAsString().substring(1)), sets, to);
            } else {
                to.add(GSON.fromJson(each, Argument.class));
            }
        }
    }

    private String withPieces(String body) {
        String whole = body;
        for (Map.Entry<String, String> piece : pieces.entrySet()) {
            whole = whole.replace("<" + piece.getKey() + ">", piece.getValue());
        }
        return whole;
    }

    private static List<String> texts(JsonObject row, String key) {
        List<String> texts = new ArrayList<>();
        if (row.has(key)) {
            row.getAsJsonArray(key).forEach(each -> texts.add(each.getAsString()));
        }
        return List.copyOf(texts);
    }

    private static String text(JsonObject row, String key) {
        return row.has(key) ? row.get(key).getAsString() : null;
    }

    /** The version of the data. */
    public String version() {
        return version;
    }

    /** All operations, as they stand in the dictionary. */
    public Collection<Operation> operations() {
        return operations.values();
    }

    /** An operation by its name; null when there is none. */
    public Operation operation(String name) {
        return operations.get(name);
    }

    /** A header by its name. */
    public Header header(String name) {
        return headers.get(name);
    }

    /** A table of codes by its name. */
    public CodeTable codes(String name) {
        return codes.get(name);
    }

    /** All tables of codes, as they stand in the dictionary. */
    public Collection<CodeTable> codeTables() {
        return codes.values();
    }

    /** The names of the scenes, as they stand in the dictionary. */
    public Collection<String> scenes() {
        return scenes.keySet();
    }

    /** What a decoder reads; null when it is no decoder. */
    public Reply reply(String decoder) {
        return replies.get(decoder);
    }

    /** The tags of a scene by their texts. */
    public Map<String, Tag> tags(String scene) {
        return scenes.getOrDefault(scene, Map.of());
    }

    /** The tag that a scene names so; null when there is none. */
    public Tag tagNamed(String scene, String name) {
        for (Tag tag : tags(scene).values()) {
            if (tag.name().equals(name)) {
                return tag;
            }
        }
        return null;
    }

    /** The messages that the library or the gateway writes. */
    public List<Message> messages() {
        return List.copyOf(messages);
    }

    /** A message in English; empty when it is none that the dictionary knows. */
    public String english(String message) {
        return english.getOrDefault(message.strip(), "");
    }
}
