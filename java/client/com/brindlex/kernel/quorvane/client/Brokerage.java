package com.brindlex.kernel.quorvane.client;

/** Whose layouts the replies of a session have. */
public enum Brokerage {
    /** The usual layouts. */
    STANDARD,
    /** Brokerage JZG, with layouts of its own for positions and settlement. */
    JZG
}
