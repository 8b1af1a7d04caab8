package com.brindlex.kernel.quorvane.console.message;

import java.util.ArrayList;
import java.util.List;

/** Lays the fields of a request beside those of a form: the longest run of tags in common. */
final class Alignment {
    /**
     * A field of the form beside one of the request.
     *
     * @param slot the field of the form; null when the request has one too many
     * @param piece the field of the request; null when it lacks one
     */
    record Pair(Template.Slot slot, Cut.Piece piece) {}

    private Alignment() {}

    private static int[][] table(List<Template.Slot> slots, List<Cut.Piece> pieces) {
        int[][] common = new int[slots.size() + 1][pieces.size() + 1];
        for (int i = slots.size() - 1; i >= 0; i--) {
            for (int j = pieces.size() - 1; j >= 0; j--) {
                common[i][j] = slots.get(i).tag().equals(pieces.get(j).tag())
                        ? common[i + 1][j + 1] + 1
                        : Math.max(common[i + 1][j], common[i][j + 1]);
            }
        }
        return common;
    }

    /** How many fields they have in common. */
    static int common(List<Template.Slot> slots, List<Cut.Piece> pieces) {
        return table(slots, pieces)[0][0];
    }

    /** The fields side by side. */
    static List<Pair> pairs(List<Template.Slot> slots, List<Cut.Piece> pieces) {
        int[][] common = table(slots, pieces);
        List<Pair> pairs = new ArrayList<>();
        int i = 0;
        int j = 0;
        while (i < slots.size() || j < pieces.size()) {
            boolean same = i < slots.size() && j < pieces.size()
                    && slots.get(i).tag().equals(pieces.get(j).tag());
            if (same) {
                pairs.add(new Pair(slots.get(i++), pieces.get(j++)));
            } else if (j < pieces.size()
                    && (i == slots.size() || common[i][j + 1] >= common[i + 1][j])) {
                pairs.add(new Pair(null, pieces.get(j++)));
            } else {
                pairs.add(new Pair(slots.get(i++), null));
            }
        }
        return pairs;
    }
}
