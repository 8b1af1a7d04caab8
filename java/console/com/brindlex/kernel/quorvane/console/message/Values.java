package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.Utf8;
import com.brindlex.kernel.quorvane.console.dictionary.Argument;
import com.brindlex.kernel.quorvane.console.dictionary.CodeTable;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.message.Binding.Bound;
import java.util.Base64;
import java.util.List;
import java.util.regex.Pattern;

/** Holds each value of a request against its argument, its conversion and its codes. */
final class Values {
    private static final Pattern STRIKE = Pattern.compile("[0-9]{1,9}(\\.[0-9]*)?");
    private static final Pattern BETWEEN_DIGITS = Pattern.compile("(?<=[0-9])[-/.](?=[0-9])");
    private static final String NO_PRICE = "00000000.000000";
    private static final String OF_ONE_OR_TWO_BYTES = "====";
    private static final int SERIAL = 20;

    private final Binding binding;
    private final Dictionary dictionary = Dictionary.get();

    private Values(Binding binding) {
        this.binding = binding;
    }

    static void check(Binding binding) {
        Values values = new Values(binding);
        binding.bound.values().forEach(values::check);
        Relations.check(binding);
    }

    private void check(Bound value) {
        String conversion = value.part().conversion();
        Argument argument = value.part().argument();
        if (conversion == null && argument == null) {
            checkComputed(value);
        } else if (conversion == null) {
            checkPlain(value, argument);
        } else {
            checkConverted(value, argument, conversion);
        }
    }

    private void checkComputed(Bound value) {
        String wire = value.wire();
        switch (value.part().name()) {
            case "requestId" -> {
                boolean digits = Digits.all(wire, 8, 8);
                require(digits && Days.isTime(wire), value, "impossible-time",
                        "is no request id: local time HHMMSS and two digits");
            }
            case "today" -> date(value, wire);
            case "now" -> require(wire.length() == 6 && Days.isTime(wire), value,
                    "impossible-time", "is no time of day");
            default -> { }
        }
    }

    private void checkPlain(Bound value, Argument argument) {
        String wire = value.wire();
        if (wire.isEmpty()) {
            boolean needed = argument.required() || argument.isLetter() || argument.isNumber();
            require(!needed, value, "missing-value", "is missing");
            return;
        }
        if (argument.isNumber()) {
            number(value, argument);
        } else if (argument.isLetter()) {
            String letter = wire.equals("%20") ? " " : wire;
            require(letter.codePointCount(0, letter.length()) == 1, value, "not-one-character",
                    "is not one character");
        } else {
            length(value, argument);
            if (argument.unit() != null && argument.unit().startsWith("date")
                    || argument.name().endsWith("Date") || argument.name().equals("date")
                    || argument.name().equals("birth")) {
                date(value, wire);
            }
            if (argument.name().startsWith("month")) {
                require(wire.length() == 6 && Days.isMonth(wire), value, "impossible-month",
                        "is no contract month");
            }
            if (argument.name().startsWith("strike")) {
                require(STRIKE.matcher(wire).matches(), value, "not-a-price",
                        "is no strike price");
            }
        }
        code(value, argument);
    }

    private void length(Bound value, Argument argument) {
        Integer longest = argument.maxLength();
        if (longest == null || !Utf8.isAtLeast(value.wire(), longest + 1)) {
            return;
        }
        // a serial number that fills its field runs on into the address
        boolean runsOn = argument.name().equals("serialNo")
                && value.wire().substring(SERIAL).equals(binding.wire("localIP"));
        require(runsOn, value, "too-long", "is longer than " + longest + " characters");
    }

    private void number(Bound value, Argument argument) {
        String wire = value.wire();
        if (!Digits.whole(wire, 18)) {
            require(false, value, "not-a-number", "is no whole number");
            return;
        }
        long number = Long.parseLong(wire);
        boolean inside = (argument.min() == null || number >= argument.min())
                && (argument.max() == null || number <= argument.max());
        require(inside, value, "out-of-range", "is not between " + argument.min() + " and "
                + argument.max());
    }

    private void code(Bound value, Argument argument) {
        CodeTable table = argument.codes() == null ? null : dictionary.codes(argument.codes());
        if (table == null || !table.isClosed()) {
            return;
        }
        String wire = value.wire();
        boolean blank = wire.isBlank() && !argument.required();
        CodeTable.Code code = table.find(wire);
        String operation = binding.template.operation.name();
        boolean listsOnly = code != null && code.listsOnly()
                && binding.template.operation.scene().equals("stockOrder");
        boolean others = code != null && code.only() != null
                && !List.of(code.only().split(" ")).contains(operation);
        require(blank || code != null && !listsOnly && !others, value, "unknown-code",
                "is no code of this request");
    }

    private void checkConverted(Bound value, Argument argument, String conversion) {
        String wire = value.wire();
        switch (conversion) {
            case "requestKind" -> require(wire.equals("S") || wire.equals("F"), value,
                    "unknown-code", "is neither S nor F");
            case "edition" -> require(dictionary.codes("platforms")
                    .findWire(wire.replace("%20", " ")) != null, value, "unknown-code",
                    "is no client edition");
            case "firstAccount", "secondAccount" -> require(Digits.all(wire, 7, 7), value,
                    "not-an-account", "is no account of seven digits");
            case "first", "second", "secondOrFirst" -> part(value, argument, conversion);
            case "base64" -> base64(value);
            case "western" -> require(wire.length() == 8 && (Days.date(wire) != null
                    || wire.equals("00000000") && !argument.required()), value,
                    "impossible-date", "is no date of eight digits");
            case "otherCalendar" -> date(value, wire);
            case "hundredths" -> require(Digits.decimal(wire, 2), value, "not-a-price",
                    "is no price with two decimals");
            case "limit" -> require(Digits.decimal(wire, 4) || wire.equals(NO_PRICE), value,
                    "not-a-price", "is no price with four decimals");
            case "changed", "marginQuery" -> require(Digits.whole(wire, 18), value,
                    "not-a-number", "is no whole number");
            case "shares" -> require(Digits.all(wire, 1, 10)
                    && Long.parseLong(wire) <= Integer.MAX_VALUE, value, "not-a-number",
                    "is no quantity");
            case "fillOrKill", "immediateOrCancel" -> require(wire.equals("0") || wire.equals("1"),
                    value, "unknown-code", "is neither 0 nor 1");
            case "period" -> require(dictionary.codes("periods").findWire(wire) != null, value,
                    "unknown-code", "is no period code");
            default -> { }
        }
    }

    /** A part of the identity, or of an order reference. */
    private void part(Bound value, Argument argument, String conversion) {
        boolean reference = argument != null && argument.name().equals("orderReference");
        if (reference) {
            require(!value.wire().isEmpty(), value, "missing-value", "is missing");
            return;
        }
        String lengths = conversion.equals("first") ? binding.template.identity.first()
                                                    : binding.template.identity.second();
        int length = Utf8.length(value.wire());
        require(value.tag().equals(Cut.PAYLOAD) || inside(lengths, length), value, "wrong-length",
                "has " + length + " characters, not "
                        + lengths.replace(" ", " or ").replace("-", " to "));
    }

    private static boolean inside(String lengths, int length) {
        if (lengths.equals("any")) {
            return true;
        }
        for (String range : lengths.split(" ")) {
            String[] ends = range.split("-");
            int last = Integer.parseInt(ends[ends.length - 1]);
            if (length >= Integer.parseInt(ends[0]) && length <= last) {
                return true;
            }
        }
        return false;
    }

    private void base64(Bound value) {
        String wire = value.wire().strip();
        require(wire.equals(OF_ONE_OR_TWO_BYTES) || isBase64(wire), value, "not-base64",
                "is no Base64");
    }

    private static boolean isBase64(String wire) {
        String letters = wire.replaceAll("\\s", "");
        try {
            return letters.length() % 4 == 0 && Base64.getDecoder().decode(letters).length > 0;
        } catch (IllegalArgumentException broken) {
            return false;
        }
    }

    private void date(Bound value, String wire) {
        boolean good = Days.date(wire) != null
                || Days.date(BETWEEN_DIGITS.matcher(wire).replaceAll("")) != null;
        require(good, value, "impossible-date", "is no date");
    }

    private void require(boolean good, Bound value, String kind, String said) {
        if (!good) {
            String shown = value.wire().length() > 40 ? value.wire().substring(0, 40) + "..."
                                                      : value.wire();
            binding.fault(value.offset(), kind, binding.label(value.tag())
                    + (shown.isEmpty() ? "" : " '" + shown + "'") + " " + said);
        }
    }
}
