package com.brindlex.kernel.quorvane.bench;

/** Looks each field up in the record by {@code indexOf}. */
final class IndexOfStockBook extends StockBook {
    @Override
    Fields index(String record) {
        return tag -> {
            String pattern = "|" + tag + "=";
            int begin = record.indexOf(pattern);
            if (begin < 0) {
                return "";
            }
            begin += pattern.length();
            int end = record.indexOf('|', begin);
            return end < 0 ? record.substring(begin) : record.substring(begin, end);
        };
    }
}
