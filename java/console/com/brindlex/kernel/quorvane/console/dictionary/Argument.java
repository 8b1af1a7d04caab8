package com.brindlex.kernel.quorvane.console.dictionary;

/**
 * An argument of an operation.
 *
 * @param type its Java type
 * @param kind of a byte or a char: {@code letter} or {@code number}; null otherwise
 * @param unit what it is counted in; null when it has no unit
 * @param required whether it may not be empty
 * @param min least number; null when there is none
 * @param max greatest number; null when there is none
 * @param maxLength most characters; null when there is no bound
 * @param codes the table of its codes; null when it has none
 * @param unread whether the library does not read it
 * @param usual the value that stands in when none is given; null when there is none
 * @param example a value that shows how it is written; null when there is none
 */
public record Argument(String name, String type, String kind, String unit, boolean required,
        Long min, Long max, Integer maxLength, String codes, boolean unread, String usual,
        String example, String purpose) {
    /** Whether it is one character of the wire. */
    public boolean isLetter() {
        return "letter".equals(kind);
    }

    /** Whether it is written as a number. */
    public boolean isNumber() {
        return "int".equals(type) || "number".equals(kind);
    }
}
