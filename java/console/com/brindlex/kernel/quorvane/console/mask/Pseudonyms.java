package com.brindlex.kernel.quorvane.console.mask;

import com.brindlex.kernel.quorvane.console.Utf8;
import java.net.URLEncoder;
import java.nio.charset.StandardCharsets;
import java.time.LocalDate;
import java.util.Base64;
import java.util.EnumMap;
import java.util.HashMap;
import java.util.HashSet;
import java.util.LinkedHashMap;
import java.util.Map;
import java.util.Set;

/** What stands for each secret: the same text wherever the secret stands. */
final class Pseudonyms {
    /** A shorter secret is replaced in its fields and lines alone; also a number of few digits. */
    private static final int SHORTEST_WORD = 4;
    private static final int SHORTEST_NUMBER = 6;

    private final Map<Secret, Map<String, String>> names = new EnumMap<>(Secret.class);
    private final Map<String, String> forms = new LinkedHashMap<>();
    private final Map<String, String> alone = new HashMap<>();
    private final Set<String> taken = new HashSet<>();
    private Forms finder;

    /** Learns a secret. */
    void add(Secret kind, String value) {
        String key = key(kind, value);
        if (key.isBlank()) {
            return;
        }
        taken.add(value);
        names.computeIfAbsent(kind, each -> new LinkedHashMap<>()).putIfAbsent(key, "");
        finder = null;
    }

    /** An account is the same with zeros before it and without. */
    private static String key(Secret kind, String value) {
        return kind == Secret.ACCOUNT && value.matches("[0-9]+")
                ? value.replaceFirst("^0+(?=[0-9])", "") : value;
    }

    /** What stands for a secret; the value itself when it was never learned. */
    String of(Secret kind, String value) {
        prepare();
        Map<String, String> known = names.getOrDefault(kind, Map.of());
        String key = key(kind, value);
        String name = known.get(key);
        if (name == null) {
            return value;
        }
        return kind == Secret.ACCOUNT && value.matches("[0-9]+") ? padded(name, value.length())
                                                                : name;
    }

    private static String padded(String number, int length) {
        return "0".repeat(Math.max(0, length - number.length())) + number;
    }

    /** Finds every form of every secret that may stand anywhere in a text. */
    Forms finder() {
        prepare();
        return finder;
    }

    /** What stands for a form that was found. */
    String ofForm(String form) {
        return forms.get(form);
    }

    /** What stands for a text that is a secret from its begin to its end; null when it is none. */
    String ofWhole(String text) {
        prepare();
        return alone.get(text);
    }

    private void prepare() {
        if (finder != null) {
            return;
        }
        forms.clear();
        alone.clear();
        names.forEach(this::name);
        finder = new Forms(forms.keySet());
    }

    private void name(Secret kind, Map<String, String> known) {
        int number = 0;
        for (Map.Entry<String, String> each : known.entrySet()) {
            String name;
            do {
                name = name(kind, each.getKey(), ++number);
            } while (taken.contains(name));
            each.setValue(name);
            addForms(kind, each.getKey(), name);
        }
    }

    private static String name(Secret kind, String value, int number) {
        return switch (kind) {
            case PASSWORD -> "password" + number;
            case ID -> id(value, number);
            case ACCOUNT -> value.matches("[0-9]+") ? String.valueOf(number) : "ACCT" + number;
            case SIGNATURE -> "certificate " + number;
            case PERSON -> value.matches("[0-9]{6,8}") ? birthday(number) : "person " + number;
        };
    }

    private static String birthday(int number) {
        return LocalDate.of(1950, 1, 1).plusDays(number - 1).toString().replace("-", "");
    }

    /** As long as the ID number, since the length decides how it is sent. */
    private static String id(String value, int number) {
        boolean letter = Character.isLetter(value.charAt(0));
        int length = Math.min(10, Math.max(8, value.length()));
        return (letter ? "A" : "") + padded(String.valueOf(number), letter ? length - 1 : length);
    }

    private void addForms(Secret kind, String value, String name) {
        if (kind == Secret.ACCOUNT && value.matches("[0-9]+")) {
            String seven = padded(value, 7);
            put(seven, padded(name, 7));
            alone.put(value, padded(name, value.length()));
            return;
        }
        alone.put(value, name);
        int bytes = Utf8.length(value);
        boolean few = bytes < SHORTEST_WORD || value.length() < Forms.SHORTEST
                || bytes < SHORTEST_NUMBER && value.matches("[0-9]+");
        if (few) {
            return;
        }
        put(value, name);
        put(value.replace(" ", "%20"), name.replace(" ", "%20"));
        if (kind == Secret.PASSWORD || kind == Secret.ID) {
            put(base64(value), base64(name));
            String escaped = URLEncoder.encode(value, StandardCharsets.UTF_8);
            put(escaped, name);
            put(escaped.replace("+", "%20"), name);
            put(asApps(escaped), name);
            put(value.replace("\\", "\\\\").replace("\"", "\\\""), name);
        }
    }

    private void put(String form, String name) {
        forms.putIfAbsent(form, name);
        alone.putIfAbsent(form, name);
    }

    /** What an app's URI leaves as it is, a form's encoding escapes. */
    private static String asApps(String escaped) {
        return escaped.replace("+", "%20").replace("%21", "!").replace("%27", "'")
                .replace("%28", "(").replace("%29", ")").replace("%7E", "~");
    }

    private static String base64(String text) {
        return Base64.getEncoder().encodeToString(text.getBytes(StandardCharsets.UTF_8));
    }
}
