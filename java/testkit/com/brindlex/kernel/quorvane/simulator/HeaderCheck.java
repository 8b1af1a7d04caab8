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

    private HeaderCheck() {}

    static void check(Request request, World world) throws Refusal {
        require(request.get("KIND").matches("[SF]"), "KIND");
        require(request.get("CB").equals("1"), "CB");
        require(request.get("VER").equals(VERSION), "VER");
        require(request.get("11").matches("NO DEFINE|[A-Z0-9]{1,8}"), "11");
        require(request.kind().variant == 2 || isAddress(request.get("IP")), "IP");
        // a serial number that fills its field runs on into the address
        require(request.get("SN").length() <= MAX_SERIAL + MAX_ADDRESS, "SN");
        require(request.get("65").matches("00[0-9]{8}"), "65");
        LocalTime sent = Texts.time(request.get("65").substring(2, 8), "65");
        if (request.has("21")) {
            checkTimeStamp(request);
        }
        if (world.tolerance != null) {
            checkClock(request, sent, world);
        }
    }

    private static boolean isAddress(String text) {
        return text.length() <= MAX_ADDRESS && text.matches("[0-9A-Fa-f.:]+(%[0-9A-Za-z]+)?");
    }

    /** The library stamps a request with the time of the device, which need not be the gateway's. */
    private static void checkClock(Request request, LocalTime sent, World world) throws Refusal {
        LocalDateTime now = world.now();
        long apart = Math.abs(Duration.between(sent, now.toLocalTime()).getSeconds());
        long aroundMidnight = Duration.ofDays(1).getSeconds() - apart;
        boolean late = Math.min(apart, aroundMidnight) > world.tolerance.getSeconds();
        if (request.has("21")) {
            LocalDate day = Texts.date(request.get("21"), "21");
            late |= Math.abs(day.toEpochDay() - now.toLocalDate().toEpochDay()) > 1;
        }
        if (late) {
            throw new Refusal(Refusal.Reason.WRONG_CLOCK);
        }
    }

    private static void checkTimeStamp(Request request) throws Refusal {
        String id = request.get("65").substring(2);
        require(request.get("22").equals(id.substring(0, 6)), "22");
        require(request.get("23").equals(id), "23");
        require(request.get("24").equals("5"), "24");
        require(request.get("V4").isEmpty(), "V4");
        Texts.date(request.get("21"), "21");
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
