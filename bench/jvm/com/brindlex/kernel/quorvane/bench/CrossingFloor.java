package com.brindlex.kernel.quorvane.bench;

/**
 * The least that a call through JNI costs: natives of the same signatures as the host class's that
 * take their strings and return a text laid ready, and do nothing with either.
 */
final class CrossingFloor {
    static {
        System.loadLibrary("quorvane_floor");
    }

    private CrossingFloor() {}

    /** Lays ready the text that the following calls return. */
    static native void layReady(String answer);

    static native String decode(String reply, int[] status);

    static native String user(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, int[] status);

    static native String stockOrder(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String stockCode, String orderDate, int quantity,
            int unit, int price, byte side, byte flag13, byte orderKind, byte priceKind,
            byte tradeType, byte n6, int[] status);

    static native String futuresOrder(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String orderRef, String orderDate, String commodity1,
            String commodity2, String month1, String month2, String strike1, String strike2,
            String callPut1, String callPut2, byte n6, byte orderKind, byte priceType,
            char function, char w3, char timeInForce, char reserved1, char side1, char side2,
            int quantity, int reserved2, int price, int[] status);
}
