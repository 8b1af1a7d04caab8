package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.CodeTable;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Reply;
import java.util.List;
import java.util.Map;
import java.util.regex.Pattern;

/** Holds the values of replies against the columns that show them. */
final class ReplyValues {
    private static final Pattern AS_WRITTEN =
            Pattern.compile("[-+]?[0-9][0-9,]{0,99}(\\.[0-9]{0,99})?");
    private static final Pattern DECIMAL = Pattern.compile("-?[0-9]{0,15}(\\.[0-9]{0,9})?");

    private ReplyValues() {}

    static void check(ReplyForm form, Cut.Piece piece, List<Fault> faults) {
        Reply.Column column = form.column(piece.tag());
        String value = piece.value();
        if (column == null || column.form() == null || value.isBlank()) {
            return;
        }
        String wrong = switch (column.form()) {
            case "count" -> Digits.whole(value, 99) ? null : "not-a-number";
            case "number" -> AS_WRITTEN.matcher(value).matches() ? null : "not-a-number";
            case "hundredths", "tenThousandths", "price2", "price4" ->
                    DECIMAL.matcher(value).matches() ? null : "not-a-price";
            case "amountOrText" -> value.contains("&") || DECIMAL.matcher(value).matches()
                    ? null : "not-a-number";
            case "date" -> isNoDate(value) ? "impossible-date" : null;
            case "time" -> Days.isTime(value) ? null : "impossible-time";
            case "month" -> Days.isMonth(value) ? null : "impossible-month";
            case "code" -> isKnown(column, value) ? null : "unknown-code";
            default -> null;
        };
        if (wrong != null) {
            faults.add(new Fault(piece.at(), wrong, column.meaning() + " '" + value + "' "
                            + said(wrong)));
        }
    }

    private static String said(String kind) {
        return switch (kind) {
            case "not-a-number" -> "is no number";
            case "not-a-price" -> "is no price";
            case "impossible-date" -> "is no date";
            case "impossible-time" -> "is no time of day";
            case "impossible-month" -> "is no contract month";
            default -> "is no code that is known";
        };
    }

    /** Zeros stand for no date. */
    private static boolean isNoDate(String value) {
        return Days.date(value) == null && !value.replace("0", "").isEmpty();
    }

    private static boolean isKnown(Reply.Column column, String value) {
        CodeTable table = Dictionary.get().codes(column.codes());
        // any other acceptance letter is a refusal
        if (table == null || table.find(value) != null || table.name().equals("acceptances")) {
            return true;
        }
        for (CodeTable.Code code : table.values()) {
            if (code.wire() != null && List.of(code.wire().split(" ")).contains(value)) {
                return true;
            }
        }
        return false;
    }

    /** The type of a record comes from order kind, trade type and side. */
    static void checkType(ReplyForm form, Map<String, String> record, int offset,
            List<Fault> faults) {
        String kind = number(record.get("27"));
        String trade = number(record.get("28"));
        String side = record.getOrDefault("32", "");
        for (CodeTable.Code code : form.types.values()) {
            boolean here = code.only() == null || code.only().contains(form.operation.name());
            if (here && code.from() != null && holds(code.from(), kind, trade, side)) {
                return;
            }
        }
        if (record.containsKey("27") && !isUnread(form, record)) {
            faults.add(new Fault(offset, "unknown-code", "order kind " + kind
                            + " with trade type " + trade + " has no code: the whole list fails"));
        }
    }

    /** A fill of nothing, and a settled trade of no stock, are passed over. */
    private static boolean isUnread(ReplyForm form, Map<String, String> record) {
        return switch (form.operation.name()) {
            case "QueryReplyDecode" -> number(record.get("47")).equals("0");
            case "PaymentDecode" -> record.getOrDefault("29", "").isEmpty();
            default -> false;
        };
    }

    private static boolean holds(Map<String, String> from, String kind, String trade,
            String side) {
        return holds(from.get("orderKind"), kind) && holds(from.get("tradeType"), trade)
                && holds(from.get("side"), side);
    }

    private static boolean holds(String condition, String value) {
        return condition == null || Binding.holds(condition, value);
    }

    private static String number(String text) {
        return text != null && Digits.whole(text, 18)
                ? String.valueOf(Long.parseLong(text)) : "0";
    }

    /** A value as people read it; empty when that says no more than the value. */
    static String meaning(Reply.Column column, String value) {
        if (column == null || column.form() == null || value.isEmpty()) {
            return "";
        }
        String read = switch (column.form()) {
            case "date" -> Days.day(value);
            case "time" -> Days.time(value);
            case "hundredths", "tenThousandths", "price2", "price4" -> Meaning.price(value);
            case "code" -> Meaning.code(column.codes(), value);
            default -> value;
        };
        return read.equals(value) ? "" : read;
    }
}
