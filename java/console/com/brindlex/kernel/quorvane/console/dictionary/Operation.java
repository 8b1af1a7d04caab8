package com.brindlex.kernel.quorvane.console.dictionary;

import java.util.List;
import java.util.Map;

/**
 * An operation: an encoder has forms, a decoder has none.
 *
 * @param name the native method
 * @param gatewayClass the class of the library that does the work
 * @param scene what its messages are about; it gives the tags their names
 * @param title the operation in a few words
 * @param header the header that opens its requests; null for a decoder
 * @param function the letter that tag 14 always carries; null when there is none
 * @param blanksEscaped whether a blank goes out as {@code %20}
 * @param forms the bodies of its requests
 * @param answeredBy the decoders that read its replies
 * @param refusals the ids of the messages that it may answer with
 * @param brokerage the brokerage whose replies it reads; null for all
 */
public record Operation(String name, String gatewayClass, String scene, String title,
        String header, String function, boolean blanksEscaped, List<Argument> arguments,
        List<Form> forms, List<String> answeredBy, List<String> refusals, String brokerage) {
    /**
     * The body of a request.
     *
     * @param when values of arguments that it is for
     * @param body what stands behind the header
     */
    public record Form(Map<String, String> when, String body) {}

    /** Whether it builds requests. */
    public boolean isEncoder() {
        return !forms.isEmpty();
    }

    /** Whether it trades futures and options. */
    public boolean isFutures() {
        return gatewayClass.equals("CGatewayFut");
    }

    /** Its argument of that name; null when it has none. */
    public Argument argument(String argument) {
        for (Argument each : arguments) {
            if (each.name().equals(argument)) {
                return each;
            }
        }
        return null;
    }
}
