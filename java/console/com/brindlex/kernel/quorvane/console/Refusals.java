package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.typed.Operation;
import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import java.util.Map;

/** The errors that the library itself gives, by operation; a test holds them to the library. */
public final class Refusals {
    private static final String NO_ADDRESS = "[CLIENT] 無法取得IP，請確認網路連線是否正常！";
    private static final String UNSPLIT = "[CLIENT] 身分證字號及帳號有誤！";
    private static final String LENGTHS = "[CLIENT] 帳號或身份證字號輸入錯誤";
    private static final String PARAMETERS = "傳入的參數錯誤";
    private static final String ORDER_KIND = "[CLIENT] 委託種類錯誤";
    private static final String DATE = "[CLIENT] 日期輸入錯誤";
    private static final String NO_REPLY = "[CLIENT]主機連線失敗";
    private static final String IN_TRANSIT = "委託單傳送中!!";

    private static final List<String> STOCK_CHANGE =
            List.of("[CLIENT] 委託交易錯誤", "[CLIENT] 股票代號最多六碼", ORDER_KIND);
    private static final List<String> STOCK_NEW =
            List.of("[CLIENT] 委託交易錯誤", "[CLIENT] 股票代號最多六碼", ORDER_KIND,
                    "[CLIENT] 委託價格錯誤", "[CLIENT] 委託數量不可小於0");

    /** What only these operations say. */
    private static final Map<Operation, List<String>> OWN = Map.ofEntries(
            Map.entry(Operation.SUBMIT_ORDER_ENCODE, STOCK_NEW),
            Map.entry(Operation.SUBMIT_ORDER_ENCODE1, STOCK_NEW),
            Map.entry(Operation.CANCEL_ORDER_ENCODE, STOCK_CHANGE),
            Map.entry(Operation.CANCEL_ORDER_ENCODE1, STOCK_CHANGE),
            Map.entry(Operation.CHANGE_ORDER_ENCODE, STOCK_CHANGE),
            Map.entry(Operation.CHANGE_ORDER_ENCODE1, STOCK_CHANGE),
            Map.entry(Operation.QUERY_ORDER_ENCODE, List.of(DATE)),
            Map.entry(Operation.QUERY_REPLY_ENCODE, List.of(DATE)),
            Map.entry(Operation.PAYMENT_ENCODE, List.of(DATE)),
            Map.entry(Operation.FUT_QUERY_ORDER_ENCODE, List.of("[CLIENT]日期輸入錯誤")),
            Map.entry(Operation.FUT_QUERY_REPLY_ENCODE, List.of("[CLIENT]起訖日期錯誤")),
            Map.entry(Operation.FUT_QUERY_INVENTORY_ENCODE, List.of(PARAMETERS)),
            Map.entry(Operation.SUBMIT_ORDER_DECODE, List.of(IN_TRANSIT)),
            Map.entry(Operation.CANCEL_CHANGE_ORDER_DECODE, List.of(IN_TRANSIT)),
            Map.entry(Operation.FUT_SUBMIT_ORDER_DECODE, List.of(IN_TRANSIT)),
            Map.entry(Operation.QUERY_ORDER_DECODE, List.of(ORDER_KIND)),
            Map.entry(Operation.QUERY_REPLY_DECODE, List.of(ORDER_KIND)),
            Map.entry(Operation.PAYMENT_DECODE, List.of(ORDER_KIND)),
            Map.entry(Operation.FUT_QUERY_ORDER_DECODE, List.of("[CLIENT]委託種類錯誤")));

    private Refusals() {}

    /** The messages of an operation, those that many share first. */
    public static List<String> of(Operation operation) {
        List<String> messages = new ArrayList<>();
        if (operation.isEncoder()) {
            encoder(operation, messages);
        } else if (operation.method().matches("FutQuery.*|QueryFinance.*")) {
            messages.add(NO_REPLY);
        } else {
            Collections.addAll(messages, "[GATEWAY]主機連線失敗", "[BROKER]主機連線失敗");
        }
        messages.addAll(OWN.getOrDefault(operation, List.of()));
        return messages;
    }

    private static void encoder(Operation operation, List<String> messages) {
        boolean order = operation.method().matches("(FutSubmit|Submit|Change|Cancel)OrderEncode.*");
        boolean certificate = operation.method().contains("Cert");
        if (operation != Operation.SUBMIT_ORDER_ENCODE2) {
            messages.add(NO_ADDRESS);
        }
        if (operation.arguments().size() > 1) {  // a certificate's message alone names nobody
            if (!order) {
                messages.add(UNSPLIT);
            }
            messages.add(LENGTHS);
        }
        messages.add(certificate
                ? operation.method().replaceFirst("2$", "") + "()" + PARAMETERS
                : "[CLIENT]" + PARAMETERS);
    }
}
