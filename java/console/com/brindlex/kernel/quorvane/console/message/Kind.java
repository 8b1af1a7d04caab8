package com.brindlex.kernel.quorvane.console.message;

/** What a text of a log is. */
public enum Kind {
    /** A whole request, or a damaged one. */
    REQUEST,
    /** The header of a request, which the library logs before the request itself. */
    HEADER,
    /** A reply of the gateway. */
    REPLY,
    /** What the library hands to the screen. */
    RESULT,
    /** A message for the user. */
    MESSAGE,
    /** The length of a text that a call was given. */
    LENGTH,
    /** A mark on the way through a call. */
    MARK,
    /** The mark that a call has ended. */
    END,
    /** Anything else. */
    TEXT
}
