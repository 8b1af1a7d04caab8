package com.brindlex.kernel.quorvane.console;

import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;

/**
 * The columns of each result text, and how its lists and sections are taken apart: '@' separates
 * fields, '!' ends a record, {@code count!} opens a list, {@code <n>!count!} opens a section.
 */
public enum ResultLayout {
    ACCOUNTS("class", "label", "account", "branch", "flag"),
    STOCK_ACKNOWLEDGEMENT("gateway no.", "order date", "", "accepted"),
    FUTURES_ACKNOWLEDGEMENT("gateway no.", "order date", "", "accepted", "MT"),
    STOCK_ORDERS("~gateway no.", "order", "type", "stock", "ordered", "state", "filled",
            "cancelled", "price", "time", "~entered", "~order date", "~N6", "~change"),
    STOCK_FILLS("order", "type", "stock", "shares", "price", "amount", "date", "time"),
    CASH_POSITIONS("stock", "opening|change"),
    MARGIN_POSITIONS("stock", "opening|change", "", "", "", "", ""),
    SHORT_POSITIONS("stock", "opening|change", "", "", "", ""),
    OTHER_POSITIONS("stock", "quantity"),
    CREDIT("stock", "margin (76)", "short (77)", "B8", "B9", "A0", "A1", "A2"),
    SETTLEMENT("date", "", "type", "stock", "shares", "price", "amount", "fee", "tax", "~84",
            "81/85", "82/87", "~86", "~89", "~88", "sign", "net"),
    SETTLEMENT_JZG("date", "", "KT", "stock", "shares", "price", "amount", "fee", "tax", "~84",
            "81/85", "82/87", "~86", "~89", "~88", "sign", "net"),
    FUTURES_ORDERS("~gateway no.", "order", "legs", "contract", "ordered", "state", "filled",
            "cancelled", "price", "~time", "~entered", "~order date", "~N6", "~change",
            "~in force", "~MT"),
    FUTURES_FILLS("~order&gateway no.", "legs", "contract", "open&filled", "price&fill price", "",
            "", "time&filled at", "~MT", "~date&fill date"),
    FUTURES_POSITIONS("side", "contract", "contracts", "price", "since", "currency"),
    OPTIONS_POSITIONS("side", "contract", "contracts", "price", "since"),
    MARGIN("currency", "", "LO, 2 decimals", "", "PN", "RA", "LO", "QY", "", "QX", "", "U5", "",
            "", "", "", "U9", "U5", "", "", "", "", "RF", "", "", "", "", "F0", "F1", "F2", "F3"),
    BALANCE("", "", "", "", "balance", "");

    private static final String MINOR = "~";

    private final List<String> columns;

    ResultLayout(String... columns) {
        this.columns = Arrays.asList(columns);
    }

    /** Column names in order; an empty one marks a position that is always empty. */
    public List<String> columns() {
        List<String> names = new ArrayList<>();
        for (String column : columns) {
            names.add(column.replace(MINOR, ""));
        }
        return names;
    }

    /** Whether a column belongs in a narrow table: it is neither a minor one nor always empty. */
    public boolean isMain(int column) {
        return !columns.get(column).isEmpty() && !columns.get(column).startsWith(MINOR);
    }

    /** How the values of a column read: as they stand, or with decimals or names put in. */
    public Readable.Form form(int column) {
        String name = columns.get(column);
        boolean futures = name().matches("(FUTURES|OPTIONS|MARGIN$).*");
        if (name.contains("price") || this == MARGIN && column > 0) {
            return futures && !name.equals("LO, 2 decimals")
                    ? Readable.Form.FOUR_DECIMALS
                    : Readable.Form.TWO_DECIMALS;
        }
        if (name.matches(".*(date|entered|since).*")) {
            return Readable.Form.DATE;
        }
        if (name.contains("time")) {
            return Readable.Form.TIME;
        }
        return name.matches("type|legs")
                ? Readable.Form.ORDER_TYPE
                : name.equals("contract") ? Readable.Form.CONTRACT : Readable.Form.PLAIN;
    }

    /** The records with every value in its readable form. */
    public List<List<String>> readable(List<List<String>> records) {
        List<List<String>> rows = new ArrayList<>();
        for (List<String> record : records) {
            List<String> row = new ArrayList<>();
            for (int i = 0; i < record.size() && i < columns.size(); i++) {
                row.add(form(i).read(record.get(i)));
            }
            rows.add(row);
        }
        return rows;
    }

    /** A section of a result: its number ({@code -1} for a plain list) and its records. */
    public record Section(int number, List<List<String>> records) {}

    /** Takes a result of one list ({@code count!...}) apart. */
    public static List<List<String>> list(String result) {
        return records(pieces(result), 1);
    }

    /** Takes a single record ({@code a@b!}) apart. */
    public static List<List<String>> record(String result) {
        return records(pieces(result), 0);
    }

    /** Takes a result of numbered sections apart. */
    public static List<Section> sections(String result) {
        List<Section> sections = new ArrayList<>();
        List<String> open = new ArrayList<>();
        int number = -1;
        for (String piece : pieces(result)) {
            if (piece.matches("<[0-9]>")) {
                if (number >= 0) {
                    sections.add(new Section(number, records(open, 1)));
                }
                number = piece.charAt(1) - '0';
                open = new ArrayList<>();
            } else {
                open.add(piece);
            }
        }
        if (number >= 0) {
            sections.add(new Section(number, records(open, 1)));
        }
        return sections;
    }

    private static List<String> pieces(String result) {
        String[] pieces = result.split("!", -1);
        return Arrays.asList(pieces).subList(0, pieces.length - 1);
    }

    private static List<List<String>> records(List<String> pieces, int first) {
        List<List<String>> records = new ArrayList<>();
        for (int i = first; i < pieces.size(); i++) {
            records.add(Arrays.asList(pieces.get(i).split("@", -1)));
        }
        return records;
    }
}
