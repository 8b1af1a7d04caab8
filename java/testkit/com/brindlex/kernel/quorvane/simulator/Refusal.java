package com.brindlex.kernel.quorvane.simulator;

/** The gateway says no: a result code and the text that the user is shown. */
final class Refusal extends Exception {
    private static final long serialVersionUID = 1L;

    /** What makes a request unacceptable, with the code that the gateway reports it under. */
    enum Reason {
        MALFORMED("E001", "電文格式錯誤"),
        WRONG_PASSWORD("E002", "密碼錯誤"),
        UNKNOWN_ACCOUNT("E003", "查無此帳號"),
        WRONG_BRANCH("E004", "分公司代號錯誤"),
        WRONG_CLOCK("E005", "電文時間不符"),
        WRONG_SIGNATURE("E006", "簽章資料不符"),
        REJECTED("E007", "主機拒絕"),
        NO_DATA("5001", "查無資料");

        final String code;
        final String text;

        Reason(String code, String text) {
            this.code = code;
            this.text = text;
        }
    }

    final Reason reason;

    Refusal(Reason reason, String text) {
        super(text, null, false, false);
        this.reason = reason;
    }

    Refusal(Reason reason) {
        this(reason, reason.text);
    }

    /** A request that breaks the grammar; {@code where} names the field or the place. */
    static Refusal malformed(String where) {
        return new Refusal(Reason.MALFORMED, Reason.MALFORMED.text + " " + where);
    }

    /** A well-formed request that the broker's rules do not allow. */
    static Refusal rejected(String text) {
        return new Refusal(Reason.REJECTED, text);
    }

    String code() {
        return reason.code;
    }
}
