package com.brindlex.kernel.quorvane;

import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.console.Demo;
import java.io.ByteArrayOutputStream;
import java.io.PrintStream;
import java.nio.charset.StandardCharsets;
import java.time.Clock;
import java.time.Duration;
import java.time.LocalDateTime;
import java.time.ZoneId;
import org.junit.jupiter.api.Test;

/** The session of scripts/demo: the library and the simulated gateway, on one stopped clock. */
class TradingSessionTest {
    private static final ZoneId ZONE = ZoneId.of("Asia/Taipei");
    private static final Clock CLOCK =
            Clock.fixed(LocalDateTime.of(2024, 1, 15, 13, 45, 21).atZone(ZONE).toInstant(), ZONE);

    private final ByteArrayOutputStream shown = new ByteArrayOutputStream();

    private boolean play(Clock gatewayClock) {
        Surroundings.enter(CLOCK.instant().getEpochSecond());
        try {
            PrintStream out = new PrintStream(shown, true, StandardCharsets.UTF_8);
            return Demo.play(out, false, gatewayClock);
        } finally {
            Surroundings.leave();
        }
    }

    @Test
    void everyOutcomeIsWhatItShouldBe() {
        assertTrue(play(CLOCK), () -> shown.toString(StandardCharsets.UTF_8));
    }

    @Test
    void aWrongOutcomeIsSeen() {
        assertFalse(play(Clock.offset(CLOCK, Duration.ofHours(1))));
    }
}
