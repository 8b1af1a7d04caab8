package com.brindlex.kernel.quorvane.simulator;

import java.time.Duration;
import java.time.LocalDate;
import java.time.LocalDateTime;
import java.time.LocalTime;

/** Judges the values of a header: version, edition, address, request id and time stamp. */
final class HeaderCheck {
    private static final String VERSION = "24369";
    private static final int MAX_SERIAL = 20;
    private static final int MAX_ADDRESS = 64;

    /** A device may be this far from the gateway's clock. */
    private static final Duration TOLERANCE = Duration.ofMinutes(10);

    private HeaderCheck() {}

    static void check(Request request, LocalDateTime now) throws Refusal {
        require(request.get("KIND").matches("[SF]"), "KIND");
        require(request.get("CB").equals("1"), "CB");
        require(request.get("VER").equals(VERSION), "VER");
        require(request.get("11").matches("NO DEFINE|[A-Z0-9]{1,8}"), "11");
        require(request.kind().variant == 2 || isAddress(request.get("IP")), "IP");
        // a serial number that fills its field runs on into the address
        require(request.get("SN").length() <= MAX_SERIAL + MAX_ADDRESS, "SN");
        require(request.get("65").matches("00[0-9]{8}"), "65");
        checkClock(Texts.time(request.get("65").substring(2, 8), "65"), now);
        if (request.has("21")) {
            checkTimeStamp(request, now.toLocalDate());
        }
    }

    private static boolean isAddress(String text) {
        return text.length() <= MAX_ADDRESS && text.matches("[0-9A-Fa-f.:]+(%[0-9A-Za-z]+)?");
    }

    private static void checkClock(LocalTime sent, LocalDateTime now) throws Refusal {
        long apart = Math.abs(Duration.between(sent, now.toLocalTime()).getSeconds());
        long aroundMidnight = Duration.ofDays(1).getSeconds() - apart;
        if (Math.min(apart, aroundMidnight) > TOLERANCE.getSeconds()) {
            throw new Refusal(Refusal.Reason.WRONG_CLOCK);
        }
    }

    private static void checkTimeStamp(Request request, LocalDate today) throws Refusal {
        String id = request.get("65").substring(2);
        require(request.get("22").equals(id.substring(0, 6)), "22");
        require(request.get("23").equals(id), "23");
        require(request.get("24").equals("5"), "24");
        require(request.get("V4").isEmpty(), "V4");
        LocalDate sent = Texts.date(request.get("21"), "21");
        if (Math.abs(sent.toEpochDay() - today.toEpochDay()) > 1) {
            throw new Refusal(Refusal.Reason.WRONG_CLOCK);
        }
        if (request.has("44")) {
            require(request.get("44").length() == 8, "44");
            Texts.date(request.get("44"), "44");
        }
    }

    private static void require(boolean holds, String tag) throws Refusal {
        if (!holds) {
            throw Refusal.malformed(tag);
        }
    }
}
