package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * What came of a request: a result, a failure, or an order that is on its way; nothing between.
 * Never changes.
 *
 * @param <T> the result
 */
public final class Reply<T> {
    /** The three outcomes. */
    public enum Outcome {
        /** The gateway did what was asked. */
        RESULT,
        /** An order was sent and not answered: it may stand. The order book will tell. */
        ON_ITS_WAY,
        /** It was not done, or cannot be read. */
        FAILURE
    }

    private static final String ON_ITS_WAY = "委託單傳送中!!";

    private final T result;
    private final Failure failure;

    private Reply(T result, Failure failure) {
        this.result = result;
        this.failure = failure;
    }

    static <T> Reply<T> result(T result) {
        return new Reply<T>(result, null);
    }

    static <T> Reply<T> onItsWay() {
        return new Reply<T>(null, null);
    }

    static <T> Reply<T> failure(Failure failure) {
        return new Reply<T>(null, failure);
    }

    /** Which of the three it is. */
    @NotNull
    public Outcome outcome() {
        return result != null ? Outcome.RESULT
                : failure != null ? Outcome.FAILURE : Outcome.ON_ITS_WAY;
    }

    /** Whether there is a result. */
    public boolean isResult() {
        return result != null;
    }

    /** Whether it is an order that was sent and not answered. */
    public boolean isOnItsWay() {
        return outcome() == Outcome.ON_ITS_WAY;
    }

    /** Whether it is a failure. */
    public boolean isFailure() {
        return failure != null;
    }

    /** The result; null when there is none. */
    @Nullable
    public T orNull() {
        return result;
    }

    /**
     * The result.
     *
     * @throws ReplyException when it is a failure, or an order on its way
     */
    @NotNull
    public T orThrow() {
        if (result == null) {
            throw new ReplyException(toString(), failure);
        }
        return result;
    }

    /** The failure; null when it is none. */
    @Nullable
    public Failure failure() {
        return failure;
    }

    /** What to tell the user when there is no result; empty when there is one. */
    @NotNull
    public String message() {
        return result != null ? "" : failure != null ? failure.text() : ON_ITS_WAY;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Reply && ((Reply<?>) other).outcome() == outcome()
                && ((Reply<?>) other).content().equals(content());
    }

    @Override
    public int hashCode() {
        return content().hashCode();
    }

    private Object content() {
        return result != null ? result : failure != null ? failure : ON_ITS_WAY;
    }

    @Override
    public String toString() {
        return content().toString();
    }
}
