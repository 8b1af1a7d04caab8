package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * Why a value cannot be sent. Never changes, and shows no password, ID number or certificate.
 */
public final class Problem {
    private final String argument;
    private final String reason;

    Problem(String argument, String reason) {
        this.argument = argument;
        this.reason = reason;
    }

    /** The argument that it is about; empty when it is about the request as a whole. */
    @NotNull
    public String argument() {
        return argument;
    }

    /** What is wrong with it, in English. */
    @NotNull
    public String reason() {
        return reason;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Problem && ((Problem) other).toString().equals(toString());
    }

    @Override
    public int hashCode() {
        return toString().hashCode();
    }

    @Override
    public String toString() {
        return argument.isEmpty() ? reason : argument + " " + reason;
    }
}
