package com.brindlex.kernel.quorvane.typed;

import java.util.List;

/**
 * A request that is being filled in. {@link Requests} opens the ones with named setters; this class
 * alone sets any argument by its name, as a console does. Not for several threads at once.
 */
public class Request {
    private static final int BYTE_MAX = 0xFF;

    private final Operation operation;
    private final Session session;
    private final List<Argument> arguments;
    private final Object[] values;

    /**
     * Opens a request with the usual values; what must be given is empty or 0 until it is.
     *
     * @throws IllegalArgumentException when the operation is a decoder
     */
    public Request(Operation operation, Session session) {
        if (!operation.isEncoder()) {
            throw new IllegalArgumentException(operation + " builds no request");
        }
        this.operation = operation;
        this.session = session;
        this.arguments = operation.arguments();
        this.values = new Object[arguments.size()];
        for (int i = 0; i < values.length; i++) {
            Argument argument = arguments.get(i);
            values[i] =
                    parse(argument, argument.isRequired() ? empty(argument) : argument.initial());
        }
    }

    Request(Operation operation, Session session, Credentials credentials) {
        this(operation, session);
        set("branch", credentials.branch);
        set("identity", credentials.identity);
        set("password", credentials.password);
    }

    private static String empty(Argument argument) {
        switch (argument.type()) {
            case TEXT:
                return "";
            case BYTE_LETTER:
            case LETTER:
                return " ";
            default:
                return "0";
        }
    }

    /** The operation that it is for. */
    public final Operation operation() {
        return operation;
    }

    /** The session that it is sent in. */
    public final Session session() {
        return session;
    }

    /** Builds the text to send. */
    public final Encoded encode() {
        return operation.encode(session, this);
    }

    /**
     * Sets an argument from a text: a number in decimal digits, a letter as one character.
     *
     * @throws IllegalArgumentException with the reason, when there is no such argument or the text
     *         is no value for it
     */
    public final Request set(String name, String text) {
        int index = indexOf(name);
        values[index] = parse(arguments.get(index), text);
        return this;
    }

    final void set(String name, int number) {
        set(name, String.valueOf(number));
    }

    final void set(String name, char letter) {
        set(name, String.valueOf(letter));
    }

    private int indexOf(String name) {
        for (int i = 0; i < values.length; i++) {
            if (arguments.get(i).name().equals(name)) {
                return i;
            }
        }
        throw new IllegalArgumentException(operation + " has no argument '" + name + "'");
    }

    private static Object parse(Argument argument, String text) {
        switch (argument.type()) {
            case TEXT:
                return text;
            case INT:
                return number(argument, text, Integer.MIN_VALUE, Integer.MAX_VALUE);
            case SMALL:
                return (byte) number(argument, text, 0, BYTE_MAX);
            case BYTE_LETTER:
                return (byte) letter(argument, text);
            default:
                return letter(argument, text);
        }
    }

    private static int number(Argument argument, String text, int least, int most) {
        Long number = Numbers.integer(text);
        if (number == null || number < least || number > most) {
            throw new IllegalArgumentException(argument.name() + " must be a whole number from "
                    + least + " to " + most + ", not '" + text + "'");
        }
        return number.intValue();
    }

    private static char letter(Argument argument, String text) {
        if (text.length() != 1 || text.charAt(0) > BYTE_MAX) {
            throw new IllegalArgumentException(
                    argument.name() + " must be one character, not '" + text + "'");
        }
        return text.charAt(0);
    }

    final String text(int index) {
        return (String) values[index];
    }

    final int number(int index) {
        return (Integer) values[index];
    }

    final byte octet(int index) {
        return (Byte) values[index];
    }

    final char letter(int index) {
        return (Character) values[index];
    }
}
