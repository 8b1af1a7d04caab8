package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Operation;
import java.util.Collections;
import java.util.LinkedHashMap;
import java.util.Map;

/** A request that has passed the grammar: its kind, its fields and its signature payload. */
final class Request {
    private final RequestKind kind;
    private final Map<String, String> fields;
    private final String payload;

    Request(RequestKind kind, Map<String, String> fields, String payload) {
        this.kind = kind;
        this.fields = new LinkedHashMap<>(fields);
        this.payload = payload;
    }

    /** The encoder that builds such a request. */
    Operation operation() {
        return kind.operation;
    }

    /** Tags and values in their order. */
    Map<String, String> fields() {
        return Collections.unmodifiableMap(fields);
    }

    /** What is asked for. */
    RequestKind kind() {
        return kind;
    }

    /** The value of a tag, empty when the request does not carry it. */
    String get(String tag) {
        return fields.getOrDefault(tag, "");
    }

    /** Whether the request carries the tag, be it with an empty value. */
    boolean has(String tag) {
        return fields.containsKey(tag);
    }

    /** The signature payload, without its leading "!!"; empty when there is none. */
    String payload() {
        return payload;
    }

    /** The market letter of the header. */
    char market() {
        return get("KIND").charAt(0);
    }

    /** The order function letter. */
    char function() {
        return get("14").charAt(0);
    }

    /** A value that must be a whole number that is not negative. */
    long number(String tag) throws Refusal {
        return Texts.number(get(tag), tag);
    }

    /** A value that must be one of the characters of {@code allowed}. */
    char letter(String tag, String allowed) throws Refusal {
        String value = get(tag);
        if (value.length() != 1 || allowed.indexOf(value.charAt(0)) < 0) {
            throw Refusal.malformed(tag);
        }
        return value.charAt(0);
    }

    /** A value that must not be empty. */
    String text(String tag) throws Refusal {
        String value = get(tag);
        if (value.isEmpty()) {
            throw Refusal.malformed(tag);
        }
        return value;
    }
}
