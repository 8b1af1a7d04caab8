package com.brindlex.kernel.quorvane.host;

import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.attribute.PosixFilePermissions;

/** Unpacks a library, says who may enter its folder, and removes it. */
public final class Private {
    public static void main(String[] arguments) throws Exception {
        Path unpacked = Unpacked.of(Private.class.getResource(arguments[0]), "libquorvane.so");
        System.out.println(PosixFilePermissions.toString(
                Files.getPosixFilePermissions(unpacked.getParent())));
        Unpacked.remove(unpacked);
    }
}
