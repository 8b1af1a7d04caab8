package com.brindlex.kernel.quorvane.typed;

import java.util.ArrayList;
import java.util.List;

/** Takes the text of a result apart, left to right, and notes what is out of place. */
final class ResultReader {
    private static final int UNKNOWN = -1;

    private final Layout layout;
    private final String text;
    private final List<Section> sections = new ArrayList<Section>();
    private final List<Fault> faults = new ArrayList<Fault>();
    private boolean message;
    private int at;

    ResultReader(Layout layout, int status, String text) {
        this.layout = layout;
        this.text = text;
        if (status == 1) {
            read();
        } else {
            message = true;
        }
    }

    List<Section> sections() {
        return sections;
    }

    List<Fault> faults() {
        return faults;
    }

    boolean isMessage() {
        return message;
    }

    private void read() {
        switch (layout.kind()) {
            case EMPTY:
                if (!text.isEmpty()) {
                    fault(0, "a text where none belongs");
                }
                break;
            case RECORD:
                readRecord();
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

    private void fault(int offset, String what) {
        faults.add(new Fault(offset, what, true));
    }

    /** One record; a text without fields is a message: the order is on its way. */
    private void readRecord() {
        if (text.indexOf('@') < 0) {
            message = true;
            return;
        }
        Table table = layout.tables().get(0);
        List<Row> rows = new ArrayList<Row>();
        Row row = Row.read(table, text.substring(0, endOfRecord()), 0, faults);
        if (!row.isBlank()) {
            rows.add(row);
        }
        sections.add(new Section(table, rows));
        checkEnd();
    }

    private void readList() {
        int count = readCount();
        Table table = layout.tables().get(0);
        Table apart = layout.tables().size() > 1 ? layout.tables().get(1) : null;
        List<Row> rows = new ArrayList<Row>();
        List<Row> others = new ArrayList<Row>();
        while (at < text.length()) {
            boolean last = rows.size() == count - 1;
            if (apart != null && last && text.startsWith("<M>@", at)) {
                // a notice is free text: it ends with the result
                int end = text.endsWith("!") ? text.length() - 1 : text.length();
                others.add(Row.read(apart, text.substring(at, Math.max(at, end)), at, faults));
                at = end;
                checkEnd();
                at = text.length();
            } else {
                rows.add(nextRow(table));
            }
        }
        checkCount(count, rows.size() + others.size(), 0);
        sections.add(new Section(table, rows));
        if (apart != null) {
            sections.add(new Section(apart, others));
        }
    }

    private void readSections() {
        for (int i = 0; i < layout.tables().size(); i++) {
            String mark = layout.mark(i) + "!";
            List<Row> rows = new ArrayList<Row>();
            Table table = layout.tables().get(i);
            sections.add(new Section(table, rows));
            if (!text.startsWith(mark, at)) {
                fault(at, "no section " + layout.mark(i));
                continue;
            }
            int opened = at;
            at += mark.length();
            int count = readCount();
            String next = i + 1 < layout.tables().size() ? layout.mark(i + 1) + "!" : "";
            while (at < text.length() && (next.isEmpty() || !text.startsWith(next, at))) {
                rows.add(nextRow(table));
            }
            checkCount(count, rows.size(), opened);
        }
        if (at < text.length()) {
            fault(at, "a text behind the last section");
        }
    }

    /** Reads {@code count!}. */
    private int readCount() {
        int end = text.indexOf('!', at);
        String digits = end < 0 ? "" : text.substring(at, end);
        if (digits.length() > 9 || !Numbers.isDigits(digits)) {
            fault(at, "no count");
            return UNKNOWN;
        }
        at = end + 1;
        return Integer.parseInt(digits);
    }

    private void checkCount(int announced, int there, int offset) {
        if (announced != UNKNOWN && announced != there) {
            fault(offset, announced + " records announced, " + there + " there");
        }
    }

    private Row nextRow(Table table) {
        int start = at;
        int end = text.indexOf('!', at);
        if (end < 0) {
            fault(text.length(), "the last record is not closed by '!'");
            end = text.length();
        }
        at = Math.min(text.length(), end + 1);
        return Row.read(table, text.substring(start, end), start, faults);
    }

    private int endOfRecord() {
        int end = text.indexOf('!');
        at = end < 0 ? text.length() : end;
        return at;
    }

    /** The text must end with the '!' that stands here. */
    private void checkEnd() {
        if (at == text.length()) {
            fault(at, "the last record is not closed by '!'");
        } else if (at + 1 < text.length()) {
            fault(at + 1, "a text behind the record");
        }
    }
}
