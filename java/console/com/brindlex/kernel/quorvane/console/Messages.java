package com.brindlex.kernel.quorvane.console;

import java.util.Map;

/** The messages that the library makes itself, in English. */
final class Messages {
    private static final Map<String, String> ENGLISH = Map.ofEntries(
            Map.entry("主機連線失敗", "no connection to the host"),
            Map.entry("連線失敗", "no connection"),
            Map.entry("無法取得IP，請確認網路連線是否正常！", "the device has no address: check the network"),
            Map.entry("身分證字號及帳號有誤！", "ID number and account are wrong: no '&' between them"),
            Map.entry("帳號或身份證字號輸入錯誤", "account or ID number has an unusable length"),
            Map.entry("日期輸入錯誤", "a date is missing or wrong"),
            Map.entry("起訖日期錯誤", "first or last day is wrong"),
            Map.entry("委託種類錯誤", "unknown order kind"),
            Map.entry("委託價格錯誤", "unknown price kind"),
            Map.entry("委託交易錯誤", "unknown trade type"),
            Map.entry("股票代號最多六碼", "a stock code has at most six characters"),
            Map.entry("委託數量不可小於0", "the quantity must be above 0"),
            Map.entry("傳入的參數錯誤", "an argument is missing, wrong or too long"),
            Map.entry("委託單傳送中!!", "the order is on its way; no answer yet"));

    private Messages() {}

    /** What a message says, or the empty text when it is not one of the library's. */
    static String english(String text) {
        return ENGLISH.getOrDefault(text.replaceFirst("^[A-Za-z0-9]+Encode2?\\(\\)", ""), "");
    }

    /** Whether a text is a message though it does not say from whom. */
    static boolean isBare(String text) {
        return !english(text).isEmpty();
    }
}
