package com.brindlex.kernel.quorvane.console.page;

import java.io.IOException;
import java.io.InputStream;
import java.io.InterruptedIOException;
import java.nio.file.Files;
import java.nio.file.NoSuchFileException;
import java.nio.file.Path;
import java.nio.file.attribute.BasicFileAttributes;

/**
 * A file that others write on: its end is where more is waited for. A file that was emptied, or
 * that another one took the place of, is read from its begin, on a line of its own.
 */
final class FollowedFile extends InputStream {
    private static final long PAUSE_MILLIS = 200;

    private final Path file;
    private InputStream in;
    private Object key;
    private long position;
    private int last;
    private boolean isReplaced;
    private volatile boolean isClosed;

    FollowedFile(Path file) throws IOException {
        this.file = file;
        open();
    }

    private void open() throws IOException {
        in = Files.newInputStream(file);
        key = Files.readAttributes(file, BasicFileAttributes.class).fileKey();
        position = 0;
        last = 0;
        isReplaced = false;
    }

    @Override
    public int read() throws IOException {
        byte[] one = new byte[1];
        return read(one, 0, 1) < 0 ? -1 : one[0] & 0xFF;
    }

    @Override
    public int read(byte[] buffer, int offset, int length) throws IOException {
        try {
            while (!isClosed) {
                int count = in.read(buffer, offset, length);
                if (count >= 0) {
                    position += count;
                    last = count > 0 ? buffer[offset + count - 1] : last;
                    return count;
                }
                if (isReplaced) {  // and read to its end
                    int end = last;
                    in.close();
                    open();
                    if (end != '\n' && end != 0) {
                        buffer[offset] = '\n';
                        return 1;
                    }
                } else if (!isAnother()) {
                    Thread.sleep(PAUSE_MILLIS);
                }
            }
            return -1;
        } catch (InterruptedException ended) {
            Thread.currentThread().interrupt();
            throw new InterruptedIOException("no longer followed");
        }
    }

    /** Whether the file begins anew; the rest of the old one is still to be read. */
    private boolean isAnother() throws IOException {
        try {
            BasicFileAttributes now = Files.readAttributes(file, BasicFileAttributes.class);
            boolean another = key != null && !key.equals(now.fileKey());
            isReplaced = another || now.size() < position;
            return isReplaced;
        } catch (NoSuchFileException between) {
            return false;  // moved away, and not there again yet
        }
    }

    /** What waits for more ends. */
    @Override
    public void close() throws IOException {
        isClosed = true;
        in.close();
    }
}
