package com.brindlex.kernel.quorvane.typed;

/** One argument of an operation: its name, its Java type, what it means and in what unit. */
public final class Argument {
    /** How an argument is passed. */
    public enum Type {
        /** A text. */
        TEXT(String.class),
        /** A whole number. */
        INT(int.class),
        /** A number from 0 to 255, passed as a byte. */
        SMALL(byte.class),
        /** A character passed as a byte. */
        BYTE_LETTER(byte.class),
        /** A character. */
        LETTER(char.class);

        private final Class<?> javaType;

        Type(Class<?> javaType) {
            this.javaType = javaType;
        }

        /** The type of the native's parameter. */
        public Class<?> javaType() {
            return javaType;
        }
    }

    /** Market, client edition, sequence, serial number and address: first in every encoder. */
    private static final Argument[] LEADING = {
            optional("market", Type.INT, "1", "market code; futures encoders add 100"),
            optional("platform", Type.INT, "0", "row of the client edition, 0 to 14"),
            optional("seqNo", Type.INT, "0", "request number, its last two digits are sent"),
            required("serialNo", Type.TEXT, "serial number of the device, 20 characters"),
            required("localIP", Type.TEXT, "address of the device, 64 characters"),
    };

    static final Argument BRANCH = required("branch", Type.TEXT, "branch code of the brokerage");
    static final Argument IDENTITY =
            required("identity", Type.TEXT, "ID number and account joined by '&'");
    static final Argument PASSWORD = required("password", Type.TEXT, "trading password");
    static final Argument REPLY = required("reply", Type.TEXT, "the gateway's reply as received");

    private static final Argument CERTIFICATE =
            required("certMsg", Type.TEXT, "certificate message, sent as Base64");
    private static final Argument STOCK =
            required("stockCode", Type.TEXT, "stock code, 6 characters");
    private static final Argument ORDER_DATE = optional(
            "orderDate", Type.TEXT, "", "date of the order, Republic of China calendar (1130115)");
    private static final Argument ORDER_REFERENCE =
            required("orderReference", Type.TEXT, "order number and gateway number joined by '&'");
    private static final Argument[] STOCK_TERMS = {
            required("quantity", Type.INT, "lots; shares for odd lots (trade type 2)"),
            optional("unit", Type.INT, "1000", "shares per lot"),
            optional("price", Type.INT, "0", "price in hundredths (1005 is 10.05)"),
            required("side", Type.BYTE_LETTER, "B buy, S sell"),
            optional("flag13", Type.BYTE_LETTER, "0", "flag of the broker, tag 13"),
            optional("orderKind", Type.SMALL, "0", "order kind: 0, 1, 2, 3, 4, 5 or 8"),
            optional("priceKind", Type.SMALL, "0", "0 limit, 1 limit down, 5 flat, 9 limit up"),
            optional("tradeType", Type.SMALL, "0", "0 board lots, 2 odd lot, 3 fixed price"),
            optional("handlingFlag", Type.SMALL, "0", "handling flag of the broker, tag N6"),
    };
    private static final Argument[] FUTURES_TERMS = {
            optional("orderReference", Type.TEXT, "",
                    "for changes: order number and gateway number joined by '&'"),
            ORDER_DATE,
            required("commodity1", Type.TEXT, "commodity of leg 1"),
            optional("commodity2", Type.TEXT, "", "commodity of leg 2"),
            required("month1", Type.TEXT, "contract month of leg 1, YYYYMM"),
            optional("month2", Type.TEXT, "", "contract month of leg 2"),
            optional("strike1", Type.TEXT, "", "strike price of leg 1"),
            optional("strike2", Type.TEXT, "", "strike price of leg 2"),
            optional("callPut1", Type.TEXT, "", "C call, P put, leg 1"),
            optional("callPut2", Type.TEXT, "", "C call, P put, leg 2"),
            optional("handlingFlag", Type.SMALL, "0", "handling flag of the broker, tag N6"),
            required("orderKind", Type.SMALL,
                    "1 futures, 2 option, 3 combination, 4 futures spread"),
            optional("priceType", Type.SMALL, "2", "1 and 3 market price, else a limit price"),
            optional("function", Type.LETTER, "I", "I new, C quantity, A price, D cancel"),
            optional("flagW3", Type.LETTER, " ", "flag of the broker, tag W3"),
            optional("timeInForce", Type.LETTER, "R",
                    "R rest of day, I immediate or cancel, F fill or kill"),
            optional("unreadLetter", Type.LETTER, " ", "not read"),
            required("side1", Type.LETTER, "B buy, S sell, leg 1"),
            optional("side2", Type.LETTER, " ", "B buy, S sell, leg 2"),
            required("quantity", Type.INT, "contracts"),
            optional("unreadNumber", Type.INT, "0", "not read"),
            optional("price", Type.INT, "0", "price in ten-thousandths (180000000 is 18000)"),
    };

    static final Argument[] NONE = {};
    static final Argument[] ACCOUNT = {BRANCH, IDENTITY, PASSWORD};
    static final Argument[] CERTIFICATE_ONLY = {CERTIFICATE};
    static final Argument[] CERTIFICATE_HOLDER = {
            BRANCH,
            IDENTITY,
            PASSWORD,
            required("birth", Type.TEXT, "date of birth, sent as given"),
            CERTIFICATE,
    };
    static final Argument[] APPLICANT = {
            optional("extra1", Type.TEXT, "", "not read"),
            IDENTITY,
            optional("extra2", Type.TEXT, "", "not read"),
            required("name", Type.TEXT, "name of the applicant"),
            required("address", Type.TEXT, "postal address"),
            required("tel", Type.TEXT, "telephone number"),
            optional("time", Type.SMALL, "0", "code of the hour to call back"),
            optional("item", Type.SMALL, "0", "code of the kind of account"),
    };
    static final Argument[] NEW_PASSWORD =
            account(required("newPassword", Type.TEXT, "the password to change to"));
    static final Argument[] STOCK_ORDER = join(account(STOCK, ORDER_DATE), STOCK_TERMS);
    static final Argument[] STOCK_CHANGE =
            join(account(STOCK, ORDER_DATE, ORDER_REFERENCE), changeTerms());
    static final Argument[] STOCK_NOTICE =
            account(optional("function", Type.BYTE_LETTER, "I", "I new, D cancel, C change"),
                    optional("tradeType", Type.SMALL, "0", "trade type, any"));
    static final Argument[] STOCK_DAY =
            account(required("date", Type.TEXT, "day to list, sent as given"),
                    optional("tradeType", Type.INT, "0", "trade type to list"));
    static final Argument[] FUTURES_DAY =
            account(required("date", Type.TEXT, "day to list, Republic of China calendar"),
                    optional("selection", Type.INT, "0", "order type to list"));
    static final Argument[] PERIOD =
            account(required("startDate", Type.TEXT, "first day, Republic of China calendar"),
                    required("endDate", Type.TEXT, "last day, Republic of China calendar"));
    static final Argument[] SETTLEMENT_PERIOD = account(
            required("periodOrStartDate", Type.TEXT, "period 1 to 6, or the first day, sent as given"),
            optional("endDate", Type.TEXT, "", "last day, sent as given"));
    static final Argument[] ONE_STOCK = account(STOCK);
    static final Argument[] MARGIN =
            account(optional("queryType", Type.INT, "0", "kind of margin account"));
    static final Argument[] FUTURES_ORDER = account(FUTURES_TERMS);
    static final Argument[] REPLY_ONLY = {REPLY};
    static final Argument[] MARKET_AND_REPLY = {LEADING[0], REPLY};

    private final String name;
    private final Type type;
    private final String initial;
    private final String meaning;

    private Argument(String name, Type type, String initial, String meaning) {
        this.name = name;
        this.type = type;
        this.initial = initial;
        this.meaning = meaning;
    }

    private static Argument required(String name, Type type, String meaning) {
        return new Argument(name, type, null, meaning);
    }

    private static Argument optional(String name, Type type, String initial, String meaning) {
        return new Argument(name, type, initial, meaning);
    }

    /** Terms of a new order, whose price kind a change does not read. */
    private static Argument[] changeTerms() {
        Argument[] terms = STOCK_TERMS.clone();
        for (int i = 0; i < terms.length; i++) {
            if (terms[i].name.equals("priceKind")) {
                terms[i] = optional("unreadPriceKind", Type.SMALL, "0", "not read");
            }
        }
        return terms;
    }

    private static Argument[] account(Argument... others) {
        return join(ACCOUNT, others);
    }

    private static Argument[] join(Argument[] first, Argument[] second) {
        Argument[] all = new Argument[first.length + second.length];
        System.arraycopy(first, 0, all, 0, first.length);
        System.arraycopy(second, 0, all, first.length, second.length);
        return all;
    }

    static Argument[] leading() {
        return LEADING;
    }

    /** The name of the native's parameter. */
    public String name() {
        return name;
    }

    /** How it is passed. */
    public Type type() {
        return type;
    }

    /** Whether it must be given: it has no usual value. */
    public boolean isRequired() {
        return initial == null;
    }

    /** The value when none is given; null when it must be given. */
    public String initial() {
        return initial;
    }

    /** What it means and in what unit. */
    public String meaning() {
        return meaning;
    }

    @Override
    public String toString() {
        return name;
    }
}
