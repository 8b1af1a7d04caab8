package com.brindlex.kernel.quorvane.simulator;

/** How the way to the broker's host is. */
public enum Line {
    /** Requests arrive and are answered. */
    UP(null),
    /** The gateway cannot reach its host. */
    GATEWAY_DOWN("[GATEWAY]error"),
    /** The broker's host does not answer in time. */
    BROKER_TIMEOUT("[BROKER]timeout"),
    /** Nothing comes back. */
    SILENT("");

    /** What every request is answered with, or null when the host answers. */
    final String reply;

    Line(String reply) {
        this.reply = reply;
    }
}
