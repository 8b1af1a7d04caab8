package com.brindlex.kernel.quorvane.console.command;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.Brokerage;
import com.brindlex.kernel.quorvane.client.InvalidRequestException;
import com.brindlex.kernel.quorvane.client.Market;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.RawReply;
import com.brindlex.kernel.quorvane.console.ReplyValues;
import com.brindlex.kernel.quorvane.console.Screen.Style;
import com.brindlex.kernel.quorvane.console.WrittenRequest;
import com.brindlex.kernel.quorvane.console.message.Kind;
import com.brindlex.kernel.quorvane.console.message.Message;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import com.brindlex.kernel.quorvane.simulator.Line;
import java.io.BufferedReader;
import java.io.IOException;
import java.io.InputStreamReader;
import java.nio.charset.StandardCharsets;
import java.time.Duration;
import java.util.ArrayList;
import java.util.HashMap;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;
import java.util.concurrent.Callable;
import java.util.regex.Matcher;
import java.util.regex.Pattern;
import picocli.CommandLine.Command;
import picocli.CommandLine.Option;
import picocli.CommandLine.ParameterException;
import picocli.CommandLine.ParentCommand;
import picocli.CommandLine;

/** Talks to the gateway simulator, line by line. */
@Command(name = "simulate", mixinStandardHelpOptions = true, sortOptions = false,
        description = "Opens a session with the gateway simulator: each line is an operation with "
                + "its options, a request as it stands, or something that happens at the exchange.")
final class SimulateCommand implements Callable<Integer> {
    private static final Duration TOLERANCE = Duration.ofMinutes(10);
    private static final Pattern WORD = Pattern.compile("'([^']*)'|\"([^\"]*)\"|(\\S+)");
    private static final String[][] HELP = {
        {"AuthEncode", "send a request; options as of 'quorvane encode', user and device are set"},
        {"F=7|KIND=...", "send a request as it stands"},
        {"set NAME VALUE", "set an option for all requests: set password secret99"},
        {"fill ORDER SHARES PRICE", "the exchange fills a stock order"},
        {"fill-futures ORDER CONTRACTS PRICE [PRICE2]", "the exchange fills a futures order"},
        {"fail ORDER TEXT", "the exchange refuses a stock order"},
        {"fail-futures ORDER TEXT", "the exchange refuses a futures order"},
        {"line up|gateway_down|broker_timeout|silent", "the way to the host"},
        {"notice [TEXT]", "the notice that comes with a login"},
        {"operations", "name the requests"},
        {"quit", "end the session"},
    };

    @ParentCommand
    private Quorvane parent;

    @Option(names = "--brokerage", paramLabel = "NAME", defaultValue = "STANDARD",
            description = "Reply layouts: STANDARD or JZG.")
    private Brokerage brokerage;

    private final Map<String, String> usual = new HashMap<>();
    private Terminal terminal;
    private Gateway gateway;
    private int sequence;

    @Override
    public Integer call() throws IOException {
        terminal = parent.terminal();
        gateway = Gateway.readyMade().tolerance(TOLERANCE).brokerage(brokerage).build();
        usual.putAll(WrittenRequest.sample());
        boolean interactive = System.console() != null && !terminal.isJson();
        if (interactive) {
            terminal.line("The gateway is up. 'help' says what it takes, 'quit' ends the session.");
        }
        BufferedReader in =
                new BufferedReader(new InputStreamReader(System.in, StandardCharsets.UTF_8));
        boolean sound = true;
        while (true) {
            if (interactive) {
                System.out.print("quorvane> ");
                System.out.flush();
            }
            String line = in.readLine();
            if (line == null || line.strip().equals("quit") || line.strip().equals("exit")) {
                return interactive || sound ? 0 : 1;
            }
            if (!line.isBlank() && !line.startsWith("#")) {
                sound &= take(line.strip());
            }
        }
    }

    private boolean take(String line) {
        if (line.startsWith("F=")) {
            // three requests end with a line feed, which reading by lines takes away
            boolean feed = line.matches("F=7\\|.*FUNC=(2|3|x\\|FUNC1=1)\\|.*");
            return sendRaw(feed ? line + "\n" : line);
        }
        List<String> words = new ArrayList<>();
        Matcher word = WORD.matcher(line);
        while (word.find()) {
            words.add(word.group(1) != null ? word.group(1)
                            : word.group(2) != null ? word.group(2) : word.group(3));
        }
        try {
            Operation operation = find(words.get(0));
            return operation == null ? act(words) : send(operation, words.subList(1, words.size()));
        } catch (ParameterException | IllegalArgumentException bad) {
            terminal.error(bad.getMessage());
        } catch (IndexOutOfBoundsException missing) {
            terminal.error("a word is missing; see 'help'");
        }
        return false;
    }

    /** {@code AuthEncode}, or {@code auth} for short. */
    private static Operation find(String name) {
        for (Operation operation : Operation.values()) {
            if (operation.isEncoder() && (operation.method().equalsIgnoreCase(name)
                            || operation.method().equalsIgnoreCase(name + "Encode"))) {
                return operation;
            }
        }
        return null;
    }

    private boolean act(List<String> words) {
        switch (words.get(0).toLowerCase(Locale.ROOT)) {
            case "help":
                for (String[] row : HELP) {
                    terminal.line(String.format("  %-46s %s", row[0], row[1]));
                }
                return true;
            case "operations":
                for (Operation operation : Operation.values()) {
                    if (operation.isEncoder()) {
                        terminal.line(String.format("  %-26s %s", operation, operation.title()));
                    }
                }
                return true;
            case "set":
                usual.put(known(words.get(1)), words.get(2));
                return true;
            case "fill":
                gateway.fillStock(words.get(1), Long.parseLong(words.get(2)),
                        WrittenRequest.stockPrice(words.get(3)));
                return true;
            case "fill-futures":
                gateway.fillFutures(words.get(1), Long.parseLong(words.get(2)), words.get(3),
                        words.size() > 4 ? words.get(4) : "");
                return true;
            case "fail":
                gateway.failStock(words.get(1), words.get(2));
                return true;
            case "fail-futures":
                gateway.failFutures(words.get(1), words.get(2));
                return true;
            case "line":
                gateway.setLine(Line.valueOf(words.get(1).toUpperCase(Locale.ROOT)));
                return true;
            case "notice":
                gateway.setNotice(String.join(" ", words.subList(1, words.size())));
                return true;
            default:
                terminal.error("not understood: " + words.get(0) + "; see 'help'");
                return false;
        }
    }

    /** The name of an argument, from its name or that of its option. */
    private static String known(String name) {
        for (Operation operation : Operation.values()) {
            for (Argument argument : Options.all(operation)) {
                boolean option = Options.dashed(argument.name()).equals(name);
                if (option || argument.name().equals(name)) {
                    return argument.name();
                }
            }
        }
        throw new IllegalArgumentException("no option " + name);
    }

    private boolean send(Operation operation, List<String> options) {
        usual.put("seqNo", String.valueOf(sequence++));
        CommandLine command = new CommandLine(
                Options.command(operation, usual, (Callable<Integer>) () -> 0));
        CommandLine.ParseResult parsed = command.parseArgs(options.toArray(new String[0]));
        if (parsed.isUsageHelpRequested()) {
            command.usage(System.out);
            return true;
        }
        String request;
        try {
            request = Options.request(operation, parsed).build().text();
        } catch (InvalidRequestException refused) {
            refused.problems().forEach(problem -> terminal.error(problem.toString()));
            return false;
        }
        String reply = gateway.answer(request);
        List<Operation> readers = operation.decoders();
        Operation reader = readers.get(brokerage == Brokerage.JZG ? readers.size() - 1 : 0);
        return show(request, reply, RawReply.of(reader, Market.SECURITIES, reply));
    }

    private boolean sendRaw(String request) {
        String reply = gateway.answer(request);
        Message read = MessageReader.read(request);
        List<Operation> readers = read.kind() != Kind.REQUEST ? List.of()
                : Operation.named(read.operation()).decoders();
        return show(request, reply, readers.isEmpty()
                        ? null : RawReply.of(readers.get(0), Market.SECURITIES, reply));
    }

    private boolean show(String request, String reply, RawReply read) {
        if (terminal.isJson()) {
            Map<String, Object> map = new LinkedHashMap<>();
            map.put("request", request);
            map.put("reply", reply);
            map.put("result", read == null ? null : ReplyValues.of(read));
            terminal.json(map);
        } else {
            terminal.screen().labelled("request", Style.DIM, request.strip());
            terminal.screen().labelled("reply", Style.DIM, reply);
            if (read != null) {
                terminal.screen().labelled("result",
                        read.reply().isFailure() ? Style.BAD : Style.GOOD,
                        read.text().isEmpty() ? "(done)" : read.text());
                Shown.reply(terminal, read);
            }
        }
        return read != null && !read.reply().isFailure();
    }
}
