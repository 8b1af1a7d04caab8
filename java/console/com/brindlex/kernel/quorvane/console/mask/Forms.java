package com.brindlex.kernel.quorvane.console.mask;

import java.util.ArrayList;
import java.util.Comparator;
import java.util.HashMap;
import java.util.List;
import java.util.Map;

/** Finds any of many texts within a text, the longest first, by their first three letters. */
final class Forms {
    /** No text is shorter. */
    static final int SHORTEST = 3;

    /** A shorter one counts where it stands as a word alone. */
    private static final int LONG_ENOUGH = 8;

    private final boolean[] begins = new boolean[1 << 16];
    private final Map<Integer, List<String>> forms = new HashMap<>();

    /** A text that was found. */
    record Hit(int begin, int end, String form) {}

    Forms(Iterable<String> all) {
        for (String form : all) {
            int key = key(form, 0);
            begins[key] = true;
            List<String> same = forms.computeIfAbsent(key, each -> new ArrayList<>(1));
            same.add(form);
            same.sort(Comparator.comparingInt(String::length).reversed());
        }
    }

    private static int key(String text, int at) {
        return (text.charAt(at) * 961 + text.charAt(at + 1) * 31 + text.charAt(at + 2)) & 0xFFFF;
    }

    /** All that stands in a text; what was found hides what begins within it. */
    List<Hit> find(String text) {
        List<Hit> hits = new ArrayList<>(0);
        for (int at = 0; at + SHORTEST <= text.length(); at++) {
            int key = key(text, at);
            String form = begins[key] ? at(text, at, forms.get(key)) : null;
            if (form != null) {
                hits.add(new Hit(at, at + form.length(), form));
                at += form.length() - 1;
            }
        }
        return hits;
    }

    private static String at(String text, int at, List<String> same) {
        for (String form : same) {
            boolean whole = form.length() >= LONG_ENOUGH || !isLetter(text, at - 1)
                    && !isLetter(text, at + form.length());
            if (whole && text.startsWith(form, at)) {
                return form;
            }
        }
        return null;
    }

    /** Letters and digits of ASCII go on with a word; Chinese characters stand each for itself. */
    private static boolean isLetter(String text, int at) {
        char c = at < 0 || at >= text.length() ? ' ' : text.charAt(at);
        return c >= '0' && c <= '9' || c >= 'A' && c <= 'Z' || c >= 'a' && c <= 'z';
    }
}
