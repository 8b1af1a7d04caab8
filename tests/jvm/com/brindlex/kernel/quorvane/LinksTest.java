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
    private static final String[] PAGES = {"README.md", "CONTRIBUTING.md", "docs/operations.md",
            "docs/results.md", "docs/wire.md", "docs/dictionary.md"};

    @Test
    void everyLinkLeadsSomewhere() throws IOException {
        int links = 0;
        for (String name : PAGES) {
            Path document = Path.of(name);
            Matcher link = Pattern.compile("\\]\\((?!https?:)([^)#]*)#?([^)]*)\\)")
                                   .matcher(withoutCode(Files.readString(document)));
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

    /** A text without what stands in backticks, where brackets are no links. */
    private static String withoutCode(String text) {
        return text.replaceAll("`[^`\n]*`", "code");
    }

    /** The headings of a document as links name them. */
    private static Set<String> anchors(Path document) throws IOException {
        Set<String> anchors = new HashSet<>();
        for (String line : Files.readAllLines(document)) {
            if (line.startsWith("#")) {
                String title = line.replaceFirst("#+ ", "").replaceAll("[^\\w -]", "");
                anchors.add(title.toLowerCase(Locale.ROOT).replace(' ', '-'));
            }
        }
        return anchors;
    }
}
