package com.brindlex.kernel.quorvane.console.mask;

import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import com.brindlex.kernel.quorvane.console.message.Payload;
import java.util.ArrayList;
import java.util.List;
import java.util.Map;

/** Finds the fields of a message that hold secrets. */
final class SecretFields {
    private static final Map<String, Secret> TAGS = Map.of(
            "PWD", Secret.PASSWORD, "54", Secret.PASSWORD, "55", Secret.PASSWORD,
            "IDNO", Secret.ID, "ACNO", Secret.ACCOUNT,
            "NAME", Secret.PERSON, "ADDRESS", Secret.PERSON, "TEL", Secret.PERSON,
            "BIRTH", Secret.PERSON, "MSG", Secret.SIGNATURE);

    /** An ID number this short is an account that stands for both. */
    private static final int LONGEST_ACCOUNT = 7;

    /**
     * A secret in a message.
     *
     * @param kind what it is
     * @param begin characters of the message before it
     * @param end characters of the message up to its end
     * @param tag the field that it stands in
     */
    record Found(Secret kind, int begin, int end, String tag) {}

    private SecretFields() {}

    /** The secrets of a message, in its order. */
    static List<Found> find(String text) {
        Kind kind = MessageReader.kind(text);
        List<Found> found = new ArrayList<>();
        if (kind != Kind.REQUEST && kind != Kind.REPLY) {
            return found;
        }
        int payload = kind == Kind.REQUEST ? Payload.find(text) : -1;
        int limit = payload < 0 ? text.length() : payload;
        boolean certificate = kind == Kind.REPLY && isCertificate(text);
        int begin = 0;
        while (begin < limit) {
            int bar = text.indexOf('|', begin);
            int end = bar < 0 || bar > limit ? limit : bar;
            int sign = text.indexOf('=', begin);
            if (sign > begin && sign < end) {
                add(text.substring(begin, sign), sign + 1, end, kind, certificate, found);
            }
            begin = end + 1;
        }
        return found;
    }

    private static void add(String tag, int begin, int end, Kind kind, boolean certificate,
            List<Found> found) {
        Secret secret = kind == Kind.REQUEST ? TAGS.get(tag)
                : tag.equals("17") || tag.equals("18") ? Secret.ACCOUNT
                : certificate && tag.equals("M2") ? Secret.SIGNATURE : null;
        if (kind == Kind.REQUEST && tag.equals("PL") && end > begin + 1) {
            found.add(new Found(Secret.SIGNATURE, begin + 1, end, tag));  // behind the S
        } else if (secret == Secret.ID && end - begin <= LONGEST_ACCOUNT) {
            found.add(new Found(Secret.ACCOUNT, begin, end, tag));
        } else if (secret != null && end > begin) {
            found.add(new Found(secret, begin, end, tag));
        }
    }

    /** A certificate comes as the one text of a record that is good. */
    private static boolean isCertificate(String text) {
        return text.contains("|68=0000|M2=");
    }

    /** A value as it was before its blanks were escaped. */
    static String plain(String value) {
        return value.replace("%20", " ");
    }
}
