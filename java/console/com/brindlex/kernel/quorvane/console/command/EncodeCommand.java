package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.client.InvalidRequestException;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.Problem;
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
        all.usageMessage().customSynopsis(
                "quorvane encode OPERATION [--json] [OPTION VALUE]...",
                "       quorvane encode OPERATION --help");
        CommandLine encode = new CommandLine(all);
        for (Operation operation : Operation.values()) {
            if (operation.isEncoder()) {
                EncodeCommand command = new EncodeCommand(root, operation);
                command.spec = Options.command(operation, Map.of(), command);
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
            String request = Options.request(operation, parsed).build().text();
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
}
