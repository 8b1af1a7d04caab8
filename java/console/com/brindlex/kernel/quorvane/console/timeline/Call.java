package com.brindlex.kernel.quorvane.console.timeline;

import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.message.Message;

/** What one thread has logged of a call of the library, until the call ends. */
final class Call {
    /** The decoder that a length line named; null when none did. */
    String decoder;

    /** The header of a request that is being built; null when there is none. */
    Message header;

    /** A text that may turn out to be the result, when the call ends behind it. */
    LogMessage text;

    /** Whether a request was built, or refused. */
    boolean isAsked;

    /** Whether a reply or a result was seen: what follows repeats it. */
    boolean isAnswered;

    /** Whether it was a call of the stock class. */
    boolean isStock;
}
