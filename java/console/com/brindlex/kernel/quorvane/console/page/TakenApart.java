package com.brindlex.kernel.quorvane.console.page;

import com.brindlex.kernel.quorvane.console.message.Fault;
import com.brindlex.kernel.quorvane.console.message.Field;
import com.brindlex.kernel.quorvane.console.message.Group;
import com.brindlex.kernel.quorvane.console.message.Message;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;

/** A message as the page shows it: each fault at the field that it stands in. */
final class TakenApart {
    private TakenApart() {}

    /** The groups, fields and faults of a message; a fault before all fields stands alone. */
    static Map<String, Object> of(Message message, List<Fault> faults) {
        List<Fault> left = new ArrayList<>(faults);
        List<Object> groups = new ArrayList<>();
        List<Field> all = message.groups().stream()
                .flatMap(each -> each.fields().stream()).toList();
        for (Group group : message.groups()) {
            List<Object> fields = new ArrayList<>();
            for (Field field : group.fields()) {
                fields.add(of(field, ofField(field, all, left)));
            }
            groups.add(Map.of("title", group.title(), "fields", fields));
        }
        Map<String, Object> value = new LinkedHashMap<>();
        value.put("kind", message.kind().name().toLowerCase(Locale.ROOT));
        value.put("operations", message.operations());
        value.put("words", message.words());
        value.put("text", message.text());
        value.put("groups", groups);
        value.put("faults", left);
        return value;
    }

    /** Takes the faults of a field: those from its beginning to that of the next one. */
    private static List<Fault> ofField(Field field, List<Field> all, List<Fault> left) {
        int end = all.stream().mapToInt(Field::offset).filter(each -> each > field.offset())
                          .min().orElse(Integer.MAX_VALUE);
        List<Fault> own = left.stream().filter(
                each -> each.offset() >= field.offset() && each.offset() < end).toList();
        left.removeAll(own);
        return own;
    }

    private static Map<String, Object> of(Field field, List<Fault> faults) {
        Map<String, Object> value = new LinkedHashMap<>();
        value.put("tag", field.tag());
        value.put("value", field.value());
        value.put("name", field.name());
        value.put("meaning", field.meaning());
        value.put("faults", faults);
        return value;
    }
}
