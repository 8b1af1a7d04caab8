package com.brindlex.kernel.quorvane.typed;

/**
 * A named value of a row.
 *
 * @param <T> what it reads as
 */
public final class Column<T> {
    /** Stands where a record has a field that is always empty. */
    static final Column<String> UNUSED = new Column<String>("", "", Form.TEXT, "always empty");

    private final String key;
    private final String tags;
    private final Form<T> form;
    private final String meaning;

    private Column(String key, String tags, Form<T> form, String meaning) {
        this.key = key;
        this.tags = tags;
        this.form = form;
        this.meaning = meaning;
    }

    /**
     * @param key name in programs, {@code orderNumber}
     * @param tags the reply tags that it comes from
     * @param form how it reads
     * @param meaning what it is, in a few words
     */
    static <T> Column<T> of(String key, String tags, Form<T> form, String meaning) {
        return new Column<T>(key, tags, form, meaning);
    }

    static <E extends Enum<E> & Named> Column<Code<E>> code(
            String key, String tags, E[] values, String meaning) {
        return new Column<Code<E>>(key, tags, Form.code("code", values), meaning);
    }

    /** The name in programs, {@code orderNumber}; empty for a field that is always empty. */
    public String key() {
        return key;
    }

    /** The reply tags that the value comes from. */
    public String tags() {
        return tags;
    }

    /** How the text reads. */
    public Form<T> form() {
        return form;
    }

    /** What it is, in a few words. */
    public String meaning() {
        return meaning;
    }

    @Override
    public String toString() {
        return key;
    }
}
