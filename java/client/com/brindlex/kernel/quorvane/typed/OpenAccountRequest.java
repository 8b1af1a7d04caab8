package com.brindlex.kernel.quorvane.typed;

/** Asks to open an account. */
public final class OpenAccountRequest extends Request {
    OpenAccountRequest(Operation operation, Session session) {
        super(operation, session);
    }

    /** The applicant: ID number, and account if there is one. */
    public OpenAccountRequest applicant(String idNumber, String account) {
        set("identity", idNumber + "&" + account);
        return this;
    }

    /** Name of the applicant. */
    public OpenAccountRequest name(String text) {
        set("name", text);
        return this;
    }

    /** Postal address. */
    public OpenAccountRequest address(String text) {
        set("address", text);
        return this;
    }

    /** Telephone number. */
    public OpenAccountRequest telephone(String text) {
        set("tel", text);
        return this;
    }

    /** Code of the hour to call back, 0 to 255. */
    public OpenAccountRequest callBackTime(int number) {
        set("time", number);
        return this;
    }

    /** Code of the kind of account wanted, 0 to 255. */
    public OpenAccountRequest accountKind(int number) {
        set("item", number);
        return this;
    }
}
