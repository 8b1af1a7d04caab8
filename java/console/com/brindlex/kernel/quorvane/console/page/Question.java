package com.brindlex.kernel.quorvane.console.page;

import com.google.gson.Gson;
import com.google.gson.JsonParseException;
import com.google.gson.reflect.TypeToken;
import java.net.URLDecoder;
import java.nio.charset.StandardCharsets;
import java.util.HashMap;
import java.util.Map;

/**
 * What the page asks its server.
 *
 * @param path what stands behind the token: {@code api/rows}
 * @param values the values behind the '?'
 * @param body what was sent along; empty for a GET
 */
record Question(String path, Map<String, String> values, byte[] body) {
    private static final Gson GSON = new Gson();

    /** A question whose values stand in {@code query}, as an address writes them; null for none. */
    static Question of(String path, String query, byte[] body) {
        Map<String, String> values = new HashMap<>();
        for (String pair : query == null ? new String[0] : query.split("&")) {
            int equals = pair.indexOf('=');
            if (equals > 0) {
                values.put(pair.substring(0, equals), URLDecoder.decode(
                        pair.substring(equals + 1), StandardCharsets.UTF_8));
            }
        }
        return new Question(path, values, body);
    }

    /** A value; the empty text when it is not there. */
    String value(String name) {
        return values.getOrDefault(name, "");
    }

    /**
     * A value that is a number of 0 or more.
     *
     * @throws IllegalArgumentException when it is none
     */
    int number(String name) {
        String text = value(name);
        if (!text.matches("[0-9]{1,9}")) {
            throw new IllegalArgumentException(name + " must be a number");
        }
        return Integer.parseInt(text);
    }

    /**
     * The texts of a JSON object that was sent along.
     *
     * @throws IllegalArgumentException when it is no such object
     */
    Map<String, String> texts() {
        try {
            Map<String, String> texts = GSON.fromJson(new String(body, StandardCharsets.UTF_8),
                    new TypeToken<Map<String, String>>() { }.getType());
            if (texts != null) {
                return texts;
            }
        } catch (JsonParseException none) {
            // told below, without what was sent
        }
        throw new IllegalArgumentException("an object of texts must be sent along");
    }
}
