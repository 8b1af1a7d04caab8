package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.io.File;
import java.lang.reflect.InvocationTargetException;
import java.lang.reflect.Proxy;
import java.net.URL;
import java.net.URLClassLoader;
import java.util.ArrayList;
import java.util.List;
import org.junit.jupiter.api.AfterEach;
import org.junit.jupiter.api.BeforeEach;
import org.junit.jupiter.api.Test;

/** The library is loaded in one place, by whom the app wants, and once. */
class NativeLibraryTest {
    private final List<String> loaded = new ArrayList<>();
    private URLClassLoader apart;
    private Class<?> library;

    /** A class loader of its own has a class that has loaded nothing yet. */
    @BeforeEach
    void begin() throws Exception {
        URL jar = new File(System.getProperty("client.jar")).toURI().toURL();
        apart = new URLClassLoader(new URL[] {jar}, null);
        library = apart.loadClass("com.brindlex.kernel.quorvane.NativeLibrary");
    }

    @AfterEach
    void end() throws Exception {
        apart.close();
    }

    private Object call(String method) throws Exception {
        try {
            return library.getMethod(method).invoke(null);
        } catch (InvocationTargetException thrown) {
            if (thrown.getCause() instanceof Error error) {
                throw error;
            }
            throw thrown;
        }
    }

    private void use(String refusal) throws Exception {
        Class<?> type = apart.loadClass("com.brindlex.kernel.quorvane.NativeLibrary$Loader");
        Object loader = Proxy.newProxyInstance(apart, new Class<?>[] {type}, (proxy, method, names) -> {
            loaded.add((String) names[0]);
            if (refusal != null) {
                throw new UnsatisfiedLinkError(refusal);
            }
            return null;
        });
        library.getMethod("use", type).invoke(null, loader);
    }

    @Test
    void anotherLoaderLoadsItOnce() throws Exception {
        use(null);
        assertEquals(true, call("isAvailable"));
        assertNull(call("whyNot"));
        call("load");
        assertEquals(List.of("quorvane"), loaded);
    }

    @Test
    void saysWhyNotAndWhatToDo() throws Exception {
        use("dlopen failed: wrong machine");
        assertEquals(false, call("isAvailable"));
        String why = (String) call("whyNot");
        assertTrue(why.contains("dlopen failed: wrong machine"), why);
        assertTrue(why.contains("-Djava.library.path") && why.contains("ABI"), why);
        UnsatisfiedLinkError refusal =
                assertThrows(UnsatisfiedLinkError.class, () -> call("load"));
        assertEquals(why, refusal.getMessage());
        use(null);
        assertEquals(true, call("isAvailable"));
    }

    @Test
    void theHostClassAsksHere() throws Exception {
        use("no such library");
        assertThrows(UnsatisfiedLinkError.class, () -> Class.forName(
                "com.brindlex.kernel.quorvane.gatewayjni", true, apart));
        assertFalse(loaded.isEmpty());
    }
}
