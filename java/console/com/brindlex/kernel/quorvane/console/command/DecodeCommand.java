package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.client.Market;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.RawReply;
import com.brindlex.kernel.quorvane.console.ReplyValues;
import java.util.concurrent.Callable;
import picocli.CommandLine.Command;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.Parameters;
import picocli.CommandLine.ParentCommand;
import picocli.CommandLine.Spec;

/** Reads a reply. */
@Command(name = "decode", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Reads a reply and shows its rows.")
final class DecodeCommand implements Callable<Integer> {
    @ParentCommand
    private Quorvane parent;

    @Spec
    private CommandSpec spec;

    @Parameters(index = "0", paramLabel = "OPERATION", converter = Quorvane.OperationName.class,
            description = "The decoder, for example AuthDecode.")
    private Operation operation;

    @Parameters(index = "1", arity = "0..1", paramLabel = "FILE", defaultValue = "-",
            description = "The reply; the standard input without it or for '-'.")
    private String file;

    @Option(names = "--market", paramLabel = "INT", defaultValue = "0",
            description = "Market code, for the stock order book.")
    private int market;

    @Option(names = "--raw", description = "Write the bare result text.")
    private boolean raw;

    @Override
    public Integer call() {
        if (operation.isEncoder()) {
            throw new ParameterException(spec.commandLine(), operation.method()
                            + " builds requests; its replies are read by " + operation.decoders());
        }
        Terminal terminal = parent.terminal();
        // the line feed that ends a file is no part of the reply
        String reply = Terminal.read(spec, file).replaceFirst("\\r?\\n\\z", "");
        RawReply read = RawReply.of(operation, market(), reply);
        if (terminal.isJson()) {
            terminal.json(ReplyValues.of(read));
        } else if (raw) {
            terminal.raw(read.text());
        } else {
            Shown.reply(terminal, read);
        }
        return read.reply().isFailure() ? 1 : 0;
    }

    private Market market() {
        try {
            return Market.of(market);
        } catch (IllegalArgumentException none) {
            throw new ParameterException(spec.commandLine(), none.getMessage());
        }
    }
}
