package com.brindlex.kernel.quorvane.console.page;

import java.io.IOException;
import java.io.InputStream;
import java.io.InterruptedIOException;
import java.nio.file.Files;
import java.nio.file.Path;

/** A file that others write on: its end is where more is waited for. */
final class FollowedFile extends InputStream {
    private static final long PAUSE_MILLIS = 200;

    private final InputStream in;

    FollowedFile(Path file) throws IOException {
        in = Files.newInputStream(file);
    }

    @Override
    public int read() throws IOException {
        byte[] one = new byte[1];
        return read(one, 0, 1) < 0 ? -1 : one[0] & 0xFF;
    }

    @Override
    public int read(byte[] buffer, int offset, int length) throws IOException {
        try {
            while (true) {
                int count = in.read(buffer, offset, length);
                if (count >= 0) {
                    return count;
                }
                Thread.sleep(PAUSE_MILLIS);
            }
        } catch (InterruptedException ended) {
            Thread.currentThread().interrupt();
            throw new InterruptedIOException("no longer followed");
        }
    }

    @Override
    public void close() throws IOException {
        in.close();
    }
}
