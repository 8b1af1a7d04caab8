package com.brindlex.kernel.quorvane.console.page;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.InvalidRequestException;
import com.brindlex.kernel.quorvane.client.Market;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.RawReply;
import com.brindlex.kernel.quorvane.console.ReplyValues;
import com.brindlex.kernel.quorvane.console.WrittenRequest;
import com.brindlex.kernel.quorvane.console.dictionary.CodeTable;
import com.brindlex.kernel.quorvane.console.dictionary.Dictionary;
import com.brindlex.kernel.quorvane.console.message.Message;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** Forms of all operations, and what the library makes of what is written in them. */
final class TryPlace {
    private static final Map<String, String> SAMPLE = WrittenRequest.sample();

    /** The futures account of the same customer. */
    private static final Map<String, String> FUTURES_SAMPLE =
            Map.of("branch", "F001", "identity", "A123456789&7654321");

    Map<String, PageServer.Place> places() {
        return Map.of("GET api/forms", question -> Answer.json(forms()),
                "POST api/encode", question -> Answer.json(encode(question.texts())),
                "POST api/decode", question -> Answer.json(decode(question.texts())));
    }

    private static List<Object> forms() {
        List<Object> forms = new ArrayList<>();
        for (Operation operation : Operation.values()) {
            Map<String, Object> form = new LinkedHashMap<>();
            form.put("name", operation.method());
            form.put("title", operation.title());
            form.put("encoder", operation.isEncoder());
            List<Object> inputs = new ArrayList<>();
            if (operation.isEncoder()) {
                WrittenRequest.arguments(operation).forEach(
                        each -> inputs.add(input(operation, each)));
            }
            form.put("inputs", inputs);
            forms.add(form);
        }
        return forms;
    }

    private static Map<String, Object> input(Operation operation, Argument argument) {
        var known = Dictionary.get().operation(operation.method()).argument(argument.name());
        Map<String, Object> input = new LinkedHashMap<>();
        input.put("name", argument.name());
        input.put("purpose", WrittenRequest.purpose(argument).replace("`", ""));
        input.put("required", argument.usual() == null);
        String example = known == null || known.example() == null ? "" : known.example();
        String usual = sample(operation, argument.name());
        input.put("usual", usual != null ? usual
                : argument.usual() == null ? example : argument.usual());
        List<Object> codes = known == null || known.codes() == null
                ? List.of() : codes(operation, Dictionary.get().codes(known.codes()));
        input.put("codes", codes);
        return input;
    }

    /** What the simulated gateway's customer would write; null where that is the usual value. */
    static String sample(Operation operation, String argument) {
        boolean futures = Dictionary.get().operation(operation.method()).isFutures();
        String own = futures ? FUTURES_SAMPLE.get(argument) : null;
        return own == null ? SAMPLE.get(argument) : own;
    }

    /** The codes to choose from; none where a row of the table stands for a range of them. */
    private static List<Object> codes(Operation operation, CodeTable table) {
        List<Object> codes = new ArrayList<>();
        for (CodeTable.Code each : table.values()) {
            if (each.code().strip().contains(" ")) {
                return List.of();
            }
            boolean fits = each.only() == null
                    || List.of(each.only().split(" ")).contains(operation.method());
            if (fits && !each.listsOnly()) {
                codes.add(Map.of("code", each.code(), "label", each.label()));
            }
        }
        return codes;
    }

    /** The operation that a request names. */
    static Operation operation(Map<String, String> texts) {
        return Operation.named(texts.getOrDefault("operation", ""));
    }

    private static Map<String, Object> encode(Map<String, String> texts) {
        Operation operation = operation(texts);
        Map<String, Object> value = new LinkedHashMap<>();
        try {
            Map<String, String> understood =
                    WrittenRequest.understood(operation, name -> text(texts, name));
            value.put("copies", Copies.of(operation, understood));
            String request = WrittenRequest.of(operation, understood::get).build().text();
            Message message = MessageReader.read(request);
            value.put("text", request);
            value.put("message", TakenApart.of(message, message.faults()));
        } catch (InvalidRequestException refused) {
            value.put("problems", problems(refused));
        } catch (WrittenRequest.NotUnderstood refused) {
            value.put("problems", problems(refused));
        }
        return value;
    }

    /** Why a request cannot be sent, by argument. */
    static List<Map<String, String>> problems(InvalidRequestException refused) {
        return refused.problems().stream().map(each -> Map.of(
                "argument", each.argument(), "reason", each.reason())).toList();
    }

    /** Why a value is not understood, at its argument. */
    static List<Map<String, String>> problems(WrittenRequest.NotUnderstood refused) {
        return List.of(Map.of("argument", refused.argument(), "reason", refused.reason()));
    }

    /** What was written for an argument. */
    static String text(Map<String, String> texts, String name) {
        String text = texts.get(name);
        if (text == null) {
            throw new IllegalArgumentException(name + " must be there");
        }
        return text;
    }

    private static Map<String, Object> decode(Map<String, String> texts) {
        Operation operation = operation(texts);
        if (operation.isEncoder()) {
            throw new IllegalArgumentException(operation + " reads no replies");
        }
        String reply = text(texts, "reply");
        Map<String, Object> value = new LinkedHashMap<>();
        value.put("result", ReplyValues.of(RawReply.of(operation, Market.SECURITIES, reply)));
        Message message = MessageReader.read(reply, List.of(operation.method()));
        value.put("text", reply);
        value.put("message", TakenApart.of(message, message.faults()));
        value.put("copies", Copies.ofReply(operation, reply));
        return value;
    }
}
