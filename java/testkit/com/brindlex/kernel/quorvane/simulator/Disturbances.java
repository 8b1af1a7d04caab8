package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Operation;
import java.util.ArrayDeque;
import java.util.Deque;
import java.util.EnumMap;
import java.util.Map;

/** What waits for the next requests, in the order in which it was asked for. */
final class Disturbances {
    private final Deque<Disturbance> forAny = new ArrayDeque<>();
    private final Map<Operation, Deque<Disturbance>> forOne = new EnumMap<>(Operation.class);
    private Disturbance standing = Disturbance.NONE;

    void add(Disturbance disturbance) {
        forAny.add(disturbance);
    }

    void add(Operation operation, Disturbance disturbance) {
        forOne.computeIfAbsent(operation, key -> new ArrayDeque<>()).add(disturbance);
    }

    void stand(Disturbance disturbance) {
        standing = disturbance;
    }

    void clear() {
        forAny.clear();
        forOne.clear();
        standing = Disturbance.NONE;
    }

    /** What befalls this request: what waits for its operation, else for any, else what stands. */
    Disturbance take(Operation operation) {
        Deque<Disturbance> own = operation == null ? null : forOne.get(operation);
        if (own != null && !own.isEmpty()) {
            return own.remove();
        }
        return forAny.isEmpty() ? standing : forAny.remove();
    }
}
