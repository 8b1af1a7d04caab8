package com.brindlex.kernel.quorvane.console.page;

import com.google.gson.Gson;
import com.google.gson.GsonBuilder;
import java.nio.charset.StandardCharsets;
import java.util.Map;

/**
 * What the page's server answers.
 *
 * @param status the HTTP status
 * @param type the media type of the body
 * @param fileName what a browser saves the body as; null for what it shows
 */
record Answer(int status, String type, byte[] body, String fileName) {
    private static final Gson GSON = new GsonBuilder().serializeNulls().create();

    static Answer json(Object value) {
        return new Answer(200, "application/json", bytes(GSON.toJson(value)), null);
    }

    /** A refusal that says why. */
    static Answer refused(int status, String why) {
        byte[] body = bytes(GSON.toJson(Map.of("error", why)));
        return new Answer(status, "application/json", body, null);
    }

    static Answer file(byte[] body, String fileName) {
        return new Answer(200, "application/octet-stream", body, fileName);
    }

    private static byte[] bytes(String text) {
        return text.getBytes(StandardCharsets.UTF_8);
    }
}
