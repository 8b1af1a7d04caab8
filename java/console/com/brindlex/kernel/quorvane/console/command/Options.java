package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.RawRequest;
import com.brindlex.kernel.quorvane.console.WrittenRequest;
import java.util.List;
import java.util.Locale;
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
                            .paramLabel(label(argument))
                            .required(given == null && !isPassword(argument))
                            .description(WrittenRequest.purpose(argument)
                                    + choices(operation, argument) + usually(given));
            spec.addOption(given == null ? option.build() : option.defaultValue(given).build());
        }
        return spec;
    }

    private static String label(Argument argument) {
        boolean amount = !WrittenRequest.purpose(argument).equals(argument.purpose());
        return amount ? "AMOUNT" : argument.type().name().replaceFirst(".*_", "");
    }

    private static String choices(Operation operation, Argument argument) {
        String choices = WrittenRequest.choices(operation, argument);
        return choices.isEmpty() ? "" : ": " + choices;
    }

    private static String usually(String given) {
        return given == null || given.isBlank() ? "" : "; usually " + given.replace("%", "%%");
    }

    /** Whether it stays off the command line, where everybody on the machine reads it. */
    static boolean isPassword(Argument argument) {
        return argument.name().toLowerCase(Locale.ROOT).endsWith("password");
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
        return WrittenRequest.of(operation, name -> {
            String written = written(parsed, name);
            if (written == null) {
                throw new IllegalArgumentException(name + " must be given");
            }
            return written;
        });
    }

    /** What was written for an argument; null when nothing was. */
    static String written(ParseResult parsed, String name) {
        return parsed.commandSpec().findOption("--" + dashed(name)).getValue();
    }

    /** All arguments of a native but the status array. */
    static List<Argument> all(Operation operation) {
        return WrittenRequest.arguments(operation);
    }
}
