package com.brindlex.kernel.quorvane.typed;

/** What an encoder gave: a request to send, or the message why there is none. */
public final class Encoded {
    private final int status;
    private final String text;

    Encoded(int status, String text) {
        this.status = status;
        this.text = text;
    }

    /** 1 for a request, -1 for a message. */
    public int status() {
        return status;
    }

    /** Whether there is a request to send. */
    public boolean isSuccess() {
        return status == 1;
    }

    /** The request, or the message. */
    public String text() {
        return text;
    }

    /** The message to show when there is no request; null when there is one. */
    public Message message() {
        return isSuccess() ? null : Message.of(text);
    }

    @Override
    public String toString() {
        return text;
    }
}
