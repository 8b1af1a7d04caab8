package com.brindlex.kernel.quorvane.client;

/** The gateway did what was asked and has nothing more to say. Never changes. */
public final class Confirmation {
    static final Confirmation DONE = new Confirmation();

    private Confirmation() {}

    @Override
    public String toString() {
        return "done";
    }
}
