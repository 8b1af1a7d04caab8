package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.simulator.Gateway;
import com.brindlex.kernel.quorvane.typed.Cell;
import com.brindlex.kernel.quorvane.typed.Column;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Result;
import com.brindlex.kernel.quorvane.typed.Row;
import com.brindlex.kernel.quorvane.typed.Section;
import java.math.BigDecimal;
import java.time.Clock;
import java.time.LocalDate;
import java.util.ArrayList;
import java.util.List;
import java.util.Locale;
import java.util.Set;

/** Where the demonstration is played: a device, its gateway, the screen, and what was expected. */
final class Stage {
    /** Market code of the securities side; the futures side adds 100 to it. */
    static final int MARKET = 1;

    /** Row of the client edition. */
    static final int PLATFORM = 0;

    static final String SERIAL = "R58M30ABCDE";

    private static final Set<String> HEADER_TAGS =
            Set.of("F", "KIND", "BHNO", "CB", "IP", "11", "VER", "65", "SN", "15", "IDNO", "ACNO",
                    "PWD", "21", "22", "23", "24", "V4", "44", "FUNC", "FUNC1", "01");

    /** Builds a request. */
    interface Encoder {
        String encode(int sequence, int[] status);
    }

    final Screen screen;
    final Clock clock;
    private Gateway gateway;
    private int sequence;
    private int steps;
    private int failures;
    private boolean wholeHeader;

    Stage(Screen screen, Clock clock) {
        this.screen = screen;
        this.clock = clock;
        this.gateway = new Gateway(clock);
    }

    Gateway gateway() {
        return gateway;
    }

    /** Moves the session to another gateway. */
    void use(Gateway other) {
        gateway = other;
    }

    /** Whether the header's fields are named too, or only those of the operation. */
    void showHeader(boolean whole) {
        wholeHeader = whole;
    }

    /** Today in the Republic of China calendar, as the app's date fields hold it. */
    String today() {
        return rocDate(LocalDate.now(clock));
    }

    static String rocDate(LocalDate date) {
        return String.format(
                "%03d%02d%02d", date.getYear() - 1911, date.getMonthValue(), date.getDayOfMonth());
    }

    /** Sends a request that must be built, and shows everything on its way there and back. */
    Result ask(String title, Encoder encoder, Operation decoder, int wanted) {
        steps++;
        screen.step(title);
        int[] status = {0};
        String request = encoder.encode(sequence++, status);
        screen.labelled("request", Screen.Style.PLAIN, request);
        if (status[0] != 1) {
            expect(false, "a request", request);
            return Result.of(decoder, status[0], request);
        }
        showFields(request);
        String reply = gateway.answer(request);
        screen.labelled("reply", Screen.Style.DIM, reply);
        checkNames(Scene.ofRequest(WireField.cut(request)), WireField.cut(reply));
        Result result = decoder.decode(MARKET, reply);
        Screen.Style style = result.isSuccess() ? Screen.Style.GOOD : Screen.Style.BAD;
        screen.labelled("result", result.isSuccess() ? Screen.Style.PLAIN : style, result.text());
        screen.labelled("status", style, result.status() + "");
        expect(result.status() == wanted, "status " + wanted, "status " + result.status());
        expect(result.faults().isEmpty(), "a sound result", result.faults().toString());
        return result;
    }

    /** As {@link #ask}, and holds the result against the text that it must be. */
    void ask(String title, Encoder encoder, Operation decoder, int wanted, String result) {
        String actual = ask(title, encoder, decoder, wanted).text();
        expect(actual.equals(result), result, actual);
    }

    /** Asks for a request that the library must refuse to build, with this text. */
    void refusedHere(String title, Encoder encoder, String message) {
        steps++;
        screen.step(title);
        int[] status = {0};
        String text = encoder.encode(sequence++, status);
        screen.labelled("result", Screen.Style.BAD, text);
        screen.labelled("status", Screen.Style.BAD, status[0] + "  (nothing is sent)");
        expect(status[0] == -1, "status -1", "status " + status[0]);
        expect(text.endsWith(message), message, text);
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
    void table(List<Row> rows, int wanted, Column<?>... columns) {
        expect(rows.size() == wanted, wanted + " rows", rows.size() + " rows");
        if (rows.isEmpty()) {
            return;
        }
        List<Column<?>> shown = columns.length > 0 ? List.of(columns) : rows.get(0).table().columns();
        List<String> names = new ArrayList<>();
        shown.forEach(column -> names.add(isLeftOut(column) ? "" : words(column)));
        List<List<String>> cells = new ArrayList<>();
        for (Row row : rows) {
            List<String> line = new ArrayList<>();
            shown.forEach(column -> line.add(isLeftOut(column) ? "" : label(row, column)));
            cells.add(line);
        }
        screen.table(names, cells);
    }

    /** Shows an order book, and checks the state that each order is in. */
    void orders(List<Row> rows, Column<?> state, Column<?> message, String[] wanted,
            Column<?>... columns) {
        table(rows, wanted.length, columns);
        for (int i = 0; i < Math.min(rows.size(), wanted.length); i++) {
            String why = rows.get(i).text(message);
            String actual = rows.get(i).text(state) + (why.isEmpty() ? "" : "&" + why);
            expect(actual.equals(wanted[i]), wanted[i], actual);
        }
    }

    /** Shows each section as a table and checks how many rows it has. */
    void sections(Result result, int... wanted) {
        expect(result.sections().size() == wanted.length, wanted.length + " sections",
                result.sections().size() + " sections");
        for (int i = 0; i < Math.min(wanted.length, result.sections().size()); i++) {
            Section section = result.sections().get(i);
            screen.line("  " + section.table().name());
            table(section.rows(), wanted[i]);
        }
    }

    /** Shows the one row that there must be as named values. */
    void record(List<Row> rows) {
        expect(rows.size() == 1, "1 row", rows.size() + " rows");
        List<List<String>> items = new ArrayList<>();
        for (Row row : rows) {
            row.cells().forEach(
                    cell -> items.add(List.of(words(cell.column()), label(cell), "")));
        }
        screen.grid("shown", items);
    }

    /** Checks the text of one column of a row. */
    void field(List<Row> rows, int row, Column<?> column, String wanted) {
        String actual = row < rows.size() ? rows.get(row).text(column) : "(missing)";
        expect(actual.equals(wanted), column + " " + wanted, actual);
    }

    /** A second leg stands in the column of the first; what comes from no tag never changes. */
    private static boolean isLeftOut(Column<?> column) {
        return column.key().matches("[a-zA-Z]+2") || column.tags().isEmpty();
    }

    /** Four decimals only where they say something. */
    private static String label(Cell<?> cell) {
        String text = cell.label();
        boolean four = text.matches("-?[0-9]+\\.[0-9]{4}");
        return four ? new BigDecimal(text).stripTrailingZeros().toPlainString() : text;
    }

    private static String words(Column<?> column) {
        return column.key().replaceAll("([A-Z])", " $1").toLowerCase(Locale.ROOT);
    }

    private static String label(Row row, Column<?> column) {
        String text = "";
        for (Cell<?> cell : row.cells()) {
            boolean second = cell.column().key().equals(column.key() + "2");
            if (cell.column() == column) {
                text = label(cell);
            } else if (second && !cell.text().isEmpty()) {
                text += " / " + label(cell);
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
