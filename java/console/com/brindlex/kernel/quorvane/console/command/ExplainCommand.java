package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.Explainer;
import com.brindlex.kernel.quorvane.console.Explanation;
import com.brindlex.kernel.quorvane.typed.Operation;
import java.util.ArrayList;
import java.util.List;
import java.util.concurrent.Callable;
import picocli.CommandLine.Command;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Option;
import picocli.CommandLine.Parameters;
import picocli.CommandLine.ParentCommand;
import picocli.CommandLine.Spec;

/** Explains lines of a log. */
@Command(name = "explain", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Names every field of requests, replies and results, one to a line, and says "
                + "where a damaged one breaks.")
final class ExplainCommand implements Callable<Integer> {
    @ParentCommand
    private Quorvane parent;

    @Spec
    private CommandSpec spec;

    @Parameters(arity = "0..1", paramLabel = "FILE", defaultValue = "-",
            description = "The lines; the standard input without it or for '-'.")
    private String file;

    @Option(names = "--operation", paramLabel = "OPERATION",
            converter = Quorvane.OperationName.class,
            description = "The operation of the lines, where that is known.")
    private Operation operation;

    @Override
    public Integer call() {
        Terminal terminal = parent.terminal();
        List<Object> all = new ArrayList<>();
        boolean sound = true;
        for (String line : Terminal.read(spec, file).split("\\r?\\n")) {
            if (line.isBlank()) {
                continue;
            }
            Explanation explained = Explainer.explain(line, operation);
            sound &= explained.faults().isEmpty();
            all.add(Shown.json(explained));
            if (!terminal.isJson()) {
                Shown.explanation(terminal, explained);
            }
        }
        if (terminal.isJson()) {
            terminal.json(all);
        } else if (all.isEmpty()) {
            terminal.error("nothing to explain");
            return 1;
        }
        return sound ? 0 : 1;
    }
}
