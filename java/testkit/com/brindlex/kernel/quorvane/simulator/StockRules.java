package com.brindlex.kernel.quorvane.simulator;

import java.math.BigDecimal;

/** What the broker and the exchange ask of a stock order, and what its signature must say. */
final class StockRules {
    private static final int FIXED_PRICE = 3;
    private static final int ODD_LOT = 2;
    private static final int MAX_KIND = 8;

    private StockRules() {}

    /** Judges the fields of a new order and its signature; returns the stock. */
    static ListedStock checkNew(Request request, World world) throws Refusal {
        int tradeType = checkTradeType(request);
        request.letter("32", "BS");
        checkSignature(request, tradeType);
        ListedStock stock = world.stock(request.get("29"));
        checkKind(request, stock);
        checkQuantity(request, tradeType, world.maxLots);
        checkPrice(request, tradeType, stock);
        return stock;
    }

    private static int checkTradeType(Request request) throws Refusal {
        return request.letter("28", "023") - '0';
    }

    private static void checkKind(Request request, ListedStock stock) throws Refusal {
        long kind = request.number("27");
        if (kind > MAX_KIND || kind == 6 || kind == 7) {
            throw Refusal.malformed("27");
        }
        if (!stock.hasCredit() && kind >= 1 && kind <= 4) {
            throw Refusal.rejected("此股票不可信用交易");
        }
    }

    private static void checkQuantity(Request request, int tradeType, long maxLots)
            throws Refusal {
        long shares = request.number("30");
        long unit = request.number("UT");
        if (unit == 0 || shares == 0) {
            throw Refusal.malformed("30");
        }
        if (tradeType == ODD_LOT ? shares >= unit : shares % unit != 0) {
            throw Refusal.rejected(tradeType == ODD_LOT ? "零股數量須小於一張" : "委託數量須為整張");
        }
        if (shares / unit > maxLots) {
            throw Refusal.rejected("委託數量超過上限");
        }
    }

    private static void checkPrice(Request request, int tradeType, ListedStock stock)
            throws Refusal {
        if (tradeType == FIXED_PRICE) {
            requireEmpty(request, "31");
            requireEmpty(request, "M8");
            return;
        }
        char kind = request.letter("M8", "0159");
        if (kind != '0') {
            if (!request.get("31").equals("0")) {
                throw Refusal.malformed("31");
            }
            return;
        }
        BigDecimal price = Texts.price(request.get("31"), 2, "31");
        long hundredths = price.movePointRight(2).longValueExact();
        if (hundredths > stock.limitUp) {
            throw Refusal.rejected("委託價格超過漲停價");
        }
        if (hundredths < stock.limitDown) {
            throw Refusal.rejected("委託價格低於跌停價");
        }
    }

    private static void requireEmpty(Request request, String tag) throws Refusal {
        if (!request.get(tag).isEmpty()) {
            throw Refusal.malformed(tag);
        }
    }

    private static void checkSignature(Request request, int tradeType) throws Refusal {
        Signature signature = Signature.of(request);
        String priceKind = request.get("M8");
        boolean limit = tradeType != FIXED_PRICE && priceKind.equals("0");
        if (request.kind().variant == 0) {
            signature.with(request.get("32"), request.get("29"), request.get("30"),
                    tradeType == FIXED_PRICE ? "3" : limit ? request.get("31") : priceKind);
        } else {
            signature.with(
                    request.get("32"), request.get("29"), request.get("27"), request.get("28"));
            if (tradeType == FIXED_PRICE) {
                signature.any("[0159]");
            } else {
                signature.with(priceKind);
            }
            signature.with(request.get("30"), limit ? request.get("31") : "0", "");
        }
        signature.check(request);
    }

    /** Judges the fields and the signature of a cancellation or change against the order. */
    static void checkChange(Request request, StockOrder order) throws Refusal {
        int tradeType = checkTradeType(request);
        boolean same = order.tradeType == tradeType && order.stock.code.equals(request.get("29"))
                && request.letter("32", "BS") == order.side && request.number("27") == order.kind
                && request.get("10").equals(Texts.date(order.entered.toLocalDate()));
        checkChangeSignature(request);
        // the price is a plain number of hundredths here, without a point
        request.number("31");
        request.number("N6");
        if (!same) {
            throw Refusal.rejected("與原委託不符");
        }
    }

    private static void checkChangeSignature(Request request) throws Refusal {
        boolean cancel = request.function() == 'D';
        Signature signature = Signature.of(request);
        if (request.kind().variant == 0) {
            signature.with(request.get("36"), request.get("32"), request.get("29"),
                    cancel ? "" : request.get("37"), "");
        } else {
            signature.with(request.get("32"), request.get("29"), "", request.get("28"), "",
                    cancel ? "" : request.get("37"), "", request.get("36"));
        }
        signature.check(request);
    }
}
