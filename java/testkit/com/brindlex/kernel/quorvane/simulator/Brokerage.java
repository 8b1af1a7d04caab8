package com.brindlex.kernel.quorvane.simulator;

/** Whose reply layouts the gateway uses for positions and settlement. */
public enum Brokerage {
    /** Pairs in positions, order kinds in settlement. */
    STANDARD,
    /** Triples in positions, a type text of its own (tag KT) in settlement. */
    JZG
}
