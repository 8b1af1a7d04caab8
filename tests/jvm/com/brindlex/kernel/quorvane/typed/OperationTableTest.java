package com.brindlex.kernel.quorvane.typed;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.gatewayjni;
import java.io.IOException;
import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.HashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;
import java.util.TreeMap;
import java.util.TreeSet;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import org.junit.jupiter.api.Test;

/** Holds the table of operations against the natives that it describes. */
class OperationTableTest {
    private static final Path HOST_CLASS =
            Path.of("java/client/com/brindlex/kernel/quorvane/gatewayjni.java");

    private static Map<String, Method> natives() {
        Map<String, Method> natives = new TreeMap<>();
        for (Method method : gatewayjni.class.getDeclaredMethods()) {
            if (Modifier.isNative(method.getModifiers())) {
                natives.put(method.getName(), method);
            }
        }
        return natives;
    }

    @Test
    void hasEveryNativeAndNoOther() {
        Set<String> named = new TreeSet<>();
        for (Operation operation : Operation.values()) {
            assertTrue(named.add(operation.method()), operation.method());
        }
        assertEquals(natives().keySet(), named);
        assertEquals(59, named.size());
        assertEquals(32, Arrays.stream(Operation.values()).filter(Operation::isEncoder).count());
    }

    @Test
    void passesTheTypesOfEveryNativeInOrder() {
        Map<String, Method> natives = natives();
        for (Operation operation : Operation.values()) {
            List<Class<?>> types = new ArrayList<>();
            operation.allArguments().forEach(argument -> types.add(argument.type().javaType()));
            if (operation.hasStatus()) {
                types.add(int[].class);
            }
            List<Class<?>> there =
                    Arrays.asList(natives.get(operation.method()).getParameterTypes());
            assertEquals(there, types, operation.method());
        }
    }

    @Test
    void namesTheParametersAsTheHostClassDoes() throws IOException {
        String source = Files.readString(HOST_CLASS);
        Pattern declaration = Pattern.compile("native String (\\w+)\\(([^)]*)\\)");
        Matcher found = declaration.matcher(source);
        int declarations = 0;
        while (found.find()) {
            declarations++;
            List<String> names = new ArrayList<>();
            for (String parameter : found.group(2).trim().split("\\s*,\\s*")) {
                String name = parameter.substring(parameter.lastIndexOf(' ') + 1);
                if (!name.equals("status")) {
                    names.add(name);
                }
            }
            Operation operation = Operation.named(found.group(1));
            List<String> listed = new ArrayList<>();
            operation.allArguments().forEach(argument -> listed.add(argument.name()));
            assertEquals(names, listed, operation.method());
        }
        assertEquals(59, declarations);
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
            for (Table table : operation.layout().tables()) {
                Set<String> keys = new HashSet<>();
                for (Column<?> column : table.columns()) {
                    assertTrue(keys.add(column.key()), table + " " + column);
                    assertTrue(column.key().matches("[a-z][A-Za-z0-9]*"), column.key());
                    assertFalse(column.meaning().isEmpty(), column.key());
                }
                int placed = 0;
                for (int position = 0; position < table.positions(); position++) {
                    placed += table.at(position).size();
                }
                assertEquals(table.columns().size(), placed, table.name());
            }
        }
    }

    @Test
    void everyEncoderHasAFactory() throws ReflectiveOperationException {
        Session session = Session.of(1, 0, "SN", "10.0.0.1");
        Credentials credentials = Credentials.of("9A01", "A123456789", "1234567", "secret");
        Set<Operation> opened = new HashSet<>();
        for (Method factory : Requests.class.getMethods()) {
            if (Modifier.isStatic(factory.getModifiers())) {
                Object[] arguments = factory.getParameterCount() == 1
                        ? new Object[] {session} : new Object[] {session, credentials};
                opened.add(((Request) factory.invoke(null, arguments)).operation());
            }
        }
        for (Operation operation : Operation.values()) {
            assertEquals(operation.isEncoder(), opened.contains(operation), operation.method());
        }
    }

    @Test
    void refusesWhatItCannotDo() {
        Session session = Session.of(1, 0, "SN", "10.0.0.1");
        assertNull(Operation.named("NoSuchEncode"));
        assertNotNull(Operation.named("AuthEncode"));
        assertThrows(IllegalStateException.class, () -> Operation.AUTH_ENCODE.decode(""));
        assertThrows(IllegalArgumentException.class,
                () -> new Request(Operation.AUTH_DECODE, session));
        Request order = new Request(Operation.SUBMIT_ORDER_ENCODE, session);
        for (String[] bad : new String[][] {{"quantity", "many"}, {"quantity", "99999999999"},
                     {"side", "BUY"}, {"side", ""}, {"tradeType", "256"}, {"tradeType", "-1"},
                     {"colour", "1"}}) {
            assertThrows(IllegalArgumentException.class, () -> order.set(bad[0], bad[1]), bad[0]);
        }
    }
}
