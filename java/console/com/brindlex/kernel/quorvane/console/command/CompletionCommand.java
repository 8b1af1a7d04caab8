package com.brindlex.kernel.quorvane.console.command;

import java.util.concurrent.Callable;
import picocli.AutoComplete;
import picocli.CommandLine.Command;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.Spec;

/** Writes what a shell completes commands and options by. */
@Command(name = "completion", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Writes the completion of commands and options, for bash and zsh.",
        footer = {"",
                "  alias quorvane=scripts/quorvane",
                "  source <(scripts/quorvane completion)"})
final class CompletionCommand implements Callable<Integer> {
    @Spec
    private CommandSpec spec;

    @Override
    public Integer call() {
        new Output().write(AutoComplete.bash("quorvane", spec.root().commandLine()));
        return 0;
    }
}
