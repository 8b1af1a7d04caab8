package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.client.ReplyException;
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
        boolean colours = Arrays.asList(arguments).contains("--colour");
        System.exit(play(out, colours, Clock.systemDefaultZone()) ? 0 : 1);
    }

    /**
     * Plays the session.
     *
     * @param out where everything is shown
     * @param colours whether {@code out} understands terminal colours
     * @param clock the gateway's clock; the library reads the clock of the system
     * @return whether every outcome was what it should be
     */
    public static boolean play(PrintStream out, boolean colours, Clock clock) {
        Stage stage = new Stage(new Screen(out, colours), clock);
        try {
            DemoLogin.play(stage);
            DemoStocks.play(stage);
            DemoStockLists.play(stage);
            DemoFutures.play(stage);
            DemoAccount.play(stage);
            DemoCertificates.play(stage);
        } catch (ReplyException noResult) {
            // what went wrong is shown where it did; nothing behind it can be played
        }
        return stage.close();
    }
}
