package com.brindlex.kernel.quorvane.host;

import java.io.File;
import java.io.IOException;
import java.io.InputStream;
import java.net.URL;
import java.nio.file.Files;
import java.nio.file.LinkOption;
import java.nio.file.Path;
import java.nio.file.Paths;
import java.util.concurrent.TimeUnit;

/** A file of a jar, unpacked into a new folder of its own that only this user may enter. */
final class Unpacked {
    private static final String PREFIX = "quorvane-host-";

    /** What is older was left by a process that was ended while it loaded. */
    private static final long LEFT_BEHIND = TimeUnit.DAYS.toMillis(1);

    private Unpacked() {}

    /**
     * Unpacks a file into the temporary folder.
     *
     * @throws UnsatisfiedLinkError when it cannot be written, with what to do
     */
    static Path of(URL packed, String name) {
        String temporary = System.getProperty("java.io.tmpdir");
        Path folder = null;
        try {
            folder = Files.createTempDirectory(Paths.get(temporary), PREFIX);
            Path file = folder.resolve(name);
            try (InputStream in = packed.openStream()) {
                Files.copy(in, file);
            }
            removeLeftBehind(folder, name);
            return file;
        } catch (IOException refused) {
            if (folder != null) {
                remove(folder.resolve(name));
            }
            throw new UnsatisfiedLinkError("quorvane-host cannot unpack its library into the folder "
                    + temporary + " (" + refused + "); -Djava.io.tmpdir names another");
        }
    }

    /** Removes the file, which may be loaded still, and its folder. */
    static void remove(Path file) {
        if (file.toFile().delete() || !Files.exists(file)) {
            file.getParent().toFile().delete();
        }
    }

    /** Others may write into the temporary folder, too: nothing of theirs is followed or removed. */
    private static void removeLeftBehind(Path own, String name) {
        File[] folders = own.getParent().toFile().listFiles((in, other) -> other.startsWith(PREFIX));
        if (folders == null) {
            return;
        }
        for (File each : folders) {
            Path folder = each.toPath();
            boolean old = each.lastModified() < System.currentTimeMillis() - LEFT_BEHIND;
            if (old && Files.isDirectory(folder, LinkOption.NOFOLLOW_LINKS) && isOf(folder, own)) {
                remove(folder.resolve(name));
            }
        }
    }

    private static boolean isOf(Path folder, Path own) {
        try {
            return Files.getOwner(folder, LinkOption.NOFOLLOW_LINKS).equals(Files.getOwner(own));
        } catch (IOException | UnsupportedOperationException unknown) {
            return false;
        }
    }
}
