package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/** The accounts of a user, and with a login perhaps a notice of the broker. Never changes. */
public final class Accounts extends Rows<Account> {
    private static final String NOTICE = "<M>@";

    private final String notice;

    Accounts(String result) {
        this(result, noticeAt(result));
    }

    private Accounts(String result, int noticeAt) {
        super(Account.SHAPE, result, 0, noticeAt, noticeAt < result.length() ? 1 : 0);
        // the notice is free text: whatever stands behind its mark belongs to it
        int end = result.length() - (result.endsWith("!") ? 1 : 0);
        this.notice = noticeAt < result.length()
                ? result.substring(noticeAt + NOTICE.length(), Math.max(end, noticeAt + 4)) : "";
    }

    /** Where the notice begins: it is the last of the records that are announced. */
    static int noticeAt(String result) {
        int at = result.indexOf('!');
        String count = at < 0 ? "" : result.substring(0, at);
        int before = Numbers.isDigits(count) && count.length() < 10 ? Integer.parseInt(count) : 0;
        for (int i = 1; i < before && at >= 0; i++) {
            at = result.indexOf('!', at + 1);
        }
        return at >= 0 && result.startsWith(NOTICE, at + 1) ? at + 1 : result.length();
    }

    /** The notice of the broker; empty when there is none. */
    @NotNull
    public String notice() {
        return notice;
    }

    @Override
    public boolean equals(Object other) {
        return super.equals(other)
                && !(other instanceof Accounts && !((Accounts) other).notice.equals(notice));
    }

    @Override
    public int hashCode() {
        return super.hashCode();
    }
}
