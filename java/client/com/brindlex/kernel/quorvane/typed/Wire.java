package com.brindlex.kernel.quorvane.typed;

import java.util.ArrayList;
import java.util.Collections;
import java.util.List;

/**
 * How requests read, as patterns: {@code *} stands for a value, {@code ~} for the place where two
 * fields meet without a bar, {@code [...]} for what only some requests of the operation have.
 */
final class Wire {
    /** The headers of requests. */
    enum Header {
        /** Queries and account operations. */
        QUERY("F=7|KIND=*|BHNO=*|CB=1|IP=*|11=*|VER=24369|65=*|SN=*|", "", "", "15=0|ACNO=*|PWD=*|",
                "15=1|IDNO=*|ACNO=*|PWD=*|", "15=1|IDNO=*|PWD=*|"),
        /**
         * Orders with a bare signature payload; the ID blocks follow the function without a bar.
         */
        ORDER("F=1|KIND=*|BHNO=*|CB=1|IP=*|11=*|VER=24369|SN=*|65=*|14=",
                "|21=*|22=*|23=*|24=5|V4=[|44=*]", "|15=0|IDNO=*|ACNO=*|PWD=*",
                "~15=1|IDNO=*|ACNO=*|PWD=*|", "~15=1|IDNO=*|PWD=*|"),
        /** Orders with their signature in tag PL. */
        ORDER_1("F=1|KIND=*|BHNO=*|CB=1|IP=*|11=*|VER=24369|SN=*|65=*|14=",
                "|21=*|22=*|23=*|24=5|V4=", "|15=0|IDNO=*|ACNO=*|PWD=*",
                "|15=1|IDNO=*|ACNO=*|PWD=*|", "|15=1|IDNO=*|PWD=*|"),
        /** The short notice of an order. */
        ORDER_2("F=1|KIND=*|CB=1|BHNO=*|VER=24369|SN=*|11=*|65=*|14=", "",
                "|15=0|IDNO=*|ACNO=*|PWD=*", "|15=1|IDNO=*|ACNO=*|PWD=*|", "|15=1|IDNO=*|PWD=*|");

        private final String begin;
        private final String end;
        private final String[] identities;

        Header(String begin, String end, String... identities) {
            this.begin = begin;
            this.end = end;
            this.identities = identities;
        }
    }

    /** Reply tags that frame a list. */
    static final String LIST = "68 M2 67";

    /** Reply tags that frame the receipt of an order. */
    static final String RECEIPT = "39 19 K1";

    // What stands behind the header. For orders the function letter comes first.
    static final String STOCK_NEW = "I|27=*|28=*|29=*|30=*|UT=*|13=*|N6=*|31=*|M8=*|32=*|33=!!*";
    static final String STOCK_NEW_1 =
            "I|27=*|28=*|29=*|30=*|UT=*|13=*|N6=*|31=*|M8=*|32=*|33=|PL=S!!*";
    static final String STOCK_CANCEL =
            "D|10=*|36=*|46=*|28=*|29=*|31=*|32=*|N6=*|27=*|UT=1000|13=*!!*";
    static final String STOCK_CANCEL_1 =
            "D|10=*|36=*|46=*|28=*|29=*|31=*|32=*|37=*|N6=*|27=*|UT=*|PL=S!!*";
    static final String STOCK_CHANGE =
            "C|10=*|36=*|46=*|28=*|29=*|31=*|32=*|37=*|N6=*|27=*|UT=*|13=*!!*";
    static final String STOCK_CHANGE_1 =
            "C|10=*|36=*|46=*|28=*|29=*|31=*|32=*|37=*|N6=*|27=*|UT=*|PL=S!!*";
    private static final String FUTURES_BODY =
            "|27=*|28=0|29=*|30=*|31=*|M8=|32=*|33=*|34=*|O4=*|V5=*|V6=*|V8=*";
    private static final String SECOND_LEG = "|EL=*|V9=*|W0=*|W1=*|W2=*";
    private static final String FUTURES_NEW =
            "I" + FUTURES_BODY + "[" + SECOND_LEG + "|EM=*]|W3=*|N6=*";
    private static final String FUTURES_CHANGE =
            "*" + FUTURES_BODY + "[" + SECOND_LEG + "]|36=*|46=*|37=*|N6=*";
    static final String[] FUTURES = {FUTURES_NEW + "!!*", FUTURES_CHANGE + "!!*"};
    static final String[] FUTURES_1 = {FUTURES_NEW + "|PL=S!!*", FUTURES_CHANGE + "|PL=S!!*"};

    private Wire() {}

    /** Every form that a request may have, without brackets. */
    static List<String> forms(Header header, String... tails) {
        List<String> forms = new ArrayList<String>();
        for (String tail : tails) {
            for (String identity : header.identities) {
                String own = header == Header.QUERY ? "" : functionOf(tail);
                String rest = tail.substring(own.length());
                addOptions(forms, header.begin + own + identity + header.end + rest);
            }
        }
        return Collections.unmodifiableList(forms);
    }

    private static String functionOf(String tail) {
        return tail.substring(0, 1);
    }

    private static void addOptions(List<String> forms, String pattern) {
        int open = pattern.indexOf('[');
        if (open < 0) {
            forms.add(pattern);
            return;
        }
        int close = pattern.indexOf(']');
        String before = pattern.substring(0, open);
        String after = pattern.substring(close + 1);
        addOptions(forms, before + after);
        addOptions(forms, before + pattern.substring(open + 1, close) + after);
    }
}
