package com.brindlex.kernel.quorvane;

import java.io.File;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * Brings {@code libquorvane.so} in: the one place that loads it, once, at the first call of a
 * native or when {@link #load} is called. May be used by several threads at once.
 *
 * <p>It is found where the virtual machine looks for libraries: in the app on a device, in the
 * folder that {@code -Djava.library.path} names on a plain machine. When it is not there, a plain
 * machine takes the one that {@code quorvane-host.jar} brings on the class path.
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

    /** The loader of quorvane-host.jar, which no app carries. */
    private static final String HOST_LOADER = "com.brindlex.kernel.quorvane.host.HostLibrary";

    private static Loader loader;
    private static volatile boolean loaded;

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
    public static void load() {
        if (!loaded) {
            find();
        }
    }

    private static synchronized void find() {
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
            boolean look = loader == null && !isOnDevice() && !isInLibraryPath();
            Loader host = look ? hostLoader() : null;
            if (host == null) {
                throw advised(refused);
            }
            host.load(NAME);
        }
        loaded = true;
    }

    private static boolean isOnDevice() {
        return "Dalvik".equals(System.getProperty("java.vm.name"));
    }

    /** A library that somebody put there and that cannot be loaded is not passed over. */
    private static boolean isInLibraryPath() {
        String folders = System.getProperty("java.library.path", "");
        for (String folder : folders.split(File.pathSeparator)) {
            if (new File(folder, System.mapLibraryName(NAME)).exists()) {
                return true;
            }
        }
        return false;
    }

    @Nullable
    private static Loader hostLoader() {
        try {
            return (Loader) Class.forName(HOST_LOADER).getDeclaredConstructor().newInstance();
        } catch (ReflectiveOperationException absent) {
            return null;
        }
    }

    private static UnsatisfiedLinkError advised(UnsatisfiedLinkError refused) {
        UnsatisfiedLinkError told = new UnsatisfiedLinkError(System.mapLibraryName(NAME)
                + " cannot be loaded (" + refused.getMessage() + "). On Android the app must carry it"
                + " for the ABI of the device; on a plain machine quorvane-host.jar brings it on the"
                + " class path, or -Djava.library.path names its folder. NativeLibrary.use(...) takes"
                + " another loader.");
        told.initCause(refused);
        return told;
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
