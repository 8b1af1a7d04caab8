package com.brindlex.kernel.quorvane.console.timeline;

import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.message.Message;
import java.util.HashMap;
import java.util.Iterator;
import java.util.LinkedHashMap;
import java.util.LinkedHashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;

/** The requests that wait for their replies: by their ids, and in the order of the log. */
final class Pending {
    /** So many requests are remembered; the oldest is forgotten when one more comes. */
    private static final int MOST = 4096;

    /** A request that waits. */
    record Request(Row row, long millis, List<String> decoders, String text) {}

    private final Map<Long, Request> inOrder = new LinkedHashMap<>();
    private final Map<String, Request> byId = new HashMap<>();

    void add(Row row, long millis, Message message) {
        Set<String> decoders = new LinkedHashSet<>();
        for (String operation : message.operations()) {
            decoders.addAll(Dictionary.get().operation(operation).answeredBy());
        }
        Request request = new Request(row, millis, List.copyOf(decoders), message.text());
        inOrder.put(row.line(), request);
        if (!row.requestId().isEmpty()) {
            byId.put(row.requestId(), request);
        }
        if (inOrder.size() > MOST) {
            remove(inOrder.values().iterator().next());
        }
    }

    private void remove(Request request) {
        inOrder.remove(request.row().line());
        byId.remove(request.row().requestId(), request);
    }

    /** Whether that request is there already: an app may log what the library logs too. */
    boolean has(String requestId, String text) {
        Request known = byId.get(requestId);
        return known != null && known.text().strip().equals(text.strip());
    }

    Request find(String requestId) {
        return byId.get(requestId);
    }

    /** Takes the request with an id; null when none waits. */
    Request take(String requestId) {
        Request found = byId.get(requestId);
        if (found != null) {
            remove(found);
        }
        return found;
    }

    /** Takes the oldest request that one of these decoders answers; any, when they are empty. */
    Request takeOldest(List<String> decoders) {
        Iterator<Request> all = inOrder.values().iterator();
        while (all.hasNext()) {
            Request each = all.next();
            boolean fits = decoders.isEmpty()
                    || each.decoders().stream().anyMatch(decoders::contains);
            if (fits) {
                remove(each);
                return each;
            }
        }
        return null;
    }

    /** The oldest request of all; null when none waits. */
    Request oldest() {
        return inOrder.isEmpty() ? null : inOrder.values().iterator().next();
    }

    /** The requests that wait still. */
    List<Row> waiting() {
        return inOrder.values().stream().map(Request::row).toList();
    }
}
