package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.Newest;
import com.brindlex.kernel.quorvane.console.dictionary.CodeTable;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Operation;
import com.brindlex.kernel.quorvane.console.dictionary.Reply;
import java.util.ArrayList;
import java.util.HashMap;
import java.util.List;
import java.util.Map;
import java.util.Set;

/** A reply's layout, indexed by tag: bounds, forms of values, names. */
final class ReplyForm {
    private static final Map<String, ReplyForm> ALL = new HashMap<>();

    /** So many kinds of replies are remembered with the decoders that fit. */
    private static final Map<Set<String>, List<String>> FITTING = new Newest<>(256);

    static {
        Dictionary dictionary = Dictionary.get();
        for (Operation operation : dictionary.operations()) {
            Reply reply = dictionary.reply(operation.name());
            if (reply != null) {
                ALL.put(operation.name(), new ReplyForm(operation, reply));
            }
        }
    }

    final Operation operation;
    final Reply reply;
    final boolean isReceipt;
    final Map<String, Dictionary.Tag> names;
    private final Map<String, Integer> ofReply = new HashMap<>();
    private final Map<String, Integer> ofRecord = new HashMap<>();
    private final Map<String, Reply.Column> columns = new HashMap<>();

    /** The table that works out a type from order kind, trade type and side; null for none. */
    final CodeTable types;

    private ReplyForm(Operation operation, Reply reply) {
        this.operation = operation;
        this.reply = reply;
        this.isReceipt = reply.isReceipt();
        this.names = Dictionary.get().tags(operation.scene());
        reply.replyTags().forEach(each -> ofReply.put(each.tag(), each.bound()));
        if (reply.record() != null) {
            reply.record().tags().forEach(each -> ofRecord.put(each.tag(), each.bound()));
        }
        CodeTable found = null;
        for (Reply.Table table : reply.tables()) {
            for (Reply.Column column : table.columns()) {
                boolean type = "type".equals(column.name()) && "code".equals(column.form());
                found = type ? Dictionary.get().codes(column.codes()) : found;
                if (column.tags() != null) {
                    column.tags().forEach(tag -> addColumn(tag, column));
                }
            }
        }
        this.types = found;
    }

    /** A column shows the tag that bears its name; counts are added up of several. */
    private void addColumn(String tag, Reply.Column column) {
        Dictionary.Tag name = names.get(tag);
        boolean same = name != null && name.name().equals(column.name());
        boolean alone = column.tags().size() == 1 && !"code".equals(column.form());
        if (same) {
            columns.put(tag, column);
        } else if (alone || "count".equals(column.form())) {
            columns.putIfAbsent(tag, column);
        }
    }

    /** The layout that a decoder reads; null when it is no decoder. */
    static ReplyForm of(String decoder) {
        return ALL.get(decoder);
    }

    /** The decoders whose layouts a reply fits best. */
    static List<String> fitting(Set<String> tags) {
        synchronized (FITTING) {
            return FITTING.computeIfAbsent(tags, ReplyForm::search);
        }
    }

    private static List<String> search(Set<String> tags) {
        List<String> best = new ArrayList<>();
        int most = Integer.MIN_VALUE;
        for (Operation operation : Dictionary.get().operations()) {
            ReplyForm form = ALL.get(operation.name());
            int score = form == null ? Integer.MIN_VALUE : form.score(tags);
            if (form != null && score >= most) {
                if (score > most) {
                    best.clear();
                }
                most = score;
                best.add(operation.name());
            }
        }
        return best;
    }

    private int score(Set<String> tags) {
        int score = 0;
        for (String tag : tags) {
            score += reads(tag) ? 3 : names.containsKey(tag) ? 0 : -1;
        }
        int unread = ofReply.size() + ofRecord.size();
        return 100 * score - unread;
    }

    boolean reads(String tag) {
        return ofRecord.containsKey(tag) || ofReply(tag);
    }

    /** Whether a tag is read from the whole reply, not record by record. */
    boolean ofReply(String tag) {
        return ofReply.containsKey(tag);
    }

    /** The size that bounds a value; null when nothing does. */
    Integer bound(String tag, boolean inRecord) {
        return (inRecord ? ofRecord : ofReply).get(tag);
    }

    /** The column that shows a tag; null when none shows it as it is. */
    Reply.Column column(String tag) {
        return columns.get(tag);
    }
}
