package com.brindlex.kernel.quorvane;

import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * Brings {@code libquorvane.so} in: the one place that loads it, once, at the first call of a
 * native or when {@link #load} is called. May be used by several threads at once.
 *
 * <p>An app that loads its libraries by a helper of its own gives it before the first call: {@code
 * NativeLibrary.use(name -> ReLinker.loadLibrary(context, name))}.
 */
public final class NativeLibrary {
    /** What loads a library. */
    public interface Loader {
        /**
         * Loads a library, or throws an {@link UnsatisfiedLinkError} that says why it cannot.
         *
         * @param name the name without {@code lib} and {@code .so}
         */
        void load(@NotNull String name);
    }

    private static final String NAME = "quorvane";

    private static Loader loader;
    private static boolean loaded;

    private NativeLibrary() {}

    /** Has this loader load the library, unless it is loaded already. */
    public static synchronized void use(@NotNull Loader other) {
        loader = other;
    }

    /**
     * Loads the library if it is not loaded yet.
     *
     * @throws UnsatisfiedLinkError when it cannot be loaded, with what to do
     */
    public static synchronized void load() {
        if (loaded) {
            return;
        }
        try {
            if (loader == null) {
                System.loadLibrary(NAME);
            } else {
                loader.load(NAME);
            }
        } catch (UnsatisfiedLinkError refused) {
            UnsatisfiedLinkError told = new UnsatisfiedLinkError(advice(refused.getMessage()));
            told.initCause(refused);
            throw told;
        }
        loaded = true;
    }

    private static String advice(String reason) {
        return System.mapLibraryName(NAME) + " cannot be loaded (" + reason + "). On Android the"
                + " app must carry it for the ABI of the device; on a plain machine"
                + " -Djava.library.path must name its folder. NativeLibrary.use(...) takes another"
                + " loader.";
    }

    /** Whether the library is loaded or can be. */
    public static boolean isAvailable() {
        return whyNot() == null;
    }

    /** Why the library cannot be loaded and what to do; null when it is loaded or could be. */
    @Nullable
    public static String whyNot() {
        try {
            load();
            return null;
        } catch (UnsatisfiedLinkError refused) {
            return refused.getMessage();
        }
    }
}
