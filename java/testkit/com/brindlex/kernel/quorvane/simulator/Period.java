package com.brindlex.kernel.quorvane.simulator;

import java.time.LocalDate;
import java.time.LocalDateTime;

/** The days from a first to a last one, both included. */
final class Period {
    private static final int WESTERN = 8;

    private final LocalDate first;
    private final LocalDate last;

    Period(LocalDate first, LocalDate last) {
        this.first = first;
        this.last = last;
    }

    /** The period of a query, in either calendar. */
    static Period of(Request request) throws Refusal {
        return new Period(Texts.date(request.get("SDATE"), "SDATE"),
                Texts.date(request.get("EDATE"), "EDATE"));
    }

    /** The period of a query that must name it in the Western calendar. */
    static Period ofWestern(Request request) throws Refusal {
        if (request.get("SDATE").length() != WESTERN || request.get("EDATE").length() != WESTERN) {
            throw Refusal.malformed("SDATE");
        }
        return of(request);
    }

    boolean contains(LocalDateTime time) {
        LocalDate day = time.toLocalDate();
        return !day.isBefore(first) && !day.isAfter(last);
    }
}
