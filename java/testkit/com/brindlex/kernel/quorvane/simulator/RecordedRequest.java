package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Operation;
import java.util.LinkedHashMap;
import java.util.Map;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * A request that came to the {@link Gateway}, and what went back. Fields have the names of the
 * dictionary (docs/dictionary.md), as the console and the operations page show them.
 *
 * <pre>{@code
 * RecordedRequest order = gateway.lastRequest(Operation.SUBMIT_ORDER_ENCODE);
 * assertEquals("2330", order.value("stockCode"));
 * assertEquals("995.50", order.value("price"));
 * }</pre>
 */
public final class RecordedRequest {
    private final String text;
    private final Operation operation;
    private final Map<String, String> values;
    private final Disturbance disturbance;
    private final String reply;

    RecordedRequest(String text, @Nullable Request request, Disturbance disturbance, String reply) {
        this.text = text;
        this.operation = request == null ? null : request.operation();
        this.values = request == null ? new LinkedHashMap<>() : FieldNames.named(request);
        this.disturbance = disturbance;
        this.reply = reply;
    }

    /** The request as it came. */
    @NotNull
    public String text() {
        return text;
    }

    /** The reply as it went back, whatever befell it. */
    @NotNull
    public String reply() {
        return reply;
    }

    /**
     * The encoder that builds such a request; null when the gateway did not understand it. Requests of
     * {@code GetCertEncode2} are those of {@code GetCertEncode}.
     */
    @Nullable
    public Operation operation() {
        return operation;
    }

    /** The fields as they were sent, in their order, by name; passwords among them. */
    @NotNull
    public Map<String, String> values() {
        return new LinkedHashMap<>(values);
    }

    /**
     * A field as it was sent: {@code value("quantity")} of an order for two lots is "2000".
     *
     * @throws IllegalArgumentException when the request has no such field, with those that it has
     */
    @NotNull
    public String value(@NotNull String name) {
        String value = values.get(name);
        if (value == null) {
            throw new IllegalArgumentException((operation == null
                            ? "The gateway did not understand this request, so that it has no field \""
                            : "A request of " + operation.method() + " has no field \"")
                    + name + "\"; it has " + String.join(", ", values.keySet()) + ".");
        }
        return value;
    }

    /** Whether the request has the field, be it empty. */
    public boolean has(@NotNull String name) {
        return values.containsKey(name);
    }

    /** The operation and its fields without passwords, for the message of a failed test. */
    @Override
    public String toString() {
        if (operation == null) {
            return "not understood: " + text;
        }
        Map<String, String> shown = values();
        shown.replaceAll((name, value) -> FieldNames.isSecret(name) ? "***" : value);
        String befell = disturbance == Disturbance.NONE ? "" : ", " + disturbance;
        return operation.method() + " " + shown + befell;
    }
}
