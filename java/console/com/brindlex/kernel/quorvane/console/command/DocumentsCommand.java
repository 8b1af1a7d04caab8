package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.console.Documents;
import java.io.IOException;
import java.nio.file.Files;
import java.nio.file.Path;
import java.util.concurrent.Callable;
import picocli.CommandLine.Command;
import picocli.CommandLine.Model.CommandSpec;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.Parameters;
import picocli.CommandLine.ParentCommand;
import picocli.CommandLine.Spec;

/** Writes the tables of the documents anew. */
@Command(name = "documents", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Writes the tables of operations.md and results.md anew; what people wrote "
                + "above them stays.")
final class DocumentsCommand implements Callable<Integer> {
    @ParentCommand
    private Quorvane parent;

    @Spec
    private CommandSpec spec;

    @Parameters(arity = "0..1", paramLabel = "DIRECTORY", defaultValue = "docs",
            description = "Where the documents are: docs.")
    private Path directory;

    @Override
    public Integer call() {
        try {
            for (String name : Documents.names()) {
                Path document = directory.resolve(name);
                Files.writeString(document, Documents.renewed(document));
                parent.terminal().line(document.toString());
            }
            return 0;
        } catch (IOException broken) {
            throw new ParameterException(spec.commandLine(), "cannot renew " + broken.getMessage());
        }
    }
}
