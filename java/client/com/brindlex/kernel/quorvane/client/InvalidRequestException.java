package com.brindlex.kernel.quorvane.client;

import java.util.Collections;
import java.util.List;
import org.jetbrains.annotations.NotNull;

/** A request that cannot be sent, with everything that is wrong with it. */
public final class InvalidRequestException extends IllegalArgumentException {
    private static final long serialVersionUID = 1;

    private final transient List<Problem> problems;

    InvalidRequestException(Operation operation, List<Problem> problems) {
        super(operation + ": " + problems);
        this.problems = Collections.unmodifiableList(problems);
    }

    /** Everything that is wrong, at least one. */
    @NotNull
    public List<Problem> problems() {
        return problems;
    }
}
