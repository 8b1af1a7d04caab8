package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.simulator.Gateway;
import java.time.Clock;
import java.time.LocalDate;
import java.util.ArrayList;
import java.util.List;
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

    /** Reads a reply. */
    interface Decoder {
        String decode(String reply, int[] status);
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
    String ask(String title, Encoder encoder, Decoder decoder, int wanted) {
        steps++;
        screen.step(title);
        int[] status = {0};
        String request = encoder.encode(sequence++, status);
        screen.labelled("request", Screen.Style.PLAIN, request);
        if (status[0] != 1) {
            expect(false, "a request", request);
            return "";
        }
        showFields(request);
        String reply = gateway.answer(request);
        screen.labelled("reply", Screen.Style.DIM, reply);
        checkNames(Scene.ofRequest(WireField.cut(request)), WireField.cut(reply));
        String result = decoder.decode(reply, status);
        screen.labelled("result", status[0] == 1 ? Screen.Style.PLAIN : Screen.Style.BAD, result);
        screen.labelled(
                "status", status[0] == 1 ? Screen.Style.GOOD : Screen.Style.BAD, status[0] + "");
        expect(status[0] == wanted, "status " + wanted, "status " + status[0]);
        return result;
    }

    /** As {@link #ask}, and holds the result against the text that it must be. */
    void ask(String title, Encoder encoder, Decoder decoder, int wanted, String result) {
        String actual = ask(title, encoder, decoder, wanted);
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

    /** Shows the records of a list as a table and checks how many there are. */
    void table(ResultLayout layout, List<List<String>> records, int wanted) {
        List<List<String>> rows = layout.readable(records);
        List<String> columns = layout.columns();
        for (int column = columns.size() - 1; column >= 0; column--) {
            if (!layout.isMain(column)) {
                columns.set(column, "");
                for (List<String> row : rows) {
                    row.set(column, "");
                }
            }
        }
        screen.table(columns, rows);
        expect(records.size() == wanted, wanted + " records", records.size() + " records");
    }

    /** Shows a single record as named values. */
    void record(ResultLayout layout, List<List<String>> records) {
        expect(records.size() == 1, "1 record", records.size() + " records");
        List<List<String>> items = new ArrayList<>();
        List<String> values = records.isEmpty() ? List.of() : layout.readable(records).get(0);
        for (int i = 0; i < values.size(); i++) {
            if (layout.isMain(i)) {
                items.add(List.of(layout.columns().get(i), values.get(i), ""));
            }
        }
        screen.grid("shown", items);
    }

    /** Checks the text of one field of a list. */
    void field(List<List<String>> records, int record, int position, String wanted) {
        boolean there = record < records.size() && position < records.get(record).size();
        String actual = there ? records.get(record).get(position) : "(missing)";
        expect(actual.equals(wanted), "field " + position + " " + wanted, actual);
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
