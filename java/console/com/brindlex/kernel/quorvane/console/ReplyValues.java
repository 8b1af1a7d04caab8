package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.client.Code;
import com.brindlex.kernel.quorvane.client.Failure;
import com.brindlex.kernel.quorvane.client.Price;
import com.brindlex.kernel.quorvane.client.RawReply;
import com.brindlex.kernel.quorvane.client.ResultText.Section;
import com.brindlex.kernel.quorvane.client.Row;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** What came of a reply, as maps and lists for JSON. */
public final class ReplyValues {
    private ReplyValues() {}

    /** What came of a reply as JSON. */
    public static Map<String, Object> of(RawReply read) {
        Map<String, Object> map = new LinkedHashMap<>();
        map.put("operation", read.decoder().method());
        map.put("status", read.status());
        map.put("text", read.text());
        map.put("outcome", read.reply().outcome().name().toLowerCase());
        Failure failure = read.reply().failure();
        if (failure != null) {
            Map<String, Object> message = new LinkedHashMap<>();
            message.put("source", failure.source());
            message.put("text", failure.text());
            message.put("code", failure.code());
            map.put("message", message);
        }
        List<Object> sections = new ArrayList<>();
        List<Object> faults = new ArrayList<>();
        if (read.reply().isResult()) {
            read.result().sections().forEach(section -> sections.add(section(section)));
            read.result().faults().forEach(
                    fault -> faults.add(fault(fault.offset(), fault.text())));
        }
        map.put("sections", sections);
        map.put("faults", faults);
        return map;
    }

    private static Map<String, Object> section(Section section) {
        List<Object> rows = new ArrayList<>();
        for (Row<?> row : section.rows()) {
            Map<String, Object> cells = new LinkedHashMap<>();
            for (int place = 0; place < section.shape().columns().size(); place++) {
                cells.put(section.shape().columns().get(place).name(), value(row, place));
            }
            rows.add(cells);
        }
        Map<String, Object> entry = new LinkedHashMap<>();
        entry.put("table", section.shape().name());
        entry.put("rows", rows);
        return entry;
    }

    private static Object value(Row<?> row, int place) {
        Object value = row.peek(place);
        if (value instanceof Number) {
            return value;
        }
        if (value instanceof Code<?> code) {
            Map<String, Object> map = new LinkedHashMap<>();
            map.put("code", code.code());
            map.put("name", code.isKnown() ? code.label() : null);
            return map;
        }
        if (value instanceof Price price && !price.isWord()) {
            return price.amount();
        }
        String text = row.text(place);
        return value == null ? text.isEmpty() ? null : text : value.toString();
    }

    private static Map<String, Object> fault(int offset, String text) {
        Map<String, Object> map = new LinkedHashMap<>();
        map.put("character", offset + 1);
        map.put("text", text);
        return map;
    }
}
