package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.typed.Encoded;
import com.brindlex.kernel.quorvane.typed.Operation;
import java.util.LinkedHashMap;
import java.util.Map;
import java.util.concurrent.Callable;
import picocli.CommandLine;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.ParameterException;

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
        Encoded encoded;
        try {
            encoded = Options.request(operation, spec.commandLine().getParseResult()).encode();
        } catch (IllegalArgumentException bad) {
            throw new ParameterException(spec.commandLine(), bad.getMessage());
        }
        if (terminal.isJson()) {
            Map<String, Object> map = new LinkedHashMap<>();
            map.put("operation", operation.method());
            map.put("status", encoded.status());
            map.put(encoded.isSuccess() ? "request" : "message", encoded.text());
            terminal.json(map);
        } else if (encoded.isSuccess()) {
            terminal.raw(encoded.text());
        } else {
            terminal.error(encoded.text());
        }
        return encoded.isSuccess() ? 0 : 1;
    }
}
