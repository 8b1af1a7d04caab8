package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.InvalidRequestException;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Problem;
import com.brindlex.kernel.quorvane.console.WrittenRequest;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;
import java.util.concurrent.Callable;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.ParseResult;
import picocli.CommandLine;

/** Builds one request; there is one such command for each encoder. */
final class EncodeCommand implements Callable<Integer> {
    private static final String[] VALUES = {
        "", "Values are written as people write them: --side BUY, --price 600 or 600.5, "
            + "--date 2026-11-21, --quantity '2 lots'. A price as the library takes it is written "
            + "with its unit: --price '60050 hundredths', for futures '180005000 "
            + "ten-thousandths'.",
        "Passwords that are not given are asked for, without showing them; where there is no "
            + "terminal, and for '-', each is a line of the standard input."};

    private final CommandLine root;
    private final Operation operation;
    private CommandSpec spec;

    private EncodeCommand(CommandLine root, Operation operation) {
        this.root = root;
        this.operation = operation;
    }

    /** The command that holds one command for each encoder. */
    static CommandLine create(CommandLine root) {
        CommandSpec all = CommandSpec.create().name("encode");
        all.mixinStandardHelpOptions(true);
        all.usageMessage().description("Builds a request and writes it.");
        all.usageMessage().footer(VALUES);
        all.usageMessage().customSynopsis(
                "quorvane encode OPERATION [--json] [OPTION VALUE]...",
                "       quorvane encode OPERATION --help");
        CommandLine encode = new CommandLine(all);
        for (Operation operation : Operation.values()) {
            if (operation.isEncoder()) {
                EncodeCommand command = new EncodeCommand(root, operation);
                command.spec = Options.command(operation, Map.of(), command);
                command.spec.usageMessage().footer(VALUES);
                encode.addSubcommand(operation.method(), command.spec);
            }
        }
        return encode.setSubcommandsCaseInsensitive(true);
    }

    @Override
    public Integer call() {
        Quorvane parent = root.getCommand();
        Terminal terminal = parent.terminal();
        Map<String, Object> map = new LinkedHashMap<>();
        map.put("operation", operation.method());
        try {
            ParseResult parsed = spec.commandLine().getParseResult();
            Map<String, String> passwords = passwords(parsed);
            String request = WrittenRequest.of(operation, name -> passwords.containsKey(name)
                    ? passwords.get(name) : Options.written(parsed, name)).build().text();
            map.put("request", request);
            if (!terminal.isJson()) {
                terminal.raw(request);
            }
        } catch (InvalidRequestException refused) {
            List<String> problems = refused.problems().stream().map(Problem::toString).toList();
            map.put("problems", problems);
            if (!terminal.isJson()) {
                problems.forEach(terminal::error);
            }
        } catch (IllegalArgumentException bad) {
            throw new ParameterException(spec.commandLine(), bad.getMessage());
        }
        if (terminal.isJson()) {
            terminal.json(map);
        }
        return map.containsKey("request") ? 0 : 1;
    }

    /** The passwords that were not given, or given as {@code -}: asked for, else read by lines. */
    private Map<String, String> passwords(ParseResult parsed) {
        Map<String, String> passwords = new LinkedHashMap<>();
        for (Argument argument : Options.all(operation)) {
            String written = Options.isPassword(argument)
                    ? Options.written(parsed, argument.name()) : "";
            if (written == null || Options.isPassword(argument) && written.equals("-")) {
                boolean prompt = written == null && System.console() != null;
                String password = prompt ? Terminal.prompt(argument.purpose())
                                         : Terminal.readLine();
                if (password == null) {
                    throw new IllegalArgumentException(argument.name()
                            + " must be given: at the prompt, or as a line of the standard input");
                }
                passwords.put(argument.name(), password);
            }
        }
        return passwords;
    }
}
