package com.brindlex.kernel.quorvane.bench;

import static com.brindlex.kernel.quorvane.bench.EntryPoints.ADDRESS;
import static com.brindlex.kernel.quorvane.bench.EntryPoints.BRANCH;
import static com.brindlex.kernel.quorvane.bench.EntryPoints.DATE;
import static com.brindlex.kernel.quorvane.bench.EntryPoints.IDENTITY;
import static com.brindlex.kernel.quorvane.bench.EntryPoints.PASSWORD;
import static com.brindlex.kernel.quorvane.bench.EntryPoints.REFERENCE;
import static com.brindlex.kernel.quorvane.bench.EntryPoints.SERIAL;
import static com.brindlex.kernel.quorvane.bench.EntryPoints.STATUS;

import com.brindlex.kernel.quorvane.gatewayjni;
import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.Map;
import java.util.function.BiFunction;
import java.util.function.Supplier;

/**
 * {@code Bench SAMPLES JSON}: measures entry points in this virtual machine against the crossing
 * floor of the same texts, and the stock order book against two decoders in Java. SAMPLES is a
 * folder of replies, {@code DECODER.RECORDS}; the ratios are written to the file JSON as well.
 */
final class Bench {
    private static final long WARM_UP_NANOS = 700_000_000L;

    private final Path samples;
    private final RatioTable table = new RatioTable();

    private Bench(Path samples) {
        this.samples = samples;
    }

    public static void main(String[] args) throws IOException {
        Bench bench = new Bench(Path.of(args[0]));
        bench.stockBook();
        bench.orders();
        bench.lists1000();
        bench.typedLayer();
        Files.writeString(Path.of(args[1]), bench.table.finish());
        System.exit(bench.table.allMet() ? 0 : 1);
    }

    private void typedLayer() throws IOException {
        String reply = EntryPoints.sample(samples, "QueryOrderDecode", 1000);
        TypedLayer.measure(table, WARM_UP_NANOS, reply, () -> EntryPoints.stockBook(reply, STATUS));
    }

    private static void demandEqual(String what, String expected, String got) {
        if (!expected.equals(got)) {
            throw new IllegalStateException(what + " differs from the library:\n"
                    + expected.substring(0, Math.min(300, expected.length())) + "\n"
                    + got.substring(0, Math.min(300, got.length())));
        }
    }

    private void stockBook() throws IOException {
        StockBook byIndex = new IndexOfStockBook();
        StockBook bySplit = new SplitStockBook();
        for (int records : new int[] {1000, 1, 20, 20000}) {
            String reply = EntryPoints.sample(samples, "QueryOrderDecode", records);
            String result = EntryPoints.stockBook(reply, STATUS);
            demandEqual("The indexOf decoder", result, byIndex.decode(reply));
            demandEqual("The split + HashMap decoder", result, bySplit.decode(reply));
            CrossingFloor.layReady(result);
            Contest contest = new Contest(WARM_UP_NANOS)
                    .add(() -> EntryPoints.stockBook(reply, STATUS))
                    .add(() -> CrossingFloor.decode(reply, STATUS))
                    .add(() -> byIndex.decode(reply))
                    .add(() -> bySplit.decode(reply))
                    .run();
            table.group("Stock order book through the JVM, records: " + records);
            if (records == 1000) {
                table.atMost("entry point / crossing floor", contest, 0, 1, 1.6, 1.4);
                table.atLeast("split + HashMap / entry point", contest, 3, 0, 3);
            } else {
                table.tell("entry point / crossing floor", contest, 0, 1);
                table.tell("split + HashMap / entry point", contest, 3, 0);
            }
            table.tell("indexOf / entry point", contest, 2, 0);
        }
    }

    private static Contest beside(Supplier<String> call, Supplier<String> floor) {
        CrossingFloor.layReady(call.get());
        return new Contest(WARM_UP_NANOS).add(call).add(floor).run();
    }

    private void orders() {
        table.group("Requests through the JVM: entry point / crossing floor");
        byte zero = 0;
        byte one = 1;
        Contest stock = beside(
                EntryPoints::submitOrder,
                () -> CrossingFloor.stockOrder(
                        0, 0, 7, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, "2330", DATE, 2, 1000,
                        58550, (byte) 'B', (byte) '0', zero, zero, zero, one, STATUS));
        table.atMost("SubmitOrderEncode", stock, 0, 1, 1.9, 1.6);
        Contest futures = beside(
                () -> gatewayjni.FutSubmitOrderEncode(
                        0, 0, 7, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, REFERENCE, DATE,
                        "TXO", "TXO", "202402", "202403", "17000", "17500", "C", "P", one, (byte) 3,
                        zero, 'I', '0', 'R', ' ', 'B', 'S', 3, 0, 1234500, STATUS),
                () -> CrossingFloor.futuresOrder(
                        0, 0, 7, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, REFERENCE, DATE,
                        "TXO", "TXO", "202402", "202403", "17000", "17500", "C", "P", one, (byte) 3,
                        zero, 'I', '0', 'R', ' ', 'B', 'S', 3, 0, 1234500, STATUS));
        table.tell("FutSubmitOrderEncode", futures, 0, 1);
        Contest login = beside(
                () -> gatewayjni.AuthEncode(
                        0, 0, 7, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, STATUS),
                () -> CrossingFloor.user(
                        0, 0, 7, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, STATUS));
        table.tell("AuthEncode", login, 0, 1);
    }

    private void lists1000() throws IOException {
        table.group("Other lists through the JVM, 1,000 records: entry point / floor");
        for (Map.Entry<String, BiFunction<String, int[], String>> list : EntryPoints.otherLists().entrySet()) {
            String reply = EntryPoints.sample(samples, list.getKey(), 1000);
            Contest contest = beside(
                    () -> list.getValue().apply(reply, STATUS),
                    () -> CrossingFloor.decode(reply, STATUS));
            table.tell(list.getKey(), contest, 0, 1);
        }
    }
}
