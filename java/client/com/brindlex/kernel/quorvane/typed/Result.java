package com.brindlex.kernel.quorvane.typed;

import java.util.Collections;
import java.util.List;

/**
 * What a decoder gave: rows, a text, or a message. Nothing in here throws, whatever the text.
 */
public final class Result {
    private final Operation operation;
    private final int status;
    private final String text;
    private final List<Section> sections;
    private final List<Fault> faults;
    private final boolean message;

    Result(Operation operation, int status, String text, ResultReader reader) {
        this.operation = operation;
        this.status = status;
        this.text = text;
        this.sections = reader.sections();
        this.faults = reader.faults();
        this.message = reader.isMessage();
    }

    /**
     * Takes the result of a decoder apart.
     *
     * @param decoder the decoder that gave it
     * @param status the status that it wrote
     * @param text the text that it returned
     */
    public static Result of(Operation decoder, int status, String text) {
        return new Result(decoder, status, text, new ResultReader(decoder.layout(), status, text));
    }

    /** The decoder that gave it. */
    public Operation operation() {
        return operation;
    }

    /** The status: 1 for success, -1 for failure. */
    public int status() {
        return status;
    }

    /** Whether the operation succeeded. */
    public boolean isSuccess() {
        return status == 1;
    }

    /** The text of the decoder as it stands. */
    public String text() {
        return text;
    }

    /** The message to show: that of a failure, or of an order that is still on its way; or null. */
    public Message message() {
        return message ? Message.of(text) : null;
    }

    /** The rows of the first section: all rows of a result that has one kind of them. */
    public List<Row> rows() {
        return sections.isEmpty() ? Collections.<Row>emptyList() : sections.get(0).rows();
    }

    /** The first row, or null when there is none. */
    public Row first() {
        return rows().isEmpty() ? null : rows().get(0);
    }

    /** The rows of one table, in whichever section they stand; none when it has no such table. */
    public List<Row> rows(Table table) {
        for (Section section : sections) {
            if (section.table() == table) {
                return section.rows();
            }
        }
        return Collections.emptyList();
    }

    /** All sections; a result of one list has one, a message none. */
    public List<Section> sections() {
        return Collections.unmodifiableList(sections);
    }

    /** What in the text is not as it should be; empty for every well-formed reply. */
    public List<Fault> faults() {
        return Collections.unmodifiableList(faults);
    }

    @Override
    public String toString() {
        return operation.method() + " status " + status + ": " + text;
    }
}
