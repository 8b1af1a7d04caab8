package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.typed.Operation;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/** Holds the text of a request against the forms that requests have. */
final class RequestForm {
    /**
     * How far a text follows the best of the forms.
     *
     * @param operations the operations with that form
     * @param reach characters that are in order
     * @param agreement pieces of the form that stand anywhere in the text, less those that do not
     * @param expected what should stand there; null when the whole text is in order
     */
    record Match(List<Operation> operations, int reach, int agreement, String expected) {
        boolean isWhole() {
            return expected == null;
        }
    }

    private static final String ORDER_STAMP = "|24=5|V4=";

    private final String text;
    private int reach;
    private String expected;

    private RequestForm(String text) {
        this.text = text;
    }

    /** Finds the operations whose form the text follows longest. */
    static Match match(String text, Operation hint) {
        Match best = new Match(List.of(), 0, Integer.MIN_VALUE, "F=");
        for (Operation operation : Operation.values()) {
            if (hint == null || operation == hint) {
                for (String form : operation.requestForms()) {
                    best = better(best, new RequestForm(text).follow(form, operation));
                }
            }
        }
        return best;
    }

    /** The better of two: whole, else the longer one, else the one of which more is there. */
    private static Match better(Match best, Match found) {
        int order = Boolean.compare(found.isWhole(), best.isWhole());
        order = order == 0 ? Integer.compare(found.reach(), best.reach()) : order;
        order = order == 0 ? Integer.compare(found.agreement(), best.agreement()) : order;
        if (order == 0 && !best.operations().containsAll(found.operations())) {
            List<Operation> both = new ArrayList<>(best.operations());
            both.addAll(found.operations());
            return new Match(both, best.reach(), best.agreement(), best.expected());
        }
        return order > 0 ? found : best;
    }

    /** Whether the text is a header alone, as the log shows it before the operation's fields. */
    static boolean isHeader(String text, Match match) {
        boolean cut = !match.isWhole() && match.reach() == text.length();
        boolean query = text.startsWith("F=7|");
        return cut && (query ? text.contains("|SN=") && text.endsWith("|")
                             : text.contains(ORDER_STAMP));
    }

    /** Walks a form through the text, literal by literal. */
    private Match follow(String form, Operation operation) {
        String[] literals = form.replace("~", "").split("\\*", -1);
        walk(literals);
        int agreement = Arrays.stream(literals)
                                .mapToInt(part -> text.contains(part.trim()) ? 1 : -1).sum();
        return new Match(List.of(operation), reach, agreement, expected);
    }

    private void walk(String[] literals) {
        int at = 0;
        for (int i = 0; i < literals.length; i++) {
            String literal = literals[i];
            if (i > 0) {
                at = literal.isEmpty() ? endOfForm(at, i == literals.length - 1)
                                       : endOfValue(at, literal);
            }
            // the line feed at the end of a request is lost in a log
            int same = common(at, literal.endsWith("\n") && !text.endsWith("\n")
                            ? literal.substring(0, literal.length() - 1) : literal);
            at += same;
            if (same < literal.trim().length()) {
                stop(at, fieldAt(literal, same));
                return;
            }
        }
        stop(at, at < text.length() ? "the end" : null);
    }

    private void stop(int where, String wanted) {
        reach = where;
        expected = wanted;
    }

    /** A value ends before the next bar, or before the literal that follows it without one. */
    private int endOfValue(int at, String literal) {
        int bar = text.indexOf('|', at);
        int end = bar < 0 ? text.length() : bar;
        if (!literal.startsWith("|")) {
            int next = text.indexOf(literal, at);
            return next >= 0 && next < end ? next : end;
        }
        return end;
    }

    private int endOfForm(int at, boolean last) {
        int bar = text.indexOf('|', at);
        return last && bar >= 0 ? bar : text.length();
    }

    private int common(int at, String literal) {
        int same = 0;
        while (same < literal.length() && at + same < text.length()
                && text.charAt(at + same) == literal.charAt(same)) {
            same++;
        }
        return same;
    }

    /** The field of a literal that a place in it belongs to. */
    private static String fieldAt(String literal, int place) {
        int begin = Math.max(0, literal.lastIndexOf('|', place));
        while (begin > 0 && literal.charAt(begin - 1) == '|') {
            begin--;
        }
        int tag = begin;
        while (tag < literal.length() && literal.charAt(tag) == '|') {
            tag++;
        }
        int end = literal.indexOf('|', tag);
        return literal.substring(begin, end < 0 ? literal.length() : end).trim();
    }
}
