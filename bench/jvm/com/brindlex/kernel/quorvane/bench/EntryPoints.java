package com.brindlex.kernel.quorvane.bench;

import com.brindlex.kernel.quorvane.gatewayjni;
import java.io.IOException;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.LinkedHashMap;
import java.util.Map;
import java.util.function.BiFunction;
import java.util.function.Supplier;

/** The calls that are measured, with the arguments of an everyday user. */
final class EntryPoints {
    static final String SERIAL = "A1B2C3D4E5F60718";
    static final String ADDRESS = "192.168.100.123";
    static final String BRANCH = "9A00";
    static final String IDENTITY = "A123456789&1234567";
    static final String PASSWORD = "s3cretpw";
    static final String REFERENCE = "20240115-100123&A0012345";
    static final String DATE = "1130115";
    static final int[] STATUS = new int[1];

    private EntryPoints() {}

    /** A new stock order. */
    static String submitOrder() {
        return gatewayjni.SubmitOrderEncode(
                0, 0, 7, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, "2330", DATE, 2, 1000, 58550,
                (byte) 'B', (byte) '0', (byte) 0, (byte) 0, (byte) 0, (byte) 1, STATUS);
    }

    /** The stock order book. */
    static String stockBook(String reply, int[] status) {
        return gatewayjni.QueryOrderDecode(0, reply, status);
    }

    /** Every other list, by its name. */
    static Map<String, BiFunction<String, int[], String>> otherLists() {
        Map<String, BiFunction<String, int[], String>> all = new LinkedHashMap<>();
        all.put("AuthDecode", gatewayjni::AuthDecode);
        all.put("GetTotalAccountDecode", gatewayjni::GetTotalAccountDecode);
        all.put("QueryReplyDecode", gatewayjni::QueryReplyDecode);
        all.put("QueryInventoryDecode", gatewayjni::QueryInventoryDecode);
        all.put("QueryInventoryDecodeJZG", gatewayjni::QueryInventoryDecodeJZG);
        all.put("PaymentDecode", gatewayjni::PaymentDecode);
        all.put("PaymentDecodeJZG", gatewayjni::PaymentDecodeJZG);
        all.put("FutQueryOrderDecode", gatewayjni::FutQueryOrderDecode);
        all.put("FutQueryReplyDecode", gatewayjni::FutQueryReplyDecode);
        all.put("FutQueryInventoryDecode", gatewayjni::FutQueryInventoryDecode);
        return all;
    }

    /** A sample reply from the folder {@code samples}. */
    static String sample(Path samples, String decoder, int records) throws IOException {
        return Files.readString(samples.resolve(decoder + "." + records), StandardCharsets.UTF_8);
    }

    /** The order, the stock order book and every other list of 1,000 records, each as one call. */
    static Map<String, Supplier<String>> wholeCalls(Path samples) throws IOException {
        Map<String, BiFunction<String, int[], String>> lists = new LinkedHashMap<>();
        lists.put("QueryOrderDecode", EntryPoints::stockBook);
        lists.putAll(otherLists());
        Map<String, Supplier<String>> calls = new LinkedHashMap<>();
        calls.put("SubmitOrderEncode", EntryPoints::submitOrder);
        for (Map.Entry<String, BiFunction<String, int[], String>> list : lists.entrySet()) {
            String reply = sample(samples, list.getKey(), 1000);
            calls.put(list.getKey(), () -> list.getValue().apply(reply, STATUS));
        }
        return calls;
    }
}
