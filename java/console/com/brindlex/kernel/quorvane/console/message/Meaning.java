package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.Argument;
import com.brindlex.kernel.quorvane.console.dictionary.CodeTable;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Operation;
import java.math.BigDecimal;
import java.util.regex.Pattern;

/** Values of the wire as people read them. */
final class Meaning {
    private static final Pattern PRICE = Pattern.compile("-?[0-9]{1,15}(\\.[0-9]{1,9})?");

    private Meaning() {}

    /** What fills a place of a request; empty when it says no more than the value. */
    static String of(Binding binding, Binding.Bound value) {
        Argument argument = value.part().argument();
        String wire = value.wire();
        String conversion = value.part().conversion();
        if (wire.isEmpty()) {
            return "";
        }
        if (conversion == null) {
            return plain(value.part().name(), argument, wire);
        }
        return switch (conversion) {
            case "requestKind" -> wire.equals("S") ? "securities" : wire.equals("F") ? "futures"
                                                                                    : "";
            case "western", "otherCalendar" -> changed(Days.day(wire), wire);
            case "shares" -> shares(binding, wire);
            case "limit" -> changed(price(wire), wire);
            case "hundredths" -> "";
            case "changed" -> hundredths(wire);
            case "fillOrKill", "immediateOrCancel" -> wire.equals("1") ? "yes" : "no";
            default -> escaped(wire);
        };
    }

    /** What a fixed value says, by the name of its tag; empty when it says no more. */
    static String ofTag(Operation operation, String name, String value) {
        if (name.equals("function")) {
            return code(!operation.scene().endsWith("Order") ? "queryFunctions"
                    : operation.isFutures() ? "futuresFunctions" : "stockFunctions", value);
        }
        Argument argument = operation.argument(name);
        return argument == null || argument.codes() == null ? ""
                                                            : code(argument.codes(), value);
    }

    private static String plain(String name, Argument argument, String wire) {
        if (argument == null) {
            return switch (name) {
                case "requestId" -> changed(Days.time(wire), wire);
                case "today" -> changed(Days.day(wire), wire);
                case "now" -> changed(Days.time(wire), wire);
                case "combination" -> code("combinations", wire);
                default -> "";
            };
        }
        if (argument.codes() != null) {
            return code(argument.codes(), wire);
        }
        if (argument.name().toLowerCase().endsWith("date")) {
            return changed(Days.day(wire), wire);
        }
        return escaped(wire);
    }

    /** What a code says; empty when its table says no more than the code. */
    static String code(String table, String code) {
        CodeTable codes = Dictionary.get().codes(table);
        CodeTable.Code found = codes == null ? null : codes.find(code);
        return found == null || found.label().equals(code) ? "" : found.label();
    }

    private static String shares(Binding binding, String wire) {
        String unit = binding.wire("unit");
        boolean lots = !binding.wire("tradeType").equals("2") && Digits.all(wire, 1, 10)
                && Digits.all(unit, 1, 10) && !unit.startsWith("0");
        if (!lots || Long.parseLong(wire) % Long.parseLong(unit) != 0) {
            return "";
        }
        return counted(Long.parseLong(wire) / Long.parseLong(unit), "lot");
    }

    static String counted(long count, String thing) {
        String many = thing.endsWith("y") ? thing.substring(0, thing.length() - 1) + "ies"
                                          : thing + "s";
        return count + " " + (count == 1 ? thing : many);
    }

    /** A price without the zeros behind it, but with two decimals when it has any. */
    static String price(String wire) {
        if (!PRICE.matcher(wire).matches()) {
            return wire;
        }
        BigDecimal price = new BigDecimal(wire).stripTrailingZeros();
        return price.scale() <= 0 ? price.toBigInteger().toString()
                : price.setScale(Math.max(2, price.scale())).toPlainString();
    }

    /** A number of hundredths as a price. */
    static String hundredths(String wire) {
        return Digits.whole(wire, 15)
                ? BigDecimal.valueOf(Long.parseLong(wire), 2).toPlainString() : "";
    }

    private static String escaped(String wire) {
        return wire.contains("%20") ? wire.replace("%20", " ") : "";
    }

    private static String changed(String meaning, String wire) {
        return meaning.equals(wire) ? "" : meaning;
    }
}
