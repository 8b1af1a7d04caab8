package com.brindlex.kernel.quorvane.typed;

/** The state of an order, as the order books derive it. */
public enum OrderStatus implements Named {
    ACCEPTED("委託成功", "accepted"),
    RECEIVED("委託收到", "received"),
    PROCESSING("正在處理", "sent, waiting for the report"),
    IN_PROCESS("處理中", "in process"),
    RESERVED("預約單", "reserved"),
    REDUCED("已改量", "quantity reduced"),
    CANCELLED("已取消", "cancelled"),
    PARTLY_FILLED("部份成交", "partly filled"),
    PARTLY_FILLED_REST_CANCELLED("部份成交，其餘已取消", "partly filled, rest cancelled"),
    FILLED("已成交", "filled"),
    MATCHED_UNFILLED("撮合未成交", "matched, nothing filled"),
    MATCHED_PARTLY("撮合部份成交", "matched, partly filled"),
    FAILED("委託失敗", "failed");

    private final String code;
    private final String label;

    OrderStatus(String code, String label) {
        this.code = code;
        this.label = label;
    }

    @Override
    public String code() {
        return code;
    }

    @Override
    public String label() {
        return label;
    }
}
