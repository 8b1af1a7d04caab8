package com.brindlex.kernel.quorvane.console.dictionary;

import java.util.List;

/**
 * What a decoder reads of a reply, and the result that it makes of it.
 *
 * @param decoder the operation
 * @param result list, sections, record, text or empty
 * @param replyTags the tags read from the whole reply
 * @param record what is read from its records; null when it has none
 * @param tables the tables of the result
 */
public record Reply(String decoder, String result, List<Bound> replyTags, Records record,
        List<Table> tables) {
    /**
     * A tag, and the size that bounds its value: a value of that many bytes or more is dropped.
     *
     * @param bound null when the record alone bounds it
     */
    public record Bound(String tag, Integer bound) {}

    /**
     * The records of a reply.
     *
     * @param size a record of that many bytes or more is dropped; null for none
     * @param endMark the least number in tag 67 that ends the list; null when nothing ends it
     * @param endsAtEmptyRecord whether the list may also end without an end mark
     * @param only {@code first} when one record alone is read; null otherwise
     */
    public record Records(Integer size, Integer endMark, boolean endsAtEmptyRecord, String only,
            List<Bound> tags) {}

    /**
     * A table of the result.
     *
     * @param mark what opens it in a result of several sections; null otherwise
     */
    public record Table(String name, String mark, List<Column> columns) {}

    /**
     * A column of a table.
     *
     * @param at its place among those that '@' separates
     * @param form how its values are written; null for places that stay empty
     * @param tags the tags that it is made of
     * @param join what separates it from the column before it in the same place; null for '@'
     * @param empty how many places stay empty from here on; null for a column
     */
    public record Column(int at, String name, String form, String codes, List<String> tags,
            String join, String meaning, Integer empty) {}

    /** Whether it is made of records that an end mark closes. */
    public boolean isList() {
        return record != null && record.endMark() != null;
    }

    /** Whether it is the receipt of an order, which has no result code. */
    public boolean isReceipt() {
        return replyTags.stream().anyMatch(each -> each.tag().equals("19"));
    }
}
