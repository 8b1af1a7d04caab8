package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertTrue;

import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.HashSet;
import java.util.Locale;
import java.util.Set;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import org.junit.jupiter.api.Test;

/** Every link of README and of the documents made from the code leads somewhere. */
class LinksTest {
    @Test
    void everyLinkLeadsSomewhere() throws IOException {
        int links = 0;
        for (String name : new String[] {"README.md", "docs/operations.md", "docs/results.md"}) {
            Path document = Path.of(name);
            Matcher link = Pattern.compile("\\]\\((?!https?:)([^)#]*)#?([^)]*)\\)")
                                   .matcher(Files.readString(document));
            while (link.find()) {
                Path target = link.group(1).isEmpty() ? document
                                                      : document.resolveSibling(link.group(1));
                assertTrue(Files.exists(target), document + " links to " + target);
                assertTrue(link.group(2).isEmpty() || anchors(target).contains(link.group(2)),
                        document + " links to " + link.group());
                links++;
            }
        }
        assertTrue(links > 100, links + " links");
    }

    /** The headings of a document as links name them. */
    private static Set<String> anchors(Path document) throws IOException {
        Set<String> anchors = new HashSet<>();
        for (String line : Files.readAllLines(document)) {
            if (line.startsWith("#")) {
                anchors.add(line.replaceFirst("#+ ", "").toLowerCase(Locale.ROOT).replace(' ', '-'));
            }
        }
        return anchors;
    }
}
