package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.Market;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Platform;
import com.brindlex.kernel.quorvane.client.RawRequest;
import com.brindlex.kernel.quorvane.client.Session;
import java.util.ArrayList;
import java.util.List;
import java.util.Map;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Model.OptionSpec;
import picocli.CommandLine.ParseResult;

/** The options of a request, made from the table of operations. */
final class Options {
    private Options() {}

    /** The command that takes the arguments of an operation; {@code usual} fills in for some. */
    static CommandSpec command(Operation operation, Map<String, String> usual, Object user) {
        CommandSpec spec = CommandSpec.wrapWithoutInspection(user);
        spec.name(operation.method());
        spec.mixinStandardHelpOptions(true);
        spec.usageMessage().description("Builds the request: " + operation.title() + ".");
        spec.usageMessage().sortOptions(false);
        for (Argument argument : all(operation)) {
            String given = usual.getOrDefault(argument.name(), argument.usual());
            OptionSpec.Builder option =
                    OptionSpec.builder("--" + dashed(argument.name()))
                            .type(String.class)
                            .paramLabel(argument.type().name().replaceFirst(".*_", ""))
                            .required(given == null)
                            .description(argument.purpose() + (given == null || given.isBlank()
                                            ? "" : "; usually " + given.replace("%", "%%")));
            spec.addOption(given == null ? option.build() : option.defaultValue(given).build());
        }
        return spec;
    }

    /** {@code stockCode} is the option {@code --stock-code}. */
    static String dashed(String name) {
        return name.replaceAll("(?<=[a-z])(?=[A-Z])", "-").toLowerCase();
    }

    /**
     * The request of a parsed command.
     *
     * @throws IllegalArgumentException with the reason, when a value is none for its argument
     */
    static RawRequest request(Operation operation, ParseResult parsed) {
        List<Argument> device = Operation.sessionArguments();
        Session session = Session.of(text(parsed, device.get(3)), text(parsed, device.get(4)))
                                  .withMarket(Market.of(number(parsed, device.get(0))))
                                  .withPlatform(Platform.of(number(parsed, device.get(1))))
                                  .withSequence(number(parsed, device.get(2)));
        RawRequest request = RawRequest.of(operation, session);
        for (Argument argument : operation.arguments()) {
            request.set(argument.name(), text(parsed, argument));
        }
        return request;
    }

    /** All arguments of a native but the status array. */
    static List<Argument> all(Operation operation) {
        List<Argument> all = new ArrayList<>();
        if (operation.isEncoder()) {
            all.addAll(Operation.sessionArguments());
        }
        all.addAll(operation.arguments());
        return all;
    }

    private static String text(ParseResult parsed, Argument argument) {
        return parsed.commandSpec().findOption("--" + dashed(argument.name())).getValue();
    }

    private static int number(ParseResult parsed, Argument argument) {
        String text = text(parsed, argument);
        try {
            return Integer.parseInt(text);
        } catch (NumberFormatException wrong) {
            throw new IllegalArgumentException(
                    argument.name() + " must be a whole number, not '" + text + "'");
        }
    }
}
