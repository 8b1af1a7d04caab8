package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/** What any decoder, by its name, makes of a reply: for consoles and tests. Never changes. */
public final class RawReply {
    private final Operation decoder;
    private final int status;
    private final String text;
    private final Reply<?> reply;

    private RawReply(Operation decoder, int status, String text, Reply<?> reply) {
        this.decoder = decoder;
        this.status = status;
        this.text = text;
        this.reply = reply;
    }

    /**
     * Reads a reply.
     *
     * @throws IllegalArgumentException when the operation reads no replies
     */
    @NotNull
    public static RawReply of(
            @NotNull Operation decoder, @NotNull Market market, @NotNull String reply) {
        ReplyType<?> type = ReplyTypes.of(decoder);
        int[] status = {0};
        String text = Natives.decode(decoder, market.code(), reply, status);
        return new RawReply(decoder, status[0], text, type.judge(reply, status[0], text));
    }

    /** The decoder. */
    @NotNull
    public Operation decoder() {
        return decoder;
    }

    /** The status that it wrote: 1 done, -1 failed. */
    public int status() {
        return status;
    }

    /** The text that it returned. */
    @NotNull
    public String text() {
        return text;
    }

    /** What that means. */
    @NotNull
    public Reply<?> reply() {
        return reply;
    }

    /** The text taken apart. */
    @NotNull
    public ResultText result() {
        return ResultText.of(decoder, text);
    }

    @Override
    public String toString() {
        return decoder + ", status " + status + ": " + text;
    }
}
