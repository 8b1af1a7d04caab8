package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.client.Operation;
import java.lang.invoke.MethodType;
import java.lang.reflect.Method;
import java.lang.reflect.Modifier;
import java.util.Arrays;
import java.util.TreeSet;
import org.junit.jupiter.api.Test;

/** The host class declares what the library exports. */
class HostClassTest {
    @Test
    void declaresEachNativeMethodWithItsArguments() {
        TreeSet<String> declared = new TreeSet<>();
        for (Method method : Natives.all().values()) {
            declared.add(
                    method.getName()
                            + MethodType.methodType(method.getReturnType(), method.getParameterTypes())
                                    .toMethodDescriptorString());
        }
        TreeSet<String> known = new TreeSet<>(Arrays.asList(Surroundings.nativeMethods()));
        assertEquals(Operation.values().length, known.size());
        assertEquals(String.join("\n", known), String.join("\n", declared));
    }

    @Test
    void declaresThemPublicAndStatic() {
        for (Method method : Natives.all().values()) {
            int modifiers = method.getModifiers();
            assertTrue(
                    Modifier.isPublic(modifiers) && Modifier.isStatic(modifiers), method.getName());
        }
    }
}
