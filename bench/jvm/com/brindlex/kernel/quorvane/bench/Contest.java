package com.brindlex.kernel.quorvane.bench;

import java.lang.management.ManagementFactory;
import java.lang.management.ThreadMXBean;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.List;
import java.util.function.Supplier;

/**
 * Measures several ways of doing one thing side by side: all are warmed up first, then they take
 * turns, and the median of the turns counts, of a ratio as of a time. Time is the thread's own, so
 * that other programs and the collector's threads do not count.
 */
final class Contest {
    private static final long TURN_NANOS = 1_000_000L;
    private static final int TURNS = 201;

    private static final ThreadMXBean THREADS = ManagementFactory.getThreadMXBean();

    /** Results go here, so that no call can be left out. */
    private static volatile Object sink;

    private static final class Contestant {
        final Supplier<?> call;
        final double[] turns = new double[TURNS];
        long repeats = 1;

        Contestant(Supplier<?> call) {
            this.call = call;
        }
    }

    private final List<Contestant> contestants = new ArrayList<>();
    private final long warmUpNanos;

    /** A contest without ways yet, each of which is warmed up for so long. */
    Contest(long warmUpNanos) {
        this.warmUpNanos = warmUpNanos;
    }

    /** Adds a way. */
    Contest add(Supplier<?> call) {
        contestants.add(new Contestant(call));
        return this;
    }

    /** Measures all. */
    Contest run() {
        for (Contestant contestant : contestants) {
            warmUp(contestant);
        }
        for (int turn = 0; turn < TURNS; turn++) {
            for (int i = 0; i < contestants.size(); i++) {
                // The order turns with the turns: none is always the one that comes after another.
                Contestant contestant = contestants.get((i + turn) % contestants.size());
                long nanos = time(contestant.call, contestant.repeats);
                contestant.turns[turn] = (double) nanos / contestant.repeats;
            }
        }
        return this;
    }

    /** The time of one call of a way, in nanoseconds; ways are numbered from 0. */
    double time(int way) {
        return median(contestants.get(way).turns);
    }

    /** The ratio of the times of two ways. */
    double ratio(int way, int against) {
        double[] ratios = contestants.get(way).turns.clone();
        for (int turn = 0; turn < TURNS; turn++) {
            ratios[turn] /= contestants.get(against).turns[turn];
        }
        return median(ratios);
    }

    private void warmUp(Contestant contestant) {
        long calls = 0;
        long spent = 0;
        while (spent < warmUpNanos || calls < 3) {
            spent += time(contestant.call, 1 + calls / 8);
            calls += 1 + calls / 8;
        }
        contestant.repeats = Math.max(1, calls * TURN_NANOS / spent);
    }

    private static long time(Supplier<?> call, long repeats) {
        long start = THREADS.getCurrentThreadCpuTime();
        for (long i = 0; i < repeats; i++) {
            sink = call.get();
        }
        return THREADS.getCurrentThreadCpuTime() - start;
    }

    private static double median(double[] values) {
        double[] sorted = values.clone();
        Arrays.sort(sorted);
        return sorted[sorted.length / 2];
    }
}
