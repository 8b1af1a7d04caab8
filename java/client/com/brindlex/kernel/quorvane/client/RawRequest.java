package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * Any request by the names of its arguments, for consoles: each is checked on its own, but nothing
 * says what goes together. For one thread.
 */
public final class RawRequest {
    private final Operation operation;
    private final Draft<?> draft;

    private RawRequest(Operation operation, Draft<?> draft) {
        this.operation = operation;
        this.draft = draft;
    }

    /**
     * Opens a request; what is not given has its usual value.
     *
     * @throws IllegalArgumentException when the operation builds no requests
     */
    @NotNull
    public static RawRequest of(@NotNull Operation operation, @NotNull Session session) {
        if (!operation.isEncoder()) {
            throw new IllegalArgumentException(operation + " builds no request");
        }
        boolean jzg = session.brokerage() == Brokerage.JZG;
        Operation decoder = operation.decoders().get(jzg ? operation.decoders().size() - 1 : 0);
        return new RawRequest(operation, draft(operation, session, ReplyTypes.of(decoder)));
    }

    private static <T> Draft<T> draft(Operation operation, Session session, ReplyType<T> type) {
        return new Draft<T>(operation, session, type);
    }

    /**
     * Sets an argument from a text: a number in decimal digits, a letter as one character.
     *
     * @throws IllegalArgumentException when there is no such argument, or the text is no value of
     *         its type
     */
    @NotNull
    public RawRequest set(@NotNull String argument, @NotNull String text) {
        for (Argument known : operation.arguments()) {
            if (known.name().equals(argument)) {
                Object value = known.parse(text);
                if (value == null) {
                    throw new IllegalArgumentException(argument + " must be "
                            + (known.type() == Argument.Type.INT
                                              || known.type() == Argument.Type.SMALL
                                      ? "a whole number" : "one character")
                            + ", not '" + text + "'");
                }
                draft.set(argument, value);
                return this;
            }
        }
        throw new IllegalArgumentException(operation + " has no argument '" + argument + "'");
    }

    /**
     * Builds the request.
     *
     * @throws InvalidRequestException with all that is wrong
     */
    @NotNull
    public Request<?> build() {
        return draft.build();
    }
}
