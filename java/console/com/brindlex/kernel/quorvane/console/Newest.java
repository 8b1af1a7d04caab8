package com.brindlex.kernel.quorvane.console;

import java.util.LinkedHashMap;
import java.util.Map;

/** What was asked for last: so many entries; the one that nobody used longest goes first. */
public final class Newest<K, V> extends LinkedHashMap<K, V> {
    private static final long serialVersionUID = 1;

    private final int most;

    /** Holds {@code most} entries. */
    public Newest(int most) {
        super(16, 0.75f, true);
        this.most = most;
    }

    @Override
    protected boolean removeEldestEntry(Map.Entry<K, V> eldest) {
        return size() > most;
    }
}
