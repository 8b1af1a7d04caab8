package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * One argument of a native method: its name and type, and the values that it takes. Never changes.
 */
public final class Argument {
    /** How an argument is passed. */
    public enum Type {
        /** A text. */
        TEXT(String.class),
        /** A whole number. */
        INT(int.class),
        /** A number from 0 to 255, passed as a byte. */
        SMALL(byte.class),
        /** A character, passed as a byte. */
        BYTE_LETTER(byte.class),
        /** A character. */
        LETTER(char.class);

        private final Class<?> javaType;

        Type(Class<?> javaType) {
            this.javaType = javaType;
        }

        /** The type of the native's parameter. */
        @NotNull
        public Class<?> javaType() {
            return javaType;
        }
    }

    private final String name;
    private final Type type;
    private final String usual;
    private final int min;
    private final int max;
    private final String characters;
    private final String purpose;

    /**
     * An argument.
     *
     * @param usual the value when none is given; null when one must be
     * @param min the least number; the least length of a text in bytes
     * @param max the greatest number; the greatest length of a text in bytes
     * @param characters a regular expression for each character of a text; empty for any
     */
    Argument(String name, Type type, @Nullable String usual, int min, int max, String characters,
            String purpose) {
        this.name = name;
        this.type = type;
        this.usual = usual;
        this.min = min;
        this.max = max;
        this.characters = characters;
        this.purpose = purpose;
    }

    /** The name of the native's parameter. */
    @NotNull
    public String name() {
        return name;
    }

    /** How it is passed. */
    @NotNull
    public Type type() {
        return type;
    }

    /** The value when none is given; null when one must be given. */
    @Nullable
    public String usual() {
        return usual;
    }

    /** What it is for and in what unit. */
    @NotNull
    public String purpose() {
        return purpose;
    }

    /** The value that a text in digits or of one character stands for; null when it is none. */
    @Nullable
    Object parse(String text) {
        if (type == Type.TEXT) {
            return text;
        }
        if (type == Type.INT || type == Type.SMALL) {
            Long number = Numbers.integer(text);
            boolean fits = number != null && number == number.intValue();
            return fits ? Integer.valueOf(number.intValue()) : null;
        }
        return text.length() == 1 ? Character.valueOf(text.charAt(0)) : null;
    }

    /** Why a value cannot be sent; null when it can. */
    @Nullable
    String problem(Object value) {
        if (value instanceof String) {
            return problemOfText((String) value);
        }
        if (value instanceof Integer) {
            int number = (Integer) value;
            return number >= min && number <= max
                    ? null : "must be from " + min + " to " + max + ", not " + number;
        }
        char letter = (Character) value;
        return letter >= ' ' && letter <= '~' && letter != '|'
                ? null : "must be one printable ASCII character other than '|'";
    }

    private String problemOfText(String text) {
        if (text.isEmpty() && usual == null) {
            return "must be given";
        }
        String foreign = Texts.foreign(text);
        if (foreign != null) {
            return foreign;
        }
        int length = Texts.utf8Length(text);
        if (length > max || length < min) {
            return "must have " + (length > max ? "at most " + max : "at least " + min)
                    + " bytes, not " + length;
        }
        if (!characters.isEmpty() && !text.matches("(" + characters + ")*")) {
            return "must consist of " + characters;
        }
        return null;
    }

    @Override
    public String toString() {
        return name;
    }
}
