package com.brindlex.kernel.quorvane.client;

import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import org.jetbrains.annotations.NotNull;

/**
 * The text of a result taken apart by the layout of its decoder, for those who have nothing but the
 * text: consoles, logs, tests. Takes any text whatever. Never changes.
 */
public final class ResultText {
    /** Rows of one shape. */
    public static final class Section {
        private final String mark;
        private final Shape<?> shape;
        private final List<? extends Row<?>> rows;

        private Section(String mark, Shape<?> shape, List<? extends Row<?>> rows) {
            this.mark = mark;
            this.shape = shape;
            this.rows = rows;
        }

        /** The mark that opens it; empty where sections have none. */
        @NotNull
        public String mark() {
            return mark;
        }

        /** The columns of its rows. */
        @NotNull
        public Shape<?> shape() {
            return shape;
        }

        /** Its rows. */
        @NotNull
        public List<? extends Row<?>> rows() {
            return rows;
        }
    }

    private final Layout layout;
    private final String text;
    private final List<Section> sections = new ArrayList<Section>();
    private final List<Fault> faults = new ArrayList<Fault>();

    private ResultText(Layout layout, String text) {
        this.layout = layout;
        this.text = text;
    }

    /** Takes a result apart. */
    @NotNull
    public static ResultText of(@NotNull Operation decoder, @NotNull String text) {
        ResultText result = new ResultText(decoder.layout(), text);
        result.read();
        return result;
    }

    private void read() {
        switch (layout.kind()) {
            case EMPTY:
                if (!text.isEmpty()) {
                    faults.add(new Fault(0, "a text where none belongs", true));
                }
                break;
            case RECORD:
                readRecord(layout.shapes().get(0));
                break;
            case LIST:
                readList();
                break;
            case SECTIONS:
                readSections();
                break;
            default:
                break;
        }
    }

    /** One record; a text without fields is a message. */
    private <R extends Row<R>> void readRecord(Shape<R> shape) {
        if (text.indexOf('@') < 0) {
            faults.add(new Fault(0, "a message where a record belongs", true));
            return;
        }
        int close = text.indexOf('!');
        int end = close < 0 ? text.length() : close;
        R row = shape.row(text, 0, end);
        faults.addAll(row.faults());
        if (close < 0) {
            faults.add(new Fault(end, "the last record is not closed by '!'", true));
        } else if (close + 1 < text.length()) {
            faults.add(new Fault(close + 1, "a text behind the record", true));
        }
        add("", shape, row.isBlank() ? Collections.<R>emptyList() : Collections.singletonList(row));
    }

    private void readList() {
        int end = layout.shapes().size() > 1 ? Accounts.noticeAt(text) : text.length();
        addRows("", layout.shapes().get(0), 0, end, end < text.length() ? 1 : 0);
        if (end < text.length()) {
            int close = text.length() - (text.endsWith("!") ? 1 : 0);
            Notice notice = Notice.SHAPE.row(text, end, Math.max(end, close));
            if (close == text.length()) {
                faults.add(new Fault(close, "the last record is not closed by '!'", true));
            }
            faults.addAll(notice.faults());
            add("", Notice.SHAPE, Collections.singletonList(notice));
        }
    }

    private void readSections() {
        Sections marked = new Sections(text);
        for (int i = 0; i < layout.shapes().size(); i++) {
            String mark = layout.mark(i);
            int at = marked.at(mark);
            boolean last = i + 1 == layout.shapes().size();
            int end = last ? text.length() : marked.at(layout.mark(i + 1));
            if (at == text.length() && !text.equals(mark + "!")) {
                faults.add(new Fault(at, "no section " + mark, true));
            } else {
                addRows(mark, layout.shapes().get(i), at + mark.length() + 1, Math.max(at, end), 0);
            }
        }
        if (marked.at(layout.mark(0)) > 0) {
            faults.add(new Fault(0, "a text before the first section", true));
        }
    }

    private <R extends Row<R>> void addRows(
            String mark, Shape<R> shape, int from, int end, int apart) {
        Rows<R> rows = new Rows<R>(shape, text, Math.min(from, end), end, apart);
        faults.addAll(rows.faults());
        add(mark, shape, rows);
    }

    private void add(String mark, Shape<?> shape, List<? extends Row<?>> rows) {
        sections.add(new Section(mark, shape, rows));
    }

    /** The sections; a result of one list has one. */
    @NotNull
    public List<Section> sections() {
        return Collections.unmodifiableList(sections);
    }

    /** What is not as it should be; empty for what a decoder makes of values without separators. */
    @NotNull
    public List<Fault> faults() {
        return Collections.unmodifiableList(faults);
    }

    @Override
    public String toString() {
        return text;
    }
}
