package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.typed.Argument;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Request;
import com.brindlex.kernel.quorvane.typed.Session;
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
        spec.usageMessage().description("Builds the request: " + operation.summary() + ".");
        spec.usageMessage().sortOptions(false);
        for (Argument argument : operation.allArguments()) {
            String given = usual.getOrDefault(argument.name(), argument.initial());
            OptionSpec.Builder option =
                    OptionSpec.builder("--" + dashed(argument.name()))
                            .type(String.class)
                            .paramLabel(argument.type().name().replaceFirst(".*_", ""))
                            .required(given == null)
                            .description(argument.meaning() + (given == null || given.isBlank()
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
    static Request request(Operation operation, ParseResult parsed) {
        List<Argument> all = operation.allArguments();
        int leading = all.size() - operation.arguments().size();
        Session session =
                Session.of(number(parsed, all.get(0)), number(parsed, all.get(1)),
                        text(parsed, all.get(3)), text(parsed, all.get(4)))
                        .withSequence(number(parsed, all.get(2)));
        Request request = new Request(operation, session);
        for (Argument argument : all.subList(leading, all.size())) {
            request.set(argument.name(), text(parsed, argument));
        }
        return request;
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
