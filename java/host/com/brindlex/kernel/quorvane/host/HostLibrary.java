package com.brindlex.kernel.quorvane.host;

import com.brindlex.kernel.quorvane.NativeLibrary;
import java.net.URL;
import java.nio.file.Path;
import java.util.ArrayList;
import java.util.List;
import java.util.Locale;
import org.jetbrains.annotations.NotNull;

/**
 * Loads the library of this machine from the jars on the class path, where it lies as {@code
 * native/<system>-<machine>/libquorvane.so}.
 *
 * <p>A library can be loaded from a file only. It is unpacked into a folder of its own in the
 * temporary folder, which nobody else may enter, and is gone again once it is loaded. So any
 * number of processes, and of class loaders within one, load it at the same time.
 */
public final class HostLibrary implements NativeLibrary.Loader {
    private static final String[] SYSTEMS = {"linux", "macos", "windows"};
    private static final String[] MACHINES = {"x86_64", "arm64", "x86", "arm"};

    /**
     * Unpacks and loads the library.
     *
     * @param name the name without {@code lib} and {@code .so}
     * @throws UnsatisfiedLinkError when there is none for this machine, or it cannot be unpacked
     *     or loaded, with what to do
     */
    @Override
    public void load(@NotNull String name) {
        URL library = find(platform(), name);
        if (library == null) {
            throw new UnsatisfiedLinkError("quorvane-host has no library for " + platform()
                    + ", it has those for " + String.join(", ", platforms(name))
                    + "; scripts/host-library, run on this machine, adds it");
        }
        Path unpacked = Unpacked.of(library, System.mapLibraryName(name));
        try {
            System.load(unpacked.toString());
        } catch (UnsatisfiedLinkError refused) {
            throw new UnsatisfiedLinkError("quorvane-host's library for " + platform()
                    + " is refused: " + refused.getMessage());
        } finally {
            Unpacked.remove(unpacked);
        }
    }

    /** This machine, as its folder is called: {@code linux-x86_64}. */
    static String platform() {
        return system(System.getProperty("os.name")) + "-" + machine(System.getProperty("os.arch"));
    }

    private static String system(String name) {
        String lower = name.toLowerCase(Locale.ROOT);
        if (lower.startsWith("mac")) {
            return "macos";
        }
        return lower.startsWith("windows") ? "windows" : lower.replace(' ', '_');
    }

    private static String machine(String name) {
        String lower = name.toLowerCase(Locale.ROOT);
        if (lower.matches("amd64|x86[-_]64|x64")) {
            return "x86_64";
        }
        if (lower.matches("i[3-6]86|x86")) {
            return "x86";
        }
        if (lower.equals("aarch64")) {
            return "arm64";
        }
        return lower.matches("armv?[0-9].*") ? "arm" : lower;
    }

    /** The library for a platform, or null. */
    private static URL find(String platform, String name) {
        String extension = platform.startsWith("macos") ? ".dylib"
                : platform.startsWith("windows") ? ".dll" : ".so";
        String prefix = platform.startsWith("windows") ? "" : "lib";
        return HostLibrary.class.getResource(
                "/native/" + platform + "/" + prefix + name + extension);
    }

    /** What the class path holds, of the systems and machines that are known. */
    private static List<String> platforms(String name) {
        List<String> found = new ArrayList<>();
        for (String system : SYSTEMS) {
            for (String machine : MACHINES) {
                if (find(system + "-" + machine, name) != null) {
                    found.add(system + "-" + machine);
                }
            }
        }
        return found;
    }
}
