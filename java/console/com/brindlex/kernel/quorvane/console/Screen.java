package com.brindlex.kernel.quorvane.console;

import java.io.PrintStream;
import java.util.ArrayList;
import java.util.List;

/** Writes to a terminal: headings, wrapped texts and tables, with colours where they are wanted. */
public final class Screen {
    private static final int WIDTH = 100;

    /** Width of one place in a grid. */
    private static final int CELL = 29;

    /** The styles that texts are written in. */
    public enum Style {
        PLAIN(""),
        TITLE("1;36"),
        LABEL("36"),
        DIM("2"),
        GOOD("32"),
        BAD("1;31"),
        STRONG("1");

        private final String code;

        Style(String code) {
            this.code = code;
        }
    }

    private final PrintStream out;
    private final boolean colours;
    private final int wrapAt;

    /** Writes to {@code out}, with terminal colours when {@code colours} is set. */
    public Screen(PrintStream out, boolean colours) {
        this(out, colours, true);
    }

    /** Likewise; long texts are wrapped when {@code wrapped} is set, else they stay in one line. */
    public Screen(PrintStream out, boolean colours, boolean wrapped) {
        this.out = out;
        this.colours = colours;
        this.wrapAt = wrapped ? WIDTH - 12 : Integer.MAX_VALUE;
    }

    /** Puts a text into a style. */
    public String styled(Style style, String text) {
        return colours && !style.code.isEmpty() ? "\033[" + style.code + "m" + text + "\033[0m"
                                                : text;
    }

    /** Writes a line. */
    public void line(String text) {
        out.println(text);
    }

    /** Opens a chapter. */
    public void title(String text) {
        out.println();
        String rule = "━".repeat(Math.max(3, WIDTH - 4 - width(text)));
        out.println(styled(Style.TITLE, "━━ " + text + " " + rule));
    }

    /** Opens a step within a chapter. */
    public void step(String text) {
        out.println();
        out.println(styled(Style.STRONG, "▸ " + text));
    }

    /** Writes a label and a text beside it, wrapped over as many lines as it takes. */
    public void labelled(String label, Style style, String text) {
        String shown = text.replace("\r", "␍").replace("\n", "␊");
        boolean first = true;
        for (String piece : wrap(shown.isEmpty() ? "(empty)" : shown, wrapAt)) {
            String head = styled(Style.LABEL, pad(first ? label : "", 9));
            out.println("  " + head + " " + styled(style, piece));
            first = false;
        }
    }

    /** Writes a table of data: numbers to the right, columns whose cells are all empty left out. */
    public void table(List<String> columns, List<List<String>> rows) {
        table(columns, rows, true);
    }

    /** Writes a table of texts, all to the left. */
    public void texts(List<String> columns, List<List<String>> rows) {
        table(columns, rows, false);
    }

    /** Writes named values, several to a line: the tag or number, the value, what it is. */
    public void grid(String label, List<List<String>> items) {
        StringBuilder line = new StringBuilder();
        int used = 0;
        String head = label;
        for (List<String> item : items) {
            String plain = item.get(0) + "=" + item.get(1) + " " + item.get(2);
            int cells = width(plain) / CELL + 1;
            if (used > 0 && used + cells * CELL > WIDTH - 12) {
                gridLine(head, line);
                head = "";
                used = 0;
            }
            line.append(styled(Style.LABEL, item.get(0)))
                    .append(styled(Style.STRONG, "=" + item.get(1)))
                    .append(styled(Style.DIM, " " + item.get(2)))
                    .append(" ".repeat(cells * CELL - width(plain)));
            used += cells * CELL;
        }
        if (used > 0) {
            gridLine(head, line);
        }
    }

    private void gridLine(String label, StringBuilder line) {
        out.println(
                "  " + styled(Style.LABEL, pad(label, 9)) + " " + line.toString().stripTrailing());
        line.setLength(0);
    }

    private void table(List<String> columns, List<List<String>> rows, boolean numbersRight) {
        List<Integer> kept = new ArrayList<>();
        List<Integer> widths = new ArrayList<>();
        for (int column = 0; column < columns.size(); column++) {
            int widest = 0;
            for (List<String> row : rows) {
                widest = Math.max(widest, width(cell(row, column)));
            }
            if (widest > 0) {
                kept.add(column);
                widths.add(Math.max(widest, width(columns.get(column))));
            }
        }
        rule("┌", "┬", "┐", widths);
        row(columns, kept, widths, Style.LABEL, false);
        rule("├", "┼", "┤", widths);
        for (List<String> row : rows) {
            row(row, kept, widths, Style.PLAIN, numbersRight);
        }
        rule("└", "┴", "┘", widths);
    }

    private static String cell(List<String> row, int column) {
        return column < row.size() ? row.get(column) : "";
    }

    private void rule(String left, String middle, String right, List<Integer> widths) {
        StringBuilder line = new StringBuilder("  ").append(left);
        for (int i = 0; i < widths.size(); i++) {
            line.append(i == 0 ? "" : middle).append("─".repeat(widths.get(i) + 2));
        }
        out.println(styled(Style.DIM, line.append(right).toString()));
    }

    private void row(List<String> cells, List<Integer> kept, List<Integer> widths, Style style,
            boolean numbersRight) {
        String bar = styled(Style.DIM, "│");
        StringBuilder line = new StringBuilder("  ").append(bar);
        for (int i = 0; i < kept.size(); i++) {
            String text = cell(cells, kept.get(i));
            boolean number = numbersRight && text.matches("-?[0-9][0-9.,]*");
            String padded = number
                    ? " ".repeat(widths.get(i) - width(text)) + text
                    : pad(text, widths.get(i));
            line.append(' ').append(styled(style, padded)).append(' ').append(bar);
        }
        out.println(line);
    }

    /** Columns that a text takes: characters of the East Asian scripts take two. */
    public static int width(String text) {
        int width = 0;
        for (int at = 0, c; at < text.length(); at += Character.charCount(c)) {
            c = text.codePointAt(at);
            width += isWide(c) ? 2 : 1;
        }
        return width;
    }

    private static boolean isWide(int c) {
        return c >= 0x1100 && c <= 0x115F || c >= 0x2E80 && c <= 0xA4CF
                || c >= 0xAC00 && c <= 0xD7A3 || c >= 0xF900 && c <= 0xFAFF
                || c >= 0xFE30 && c <= 0xFE6F || c >= 0xFF00 && c <= 0xFF60
                || c >= 0xFFE0 && c <= 0xFFE6 || c >= 0x20000 && c <= 0x3FFFD;
    }

    /** A text that takes so many columns at most; what is lost shows. */
    public static String cut(String text, int columns) {
        if (text.length() * 2 <= columns || width(text) <= columns) {
            return text;
        }
        StringBuilder out = new StringBuilder();
        int used = 0;
        for (int c : text.codePoints().toArray()) {
            used += isWide(c) ? 2 : 1;
            if (used >= columns) {
                break;
            }
            out.appendCodePoint(c);
        }
        return out.append('…').toString();
    }

    /** A text with blanks behind it, so that it takes so many columns. */
    public static String pad(String text, int columns) {
        return text + " ".repeat(Math.max(0, columns - width(text)));
    }

    private static List<String> wrap(String text, int columns) {
        List<String> lines = new ArrayList<>();
        StringBuilder line = new StringBuilder();
        int used = 0;
        for (int c : text.codePoints().toArray()) {
            int wide = isWide(c) ? 2 : 1;
            if (used + wide > columns) {
                lines.add(line.toString());
                line.setLength(0);
                used = 0;
            }
            line.appendCodePoint(c);
            used += wide;
        }
        lines.add(line.toString());
        return lines;
    }
}
