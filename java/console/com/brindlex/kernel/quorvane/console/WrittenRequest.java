package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.Market;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Platform;
import com.brindlex.kernel.quorvane.client.RawRequest;
import com.brindlex.kernel.quorvane.client.Session;
import com.brindlex.kernel.quorvane.client.TradeDate;
import java.math.BigDecimal;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;
import java.util.function.UnaryOperator;

/** Requests whose arguments people write, as options or in a form. */
public final class WrittenRequest {
    /** Says at which argument a value was written that nobody understands, and why. */
    public static final class NotUnderstood extends IllegalArgumentException {
        private static final long serialVersionUID = 1;

        private final String argument;
        private final String reason;

        NotUnderstood(String argument, String reason) {
            super(argument + " " + reason);
            this.argument = argument;
            this.reason = reason;
        }

        /** The argument by its name. */
        public String argument() {
            return argument;
        }

        /** Why its value is none. */
        public String reason() {
            return reason;
        }
    }

    private WrittenRequest() {}

    /** All arguments of a native but the status array. */
    public static List<Argument> arguments(Operation operation) {
        List<Argument> all = new ArrayList<>();
        if (operation.isEncoder()) {
            all.addAll(Operation.sessionArguments());
        }
        all.addAll(operation.arguments());
        return all;
    }

    /**
     * What the natives take for what was written: {@code BUY} is B, 600.5 is 60050 hundredths,
     * 600 is 60000, 2026-11-21 is 1151121. Codes, dates and counts as they take them stay.
     *
     * @param texts the text of an argument by its name
     * @throws NotUnderstood when a text is none for its argument
     */
    public static Map<String, String> understood(Operation operation,
            UnaryOperator<String> texts) {
        Map<String, String> values = new LinkedHashMap<>();
        for (Argument argument : arguments(operation)) {
            values.put(argument.name(), WrittenValue.of(operation, argument.name(), texts));
        }
        return values;
    }

    /**
     * The request of what was written.
     *
     * @param written the text of an argument by its name
     * @throws IllegalArgumentException with the reason, when a text is none for its argument
     */
    public static RawRequest of(Operation operation, UnaryOperator<String> written) {
        UnaryOperator<String> texts = understood(operation, written)::get;
        List<Argument> device = Operation.sessionArguments();
        Session session = Session.of(text(texts, device.get(3)), text(texts, device.get(4)))
                                  .withMarket(Market.of(number(texts, device.get(0))))
                                  .withPlatform(Platform.of(number(texts, device.get(1))))
                                  .withSequence(number(texts, device.get(2)));
        RawRequest request = RawRequest.of(operation, session);
        for (Argument argument : operation.arguments()) {
            request.set(argument.name(), text(texts, argument));
        }
        return request;
    }

    /** What an argument is for, without how the natives write it: here amounts are written. */
    public static String purpose(Argument argument) {
        return argument.purpose().replaceFirst(" \\(`[0-9]+` is [0-9.]+\\)", "")
                .replaceFirst(" \\((?:hundredths|ten-thousandths)\\)$", "");
    }

    /** The codes that an argument takes, with their names; empty where others may be good, too. */
    public static String choices(Operation operation, Argument argument) {
        return WrittenValue.choices(operation, argument.name());
    }

    /**
     * A stock price, as the exchange writes it: 995.00.
     *
     * @throws IllegalArgumentException when that is no amount of whole cents
     */
    public static String stockPrice(String written) {
        try {
            return new BigDecimal(written.strip()).setScale(2).toPlainString();
        } catch (NumberFormatException | ArithmeticException none) {
            throw new IllegalArgumentException(
                    "the price must be an amount such as 995.50, not '" + written + "'");
        }
    }

    /** What to send as the simulated gateway's customer, from a device, today. */
    public static Map<String, String> sample() {
        String today = TradeDate.today().rocText();
        return Map.of("serialNo", "R58M30ABCDE", "localIP", "10.20.30.40", "branch", "9A01",
                "identity", "A123456789&1234567", "password", "pass1234", "date", today,
                "startDate", today, "endDate", today, "orderDate", today);
    }

    private static String text(UnaryOperator<String> texts, Argument argument) {
        return texts.apply(argument.name());
    }

    private static int number(UnaryOperator<String> texts, Argument argument) {
        String text = text(texts, argument);
        try {
            return Integer.parseInt(text);
        } catch (NumberFormatException wrong) {
            throw new IllegalArgumentException(
                    argument.name() + " must be a whole number, not '" + text + "'");
        }
    }
}
