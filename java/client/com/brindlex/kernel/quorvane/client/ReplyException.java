package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/** Thrown by {@link Reply#orThrow} when there is no result: a failure, or an order on its way. */
public final class ReplyException extends RuntimeException {
    private static final long serialVersionUID = 1;

    private final transient Failure failure;

    ReplyException(@NotNull String message, @Nullable Failure failure) {
        super(message);
        this.failure = failure;
    }

    /** The failure; null for an order that is on its way. */
    @Nullable
    public Failure failure() {
        return failure;
    }

    /** Whether an order is on its way: it may stand, and must not be sent again unseen. */
    public boolean isOnItsWay() {
        return failure == null;
    }
}
