package com.brindlex.kernel.quorvane.console;

import java.io.PrintStream;
import java.nio.charset.StandardCharsets;
import java.time.Clock;
import java.util.Arrays;

/**
 * Plays a whole trading session: the real library on one side, the simulated gateway on the other.
 *
 * <p>Every request, reply, result and status is shown, and held against what it should be. The
 * program ends with 1 when one of them is not.
 */
public final class Demo {
    private Demo() {}

    /**
     * Runs the session.
     *
     * @param arguments {@code --colour} for a terminal with colours
     */
    public static void main(String[] arguments) {
        PrintStream out = new PrintStream(System.out, true, StandardCharsets.UTF_8);
        Screen screen = new Screen(out, Arrays.asList(arguments).contains("--colour"));
        Stage stage = new Stage(screen, Clock.systemDefaultZone());
        DemoLogin.play(stage);
        DemoStocks.play(stage);
        DemoStockLists.play(stage);
        DemoFutures.play(stage);
        DemoAccount.play(stage);
        DemoCertificates.play(stage);
        System.exit(stage.close() ? 0 : 1);
    }
}
