package com.brindlex.kernel.quorvane.simulator;

import java.time.Duration;
import java.util.function.UnaryOperator;
import org.jetbrains.annotations.NotNull;

/**
 * Something that happens to a request or its reply on the way: see {@link Gateway#disturbNext}. Never
 * changes.
 *
 * <p>Unless it is {@link #lost}, the request has reached the gateway and was carried out: an order
 * stands, though its reply did not come.
 */
public final class Disturbance {
    private static final String PAGE = "<!DOCTYPE html>\n<html><head><title>502 Bad Gateway</title>"
            + "</head>\n<body><h1>502 Bad Gateway</h1></body></html>\n";

    static final Disturbance NONE = new Disturbance("nothing", true, reply -> reply, Duration.ZERO);

    private final String title;

    /** Whether the request reaches the gateway. */
    final boolean arrives;

    private final UnaryOperator<String> change;
    private final Duration delay;

    private Disturbance(
            String title, boolean arrives, UnaryOperator<String> change, Duration delay) {
        this.title = title;
        this.arrives = arrives;
        this.change = change;
        this.delay = delay;
    }

    /** The request does not arrive: nothing is done and nothing comes back. */
    @NotNull
    public static Disturbance lost() {
        return new Disturbance("request lost", false, reply -> "", Duration.ZERO);
    }

    /** Nothing arrives, and the marker of the line comes back. */
    static Disturbance down(Line line) {
        return new Disturbance(line.toString(), false, reply -> line.reply, Duration.ZERO);
    }

    /** The request is carried out and nothing comes back. */
    @NotNull
    public static Disturbance empty() {
        return new Disturbance("reply emptied", true, reply -> "", Duration.ZERO);
    }

    /** The reply comes late. */
    @NotNull
    public static Disturbance delay(@NotNull Duration delay) {
        return NONE.delayed(delay);
    }

    /**
     * The reply ends early.
     *
     * @param characters how many of its characters come; a shorter reply comes whole
     */
    @NotNull
    public static Disturbance cut(int characters) {
        if (characters < 0) {
            throw new IllegalArgumentException(
                    "A reply is cut after 0 or more characters, not after " + characters + ".");
        }
        return new Disturbance("reply cut", true,
                reply -> reply.substring(0, Math.min(characters, reply.length())), Duration.ZERO);
    }

    /** A marker of the line comes in the place of the reply. */
    @NotNull
    public static Disturbance marker(@NotNull Line line) {
        if (line == Line.UP) {
            throw new IllegalArgumentException(
                    "A line that is up sends no marker: take GATEWAY_DOWN or BROKER_TIMEOUT.");
        }
        return text(line.reply);
    }

    /** A web page comes in the place of the reply, as from a proxy on the way. */
    @NotNull
    public static Disturbance page() {
        return text(PAGE);
    }

    /** Another text comes in the place of the reply. */
    @NotNull
    public static Disturbance text(@NotNull String text) {
        return new Disturbance("reply replaced", true, reply -> text, Duration.ZERO);
    }

    /** The same, and what comes comes late: {@code Disturbance.empty().delayed(...)}. */
    @NotNull
    public Disturbance delayed(@NotNull Duration delay) {
        if (delay.isNegative()) {
            throw new IllegalArgumentException("A reply cannot come early, by " + delay + ".");
        }
        return new Disturbance(title, arrives, change, delay);
    }

    String change(String reply) {
        return change.apply(reply);
    }

    /**
     * Waits.
     *
     * @return whether nobody interrupted it; the thread stays interrupted
     */
    boolean await() {
        try {
            Thread.sleep(delay.toMillis());
            return true;
        } catch (InterruptedException interrupted) {
            Thread.currentThread().interrupt();
            return false;
        }
    }

    @Override
    public String toString() {
        return title + (delay.isZero() ? "" : " after " + delay);
    }
}
