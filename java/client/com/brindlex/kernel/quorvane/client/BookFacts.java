package com.brindlex.kernel.quorvane.client;

import java.util.ArrayList;
import java.util.List;
import org.jetbrains.annotations.Nullable;

/**
 * Takes what the amendment of an order needs from its row of the book, and tells what is not there.
 */
final class BookFacts<R extends Row<R>> {
    private static final String NOT_SHOWN = "must be given: the order book does not show it";

    private final Draft<?> draft;
    private final R row;

    BookFacts(Draft<?> draft, R row) {
        this.draft = draft;
        this.row = row;
    }

    /** A value of the row; null when there is none, which is told when it cannot be read. */
    @Nullable
    <T> T value(String argument, Column<R, T> column) {
        try {
            return row.get(column);
        } catch (MalformedValueException malformed) {
            draft.refuse(argument, "cannot be read from the order book: " + malformed.getMessage());
            return null;
        }
    }

    /** What was given, or else what the row shows; told when neither is there. */
    @Nullable
    <T> T given(String argument, @Nullable T given, @Nullable T shown) {
        T value = given == null ? shown : given;
        if (value == null) {
            draft.refuse(argument, NOT_SHOWN);
        }
        return value;
    }

    /**
     * One of the numbers that the row leaves open, {@code 1 3}: the one that was given, or the only
     * one. No numbers leave all open.
     */
    int choice(String argument, @Nullable NumberCode given, String open) {
        List<String> numbers = new ArrayList<String>();
        for (String number : open.split(" ")) {
            if (!number.isEmpty()) {
                numbers.add(number);
            }
        }
        if (given == null && numbers.size() != 1) {
            draft.refuse(argument, numbers.isEmpty() ? NOT_SHOWN
                                                     : NOT_SHOWN + ", only that it is " + numbers);
            return 0;
        }
        int number = given == null ? Integer.parseInt(numbers.get(0)) : given.number();
        if (!numbers.isEmpty() && !numbers.contains(String.valueOf(number))) {
            draft.refuse(argument, "is shown as " + numbers + ", not " + number);
        }
        draft.set(argument, number);
        return number;
    }

    /** Writes order number and gateway number. */
    void reference(String orderNumber, String gatewayNumber, int longest) {
        boolean sound = !orderNumber.isEmpty() && orderNumber.length() <= longest
                && !gatewayNumber.isEmpty() && gatewayNumber.length() <= longest
                && (orderNumber + gatewayNumber).indexOf('&') < 0;
        if (!sound) {
            draft.refuse("orderReference", "must be two numbers of up to " + longest
                    + " characters, not '" + orderNumber + "' and '" + gatewayNumber + "'");
        }
        draft.set("orderReference", orderNumber + "&" + gatewayNumber);
    }

    /** Writes the handling number: the one that was given, or the one of the row. */
    void handling(@Nullable Handling given, String shown) {
        Long number = Numbers.integer(shown.trim());
        Handling own = number == null || number < 0 || number > 255
                ? null : Handling.of(number.intValue());
        draft.set("handlingFlag", given("handlingFlag", given, own));
    }

    /** What is still open of an order; null when the row does not tell. */
    @Nullable
    Long open(Column<R, Long> ordered, Column<R, Long> filled, Column<R, Long> cancelled) {
        Long all = value("quantity", ordered);
        Long done = value("quantity", filled);
        Long gone = value("quantity", cancelled);
        return all == null || done == null || gone == null ? null
                                                           : Long.valueOf(all - done - gone);
    }
}
