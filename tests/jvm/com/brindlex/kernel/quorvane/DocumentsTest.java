package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.console.Documents;
import com.brindlex.kernel.quorvane.typed.Operation;
import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.List;
import java.util.Map;
import java.util.Set;
import java.util.TreeMap;
import java.util.TreeSet;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import org.junit.jupiter.api.Test;

/** The committed documents say what the library does today. */
class DocumentsTest {
    private static final Path DOCS = Path.of("docs");
    private static final Pattern FUNCTION = Pattern.compile("FUNC=(\\w+)");

    @Test
    void theTablesAreThoseOfToday() throws IOException {
        assertEquals(List.of("operations.md", "results.md"), Documents.names());
        for (String name : Documents.names()) {
            Path document = DOCS.resolve(name);
            assertEquals(Documents.renewed(document), Files.readString(document),
                    document + ": run scripts/quorvane documents");
        }
    }

    @Test
    void everyOperationHasItsSection() throws IOException {
        String operations = Files.readString(DOCS.resolve("operations.md"));
        String results = Files.readString(DOCS.resolve("results.md"));
        for (Operation operation : Operation.values()) {
            String name = operation.method();
            assertTrue(operations.contains("\n### " + name + "\n"), name);
            assertEquals(!operation.isEncoder(), results.contains("\n## " + name + "\n"), name);
        }
    }

    /** The rows of docs/wire.md that tell what stands behind the header, by operation. */
    private static Map<String, String> wireRows() throws IOException {
        Map<String, String> rows = new TreeMap<>();
        boolean numbers = false;
        boolean replies = false;
        for (String line : Files.readAllLines(DOCS.resolve("wire.md"))) {
            replies |= line.equals("## Replies");
            numbers = line.isEmpty() ? false : numbers || line.startsWith("| Operation | FUNC |");
            if (!line.matches("\\| \\w*Encode.*") || replies) {
                continue;
            }
            String[] cells = line.replace("\\|", "\u0001").split("\\|");
            String body = cells[2].replace('\u0001', '|').trim();
            for (String name : cells[1].trim().split(", ")) {
                rows.put(name, numbers ? "FUNC=" + body + "|" : body);
            }
        }
        return rows;
    }

    private static Set<String> tags(String text) {
        Set<String> tags = new TreeSet<>();
        Matcher tag = Pattern.compile("(?:^|[|`~\\[])(\\w+)=").matcher(text);
        while (tag.find()) {
            tags.add(tag.group(1));
        }
        return tags;
    }

    @Test
    void theWireTellsEveryQueryAsTheTableDoes() throws IOException {
        Map<String, String> rows = wireRows();
        Set<String> headerTags = tags("F=7|KIND=*|BHNO=*|CB=1|IP=*|11=*|VER=*|65=*|SN=*|15=0"
                + "|IDNO=*|ACNO=*|PWD=*|14=*|21=*|22=*|23=*|24=5|V4=|44=*");
        String wire = Files.readString(DOCS.resolve("wire.md"));
        for (Operation operation : Operation.values()) {
            if (!operation.isEncoder()) {
                continue;
            }
            String form = operation.requestForms().get(0);
            Set<String> sent = tags(form);
            sent.removeAll(headerTags);
            if (operation.method().startsWith("FutSubmit")) {
                for (String tag : sent) {
                    assertTrue(wire.contains("|" + tag + "="), operation + " " + tag);
                }
                continue;
            }
            String row = rows.get(operation.method());
            assertTrue(row != null, operation + " has no row in docs/wire.md");
            if (form.contains("FUNC=")) {
                assertEquals(functionOf(form), functionOf(row), operation.method());
            }
            boolean ownRow = row.contains("01=") || row.contains("|10=");
            if (ownRow) {
                assertEquals(sent, tags(row), operation.method());
            }
        }
    }

    @Test
    void theLibrarySendsTheFunctionsThatTheWireTells() throws Exception {
        Map<String, String> rows = wireRows();
        Set<String> held = new TreeSet<>();
        for (List<GoldenCase> cases :
                GoldenCase.readAll(Path.of(System.getProperty("golden.vectors"))).values()) {
            for (GoldenCase golden : cases) {
                String request = Natives.play(golden).result;
                if (request.startsWith("F=7|") && request.contains("FUNC=")) {
                    assertEquals(functionOf(rows.get(golden.operation)), functionOf(request),
                            golden.operation);
                    held.add(golden.operation);
                }
            }
        }
        assertEquals(23, held.size(), held.toString());
    }

    private static String functionOf(String text) {
        Matcher function = FUNCTION.matcher(text);
        assertTrue(function.find(), text);
        return function.group(1);
    }
}
