package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.Operation;
import com.brindlex.kernel.quorvane.console.message.Binding.Bound;

/** What the values of a request say of each other. */
final class Relations {
    private final Binding binding;

    private Relations(Binding binding) {
        this.binding = binding;
    }

    static void check(Binding binding) {
        Relations relations = new Relations(binding);
        relations.checkClock();
        relations.checkMarket();
        relations.checkLots();
        relations.checkTimeInForce();
        relations.checkPriceType();
        relations.checkCombination();
    }

    private void checkClock() {
        String now = binding.wire("now");
        String id = binding.wire("requestId");
        if (!now.isEmpty() && !id.isEmpty() && Days.isTime(now) && !id.startsWith(now)) {
            fault("now", "contradiction", "the time is " + now + ", the request id says " + id);
        }
    }

    private void checkMarket() {
        String kind = binding.wire("market|requestKind");
        Operation operation = binding.template.operation;
        if (operation.isFutures() && kind.equals("S")) {
            fault("market|requestKind", "wrong-market",
                    "a futures request goes out as securities (KIND=S)");
        } else if (operation.gatewayClass().equals("CGatewayStk") && kind.equals("F")) {
            fault("market|requestKind", "wrong-market",
                    "a stock request goes out as futures (KIND=F)");
        }
    }

    private void checkLots() {
        String shares = binding.wire("quantity|shares");
        String unit = binding.wire("unit");
        boolean odd = binding.wire("tradeType").equals("2");
        if (odd || !Digits.all(shares, 1, 10) || !Digits.all(unit, 1, 10) || unit.startsWith("0")) {
            return;
        }
        if (Long.parseLong(shares) % Long.parseLong(unit) != 0) {
            fault("quantity|shares", "not-whole-lots",
                    shares + " shares are no whole lots of " + unit);
        }
        newOrderOfNothing(shares);
    }

    private void newOrderOfNothing(String shares) {
        if (binding.template.has("30") && Long.parseLong(shares) == 0) {
            fault("quantity|shares", "out-of-range", "an order of 0 shares");
        }
    }

    private void checkTimeInForce() {
        String kill = binding.wire("timeInForce|fillOrKill");
        String immediate = binding.wire("timeInForce|immediateOrCancel");
        if (kill.equals("1") && immediate.equals("1")) {
            fault("timeInForce|immediateOrCancel", "contradiction",
                    "fill or kill (O4) and immediate or cancel (V5) at once");
            return;
        }
        Bound signed = binding.bound.get("timeInForce");
        if (signed == null || kill.isEmpty()) {
            return;
        }
        String letter = signed.wire();
        String wanted = kill.equals("1") ? "F" : immediate.equals("1") ? "I" : null;
        boolean same = wanted == null ? !letter.equals("F") && !letter.equals("I")
                                      : letter.equals(wanted);
        if (!same) {
            fault("timeInForce", "signature-mismatch", "time in force: the signature says '"
                    + letter + "', tags O4 and V5 say " + kill + " and " + immediate);
        }
    }

    private void checkPriceType() {
        String type = binding.wire("priceType");
        String price = binding.wire("price|limit");
        if (price.isEmpty() || type.isEmpty()) {
            return;
        }
        boolean market = type.equals("1") || type.equals("3");
        if (market != price.equals("00000000.000000")) {
            fault("price|limit", "contradiction", market
                    ? "a market order (price type " + type + ") carries the price " + price
                    : "an order of price type " + type + " carries no price");
        }
    }

    private void checkCombination() {
        Bound code = binding.bound.get("combination");
        if (code == null) {
            return;
        }
        String wanted = combination();
        if (!code.wire().equals(wanted)) {
            fault("combination", "contradiction", "combination code "
                    + binding.quoted(code.wire()) + ": the legs make it "
                    + binding.quoted(wanted));
        }
    }

    /** The code of an order with two legs: sides decide first, then call/put, then months. */
    private String combination() {
        if (binding.named("side2") == null) {
            return "";
        }
        if (binding.wire("callPut1").isBlank() && binding.wire("callPut2").isBlank()) {
            return "7";
        }
        if (same("side1", "side2")) {
            return same("commodity1", "commodity2") ? "3" : "4";
        }
        return !same("callPut1", "callPut2") ? "5" : same("month1", "month2") ? "1" : "2";
    }

    private boolean same(String one, String other) {
        return binding.wire(one).equals(binding.wire(other));
    }

    private void fault(String key, String kind, String said) {
        binding.fault(binding.bound.get(key).offset(), kind, said);
    }
}
