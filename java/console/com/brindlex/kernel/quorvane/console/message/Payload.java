package com.brindlex.kernel.quorvane.console.message;

import java.util.Set;

/** Where the signature payload of a request begins. */
public final class Payload {
    /** Stands before a signature payload, which has no tag of its own. */
    static final String MARK = "!!";

    /** What people type may hold the mark, too. */
    private static final Set<String> TYPED = Set.of("PWD", "54", "55", "NAME", "ADDRESS", "TEL");

    private Payload() {}

    /** The characters of a request before the mark of its payload; -1 when it has none. */
    public static int find(String request) {
        int mark = request.indexOf(MARK);
        while (mark >= 0 && isTyped(request, mark)) {
            mark = request.indexOf(MARK, mark + 1);
        }
        return mark;
    }

    private static boolean isTyped(String request, int mark) {
        int begin = request.lastIndexOf('|', mark) + 1;
        int sign = request.indexOf('=', begin);
        return sign >= 0 && sign < mark && TYPED.contains(request.substring(begin, sign));
    }
}
