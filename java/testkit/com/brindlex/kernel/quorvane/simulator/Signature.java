package com.brindlex.kernel.quorvane.simulator;

import java.util.regex.Pattern;

/**
 * Rebuilds the signature payload of an order from its fields and holds it against the one sent.
 *
 * <p>The plain family joins its values by '_', the family with tag PL by ','. Two values are not in
 * the fields and are left free: the first identity part when only an ID number was sent, and the
 * letter of the default time in force.
 */
final class Signature {
    private final boolean plain;
    private final StringBuilder pattern = new StringBuilder();

    private Signature(Request request) {
        plain = request.kind().variant == 0;
        String branch = Pattern.quote(request.get("BHNO"));
        String function = Pattern.quote(request.get("14"));
        if (plain) {
            pattern.append(branch)
                    .append('_')
                    .append(identity(request))
                    .append('_')
                    .append(function);
        } else {
            pattern.append(Pattern.quote(request.get("SN")))
                    .append(',')
                    .append(Pattern.quote(request.get("IP")))
                    .append(',')
                    .append(Pattern.quote(request.get("21")))
                    .append(',')
                    .append(branch)
                    .append('-')
                    .append(identity(request))
                    .append(',')
                    .append(function);
        }
    }

    /** Opens the payload with the order key. */
    static Signature of(Request request) {
        return new Signature(request);
    }

    private String identity(Request request) {
        String idNumber = request.get("IDNO");
        String account = request.get("ACNO");
        boolean accountSecond = request.get("15").equals("0");
        String second = Pattern.quote(accountSecond ? account : idNumber);
        String first = accountSecond ? Pattern.quote(idNumber)
                : request.has("ACNO") ? Pattern.quote(account) : "[^_,|]*";
        return second + (plain ? "_" : ",") + first;
    }

    /** Adds values in order. */
    Signature with(Object... values) {
        for (Object value : values) {
            pattern.append(plain ? "_" : ",").append(Pattern.quote(value.toString()));
        }
        return this;
    }

    /** Adds empty values. */
    Signature empty(int count) {
        for (int i = 0; i < count; i++) {
            with("");
        }
        return this;
    }

    /** Adds the letter of a time in force; the default one may be any letter but I and F. */
    Signature timeInForce(char letter) {
        if (letter == 'I' || letter == 'F') {
            return with(letter);
        }
        return any("[^IF|]");
    }

    /** Adds a value that the fields leave open but for this pattern. */
    Signature any(String regex) {
        pattern.append(plain ? "_" : ",").append(regex);
        return this;
    }

    /** Refuses the request unless its payload is the one that its fields give. */
    void check(Request request) throws Refusal {
        if (!Pattern.matches(pattern.toString(), request.payload())) {
            throw new Refusal(Refusal.Reason.WRONG_SIGNATURE);
        }
    }
}
