package com.brindlex.kernel.quorvane.simulator;

/** One leg of a futures order: product, contract month, strike, call or put, side. */
final class FuturesLeg {
    final ListedProduct product;
    final String month;
    final String strike;
    final String callPut;
    final char side;

    /** Reads leg 1 or 2 of a request and judges its texts. */
    FuturesLeg(Request request, boolean first, World world) throws Refusal {
        product = world.product(request.get(first ? "33" : "V9"));
        month = request.get(first ? "29" : "W0");
        strike = request.get(first ? "34" : "W2");
        callPut = request.get(first ? "V8" : "W1");
        side = request.letter(first ? "32" : "EL", "BS");
        if (!month.matches("[0-9]{4}(0[1-9]|1[0-2])(W[1-5])?")) {
            throw Refusal.rejected("契約年月錯誤");
        }
        boolean complete = product.option
                ? callPut.matches("[CP]") && strike.matches("[0-9]{1,6}(\\.[0-9]{1,4})?")
                : callPut.isEmpty() && strike.isEmpty();
        if (!complete) {
            throw Refusal.rejected("選擇權條件錯誤");
        }
    }

    private FuturesLeg(FuturesLeg other, char side) {
        product = other.product;
        month = other.month;
        strike = other.strike;
        callPut = other.callPut;
        this.side = side;
    }

    boolean bindsMargin() {
        return !product.option || side == 'S';
    }

    FuturesLeg opposite() {
        return new FuturesLeg(this, side == 'B' ? 'S' : 'B');
    }

    boolean sameContract(FuturesLeg other) {
        return product == other.product && month.equals(other.month) && strike.equals(other.strike)
                && callPut.equals(other.callPut);
    }

    /** Writes the leg's fields, with the tags of leg 1 or leg 2. */
    void write(Reply reply, boolean first) {
        reply.field(first ? "33" : "V9", product.commodity)
                .field(first ? "29" : "W0", month)
                .field(first ? "V8" : "W1", callPut)
                .field(first ? "34" : "W2", strike)
                .field(first ? "32" : "EL", side);
    }
}
