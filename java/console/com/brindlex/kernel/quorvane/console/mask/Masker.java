package com.brindlex.kernel.quorvane.console.mask;

import com.brindlex.kernel.quorvane.console.mask.SecretFields.Found;
import java.nio.charset.StandardCharsets;
import java.util.ArrayList;
import java.util.Base64;
import java.util.Comparator;
import java.util.EnumSet;
import java.util.List;
import java.util.Set;

/** Learns the secrets of messages, and replaces them. */
public final class Masker {
    /** Ends each line of Base64. */
    private static final String LINE_END = "\r\n";
    private static final int LINE = 1024;

    private final Pseudonyms pseudonyms = new Pseudonyms();
    private final Set<Secret> masked;

    /** A text, and where places of it have gone; -1 for a place within what was replaced. */
    record Masked(String text, List<Integer> places) {}

    private record Span(int begin, int end, String by) {}

    /** Replaces passwords, and every other kind of secret that is not to be kept. */
    public Masker(Set<Secret> kept) {
        this.masked = EnumSet.complementOf(
                kept.isEmpty() ? EnumSet.noneOf(Secret.class) : EnumSet.copyOf(kept));
        this.masked.add(Secret.PASSWORD);
    }

    /** Learns the secrets of a message. */
    void learn(String text) {
        StringBuilder account = new StringBuilder();
        for (Found found : SecretFields.find(text)) {
            String value = text.substring(found.begin(), found.end());
            if (found.tag().equals("17")) {
                account.setLength(0);
                account.append(value.strip());
            } else if (found.tag().equals("18")) {
                learn(Secret.ACCOUNT, account + value.strip());
                account.setLength(0);
            } else if (found.tag().equals("MSG")) {
                learn(Secret.SIGNATURE, decoded(value));
            } else {
                learn(found.kind(), SecretFields.plain(value));
            }
        }
        learn(Secret.ACCOUNT, account.toString());
    }

    /** Learns one secret. */
    void learn(Secret kind, String value) {
        if (masked.contains(kind)) {
            pseudonyms.add(kind, value.strip());
        }
    }

    private static String decoded(String base64) {
        try {
            byte[] bytes = Base64.getMimeDecoder().decode(base64);
            return new String(bytes, StandardCharsets.UTF_8);
        } catch (IllegalArgumentException broken) {
            return base64;
        }
    }

    /** A text without its secrets, whatever it is. */
    public String mask(String text) {
        return mask(text, List.of()).text();
    }

    /**
     * A message without its secrets.
     *
     * @param places characters of the text whose new places are wanted, in their order
     */
    Masked mask(String text, List<Integer> places) {
        String whole = pseudonyms.ofWhole(text);
        if (whole != null) {
            return new Masked(whole, places.stream().map(place -> -1).toList());
        }
        List<Span> spans = spans(text);
        StringBuilder out = new StringBuilder(text.length());
        List<Integer> moved = new ArrayList<>(places.size());
        int at = 0;
        int next = 0;
        for (Span span : spans) {
            if (span.begin() < at) {
                continue;
            }
            while (next < places.size() && places.get(next) <= span.begin()) {
                moved.add(out.length() + places.get(next++) - at);
            }
            while (next < places.size() && places.get(next) < span.end()) {
                moved.add(-1);
                next++;
            }
            out.append(text, at, span.begin()).append(span.by());
            at = span.end();
        }
        while (next < places.size()) {
            moved.add(out.length() + places.get(next++) - at);
        }
        return new Masked(out.append(text, at, text.length()).toString(), moved);
    }

    private List<Span> spans(String text) {
        List<Span> spans = new ArrayList<>();
        String account = "";
        List<Found> fields = SecretFields.find(text);
        for (int i = 0; i < fields.size(); i++) {
            Found found = fields.get(i);
            String value = text.substring(found.begin(), found.end());
            boolean certificate = found.tag().equals("MSG");
            if (!masked.contains(found.kind())) {
                if (certificate) {
                    spans.add(new Span(found.begin(), found.end(), kept(value)));
                }
                continue;
            }
            if (found.tag().equals("17")) {
                account = value;
                boolean paired = i + 1 < fields.size() && fields.get(i + 1).tag().equals("18");
                String tail = paired ? text.substring(fields.get(i + 1).begin(),
                        fields.get(i + 1).end()) : "";
                String name = pseudonyms.of(Secret.ACCOUNT, value.strip() + tail.strip());
                spans.add(new Span(found.begin(), found.end(),
                        name.substring(0, Math.min(name.length(), value.length()))));
            } else if (found.tag().equals("18")) {
                String name = pseudonyms.of(Secret.ACCOUNT, account.strip() + value.strip());
                spans.add(new Span(found.begin(), found.end(),
                        name.substring(Math.min(name.length(), account.length()))));
                account = "";
            } else if (certificate) {
                spans.add(new Span(found.begin(), found.end(), message(value)));
            } else {
                spans.add(new Span(found.begin(), found.end(), escaped(value,
                        pseudonyms.of(found.kind(), SecretFields.plain(value).strip()))));
            }
        }
        for (Forms.Hit hit : pseudonyms.finder().find(text)) {
            spans.add(new Span(hit.begin(), hit.end(), pseudonyms.ofForm(hit.form())));
        }
        // a field goes before what was found within it
        spans.sort(Comparator.comparingInt(Span::begin)
                .thenComparing(Comparator.comparingInt(Span::end).reversed()));
        return spans;
    }

    private static String escaped(String value, String name) {
        return value.contains("%20") ? name.replace(" ", "%20") : name;
    }

    /** The Base64 of what stands for a certificate's text, in lines as the library writes them. */
    private String message(String value) {
        String name = pseudonyms.of(Secret.SIGNATURE, decoded(value).strip());
        return encoded(name, value);
    }

    /** A certificate's text that is kept, without the other secrets that stand in it. */
    private String kept(String value) {
        String text = decoded(value);
        String without = mask(text);
        return without.equals(text) ? value : encoded(without, value);
    }

    private static String encoded(String text, String before) {
        String base64 = Base64.getMimeEncoder(LINE, LINE_END.getBytes(StandardCharsets.US_ASCII))
                .encodeToString(text.getBytes(StandardCharsets.UTF_8));
        return base64 + (before.endsWith("\n") || before.endsWith("\r") ? LINE_END : "");
    }
}
