package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.client.Brokerage;
import com.brindlex.kernel.quorvane.client.Column;
import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.InvalidRequestException;
import com.brindlex.kernel.quorvane.client.Market;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Problem;
import com.brindlex.kernel.quorvane.client.RawReply;
import com.brindlex.kernel.quorvane.client.Reply;
import com.brindlex.kernel.quorvane.client.ReplyException;
import com.brindlex.kernel.quorvane.client.Request;
import com.brindlex.kernel.quorvane.client.Requests;
import com.brindlex.kernel.quorvane.client.Row;
import com.brindlex.kernel.quorvane.client.Session;
import com.brindlex.kernel.quorvane.client.TradeDate;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import java.math.BigDecimal;
import java.time.Clock;
import java.time.Duration;
import java.time.LocalDate;
import java.util.ArrayList;
import java.util.List;
import java.util.Locale;
import java.util.Set;
import java.util.function.Supplier;

/** Where the demonstration is played: a device, its gateway, the screen, and what was expected. */
final class Stage {
    static final Session SESSION = Session.of("R58M30ABCDE", "192.168.1.20");

    private static final Set<String> HEADER_TAGS =
            Set.of("F", "KIND", "BHNO", "CB", "IP", "11", "VER", "65", "SN", "15", "IDNO", "ACNO",
                    "PWD", "21", "22", "23", "24", "V4", "44", "FUNC", "FUNC1", "01");

    private static final Duration TOLERANCE = Duration.ofMinutes(10);

    final Screen screen;
    final Clock clock;
    private Gateway gateway;
    private Session session = SESSION;
    private int asked;
    private int steps;
    private int failures;
    private boolean wholeHeader;

    Stage(Screen screen, Clock clock) {
        this.screen = screen;
        this.clock = clock;
        this.gateway = gateway(Brokerage.STANDARD);
    }

    Gateway gateway() {
        return gateway;
    }

    /** A gateway that looks at the clock of a device, as real ones do. */
    Gateway gateway(Brokerage brokerage) {
        return Gateway.readyMade().clock(clock).tolerance(TOLERANCE).brokerage(brokerage).build();
    }

    /** Moves the session to another gateway and its brokerage. */
    void use(Gateway other, Brokerage brokerage) {
        gateway = other;
        session = session.withBrokerage(brokerage);
    }

    /** The requests of a user, numbered on from the last one. */
    Requests as(Credentials user) {
        return Requests.of(session.withSequence(asked++), user);
    }

    /** Whether the header's fields are named too, or only those of the operation. */
    void showHeader(boolean whole) {
        wholeHeader = whole;
    }

    /** Today as the gateway has it. */
    TradeDate today() {
        LocalDate now = LocalDate.now(clock);
        return TradeDate.of(now.getYear(), now.getMonthValue(), now.getDayOfMonth());
    }

    /**
     * Sends a request, shows everything on its way there and back, and gives the result.
     *
     * @throws ReplyException when there is none: nothing can go on then
     */
    <T> T ask(String title, Supplier<Request<T>> building) {
        return ask(title, building, null);
    }

    /** As {@link #ask}, and holds the text of the result against what it must be. */
    <T> T ask(String title, Supplier<Request<T>> building, String result) {
        Reply<T> reply = send(title, building.get(), result);
        expect(reply.isResult(), "a result", reply.toString());
        return reply.orThrow();
    }

    /** Sends a request that is not shown. */
    <T> T quietly(Request<T> request) {
        return request.read(gateway.answer(request.text())).orThrow();
    }

    /** Sends a request that must fail, with this said. */
    void fails(String title, Supplier<? extends Request<?>> building, String wanted) {
        String said = send(title, building.get(), null).toString();
        expect(said.equals(wanted), wanted, said);
    }

    private <T> Reply<T> send(String title, Request<T> request, String wanted) {
        steps++;
        screen.step(title);
        screen.labelled("request", Screen.Style.PLAIN, request.text());
        showFields(request.text());
        String text = gateway.answer(request.text());
        screen.labelled("reply", Screen.Style.DIM, text);
        checkNames(Scene.ofRequest(WireField.cut(request.text())), WireField.cut(text));
        List<Operation> decoders = request.operation().decoders();
        boolean own = session.brokerage() == Brokerage.JZG;
        RawReply read = RawReply.of(
                decoders.get(own ? decoders.size() - 1 : 0), Market.SECURITIES, text);
        Reply<T> reply = request.read(text);
        Screen.Style style = reply.isResult() ? Screen.Style.GOOD : Screen.Style.BAD;
        screen.labelled("result", reply.isResult() ? Screen.Style.PLAIN : style, read.text());
        screen.labelled("status", style, read.status() + "");
        if (wanted != null) {
            expect(read.text().equals(wanted), wanted, read.text());
        }
        if (reply.isResult()) {
            expect(read.result().faults().isEmpty(), "a sound result",
                    read.result().faults().toString());
        }
        return reply;
    }

    /** Asks for a request that must be refused before it is sent, for these arguments. */
    void refusedHere(String title, Supplier<? extends Request<?>> building, String... arguments) {
        steps++;
        screen.step(title);
        List<String> refused = new ArrayList<>();
        try {
            building.get();
        } catch (InvalidRequestException refusal) {
            for (Problem problem : refusal.problems()) {
                screen.labelled("refused", Screen.Style.BAD, problem.toString());
                refused.add(problem.argument());
            }
        }
        screen.line("  " + screen.styled(Screen.Style.DIM, "nothing is sent"));
        expect(refused.equals(List.of(arguments)), List.of(arguments) + " refused", refused + "");
    }

    /** Lets the exchange act, outside the device. */
    void exchange(String text, Runnable action) {
        screen.line("");
        screen.line("  " + screen.styled(Screen.Style.DIM, "· " + text));
        try {
            action.run();
        } catch (IllegalArgumentException impossible) {
            expect(false, "orders that can be filled", impossible.getMessage());
        }
    }

    /** Shows rows as a table and checks how many there are; of all columns, or of these. */
    void table(List<? extends Row<?>> rows, int wanted, Column<?, ?>... columns) {
        expect(rows.size() == wanted, wanted + " rows", rows.size() + " rows");
        if (rows.isEmpty()) {
            return;
        }
        List<Column<?, ?>> all = new ArrayList<>(rows.get(0).shape().columns());
        List<Column<?, ?>> shown = columns.length > 0 ? List.of(columns) : all;
        List<String> names = new ArrayList<>();
        shown.forEach(column -> names.add(isLeftOut(column) ? "" : words(column)));
        List<List<String>> cells = new ArrayList<>();
        for (Row<?> row : rows) {
            List<String> line = new ArrayList<>();
            shown.forEach(column -> line.add(isLeftOut(column) ? "" : label(row, all, column)));
            cells.add(line);
        }
        screen.table(names, cells);
    }

    /** Shows the one row that there must be as named values. */
    void record(Row<?> row) {
        expect(row != null && !row.isBlank(), "a record", "none");
        List<List<String>> items = new ArrayList<>();
        for (int place = 0; row != null && place < row.shape().columns().size(); place++) {
            items.add(List.of(words(row.shape().columns().get(place)), label(row, place), ""));
        }
        screen.grid("shown", items);
    }

    /** Checks a value. */
    void value(String what, Object wanted, Object actual) {
        expect(wanted.equals(actual), what + " " + wanted, String.valueOf(actual));
    }

    /** A second leg stands in the column of the first; what comes from no tag never changes. */
    private static boolean isLeftOut(Column<?, ?> column) {
        return column.name().matches("[a-zA-Z]+2") || column.tags().isEmpty();
    }

    /** Four decimals only where they say something. */
    private static String label(Row<?> row, int place) {
        String text = row.label(place);
        boolean four = text.matches("-?[0-9]+\\.[0-9]{4}");
        return four ? new BigDecimal(text).stripTrailingZeros().toPlainString() : text;
    }

    private static String words(Column<?, ?> column) {
        return column.name().replaceFirst("(?<=[a-z])1$", "").replaceAll("([A-Z])", " $1")
                .toLowerCase(Locale.ROOT);
    }

    private static String label(Row<?> row, List<Column<?, ?>> all, Column<?, ?> column) {
        String text = "";
        for (int place = 0; place < all.size(); place++) {
            boolean second =
                    all.get(place).name().equals(column.name().replaceFirst("1$", "2"));
            if (all.get(place) == column) {
                text = label(row, place);
            } else if (second && !row.text(place).isEmpty()) {
                text += " / " + label(row, place);
            }
        }
        return text;
    }

    private void expect(boolean holds, String wanted, String actual) {
        if (!holds) {
            failures++;
            screen.labelled("WRONG", Screen.Style.BAD, "expected " + wanted + ", not " + actual);
        }
    }

    private void showFields(String request) {
        List<WireField> fields = WireField.cut(request);
        Scene scene = Scene.ofRequest(fields);
        checkNames(scene, fields);
        List<List<String>> rows = new ArrayList<>();
        for (WireField field : fields) {
            String name = FieldNames.name(scene, field.tag());
            if (!wholeHeader && field.tag().equals(FieldNames.PAYLOAD)) {
                screen.grid("fields", rows);
                screen.labelled("signed", Screen.Style.PLAIN, field.value());
                rows.clear();
            } else if (wholeHeader || !HEADER_TAGS.contains(field.tag())) {
                rows.add(List.of(field.tag(), field.value(), name == null ? "" : name));
            }
        }
        if (wholeHeader) {
            screen.texts(List.of("tag", "value as sent", "what it is"), rows);
        } else {
            screen.grid("fields", rows);
        }
    }

    /** Every tag of the wire has a name; a transport marker has no tags. */
    private void checkNames(Scene scene, List<WireField> fields) {
        for (WireField field : fields) {
            boolean named =
                    FieldNames.name(scene, field.tag()) != null || field.value().startsWith("[");
            expect(named, "a name for tag " + field.tag(), "none");
        }
    }

    /** Prints the verdict. Returns whether every outcome was what it should be. */
    boolean close() {
        screen.title(failures == 0 ? "All " + steps + " steps as they should be"
                                   : failures + " outcomes are WRONG");
        return failures == 0;
    }
}
