package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.Nullable;

/** Reads the replies to one kind of request: calls the decoder and judges what it says. */
abstract class ReplyType<T> {
    private static final String DONE = "0000";
    private static final String NO_LINE = "主機連線失敗";
    private static final String NO_REASON = "主機未說明原因";
    private static final String UNREADABLE = "無法辨識主機回覆";

    /** How much of a reply its decoder judges itself. */
    enum Judge {
        /** All that there is to judge. */
        DECODER,
        /** As {@link #DECODER}; without a reply the order is on its way. */
        DECODER_OF_ORDERS,
        /** Neither markers nor result codes: they read as a success. */
        NOBODY
    }

    private final Operation decoder;
    private final Layout layout;
    private final Judge judge;

    ReplyType(Operation decoder, Layout layout, Judge judge) {
        this.decoder = decoder;
        this.layout = layout;
        this.judge = judge;
    }

    /** Reads the result of the decoder. */
    abstract T result(String text);

    Operation decoder() {
        return decoder;
    }

    Layout layout() {
        return layout;
    }

    Reply<T> read(Market market, String reply) {
        int[] status = {0};
        String text = Natives.decode(decoder, market.code(), reply, status);
        return judge(reply, status[0], text);
    }

    /** What a reply means of which the decoder made this. */
    Reply<T> judge(String reply, int status, String text) {
        if (judge == Judge.DECODER_OF_ORDERS && reply.isEmpty()) {
            return Reply.onItsWay();
        }
        Failure failure = judge == Judge.NOBODY ? unjudged(reply) : null;
        if (failure != null) {
            return Reply.failure(failure);
        }
        return status == 1 ? Reply.result(result(text)) : Reply.<T>failure(told(text, reply));
    }

    /** The failure that a decoder tells; its code and speaker, too, where the reply has them. */
    private static Failure told(String message, String reply) {
        Failure told = Failure.of(message);
        String code = told.code().isEmpty() ? tag(reply, "68") : told.code();
        return complete(told.source(), code, told.text(), reply);
    }

    /** What a decoder that judges nothing would take for a success; null when it is one. */
    @Nullable
    private static Failure unjudged(String reply) {
        String code = tag(reply, "68");
        boolean sound = code.equals(DONE) || reply.contains("|00=") && !reply.contains("|68=");
        if (lineFailure(reply) == null && sound) {
            return null;
        }
        Failure told = Failure.of(tag(reply, "M2"));
        return complete(told.source(), code, told.text(), reply);
    }

    private static Failure complete(
            Failure.Source source, String code, String text, String reply) {
        Failure line = lineFailure(reply);
        boolean answered = !code.isEmpty() || !tag(reply, "39").isEmpty();
        if (text.isEmpty() && line != null) {
            return line;
        }
        if (text.isEmpty() && !answered) {
            return new Failure(Failure.Source.CLIENT, "", UNREADABLE);
        }
        boolean unnamed = source == Failure.Source.UNKNOWN && answered;
        return new Failure(unnamed ? Failure.Source.GATEWAY : source, code.equals(DONE) ? "" : code,
                text.isEmpty() ? NO_REASON : text);
    }

    @Nullable
    private static Failure lineFailure(String reply) {
        if (reply.contains("[GATEWAY]error")) {
            return new Failure(Failure.Source.GATEWAY, "", NO_LINE);
        }
        return reply.isEmpty() || reply.contains("[BROKER]timeout")
                ? new Failure(Failure.Source.BROKER, "", NO_LINE) : null;
    }

    /** The first value of a tag in a reply, or the empty text. */
    private static String tag(String reply, String tag) {
        String mark = "|" + tag + "=";
        int at = reply.indexOf(mark);
        if (at < 0) {
            return "";
        }
        int end = reply.indexOf('|', at + mark.length());
        return reply.substring(at + mark.length(), end < 0 ? reply.length() : end).trim();
    }
}
