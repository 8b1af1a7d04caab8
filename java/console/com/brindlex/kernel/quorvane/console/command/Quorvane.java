package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import java.util.ArrayList;
import java.util.List;
import picocli.CommandLine.Command;
import picocli.CommandLine.ITypeConverter;
import picocli.CommandLine.Option;
import picocli.CommandLine.ScopeType;
import picocli.CommandLine.TypeConversionException;
import picocli.CommandLine;

/** The message codec on the command line. */
@Command(name = "quorvane", mixinStandardHelpOptions = true, sortOptions = false,
        versionProvider = Quorvane.Version.class,
        description = "Builds requests, reads replies, and explains what a log holds of both.",
        footer = {"", "Exit codes: 0 done, 1 the operation failed or a line is damaged, 2 usage.",
                "",
                "  quorvane operations AuthEncode",
                "  quorvane encode AuthEncode --serial-no SN1 --local-ip 10.0.0.1 \\",
                "      --branch 9A01 --identity 'A123456789&1234567' --password pass1234",
                "  adb logcat -s gatewayjni | quorvane explain",
                "  quorvane timeline log.txt --failures",
                "  quorvane mask log.txt > log-to-send.txt",
                "  scripts/quorvane dictionary"},
        synopsisSubcommandLabel = "COMMAND")
public final class Quorvane {
    /** When colours are wanted. */
    enum Colour { AUTO, ALWAYS, NEVER }

    @Option(names = "--json", scope = ScopeType.INHERIT, description = "Write JSON.")
    private boolean json;

    @Option(names = {"--colour", "--color"}, scope = ScopeType.INHERIT, paramLabel = "WHEN",
            defaultValue = "auto", description = "Colours: auto, always or never.")
    private Colour colour;

    /** Runs a command and ends with its exit code. */
    public static void main(String[] arguments) {
        System.exit(commandLine().execute(arguments));
    }

    static CommandLine commandLine() {
        CommandLine root = new CommandLine(new Quorvane());
        root.addSubcommand(new OperationsCommand());
        root.addSubcommand(EncodeCommand.create(root));
        root.addSubcommand(new DecodeCommand());
        root.addSubcommand(new ExplainCommand());
        root.addSubcommand(new TimelineCommand());
        root.addSubcommand(new CheckCommand());
        root.addSubcommand(new MaskCommand());
        root.addSubcommand(new CompletionCommand());
        root.addSubcommand(new SimulateCommand());
        root.addSubcommand(new PageCommand());
        root.setCaseInsensitiveEnumValuesAllowed(true);
        root.setUsageHelpAutoWidth(true);
        root.setParameterExceptionHandler(Quorvane::badUsage);
        root.setExecutionExceptionHandler((failure, command, parsed) -> {
            command.getErr().println("quorvane: " + failure);
            return 1;
        });
        return root;
    }

    /** Says what is wrong and where help is, in two lines. */
    private static int badUsage(CommandLine.ParameterException bad, String[] arguments) {
        CommandLine command = bad.getCommandLine();
        command.getErr().println(command.getColorScheme().errorText(bad.getMessage()));
        if (!CommandLine.UnmatchedArgumentException.printSuggestions(bad, command.getErr())) {
            command.getErr().println("Try '" + command.getCommandSpec().qualifiedName()
                    + " --help'.");
        }
        return CommandLine.ExitCode.USAGE;
    }

    Terminal terminal() {
        boolean wanted = colour == Colour.ALWAYS
                || colour == Colour.AUTO && CommandLine.Help.Ansi.AUTO.enabled();
        return new Terminal(json, wanted && !json);
    }

    /** The version of the jar, and of the dictionary that all commands know the protocol by. */
    static final class Version implements CommandLine.IVersionProvider {
        @Override
        public String[] getVersion() {
            String jar = Quorvane.class.getPackage().getImplementationVersion();
            return new String[] {"quorvane " + (jar == null ? "(no jar)" : jar) + ", dictionary "
                    + Dictionary.get().version()};
        }
    }

    /** The name of an operation as the dictionary writes it, from one in any case. */
    static final class DictionaryOperation implements ITypeConverter<String> {
        @Override
        public String convert(String text) {
            for (var operation : Dictionary.get().operations()) {
                if (operation.name().equalsIgnoreCase(text)) {
                    return operation.name();
                }
            }
            throw new TypeConversionException("no operation '" + text
                    + "'; see quorvane operations");
        }
    }

    /** An operation by its name, whatever the case of its letters. */
    static final class OperationName implements ITypeConverter<Operation> {
        @Override
        public Operation convert(String text) {
            List<String> close = new ArrayList<>();
            for (Operation operation : Operation.values()) {
                if (operation.method().equalsIgnoreCase(text)) {
                    return operation;
                }
                if (operation.method().toLowerCase().contains(text.toLowerCase())) {
                    close.add(operation.method());
                }
            }
            throw new TypeConversionException("no operation '" + text + "'"
                    + (close.isEmpty() ? "; see quorvane operations"
                                       : "; is it " + String.join(", ", close) + "?"));
        }
    }
}
