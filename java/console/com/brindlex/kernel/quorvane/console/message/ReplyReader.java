package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.Utf8;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Reply;
import java.util.ArrayList;
import java.util.HashMap;
import java.util.LinkedHashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;

/** Takes replies apart, record by record. */
final class ReplyReader {
    private static final String GOOD = "0000";
    private static final String NO_DATA = "5001";
    private static final Set<String> OF_EVERY_REPLY =
            Set.of("F", "KIND", "65", "00", "01", "67", "68", "M2", "");

    private final String text;
    private final List<Cut.Piece> pieces;
    private final boolean full;
    private final ReplyForm form;
    private final List<Fault> faults = new ArrayList<>();
    private final List<Group> groups = new ArrayList<>();
    private final Map<String, String> record = new HashMap<>();
    private List<Field> open = new ArrayList<>();
    private int recordBegin = -1;
    private boolean ended;
    private int records;
    private int good;

    private ReplyReader(String text, List<Cut.Piece> pieces, ReplyForm form, boolean full) {
        this.full = full;
        this.text = text;
        this.pieces = pieces;
        this.form = form;
    }

    /**
     * Takes a reply apart.
     *
     * @param decoders the operations that can read it; empty when that is to be found out
     * @param full whether its fields are wanted, too
     */
    static Message read(String text, List<String> decoders, boolean full) {
        List<Cut.Piece> pieces = Cut.reply(text);
        List<String> readers = decoders;
        if (readers.size() != 1) {
            Set<String> tags = new LinkedHashSet<>();
            pieces.stream().limit(80).forEach(piece -> tags.add(piece.tag()));
            readers = ReplyForm.fitting(tags);
            List<String> both = readers.stream().filter(decoders::contains).toList();
            readers = !both.isEmpty() ? both : decoders.isEmpty() ? readers
                                                                  : decoders.subList(0, 1);
        }
        Message read = new ReplyReader(text, pieces, ReplyForm.of(readers.get(0)), full)
                .read(readers);
        boolean anyone = decoders.isEmpty() && pieces.stream().allMatch(
                piece -> OF_EVERY_REPLY.contains(piece.tag()));
        return !anyone ? read : new Message(read.kind(), List.of(), read.words(), text,
                read.groups(), read.faults(), read.facts());
    }

    private Message read(List<String> readers) {
        for (Cut.Piece piece : pieces) {
            take(piece);
        }
        if (recordBegin >= 0) {
            faults.add(new Fault(text.length(), "record-not-closed",
                    "the last record is not closed: no '|01='"));
        }
        close("fields of the reply");
        ReplyWords words = new ReplyWords(form, pieces, good);
        boolean refused = words.isRefused();
        boolean wanted = form.reply.isList() && !form.reply.record().endsAtEmptyRecord()
                && records > 0 && !refused && !words.code().equals(NO_DATA);
        if (wanted && !ended && recordBegin < 0) {
            faults.add(new Fault(text.length(), "no-end-mark", "the list has no end: no record "
                            + "with tag 67 of " + form.reply.record().endMark() + " or more"));
        }
        checkOutcome(words);
        return new Message(Kind.REPLY, readers, words.words(), text, groups, faults,
                words.facts());
    }

    private void checkOutcome(ReplyWords words) {
        if (words.code().isEmpty() && !form.isReceipt && form.reads("68")) {
            faults.add(new Fault(0, "no-result-code", "the reply has no result code (tag 68)"));
        }
        if (form.isReceipt && pieces.stream().noneMatch(each -> each.tag().equals("39"))) {
            faults.add(new Fault(0, "missing-field",
                    "the receipt has no refusal mark (tag 39): it reads as refused"));
        }
    }

    private void take(Cut.Piece piece) {
        String tag = piece.tag();
        if (tag.equals("00")) {
            if (recordBegin >= 0) {
                faults.add(new Fault(piece.offset(), "record-not-closed",
                        "a record begins before the one before it is closed"));
            }
            close(records == 0 ? "fields of the reply" : "between records");
            recordBegin = piece.offset();
            records++;
        }
        if (tag.equals("01")) {
            end(piece);
            return;
        }
        if (tag.isEmpty()) {
            faults.add(new Fault(piece.offset(), "no-tag", "'" + piece.value()
                            + "' has no tag"));
        } else {
            check(piece);
        }
        show(piece);
    }

    private void end(Cut.Piece piece) {
        if (full) {
            open.add(new Field(piece.offset(), "01", piece.value(), "record ends", ""));
        }
        if (recordBegin < 0) {
            if (records > 0) {
                faults.add(new Fault(piece.offset(), "record-not-opened",
                        "a record ends that did not begin"));
            }
            return;
        }
        Reply.Records layout = form.reply.record();
        if (layout != null && layout.size() != null) {
            String whole = text.substring(recordBegin, piece.offset());
            if (Utf8.isAtLeast(whole, layout.size())) {
                faults.add(new Fault(recordBegin, "record-too-long", "a record of "
                                + Utf8.length(whole) + " bytes is dropped: there is room for "
                                + (layout.size() - 1)));
            }
        }
        endRecord();
        close("record " + records);
        recordBegin = -1;
    }

    private void endRecord() {
        String sequence = record.getOrDefault("67", "");
        Reply.Records layout = form.reply.record();
        boolean mark = layout != null && layout.endMark() != null
                && Digits.all(sequence, 1, 9) && Long.parseLong(sequence) >= layout.endMark();
        if (ended) {
            faults.add(new Fault(recordBegin, "after-end-mark",
                    "a record stands behind the end of the list: nobody reads it"));
        } else if (!mark && record.getOrDefault("68", GOOD).equals(GOOD)) {
            good++;
            if (form.types != null) {
                ReplyValues.checkType(form, record, recordBegin, faults);
            }
        }
        ended |= mark;
    }

    private void check(Cut.Piece piece) {
        String tag = piece.tag();
        if (recordBegin >= 0 && record.putIfAbsent(tag, piece.value()) != null
                && !tag.equals("17") && !tag.equals("18")) {
            faults.add(new Fault(piece.offset(), "repeated-field", "tag " + tag
                            + " stands twice in a record: the first one counts"));
        }
        if (!form.names.containsKey(tag)) {
            faults.add(new Fault(piece.offset(), "unknown-tag", "nobody knows tag " + tag));
            return;
        }
        Integer bound = form.bound(tag, recordBegin >= 0);
        if (bound != null && Utf8.isAtLeast(piece.value(), bound)) {
            faults.add(new Fault(piece.at(), "too-long", "tag " + tag + ": "
                            + Utf8.length(piece.value())
                            + " bytes are dropped, there is room for " + (bound - 1)));
        } else if (!ended) {
            ReplyValues.check(form, piece, faults);
        }
    }

    private String meaning(String tag, String value) {
        if (tag.equals("68")) {
            return Meaning.code("resultCodes", value);
        }
        return ReplyValues.meaning(form.column(tag), value);
    }

    private void show(Cut.Piece piece) {
        if (full) {
            Dictionary.Tag name = form.names.get(piece.tag());
            open.add(new Field(piece.offset(), piece.tag(), piece.value(),
                    name == null ? null : name.label(), meaning(piece.tag(), piece.value())));
        }
    }

    private void close(String title) {
        if (!open.isEmpty()) {
            groups.add(new Group(title, open));
            open = new ArrayList<>();
        }
        record.clear();
    }
}
