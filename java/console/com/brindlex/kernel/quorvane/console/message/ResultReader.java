package com.brindlex.kernel.quorvane.console.message;

import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.dictionary.Reply;
import java.math.BigDecimal;
import java.util.ArrayList;
import java.util.HashMap;
import java.util.IdentityHashMap;
import java.util.List;
import java.util.Map;
import java.util.Objects;
import java.util.function.Predicate;
import java.util.regex.Matcher;
import java.util.regex.Pattern;

/** Takes results apart, position by position. */
final class ResultReader {
    private static final Pattern LIST = Pattern.compile("(?s)([0-9]{1,9})!(.*)");
    private static final Pattern SECTION = Pattern.compile("<([0-9])>!([0-9]{1,9})!");
    private static final String NOTICE = "<M>@";
    private static final List<Reply> REPLIES = replies();
    private static final Map<Reply.Table, Integer> PLACES = countPlaces();

    private final String text;
    private final List<Fault> faults = new ArrayList<>();
    private final List<Group> groups = new ArrayList<>();
    private final boolean full;
    private final boolean sections;
    private final boolean isList;
    private final int places;
    private int records;

    private static List<Reply> replies() {
        return Dictionary.get().operations().stream()
                .map(each -> Dictionary.get().reply(each.name())).filter(Objects::nonNull).toList();
    }

    private static Map<Reply.Table, Integer> countPlaces() {
        Map<Reply.Table, Integer> places = new IdentityHashMap<>();
        REPLIES.forEach(reply -> reply.tables().forEach(
                each -> places.put(each, countPlaces(each))));
        return places;
    }

    private static int countPlaces(Reply.Table table) {
        int places = 0;
        for (Reply.Column column : table.columns()) {
            int empty = column.empty() == null ? 1 : column.empty();
            places = Math.max(places, column.at() + empty);
        }
        return places;
    }

    private ResultReader(String text, boolean full) {
        this.full = full;
        this.text = text;
        this.sections = text.startsWith("<");
        Matcher list = LIST.matcher(text);
        this.isList = list.matches();
        String all = isList ? list.group(2) : text;
        this.places = isList && all.isEmpty() ? 0 : places(first(all));
    }

    static Message read(String text, List<String> decoders, boolean full) {
        ResultReader reader = new ResultReader(text, full);
        List<Reply> fitting = reader.fitting(decoders, reader::fits);
        if (fitting.isEmpty() && !decoders.isEmpty()) {
            fitting = List.of(Dictionary.get().reply(decoders.get(0)));
        } else if (fitting.isEmpty()) {
            fitting = reader.fitting(decoders, reader::beginsAs);
        }
        String words = fitting.isEmpty() ? "result" : reader.take(fitting.get(0));
        Map<String, String> facts = new HashMap<>();
        facts.put("outcome", "done");
        return new Message(Kind.RESULT, fitting.stream().map(Reply::decoder).toList(), words, text,
                reader.groups, reader.faults, facts);
    }

    private List<Reply> fitting(List<String> decoders, Predicate<Reply> test) {
        List<Reply> fitting = new ArrayList<>();
        for (Reply reply : REPLIES) {
            boolean wanted = decoders.isEmpty() || decoders.contains(reply.decoder());
            if (wanted && test.test(reply)) {
                fitting.add(reply);
            }
        }
        return fitting;
    }

    /** Whether the first section is that of a result, whatever became of the others. */
    private boolean beginsAs(Reply reply) {
        return sections && reply.result().equals("sections")
                && text.startsWith(reply.tables().get(0).mark());
    }

    private boolean fits(Reply reply) {
        switch (reply.result()) {
            case "sections":
                return sections && text.startsWith(reply.tables().get(0).mark())
                        && text.contains(lastMark(reply)) == (reply.tables().size() > 1)
                        && count(text) == reply.tables().size();
            case "list":
                return isList && (places == 0 || places == places(reply.tables().get(0)));
            case "record":
                return !sections && !isList && places == places(reply.tables().get(0));
            default:
                return false;
        }
    }

    private static String lastMark(Reply reply) {
        return reply.tables().get(reply.tables().size() - 1).mark() + "!";
    }

    private static int count(String text) {
        Matcher section = SECTION.matcher(text);
        int count = 0;
        while (section.find()) {
            count++;
        }
        return count;
    }

    private static String first(String records) {
        int end = records.indexOf('!');
        return end < 0 ? records : records.substring(0, end);
    }

    private static int places(String record) {
        return (int) record.chars().filter(c -> c == '@').count() + 1;
    }

    private static int places(Reply.Table table) {
        return PLACES.get(table);
    }

    private String take(Reply reply) {
        switch (reply.result()) {
            case "sections":
                sections(reply);
                return Meaning.counted(records, "position");
            case "list":
                Matcher list = LIST.matcher(text);
                if (list.matches()) {
                    records(reply.tables(), list.start(2), text.length(), list.group(1));
                }
                String name = reply.tables().get(0).name().replace(" (JZG)", "");
                return reply.record().only() == null ? Meaning.counted(records, name) : name;
            case "record":
                records(reply.tables(), 0, text.length(), null);
                return reply.isReceipt() ? ("accepted " + first(text).split("@", 2)[0]).strip()
                                         : reply.tables().get(0).name();
            default:
                return "done";
        }
    }

    private void sections(Reply reply) {
        Matcher section = SECTION.matcher(text);
        int at = 0;
        while (section.find(at)) {
            int begin = section.end();
            int next = text.indexOf("!<", begin - 1);
            int end = next < 0 ? text.length() : next + 1;
            String mark = "<" + section.group(1) + ">";
            List<Reply.Table> tables = reply.tables().stream()
                    .filter(each -> mark.equals(each.mark())).toList();
            if (tables.isEmpty()) {
                faults.add(new Fault(section.start(), "unknown-section",
                        "no section " + mark + " is known"));
            } else {
                records(tables, begin, end, section.group(2));
            }
            at = end;
        }
    }

    private void records(List<Reply.Table> tables, int from, int to, String said) {
        int before = records;
        int begin = from;
        while (begin < to) {
            int end = text.indexOf('!', begin);
            if (end < 0 || end >= to) {
                faults.add(new Fault(to, "cut-short", "the last record is not closed by '!'"));
                end = to;
            }
            String record = text.substring(begin, end);
            record(record.startsWith(NOTICE) && tables.size() > 1 ? tables.get(1) : tables.get(0),
                    record, begin);
            records++;
            begin = end + 1;
        }
        if (said != null && Long.parseLong(said) != records - before) {
            faults.add(new Fault(from, "wrong-count", "the count says " + said + ", "
                            + Meaning.counted(records - before, "record") + " stand here"));
        }
    }

    private void record(Reply.Table table, String record, int offset) {
        String[] values = record.split("@", -1);
        if (values.length != places(table)) {
            faults.add(new Fault(offset, "wrong-places", "a record of " + values.length
                            + " places; " + table.name() + " has " + places(table)));
        }
        if (!full) {
            return;
        }
        List<Field> fields = new ArrayList<>();
        int at = offset;
        for (int place = 0; place < values.length; place++) {
            field(table, place, values[place], at, fields);
            at += values[place].length() + 1;
        }
        groups.add(new Group(table.name(), fields));
    }

    private static void field(Reply.Table table, int place, String value, int offset,
            List<Field> fields) {
        List<Reply.Column> columns = new ArrayList<>();
        boolean known = false;
        for (Reply.Column column : table.columns()) {
            int empty = column.empty() == null ? 1 : column.empty();
            known |= place >= column.at() && place < column.at() + empty;
            if (column.empty() == null && column.at() == place) {
                columns.add(column);
            }
        }
        if (columns.isEmpty()) {
            if (!known || !value.isEmpty()) {
                fields.add(new Field(offset, String.valueOf(place), value,
                        known ? "always empty" : null, ""));
            }
            return;
        }
        String[] parts = columns.size() > 1 ? value.split("[&|]", -1) : new String[] {value};
        if (parts.length > columns.size()) {
            parts = new String[] {value};
        }
        int at = offset;
        for (int i = 0; i < parts.length; i++) {
            boolean each = parts.length == columns.size() || parts.length < 3;
            Reply.Column column = columns.get(i);
            fields.add(new Field(at, String.valueOf(place), parts[i],
                    each ? column.meaning() : "contract, part " + (i + 1),
                    each ? meaning(column, parts[i]) : ""));
            at += parts[i].length() + 1;
        }
    }

    private static String meaning(Reply.Column column, String value) {
        if (Digits.whole(value, 18) && column.form().matches("hundredths|price2")) {
            return Meaning.hundredths(value);
        }
        if (Digits.whole(value, 18) && column.form().matches("tenThousandths|price4")) {
            return Meaning.price(BigDecimal.valueOf(Long.parseLong(value), 4)
                    .toPlainString());
        }
        String meaning = ReplyValues.meaning(column, value);
        return meaning.isEmpty() && column.codes() != null
                ? Meaning.code(column.codes(), value) : meaning;
    }
}
