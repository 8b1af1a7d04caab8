package com.brindlex.kernel.quorvane.client;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.gatewayjni;
import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.HashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;
import java.util.TreeMap;
import java.util.TreeSet;
import org.junit.jupiter.api.Test;

/** Holds the table of operations against the natives that it describes. */
class OperationTableTest {
    private static Map<String, Method> natives() {
        Map<String, Method> natives = new TreeMap<>();
        for (Method method : gatewayjni.class.getDeclaredMethods()) {
            if (Modifier.isNative(method.getModifiers())) {
                natives.put(method.getName(), method);
            }
        }
        return natives;
    }

    /** All arguments of a native but the status array. */
    private static List<Argument> all(Operation operation) {
        List<Argument> all = new ArrayList<>();
        if (operation.isEncoder()) {
            all.addAll(Operation.sessionArguments());
        }
        all.addAll(operation.arguments());
        return all;
    }

    @Test
    void hasEveryNativeAndNoOther() {
        Set<String> named = new TreeSet<>();
        for (Operation operation : Operation.values()) {
            assertTrue(named.add(operation.method()), operation.method());
        }
        assertEquals(natives().keySet(), named);
    }

    @Test
    void passesTheTypesOfEveryNativeInOrder() {
        Map<String, Method> natives = natives();
        for (Operation operation : Operation.values()) {
            List<Class<?>> types = new ArrayList<>();
            all(operation).forEach(argument -> types.add(argument.type().javaType()));
            if (operation != Operation.SUBMIT_ORDER_ENCODE2) {
                types.add(int[].class);
            }
            List<Class<?>> there =
                    Arrays.asList(natives.get(operation.method()).getParameterTypes());
            assertEquals(there, types, operation.method());
        }
    }

    @Test
    void everyRequestHasItsReader() {
        Set<Operation> readers = new HashSet<>();
        for (Operation operation : Operation.values()) {
            if (operation.isEncoder()) {
                assertFalse(operation.decoders().isEmpty(), operation.method());
                readers.addAll(operation.decoders());
            } else {
                assertTrue(operation.decoders().isEmpty(), operation.method());
            }
        }
        assertEquals(27, readers.size());
    }

    @Test
    void everyColumnIsNamedOnceInItsTable() {
        for (Operation operation : Operation.values()) {
            for (Shape<?> shape : operation.isEncoder() ? List.<Shape<?>>of()
                                                        : operation.layout().shapes()) {
                Set<String> names = new HashSet<>();
                for (Column<?, ?> column : shape.columns()) {
                    assertTrue(names.add(column.name()), shape + " " + column);
                    assertTrue(column.name().matches("[a-z][A-Za-z0-9]*"), column.name());
                    assertFalse(column.meaning().isEmpty(), column.name());
                }
                Set<String> placed = new HashSet<>();
                for (int field = 0; field < shape.fields(); field++) {
                    shape.at(field).forEach(column -> assertTrue(placed.add(column.name())));
                }
                assertTrue(names.containsAll(placed), shape.name());
            }
        }
    }

    @Test
    void refusesWhatItCannotDo() {
        assertNull(Operation.named("NoSuchEncode"));
        assertNotNull(Operation.named("AuthEncode"));
        assertThrows(IllegalArgumentException.class,
                () -> RawReply.of(Operation.AUTH_ENCODE, Market.SECURITIES, ""));
        assertThrows(IllegalArgumentException.class,
                () -> RawRequest.of(Operation.AUTH_DECODE, Fixtures.SESSION));
        RawRequest order = RawRequest.of(Operation.SUBMIT_ORDER_ENCODE, Fixtures.SESSION);
        for (String[] bad : new String[][] {{"quantity", "many"}, {"quantity", "99999999999"},
                     {"side", "BUY"}, {"side", ""}, {"colour", "1"}}) {
            assertThrows(IllegalArgumentException.class, () -> order.set(bad[0], bad[1]), bad[0]);
        }
        order.set("tradeType", "256").set("orderKind", "-1");
        assertEquals(List.of("branch", "identity", "password", "stockCode", "quantity", "side",
                "orderKind", "tradeType"), Fixtures.refused(order::build));
    }
}
