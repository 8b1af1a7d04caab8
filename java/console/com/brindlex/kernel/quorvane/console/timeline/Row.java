package com.brindlex.kernel.quorvane.console.timeline;

import com.brindlex.kernel.quorvane.console.message.Fault;
import java.util.List;

/**
 * A message in a timeline.
 *
 * @param line the line of the log that it begins at
 * @param time as the log writes it; else the time of a request, from its id; else empty
 * @param isRequest whether the app sent it; else it answers
 * @param operation the native method that built it or that reads it; empty when nobody knows
 * @param title the operation in words; empty when nobody knows
 * @param account the account that it is for, else the ID number; empty when it names none
 * @param idNumber the ID number of the request; empty when it names none
 * @param instrument the stock or the commodity; empty when it names none
 * @param words what it says
 * @param status sent, done, refused, failed, pending or answered
 * @param requestId the id of the request; empty when there is none
 * @param requestLine the line of the request that it answers; 0 for a request and where none fits
 * @param millis how long the answer took; null where the log does not tell
 * @param faults what is wrong with the message
 */
public record Row(long line, String time, boolean isRequest, String operation, String title,
        String account, String idNumber, String instrument, String words, String status,
        String requestId, long requestLine, Long millis, List<Fault> faults) {
    /** Whether a person should look at it. */
    public boolean isFailure() {
        return !faults.isEmpty() || status.equals("refused") || status.equals("failed");
    }
}
