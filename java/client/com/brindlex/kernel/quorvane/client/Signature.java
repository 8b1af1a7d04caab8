package com.brindlex.kernel.quorvane.client;

/** Where an order carries its signature payload. The broker says which one it reads. */
public enum Signature {
    /** Bare, behind the last value. */
    BARE,
    /** In a tag of its own, PL, which names more of the order. */
    TAG_PL
}
