package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.Operation;

/** Says in a few words what a request asks for. */
final class RequestWords {
    private final Binding binding;
    private final Operation operation;

    private RequestWords(Binding binding) {
        this.binding = binding;
        this.operation = binding.template.operation;
    }

    static String of(Binding binding) {
        RequestWords words = new RequestWords(binding);
        return switch (words.operation.scene()) {
            case "stockOrder" -> words.stockOrder();
            case "futuresOrder" -> words.futuresOrder();
            default -> words.query();
        };
    }

    private String function() {
        return binding.template.operation.function() != null
                ? binding.template.operation.function() : binding.wire("function");
    }

    private String side(String name) {
        String wire = binding.wire(name);
        String word = Meaning.code("sides", wire);
        return word.isEmpty() ? "side '" + wire + "'" : word;
    }

    private String stockOrder() {
        String stock = binding.wire("stockCode");
        if (stock.isEmpty()) {
            return operation.title();
        }
        String kind = binding.wire("orderKind");
        String with = kind.isEmpty() || kind.equals("0") ? "" : ", kind " + kind;
        return switch (function()) {
            case "D" -> "cancel " + binding.wire("orderReference|first") + " (" + side("side")
                    + " " + stock + ")" + with;
            case "C" -> "change " + binding.wire("orderReference|first") + " (" + side("side")
                    + " " + stock + "): " + quantity() + with;
            default -> side("side") + " " + quantity() + " " + stock + stockPrice() + with
                    + reservation();
        };
    }

    private String reservation() {
        return binding.wire("handlingFlag").equals("0") ? ", reservation" : "";
    }

    private String quantity() {
        Binding.Bound shares = binding.bound.get("quantity|shares");
        if (shares == null) {
            return "";
        }
        String lots = Meaning.of(binding, shares);
        return lots.isEmpty() ? shares.wire() + " shares" : lots;
    }

    private String stockPrice() {
        if (binding.wire("tradeType").equals("3")) {
            return " without a price";
        }
        String kind = binding.wire("priceKind");
        if (!kind.isEmpty() && !kind.equals("0")) {
            String word = Meaning.code("priceKinds", kind);
            return " at " + (word.isEmpty() ? "price kind " + kind : word);
        }
        return " at " + binding.wire("price|hundredths");
    }

    private String futuresOrder() {
        String what = binding.wire("quantity") + " " + contract("1") + secondLeg();
        String order = binding.wire("orderReference|first");
        return switch (function()) {
            case "I" -> side("side1") + " " + what + futuresPrice() + timeInForce()
                    + reservation();
            case "C" -> "change " + order + " (" + contract("1") + secondLeg() + "): "
                    + Meaning.counted(count(), "contract");
            case "A" -> "change " + order + " (" + contract("1") + secondLeg() + "):"
                    + futuresPrice();
            default -> "cancel " + order + " (" + contract("1") + secondLeg() + ")";
        };
    }

    private long count() {
        String quantity = binding.wire("quantity");
        return Digits.all(quantity, 1, 10) ? Long.parseLong(quantity) : 0;
    }

    private String contract(String leg) {
        String callPut = binding.wire("callPut" + leg);
        String name = binding.wire("commodity" + leg) + " " + binding.wire("month" + leg);
        return callPut.isBlank() ? name : name + " " + callPut + " "
                        + Meaning.price(binding.wire("strike" + leg));
    }

    private String secondLeg() {
        return binding.bound.containsKey("commodity2")
                ? " and " + side("side2") + " " + contract("2") : "";
    }

    private String futuresPrice() {
        String type = binding.wire("priceType");
        if (type.equals("1") || type.equals("3")) {
            return " at " + Meaning.code("priceTypes", type);
        }
        return " at " + Meaning.price(binding.wire("price|limit"));
    }

    private String timeInForce() {
        return binding.wire("timeInForce|fillOrKill").equals("1") ? ", fill or kill"
                : binding.wire("timeInForce|immediateOrCancel").equals("1")
                ? ", immediate or cancel" : "";
    }

    private String query() {
        String stock = binding.wire("stockCode");
        return operation.title() + (stock.isEmpty() ? "" : " " + stock) + period();
    }

    private String period() {
        Binding.Bound first = binding.named("startDate");
        first = first == null ? binding.named("date") : first;
        if (first == null) {
            return "";
        }
        Binding.Bound last = binding.named("endDate");
        String from = Days.day(first.wire());
        String to = last == null ? from : Days.day(last.wire());
        return " " + (to.equals(from) ? from : from + " to " + to);
    }
}
