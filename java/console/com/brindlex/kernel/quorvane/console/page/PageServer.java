package com.brindlex.kernel.quorvane.console.page;

import com.sun.net.httpserver.HttpExchange;
import com.sun.net.httpserver.HttpServer;
import java.io.Closeable;
import java.io.IOException;
import java.io.InputStream;
import java.net.InetAddress;
import java.net.InetSocketAddress;
import java.util.HashMap;
import java.util.Map;
import java.util.Set;
import java.util.concurrent.ExecutorService;
import java.util.concurrent.Executors;

/** Serves the page to the browser of this machine, and answers what it asks. */
public final class PageServer implements Closeable {
    /** The most bytes of a log. */
    static final int LONGEST_LOG = 64 << 20;

    /** The most bytes of anything else. */
    static final int LONGEST_OTHER = 1 << 20;

    private static final int THREADS = 4;
    private static final Set<String> FILES = Set.of("page.html", "page.css", "page.js", "parts.js",
            "log.js", "csv.js", "try.js", "session.js", "dictionary.js");

    private final HttpServer server;
    private final ExecutorService threads;
    private final Guard guard;
    private final Map<String, Place> places = new HashMap<>();

    /** Answers the questions of one place of the page. */
    interface Place {
        Answer answer(Question question) throws IOException;
    }

    /**
     * Opens the server on the loopback address.
     *
     * @param port the port; 0 for one that is free
     * @param logs the logs that it shows
     */
    public PageServer(int port, Logs logs) throws IOException {
        server = HttpServer.create(
                new InetSocketAddress(InetAddress.getByAddress(new byte[] {127, 0, 0, 1}), port), 0);
        guard = new Guard(server.getAddress().getPort());
        logs.places().forEach(places::put);
        new DictionaryPlace().places().forEach(places::put);
        new TryPlace().places().forEach(places::put);
        new SessionPlace().places().forEach(places::put);
        threads = Executors.newFixedThreadPool(THREADS, work -> {
            Thread thread = new Thread(work, "page");
            thread.setDaemon(true);
            return thread;
        });
        server.setExecutor(threads);
        server.createContext("/", this::handle);
        server.start();
    }

    /** The address of the page, with its token. */
    public String address() {
        return "http://127.0.0.1:" + server.getAddress().getPort() + "/" + guard.token() + "/";
    }

    @Override
    public void close() {
        server.stop(0);
        threads.shutdownNow();
    }

    private void handle(HttpExchange exchange) throws IOException {
        try (exchange) {
            send(exchange, answer(exchange));
        }
    }

    private Answer answer(HttpExchange exchange) throws IOException {
        String path = exchange.getRequestURI().getRawPath();
        Answer refusal = guard.refusal(
                exchange.getRequestMethod(), path, exchange.getRequestHeaders());
        if (refusal != null) {
            return refusal;
        }
        String inside = guard.inside(path).isEmpty() ? "page.html" : guard.inside(path);
        boolean post = exchange.getRequestMethod().equals("POST");
        if (!post && FILES.contains(inside)) {
            return file(inside);
        }
        Place place = places.get((post ? "POST " : "GET ") + inside);
        if (place == null) {
            return Answer.refused(404, "nothing here");
        }
        int most = inside.equals("api/log") ? LONGEST_LOG : LONGEST_OTHER;
        byte[] body = exchange.getRequestBody().readNBytes(most + 1);
        if (body.length > most) {
            return Answer.refused(413, "too long: at most " + most + " bytes are taken");
        }
        return answer(place, Question.of(inside, exchange.getRequestURI().getRawQuery(), body));
    }

    private static Answer answer(Place place, Question question) throws IOException {
        try {
            return place.answer(question);
        } catch (IllegalArgumentException bad) {
            return Answer.refused(400, String.valueOf(bad.getMessage()));
        } catch (LinkageError missing) {
            return Answer.refused(501, "the codec's library is not here: " + missing.getMessage());
        }
    }

    private static Answer file(String name) throws IOException {
        String type = name.endsWith(".html") ? "text/html" : name.endsWith(".css") ? "text/css"
                                                                                   : "text/javascript";
        try (InputStream in = PageServer.class.getResourceAsStream(name)) {
            return in == null ? Answer.refused(404, "the console was built without " + name)
                              : new Answer(200, type + "; charset=utf-8", in.readAllBytes(), null);
        }
    }

    private static void send(HttpExchange exchange, Answer reply) throws IOException {
        Guard.HEADERS.forEach(each -> exchange.getResponseHeaders().set(each[0], each[1]));
        exchange.getResponseHeaders().set("Content-Type", reply.type());
        if (reply.fileName() != null) {
            exchange.getResponseHeaders().set("Content-Disposition",
                    "attachment; filename=\"" + reply.fileName() + "\"");
        }
        int length = reply.body().length;
        exchange.sendResponseHeaders(reply.status(), length == 0 ? -1 : length);
        exchange.getResponseBody().write(reply.body());
    }
}
