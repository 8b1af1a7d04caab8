package com.brindlex.kernel.quorvane.client;

import java.util.ArrayList;
import java.util.List;
import org.jetbrains.annotations.Nullable;

/** A request before it is judged: what was given for each argument, and what is wrong so far. */
final class Draft<T> {
    private final Operation operation;
    private final Session session;
    private final ReplyType<T> replyType;
    private final List<Argument> arguments;
    private final Object[] values;
    private final List<Problem> problems = new ArrayList<Problem>();

    Draft(Operation operation, Session session, ReplyType<T> replyType) {
        this.operation = operation;
        this.session = session;
        this.replyType = replyType;
        this.arguments = operation.arguments();
        this.values = new Object[arguments.size()];
    }

    /** Gives an argument its value: text, whole number or letter; null leaves it as it was. */
    Draft<T> set(String argument, @Nullable Object value) {
        if (value != null) {
            values[indexOf(argument)] = value;
        }
        return this;
    }

    /** Gives an argument the number of a code; null leaves it as it was. */
    Draft<T> set(String argument, @Nullable NumberCode code) {
        return set(argument, code == null ? null : (Object) code.number());
    }

    /** Gives an argument a day in the Republic of China calendar; null leaves it as it was. */
    Draft<T> set(String argument, @Nullable TradeDate day) {
        if (day != null && (day.year() < 1912 || day.year() > 2910)) {
            refuse(argument, "must lie in the years 1912 to 2910, not " + day.year());
        }
        return set(argument, day == null ? null : (Object) day.rocText());
    }

    private int indexOf(String argument) {
        for (int i = 0; i < values.length; i++) {
            if (arguments.get(i).name().equals(argument)) {
                return i;
            }
        }
        throw new IllegalArgumentException(operation + " has no argument '" + argument + "'");
    }

    /** Notes what is wrong with an argument. */
    void refuse(String argument, String reason) {
        problems.add(new Problem(argument, reason));
    }

    /** Builds the request, or refuses with all that is wrong. */
    Request<T> build() {
        judge(Arguments.SERIAL_NO, session.serialNumber());
        judge(Arguments.LOCAL_IP, session.localAddress());
        judge(Arguments.SEQ_NO, session.sequence());
        judge(Arguments.PLATFORM, session.platform().number());
        for (int i = 0; i < values.length; i++) {
            Argument argument = arguments.get(i);
            if (values[i] == null && argument.usual() != null) {
                values[i] = argument.parse(argument.usual());
            }
            judge(argument, values[i]);
        }
        refuseIfWrong();
        int[] status = {1};
        String text = Natives.encode(operation, market(), session, values, status);
        if (status[0] != 1 || !text.startsWith("F=")) {
            refuse("", text.substring(Math.max(0, text.lastIndexOf("[CLIENT]"))));
            refuseIfWrong();
        }
        return new Request<T>(operation, session, text, replyType);
    }

    private int market() {
        return operation.isFutures() ? session.market().futuresCode()
                : operation.isStock() ? session.market().stockCode()
                : session.market().code();
    }

    private void judge(Argument argument, @Nullable Object value) {
        for (Problem known : problems) {
            if (known.argument().equals(argument.name())) {
                return;
            }
        }
        String reason = value == null ? "must be given" : argument.problem(value);
        if (reason != null) {
            refuse(argument.name(), reason);
        }
    }

    private void refuseIfWrong() {
        if (!problems.isEmpty()) {
            throw new InvalidRequestException(operation, problems);
        }
    }
}
