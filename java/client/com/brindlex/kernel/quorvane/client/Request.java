package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * A request that is ready to be sent, and what reads the reply to it. Never changes. Its text
 * carries ID number and password; {@link #toString} does not.
 *
 * @param <T> what a reply to it brings
 */
public final class Request<T> {
    private final Operation operation;
    private final Session session;
    private final String text;
    private final ReplyType<T> replyType;

    Request(Operation operation, Session session, String text, ReplyType<T> replyType) {
        this.operation = operation;
        this.session = session;
        this.text = text;
        this.replyType = replyType;
    }

    /** The operation that it asks for. */
    @NotNull
    public Operation operation() {
        return operation;
    }

    /** The text to send. */
    @NotNull
    public String text() {
        return text;
    }

    /**
     * Reads the reply to this request.
     *
     * @param reply the gateway's reply as it was received; null or empty when there was none
     */
    @NotNull
    public Reply<T> read(@Nullable String reply) {
        return replyType.read(session.market(), reply == null ? "" : reply);
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Request && ((Request<?>) other).operation == operation
                && ((Request<?>) other).text.equals(text);
    }

    @Override
    public int hashCode() {
        return text.hashCode();
    }

    @Override
    public String toString() {
        return "Request(" + operation + ")";
    }
}
