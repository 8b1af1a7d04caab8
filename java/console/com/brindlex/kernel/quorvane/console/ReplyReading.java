package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.console.Explanation.Group;
import com.brindlex.kernel.quorvane.console.Explanation.Item;
import com.brindlex.kernel.quorvane.console.Explanation.Kind;
import com.brindlex.kernel.quorvane.console.Explanation.Trouble;
import com.brindlex.kernel.quorvane.typed.Layout;
import com.brindlex.kernel.quorvane.typed.Operation;
import java.util.ArrayList;
import java.util.LinkedHashSet;
import java.util.List;
import java.util.Set;

/** Explains replies. */
final class ReplyReading {
    /** Tags that any reply may carry. */
    private static final Set<String> FRAME =
            Set.of("F", "KIND", "65", "00", "01", "67", "68", "M2", "FUNC", "FUNC1");

    /** Tags that requests alone carry. */
    private static final List<String> OF_REQUESTS = List.of("BHNO", "CB", "IP", "11", "VER", "SN");

    private static final int END_OF_LIST = 900000;

    private final String text;
    private final List<Token> tokens;
    private final List<Trouble> faults = new ArrayList<>();
    private final List<Group> groups = new ArrayList<>();
    private List<Item> open = new ArrayList<>();
    private boolean inRecord;
    private boolean ended;
    private int records;

    private ReplyReading(String text) {
        this.text = text;
        this.tokens = Token.cut(text);
    }

    /** Whether a text is a request, or the beginning of one: both sides write F and KIND first. */
    static boolean looksLikeRequest(String text) {
        List<Token> tokens = Token.cut(text);
        long header = tokens.stream().filter(token -> OF_REQUESTS.contains(token.tag())).count();
        boolean family = !tokens.isEmpty() && tokens.get(0).tag().equals("F");
        return header >= 2 || family && (header == 1 && tokens.size() < 5 || tokens.size() <= 2);
    }

    static Explanation explain(String text, Operation hint) {
        return new ReplyReading(text).read(hint);
    }

    private Explanation read(Operation hint) {
        List<Operation> operations = hint != null && !hint.isEncoder() ? List.of(hint) : readers();
        Operation operation = operations.isEmpty() ? null : operations.get(0);
        Scene scene = operation == null ? Scene.ACCOUNT : Scene.ofOperation(operation.method());
        for (Token token : tokens) {
            readToken(token, scene, operation);
        }
        if (inRecord) {
            faults.add(new Trouble(text.length(), "the last record is not closed: no '|01='"));
        }
        close("behind the records");
        boolean list = operation != null && operation.layout().kind() != Layout.Kind.RECORD
                && !operation.layout().tables().isEmpty() && endsWithMark(operation);
        if (list && records > 0 && !ended && !inRecord && isGood()) {
            faults.add(new Trouble(text.length(), "the list has no end: no record with tag 67 of "
                            + END_OF_LIST + " or more"));
        }
        String summary = operations.size() == 1 ? "reply: " + operation.summary() : "reply";
        return new Explanation(Kind.REPLY, operations, summary, text, groups, faults);
    }

    private boolean isGood() {
        return tokens.stream().filter(token -> token.tag().equals("68")).findFirst()
                .map(token -> token.value().equals("0000")).orElse(false);
    }

    /**
     * Balance and margin are read from the first record alone; the lists of accounts, and the fills
     * and positions of futures, need no end mark.
     */
    private static boolean endsWithMark(Operation operation) {
        return operation == Operation.QUERY_ORDER_DECODE
                || operation == Operation.QUERY_REPLY_DECODE
                || operation == Operation.QUERY_INVENTORY_DECODE
                || operation == Operation.QUERY_INVENTORY_DECODE_JZG
                || operation == Operation.PAYMENT_DECODE
                || operation == Operation.PAYMENT_DECODE_JZG
                || operation == Operation.FUT_QUERY_ORDER_DECODE;
    }

    /** The decoders that know the most of the tags. */
    private List<Operation> readers() {
        Set<String> tags = new LinkedHashSet<>();
        tokens.forEach(token -> tags.add(token.tag()));
        tags.removeAll(FRAME);
        List<Operation> best = new ArrayList<>();
        long most = 0;
        for (Operation operation : Operation.values()) {
            long known = tags.stream().filter(operation.replyTags()::contains).count();
            if (!operation.isEncoder() && known > 0 && known >= most) {
                if (known > most) {
                    best.clear();
                }
                most = known;
                best.add(operation);
            }
        }
        return best;
    }

    private void readToken(Token token, Scene scene, Operation operation) {
        String tag = token.tag();
        if (tag.equals("00")) {
            if (inRecord) {
                faults.add(new Trouble(
                        token.offset(), "a record begins before the last one ended"));
            }
            close(records == 0 ? "before the records" : "between records");
            inRecord = true;
            records++;
        } else if (tag.equals("67") && token.value().matches("[0-9]{1,9}")
                && Integer.parseInt(token.value()) >= END_OF_LIST) {
            ended = true;
        }
        String name = FieldNames.name(scene, tag);
        if (tag.isEmpty()) {
            boolean marker = token.value().startsWith("[");
            name = marker ? "transport marker" : null;
            faults.add(new Trouble(token.start(), "'" + token.value() + "' "
                            + (marker ? "stands behind the fields" : "has no tag")));
        } else if (name == null) {
            faults.add(new Trouble(token.start(), "unknown tag " + tag));
        } else if (token.bars() == 0 && !tag.equals("F")) {
            faults.add(new Trouble(token.start(), "no bar before tag " + tag + ": it is not read"));
        }
        open.add(new Item(token.start(), tag, token.value(), name,
                TagReading.of(tag, token.value(), scene, operation)));
        if (tag.equals("01")) {
            if (!inRecord) {
                faults.add(new Trouble(token.start(), "the end of a record that did not begin"));
            }
            close("record " + records);
            inRecord = false;
        }
    }

    private void close(String title) {
        if (!open.isEmpty()) {
            groups.add(new Group(inRecord ? "record " + records : title, open));
            open = new ArrayList<>();
        }
    }
}
