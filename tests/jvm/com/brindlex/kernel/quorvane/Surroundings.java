package com.brindlex.kernel.quorvane;

/**
 * The clock and the log that the library finds in these tests. Preloaded into the virtual machine
 * by {@code tests/jvm/run}.
 */
final class Surroundings {
    static {
        System.load(System.getProperty("surroundings.library"));
    }

    private Surroundings() {}

    /**
     * Stops the library's clock on this thread and begins to collect its log lines.
     *
     * @param clock seconds since 1970
     */
    static native void enter(long clock);

    /**
     * Ends what {@link #enter} began on this thread.
     *
     * @return the log lines since then, in order
     */
    static native String[] leave();

    /**
     * The native methods that the native tests know.
     *
     * @return one text each, name and descriptor: {@code "AuthDecode(Ljava/lang/String;[I)..."}
     */
    static native String[] nativeMethods();

    /**
     * The names of their arguments, without the status array.
     *
     * @return one text each, the method's name in front: {@code "QueryOrderDecode market reply"}
     */
    static native String[] argumentNames();
}
