package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.TradeDate;
import com.brindlex.kernel.quorvane.console.dictionary.Argument;
import com.brindlex.kernel.quorvane.console.dictionary.CodeTable;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import java.math.BigDecimal;
import java.util.List;
import java.util.Locale;
import java.util.Map;
import java.util.function.UnaryOperator;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import java.util.stream.Collectors;

/** Values as people write them, turned into what the natives take; those stay as they are. */
final class WrittenValue {
    private static final Pattern DAY =
            Pattern.compile("([0-9]{4})([-/])([0-9]{1,2})\\2([0-9]{1,2})");
    private static final Pattern AMOUNT =
            Pattern.compile("(-?(?:[0-9]{1,3}(?:,[0-9]{3})+|[0-9]{1,10})(?:\\.[0-9]{1,10})?)"
                    + "(?: +(hundredths|ten-thousandths))?");
    private static final Pattern COUNT =
            Pattern.compile("([0-9]{1,3}(?:,[0-9]{3})+|[0-9]+)(?: +([a-z]+))?");
    private static final Map<String, Integer> DECIMALS =
            Map.of("hundredths", 2, "ten-thousandths", 4);
    private static final int WESTERN = 8;

    /** The natives take prices and counts as 32 bits. */
    private static final BigDecimal MOST = BigDecimal.valueOf(Integer.MAX_VALUE);

    private final Operation operation;
    private final Argument argument;
    private final UnaryOperator<String> texts;
    private final String text;

    private WrittenValue(Operation operation, Argument argument, UnaryOperator<String> texts) {
        this.operation = operation;
        this.argument = argument;
        this.texts = texts;
        this.text = texts.apply(argument.name());
    }

    /**
     * The value of an argument.
     *
     * @param texts what was written for each argument
     * @throws WrittenRequest.NotUnderstood when nobody can tell what was meant
     */
    static String of(Operation operation, String name, UnaryOperator<String> texts) {
        Argument known = Dictionary.get().operation(operation.method()).argument(name);
        boolean plain = known == null || known.unread() || texts.apply(name).equals(known.usual());
        return plain ? texts.apply(name) : new WrittenValue(operation, known, texts).value();
    }

    private String value() {
        if (argument.codes() != null) {
            return code(Dictionary.get().codes(argument.codes()));
        }
        if (argument.unit() != null && DECIMALS.containsKey(argument.unit())) {
            return price(DECIMALS.get(argument.unit()));
        }
        if (isDate()) {
            return date();
        }
        return argument.unit() != null && argument.isNumber() ? count() : text;
    }

    /** A row by its code, its name or its label; a number may be one that the table leaves out. */
    private String code(CodeTable table) {
        List<CodeTable.Code> rows = offered(operation, table);
        String word = text.strip();
        for (CodeTable.Code each : rows) {
            if (each.code().equalsIgnoreCase(word) || word.equalsIgnoreCase(each.label())
                    || word.replaceAll("[- ]", "_").equalsIgnoreCase(each.name())) {
                return each.code();
            }
        }
        boolean letter = argument.isLetter() && text.length() == 1;
        boolean open = argument.isNumber() ? word.matches("-?[0-9]+")
                                           : !table.isClosed() && (letter || !argument.isLetter());
        if (open) {
            return text;
        }
        throw refused("must be " + named(rows));
    }

    private static String named(List<CodeTable.Code> rows) {
        return rows.stream().map(each -> each.name() == null ? each.code()
                : each.code() + " (" + each.name() + ")").collect(Collectors.joining(", "));
    }

    /** The codes that an argument takes, with their names; empty where others may be good, too. */
    static String choices(Operation operation, String name) {
        Argument known = Dictionary.get().operation(operation.method()).argument(name);
        CodeTable table = known == null || known.unread() || known.codes() == null
                ? null : Dictionary.get().codes(known.codes());
        return table == null || !table.isClosed() ? "" : named(offered(operation, table));
    }

    private static List<CodeTable.Code> offered(Operation operation, CodeTable table) {
        return table.values().stream().filter(each -> isOffered(operation, each)).toList();
    }

    private static boolean isOffered(Operation operation, CodeTable.Code row) {
        boolean fits = row.only() == null
                || List.of(row.only().split(" ")).contains(operation.method());
        return fits && !row.listsOnly() && !row.code().contains(" ");
    }

    /** An amount of money; the whole number that the native takes is told by its unit. */
    private String price(int decimals) {
        Matcher amount = AMOUNT.matcher(text.strip());
        boolean understood = amount.matches()
                && (amount.group(2) == null || amount.group(2).equals(argument.unit()));
        if (!understood) {
            throw refused("must be an amount such as 600 or 600.5, or as in '60050 "
                    + argument.unit() + "'");
        }
        BigDecimal written = new BigDecimal(amount.group(1).replace(",", ""));
        BigDecimal shifted = amount.group(2) == null ? written.movePointRight(decimals) : written;
        if (shifted.stripTrailingZeros().scale() > 0) {
            throw refused(amount.group(2) == null ? "must have at most " + decimals + " decimals"
                                                  : "must be whole " + argument.unit());
        }
        if (shifted.signum() < 0) {
            throw refused("must not be negative");
        }
        if (shifted.compareTo(MOST) > 0) {
            throw refused("must be at most " + MOST.movePointLeft(decimals).toPlainString());
        }
        return shifted.toBigInteger().toString();
    }

    /** Some dates have no unit, since they are sent as they are: their examples tell. */
    private boolean isDate() {
        return isCalendar() || argument.example() != null
                && TradeDate.parse(argument.example()) != null;
    }

    private boolean isCalendar() {
        return argument.unit() != null && argument.unit().startsWith("date");
    }

    private String date() {
        Matcher day = DAY.matcher(text.strip());
        if (!day.matches()) {
            if (isCalendar() && !text.isEmpty() && TradeDate.parse(text) == null) {
                throw refused("must be a day such as 2026-11-21 or 1151121");
            }
            return text;
        }
        try {
            TradeDate date = TradeDate.of(Integer.parseInt(day.group(1)),
                    Integer.parseInt(day.group(3)), Integer.parseInt(day.group(4)));
            boolean western = argument.example() != null
                    && argument.example().length() == WESTERN;
            return western ? String.valueOf(date.yyyymmdd()) : date.rocText();
        } catch (IllegalArgumentException none) {
            throw refused("must be a day of the calendar");
        }
    }

    /** A count, with commas and its unit where people write them. */
    private String count() {
        Matcher count = COUNT.matcher(text.strip().toLowerCase(Locale.ROOT));
        if (!count.matches()) {
            return text;
        }
        String unit = unit();
        if (count.group(2) != null && !unit.equals(count.group(2))
                && !unit.equals(count.group(2) + "s")) {
            throw refused("is counted in " + unit + " here");
        }
        String digits = count.group(1).replace(",", "");
        if (new BigDecimal(digits).compareTo(MOST) > 0) {
            throw refused("must be at most " + MOST);
        }
        return digits;
    }

    /** {@code lots; shares for trade type 2} depends on another argument. */
    private String unit() {
        String[] units = argument.unit().split("; ", 2);
        String[] special = units.length < 2 ? units : units[1].split(" for trade type ", 2);
        boolean other = special.length == 2
                && of(operation, "tradeType", texts).equals(special[1]);
        return other ? special[0] : units[0];
    }

    private WrittenRequest.NotUnderstood refused(String reason) {
        return new WrittenRequest.NotUnderstood(argument.name(), reason + ", not '" + text + "'");
    }
}
