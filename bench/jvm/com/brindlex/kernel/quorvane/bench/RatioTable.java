package com.brindlex.kernel.quorvane.bench;

import java.util.ArrayList;
import java.util.List;
import java.util.Locale;

/** Prints ratios as they become known, each with what is asked of it. */
final class RatioTable {
    private final List<String> json = new ArrayList<>();
    private int asked;
    private int missed;

    /** Opens a group of rows. */
    void group(String title) {
        System.out.printf(
                "%n%-54s %9s  %-8s %-8s %-8s %11s %11s%n",
                title, "ratio", "target", "aim", "", "measured", "against");
    }

    /** A row without a target: the time of one way of {@code contest} against another's. */
    void tell(String label, Contest contest, int way, int against) {
        row(label, contest, way, against, "", 0, 0, "");
    }

    /** A row whose ratio is to be at most {@code target}, or better at most {@code aim}. */
    void atMost(
            String label, Contest contest, int way, int against, double target, double aim) {
        double ratio = contest.ratio(way, against);
        row(label, contest, way, against, "<= ", target, aim,
                verdict(ratio <= target, aim > 0 && ratio <= aim));
    }

    /** A row whose ratio is to be at least {@code target}. */
    void atLeast(String label, Contest contest, int way, int against, double target) {
        row(label, contest, way, against, ">= ", target, 0,
                verdict(contest.ratio(way, against) >= target, false));
    }

    /** Prints how many targets were met; the rows as a JSON array. */
    String finish() {
        System.out.printf("%n%d of %d targets met%n", asked - missed, asked);
        return "[\n" + String.join(",\n", json) + "\n]\n";
    }

    boolean allMet() {
        return missed == 0;
    }

    private String verdict(boolean target, boolean aim) {
        asked++;
        if (!target) {
            missed++;
            return "MISSED";
        }
        return aim ? "aim met" : "met";
    }

    private void row(
            String label, Contest contest, int way, int other, String sense, double target,
            double aim, String verdict) {
        double ratio = contest.ratio(way, other);
        double measured = contest.time(way);
        double against = contest.time(other);
        System.out.printf(
                Locale.ROOT, "  %-52s %9.2f  %-8s %-8s %-8s %11s %11s%n", label, ratio,
                bound(sense, target), bound(sense, aim), verdict, time(measured), time(against));
        json.add(String.format(
                Locale.ROOT,
                "  {\"case\": \"%s\", \"ratio\": %.4f, \"target\": %.2f, \"aim\": %.2f, "
                        + "\"verdict\": \"%s\", \"measured_ns\": %.1f, \"against_ns\": %.1f}",
                label, ratio, target, aim, verdict, measured, against));
    }

    private static String bound(String sense, double bound) {
        return bound == 0 ? "" : sense + (bound == Math.rint(bound) ? "" + (int) bound : "" + bound);
    }

    private static String time(double nanos) {
        if (nanos < 1e3) {
            return String.format(Locale.ROOT, "%.1f ns", nanos);
        } else if (nanos < 1e6) {
            return String.format(Locale.ROOT, "%.2f us", nanos / 1e3);
        }
        return String.format(Locale.ROOT, "%.2f ms", nanos / 1e6);
    }
}
