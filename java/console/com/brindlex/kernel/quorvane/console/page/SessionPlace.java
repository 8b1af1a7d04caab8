package com.brindlex.kernel.quorvane.console.page;

import com.brindlex.kernel.quorvane.client.Argument;
import com.brindlex.kernel.quorvane.client.InvalidRequestException;
import com.brindlex.kernel.quorvane.client.Market;
import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.RawReply;
import com.brindlex.kernel.quorvane.console.ReplyValues;
import com.brindlex.kernel.quorvane.console.WrittenRequest;
import com.brindlex.kernel.quorvane.console.message.Message;
import com.brindlex.kernel.quorvane.console.message.MessageReader;
import com.brindlex.kernel.quorvane.simulator.Gateway;
import com.brindlex.kernel.quorvane.simulator.Line;
import java.util.HashMap;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Locale;
import java.util.Map;

/** A trading session with the simulated gateway, and what happens at its exchange. */
final class SessionPlace {
    /** The lists that show what became of the orders. */
    private static final Map<String, Operation> LISTS = lists();

    private Gateway gateway = Gateway.open();
    private Line line = Line.UP;

    private static Map<String, Operation> lists() {
        Map<String, Operation> lists = new LinkedHashMap<>();
        lists.put("Stock orders", Operation.QUERY_ORDER_ENCODE);
        lists.put("Stock fills", Operation.QUERY_REPLY_ENCODE);
        lists.put("Stock positions", Operation.QUERY_INVENTORY_ENCODE);
        lists.put("Futures orders", Operation.FUT_QUERY_ORDER_ENCODE);
        lists.put("Futures fills", Operation.FUT_QUERY_REPLY_ENCODE);
        lists.put("Futures positions", Operation.FUT_QUERY_INVENTORY_ENCODE);
        return lists;
    }

    Map<String, PageServer.Place> places() {
        return Map.of("GET api/session", question -> Answer.json(state()),
                "POST api/session/send", question -> Answer.json(send(question.texts())),
                "POST api/session/act", question -> Answer.json(act(question.texts())));
    }

    private synchronized Map<String, Object> send(Map<String, String> texts) {
        Operation operation = TryPlace.operation(texts);
        Map<String, Object> value = new LinkedHashMap<>();
        try {
            String request = WrittenRequest.of(operation, name -> TryPlace.text(texts, name))
                    .build().text();
            String reply = gateway.answer(request);
            Operation decoder = operation.decoders().get(0);
            value.put("request", takenApart(request, List.of()));
            value.put("reply", takenApart(reply, List.of(decoder.method())));
            value.put("result", ReplyValues.of(RawReply.of(decoder, Market.SECURITIES, reply)));
        } catch (InvalidRequestException refused) {
            value.put("problems", TryPlace.problems(refused));
        } catch (WrittenRequest.NotUnderstood refused) {
            value.put("problems", TryPlace.problems(refused));
        }
        return value;
    }

    private static Map<String, Object> takenApart(String text, List<String> decoders) {
        Message message = MessageReader.read(text, decoders);
        return TakenApart.of(message, message.faults());
    }

    /** The lists as they are, though the line be down for others. */
    private synchronized Map<String, Object> state() {
        Map<String, Object> lists = new LinkedHashMap<>();
        gateway.setLine(Line.UP);
        LISTS.forEach((title, operation) -> {
            Map<String, String> texts = new HashMap<>();
            for (Argument each : WrittenRequest.arguments(operation)) {
                String sample = TryPlace.sample(operation, each.name());
                texts.put(each.name(), sample == null ? each.usual() : sample);
            }
            String reply = gateway.answer(WrittenRequest.of(operation, texts::get).build().text());
            lists.put(title, ReplyValues.of(RawReply.of(
                    operation.decoders().get(0), Market.SECURITIES, reply)));
        });
        gateway.setLine(line);
        return Map.of("lists", lists, "line", line.name().toLowerCase(Locale.ROOT));
    }

    /** Something happens at the exchange, or on the way to it. */
    private synchronized Map<String, Object> act(Map<String, String> texts) {
        String order = texts.getOrDefault("order", "");
        switch (TryPlace.text(texts, "act")) {
            case "fill" -> gateway.fillStock(order, number(texts, "quantity"),
                    WrittenRequest.stockPrice(TryPlace.text(texts, "price")));
            case "fill-futures" -> gateway.fillFutures(order, number(texts, "quantity"),
                    TryPlace.text(texts, "price"), texts.getOrDefault("price2", ""));
            case "fail" -> gateway.failStock(order, TryPlace.text(texts, "text"));
            case "fail-futures" -> gateway.failFutures(order, TryPlace.text(texts, "text"));
            case "line" -> {
                line = Line.valueOf(TryPlace.text(texts, "line").toUpperCase(Locale.ROOT));
                gateway.setLine(line);
            }
            case "anew" -> {
                gateway = Gateway.open();
                line = Line.UP;
            }
            default -> throw new IllegalArgumentException("nothing of that kind happens");
        }
        return state();
    }

    private static long number(Map<String, String> texts, String name) {
        String text = TryPlace.text(texts, name);
        if (!text.matches("[0-9]{1,12}")) {
            throw new IllegalArgumentException(name + " must be a whole number");
        }
        return Long.parseLong(text);
    }
}
