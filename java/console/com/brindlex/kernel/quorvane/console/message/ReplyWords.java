package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.CodeTable;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Reply;
import java.util.HashMap;
import java.util.List;
import java.util.Map;

/** Says in a few words what a reply answers. */
final class ReplyWords {
    private final ReplyForm form;
    private final List<Cut.Piece> pieces;
    private final int records;
    private final String code;
    private final boolean isRefused;

    ReplyWords(ReplyForm form, List<Cut.Piece> pieces, int records) {
        this.form = form;
        this.pieces = pieces;
        this.records = records;
        this.code = Cut.value(form.ofReply("68") ? pieces : firstRecord(pieces), "68");
        this.isRefused = form.isReceipt ? !isAccepted()
                : form.reads("68") && !code.equals("0000") && !code.equals("5001");
    }

    /** The first record; the whole reply when it has none. */
    private static List<Cut.Piece> firstRecord(List<Cut.Piece> pieces) {
        int begin = -1;
        for (int i = 0; i < pieces.size(); i++) {
            begin = begin < 0 && pieces.get(i).tag().equals("00") ? i : begin;
            if (begin >= 0 && pieces.get(i).tag().equals("01")) {
                return pieces.subList(begin, i);
            }
        }
        return pieces;
    }

    /** The result code; empty when there is none. */
    String code() {
        return code;
    }

    boolean isRefused() {
        return isRefused;
    }

    /** A single blank in tag 39, and an acceptance letter in tag 19. */
    private boolean isAccepted() {
        String letter = Cut.value(pieces, "19");
        if (!Cut.value(pieces, "39").equals(" ") || letter.isEmpty()) {
            return false;
        }
        for (CodeTable.Code each : Dictionary.get().codes("acceptances").values()) {
            if (List.of(each.wire().split(" ")).contains(letter.substring(0, 1))) {
                return true;
            }
        }
        return false;
    }

    String words() {
        if (form.isReceipt) {
            return isRefused ? "refused: " + orNothing(Cut.value(pieces, "K1"))
                             : ("accepted " + Cut.value(pieces, "46")).strip();
        }
        if (isRefused) {
            String said = orNothing(Cut.value(pieces, "M2"));
            return "refused: " + said + (code.isEmpty() ? "" : " (" + code + ")");
        }
        return code.equals("5001") ? "no data" : done();
    }

    private static String orNothing(String text) {
        return text.isEmpty() ? "(no text)" : text;
    }

    private String done() {
        Reply reply = form.reply;
        if (reply.isList() && reply.result().equals("sections")) {
            return Meaning.counted(records, "position");
        }
        if (reply.isList()) {
            return Meaning.counted(records, reply.tables().get(0).name().replace(" (JZG)", ""));
        }
        return reply.tables().isEmpty() ? "done" : reply.tables().get(0).name();
    }

    Map<String, String> facts() {
        Map<String, String> facts = new HashMap<>();
        String id = Cut.value(pieces, "65");
        if (!id.isEmpty()) {
            facts.put("requestId", id);
        }
        facts.put("outcome", isRefused ? "refused" : "done");
        if (!code.isEmpty()) {
            facts.put("code", code);
        }
        return facts;
    }
}
