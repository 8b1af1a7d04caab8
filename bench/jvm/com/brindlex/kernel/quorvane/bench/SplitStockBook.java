package com.brindlex.kernel.quorvane.bench;

import java.util.HashMap;
import java.util.Map;

/** Splits each record at its bars and keeps the fields in a map. */
final class SplitStockBook extends StockBook {
    @Override
    Fields index(String record) {
        Map<String, String> values = new HashMap<>();
        for (String field : record.split("\\|")) {
            String[] parts = field.split("=", 2);
            if (parts.length == 2) {
                values.putIfAbsent(parts[0], parts[1]);
            }
        }
        return tag -> values.getOrDefault(tag, "");
    }
}
