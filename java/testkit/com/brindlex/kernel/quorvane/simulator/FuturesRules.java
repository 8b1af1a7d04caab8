package com.brindlex.kernel.quorvane.simulator;

/** What the broker asks of a futures order, and what its signature must say. */
final class FuturesRules {
    private static final String MARKET_PRICE = "00000000.000000";

    private FuturesRules() {}

    /** Judges fields and signature of a new order or a change. */
    static void check(Request request, World world) throws Refusal {
        boolean fresh = request.function() == 'I';
        boolean twoLegs = request.has("EL");
        require(request.get("28").equals("0"), "28");
        require(request.get("M8").isEmpty(), "M8");
        require(request.get("O4").matches("[01]") && request.get("V5").matches("[01]"), "O4");
        require(!(request.get("O4") + request.get("V5")).equals("11"), "V5");
        require(request.get("V6").equals(combination(request)), "V6");
        require(!twoLegs || !fresh || request.get("EM").equals(request.get("30")), "EM");
        require(fresh || request.get("37").equals(request.get("30")), "37");
        request.number("N6");
        checkPrice(request);
        if (fresh) {
            newSignature(request).check(request);
            long contracts = request.number("30");
            if (contracts == 0 || contracts > world.maxContracts) {
                throw Refusal.rejected("委託口數錯誤");
            }
        } else {
            changeSignature(request).check(request);
        }
    }

    private static void require(boolean holds, String tag) throws Refusal {
        if (!holds) {
            throw Refusal.malformed(tag);
        }
    }

    private static void checkPrice(Request request) throws Refusal {
        char type = request.letter("27", "0123");
        if (type == '1' || type == '3') {
            require(request.get("31").equals(MARKET_PRICE), "31");
        } else {
            Texts.price(request.get("31"), 4, "31");
        }
    }

    /** The combination code that the two legs call for; empty for one leg. */
    private static String combination(Request request) {
        if (!request.has("EL")) {
            return "";
        }
        if (request.get("V8").isEmpty()) {
            return "7";
        }
        if (request.get("32").equals(request.get("EL"))) {
            return request.get("33").equals(request.get("V9")) ? "3" : "4";
        }
        if (!request.get("V8").equals(request.get("W1"))) {
            return "5";
        }
        return request.get("29").equals(request.get("W0")) ? "1" : "2";
    }

    private static char timeInForce(Request request) {
        return request.get("V5").equals("1") ? 'I' : request.get("O4").equals("1") ? 'F' : 'R';
    }

    private static Signature newSignature(Request request) {
        boolean plain = request.kind().variant == 0;
        Signature signature = Signature.of(request).timeInForce(timeInForce(request));
        if (!plain) {
            signature.with(request.get("W3"), request.get("27"));
        }
        with(signature, request, "32", "33", "29", "34", "V8");
        if (request.has("EL")) {
            with(signature, request, "EL", "V9", "W0", "W2", "W1");
        } else if (!plain) {
            signature.empty(5);
        }
        with(signature, request, "30", "31");
        return plain ? signature : signature.empty(1);
    }

    private static Signature changeSignature(Request request) {
        boolean quantity = request.function() == 'C';
        boolean price = request.function() == 'A';
        Signature signature = Signature.of(request);
        if (request.kind().variant == 0) {
            with(signature, request, "36");
            return quantity ? with(signature, request, "30") : signature;
        }
        if (price) {
            signature.timeInForce(timeInForce(request)).empty(12);
            return with(signature, request, "30", "31", "36");
        }
        signature.empty(13).with(quantity ? request.get("30") : "0").empty(1);
        return with(signature, request, "36");
    }

    private static Signature with(Signature signature, Request request, String... tags) {
        for (String tag : tags) {
            signature.with(request.get(tag));
        }
        return signature;
    }
}
