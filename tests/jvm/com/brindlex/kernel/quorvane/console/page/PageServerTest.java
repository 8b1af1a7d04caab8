package com.brindlex.kernel.quorvane.console.page;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertThrows;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.google.gson.JsonElement;
import com.google.gson.JsonObject;
import com.google.gson.JsonParser;
import java.io.IOException;
import java.io.OutputStream;
import java.net.InetAddress;
import java.net.InetSocketAddress;
import java.net.NetworkInterface;
import java.net.Socket;
import java.net.URI;
import java.nio.charset.Charset;
import java.nio.charset.StandardCharsets;
import java.nio.file.Files;
import java.nio.file.Path;
import java.nio.file.StandardOpenOption;
import java.util.List;
import org.junit.jupiter.api.AfterEach;
import org.junit.jupiter.api.BeforeEach;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.api.io.TempDir;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.CsvSource;
import org.junit.jupiter.params.provider.ValueSource;

/** Whom the page's server listens to, what it takes, and what it answers. */
class PageServerTest {
    private static final String REQUEST = "F=7|KIND=S|BHNO=9A01|CB=1|IP=10.0.0.1|11=NO DEFINE"
            + "|VER=24369|65=0013452107|SN=SN1|15=0|ACNO=1234567|PWD=pass1234|FUNC=0|01=";
    private static final String HOSTILE = "<img src=x onerror=alert(1)></script>\"'&";

    private PageServer server;
    private URI address;

    /** What came back over the wire. */
    private record Seen(int status, String head, String body) {
        JsonObject json() {
            return JsonParser.parseString(body).getAsJsonObject();
        }
    }

    @BeforeEach
    void open() throws IOException {
        server = new PageServer(0, new Logs(StandardCharsets.UTF_8, "gatewayjni"));
        address = URI.create(server.address());
    }

    @AfterEach
    void close() {
        server.close();
    }

    /** Sends what a browser would not: any headers, any path. */
    private Seen send(String method, String path, byte[] body, String... headers)
            throws IOException {
        try (Socket socket = new Socket(address.getHost(), address.getPort())) {
            socket.setSoTimeout(20_000);
            OutputStream out = socket.getOutputStream();
            String head = method + " " + path + " HTTP/1.1\r\n" + String.join("\r\n", headers)
                    + "\r\nConnection: close\r\nContent-Length: " + body.length + "\r\n\r\n";
            out.write(head.getBytes(StandardCharsets.UTF_8));
            out.write(body);
            out.flush();
            String all = new String(socket.getInputStream().readAllBytes(), StandardCharsets.UTF_8);
            int end = all.indexOf("\r\n\r\n");
            return new Seen(Integer.parseInt(all.split(" ")[1]), all.substring(0, end),
                    all.substring(end + 4));
        }
    }

    private Seen ask(String method, String path, String body) throws IOException {
        return send(method, address.getPath() + path, body.getBytes(StandardCharsets.UTF_8),
                "Host: " + address.getAuthority());
    }

    private Seen read(String log) throws IOException {
        String id = ask("POST", "api/log?from=paste", log).json().get("log").getAsString();
        return ask("GET", "api/rows?from=0&log=" + id, "");
    }

    @Test
    void thePageComesWithItsPolicy() throws IOException {
        Seen seen = ask("GET", "", "");
        assertEquals(200, seen.status());
        for (String wanted : List.of("default-src 'none'", "script-src 'self'", "style-src 'self'",
                     "frame-ancestors 'none'", "nosniff", "no-store", "no-referrer")) {
            assertTrue(seen.head().contains(wanted), wanted);
        }
        assertFalse(seen.body().matches("(?s).*(https?:|style=|onclick=|<script>).*"), seen.body());
    }

    @ParameterizedTest
    @ValueSource(strings = {"", "/", "api/start", "wrong/", "wrong/api/start", "favicon.ico"})
    void nothingIsThereWithoutTheToken(String path) throws IOException {
        String start = path.startsWith("/") ? "" : "/";
        Seen seen = send("GET", start + path, new byte[0], "Host: " + address.getAuthority());
        assertEquals(404, seen.status());
        assertFalse(seen.body().contains(address.getPath()), "the token is told");
    }

    @ParameterizedTest
    @ValueSource(strings = {"../page/PageServer.class", "PageServer.class", "%2e%2e/", "page.htm",
            "api/", "api/rows/", "..%2fdictionary%2ftags.json"})
    void noOtherFileIsServed(String path) throws IOException {
        assertEquals(404, ask("GET", path, "").status());
    }

    @ParameterizedTest
    @CsvSource({"evil.example", "evil.example:80", "127.0.0.1", "127.0.0.1:1", "''"})
    void anotherHostIsRefused(String host) throws IOException {
        assertEquals(403, send("GET", address.getPath(), new byte[0], "Host: " + host).status());
    }

    @Test
    void aHostNamedTwiceIsRefused() throws IOException {
        String own = "Host: " + address.getAuthority();
        Seen seen = send("GET", address.getPath(), new byte[0], own, "Host: evil.example");
        assertTrue(seen.status() == 403 || seen.status() == 400, seen.head());
    }

    @ParameterizedTest
    @ValueSource(strings = {"Origin: http://evil.example", "Origin: null",
            "Sec-Fetch-Site: cross-site", "Sec-Fetch-Site: same-site"})
    void anotherPageIsRefused(String header) throws IOException {
        String own = "Host: " + address.getAuthority();
        assertEquals(403,
                send("POST", address.getPath() + "api/log", new byte[1], own, header).status());
    }

    @ParameterizedTest
    @ValueSource(strings = {"PUT", "DELETE", "OPTIONS", "TRACE"})
    void otherMethodsAreRefused(String method) throws IOException {
        assertEquals(405, ask(method, "", "").status());
    }

    @Test
    void whatIsTooLongIsRefused() throws IOException {
        String most = "x".repeat(PageServer.LONGEST_OTHER);
        assertEquals(400, ask("POST", "api/encode", most).status());
        assertEquals(413, ask("POST", "api/encode", most + "x").status());
        assertEquals(200, ask("POST", "api/log?from=paste", most + "x").status());
    }

    /** What the page answers to the form of an order as it opens, with one value changed. */
    private JsonObject order(String argument, String value) throws IOException {
        JsonObject asked = new JsonObject();
        for (JsonElement each : JsonParser.parseString(ask("GET", "api/forms", "").body())
                                        .getAsJsonArray()) {
            JsonObject form = each.getAsJsonObject();
            if (form.get("name").getAsString().equals("SubmitOrderEncode")) {
                form.getAsJsonArray("inputs").forEach(input -> asked.add(
                        input.getAsJsonObject().get("name").getAsString(),
                        input.getAsJsonObject().get("usual")));
            }
        }
        asked.addProperty("operation", "SubmitOrderEncode");
        asked.addProperty(argument, value);
        return ask("POST", "api/encode", asked.toString()).json();
    }

    @Test
    void formsTakeValuesAsPeopleWriteThem() throws IOException {
        JsonObject sent = order("price", "600.5");
        assertTrue(sent.has("text"), sent.toString());
        String java = sent.getAsJsonObject("copies").get("java").getAsString();
        assertTrue(java.contains(".set(\"price\", \"60050\")"), java);
        java = order("price", "600").getAsJsonObject("copies").get("java").getAsString();
        assertTrue(java.contains(".set(\"price\", \"60000\")"), java);
        JsonObject refused = order("price", "600.505");
        assertFalse(refused.has("text"), refused.toString());
        JsonObject problem = refused.getAsJsonArray("problems").get(0).getAsJsonObject();
        assertEquals("price", problem.get("argument").getAsString());
        assertEquals("must have at most 2 decimals, not '600.505'",
                problem.get("reason").getAsString());
    }

    @ParameterizedTest
    @CsvSource(delimiter = ' ', value = {"GET api/rows?log=9&from=0", "GET api/rows?log=1&from=-1",
            "GET api/message?log=1&row=x", "POST api/encode", "POST api/decode",
            "POST api/session/act", "POST api/mask?log=9", "GET api/masked?log=1"})
    void aQuestionThatMakesNoSenseIsRefused(String method, String path) throws IOException {
        read(REQUEST);
        Seen seen = ask(method, path, "");
        assertEquals(400, seen.status(), seen.body());
        assertFalse(seen.json().get("error").getAsString().isEmpty());
    }

    @Test
    void noOtherAddressAnswers() throws IOException {
        for (NetworkInterface each : NetworkInterface.networkInterfaces().toList()) {
            for (InetAddress other : each.inetAddresses().toList()) {
                if (!other.isLoopbackAddress()) {
                    assertThrows(IOException.class, () -> {
                        try (Socket socket = new Socket()) {
                            socket.connect(
                                    new InetSocketAddress(other, address.getPort()), 1000);
                        }
                    }, other.toString());
                }
            }
        }
    }

    @Test
    void hostileTextsComeBackAsTheyAre() throws IOException {
        Seen seen = read("F=7|68=0000|00=1|67=1|68=0000|07=S|M5=" + HOSTILE
                + "|16=9A00|17=123|18=4567|69=1|01=");
        assertTrue(seen.head().contains("application/json"));
        Seen message = ask("GET", "api/message?log=1&row=0", "");
        assertTrue(message.json().get("text").getAsString().contains(HOSTILE));
        assertFalse(message.body().contains("<img"), "markup within JSON is escaped");
    }

    @Test
    void noScriptMakesMarkupOfTexts() throws IOException {
        for (String each : List.of("page", "parts", "log", "try", "session", "dictionary")) {
            String script = ask("GET", each + ".js", "").body();
            assertTrue(script.startsWith("//"), each);
            assertFalse(script.matches("(?s).*(innerHTML|outerHTML|insertAdjacentHTML|eval\\(|"
                    + "document\\.write|createContextualFragment|DOMParser).*"), each);
        }
    }

    @Test
    void faultsStandAtTheirFields() throws IOException {
        Seen seen = read(REQUEST.replace("KIND=S", "KIND=Q"));
        assertEquals(1, seen.json().get("total").getAsInt());
        JsonObject message = ask("GET", "api/message?log=1&row=0", "").json();
        assertEquals(0, message.getAsJsonArray("faults").size(), message.toString());
        JsonObject field = message.getAsJsonArray("groups").get(0).getAsJsonObject()
                .getAsJsonArray("fields").get(1).getAsJsonObject();
        assertEquals("KIND", field.get("tag").getAsString());
        assertEquals(1, field.getAsJsonArray("faults").size(), field.toString());
    }

    @Test
    void aCallIsCopiedAsSourceText() throws IOException {
        JsonObject asked = new JsonObject();
        asked.addProperty("operation", "AuthDecode");
        asked.addProperty("reply", "a\"b\\c$d\n\u2028 ");
        JsonObject copies = ask("POST", "api/decode", asked.toString()).json()
                .getAsJsonObject("copies");
        String call = "RawReply.of(Operation.AUTH_DECODE, Market.SECURITIES,\n        ";
        assertEquals("RawReply read = " + call + "\"a\\\"b\\\\c$d\\n\u2028 \");\n",
                copies.get("java").getAsString());
        assertEquals("val read = " + call + "\"a\\\"b\\\\c\\$d\\n\u2028 \")\n",
                copies.get("kotlin").getAsString());
        assertEquals("== title that says the point of the case\nop AuthDecode\n"
                + "reply str a\"b\\\\c$d\\n\u2028\\s\n", copies.get("golden").getAsString());
    }

    @Test
    void aMaskedLogIsSavedWithoutItsSecrets() throws IOException {
        read(REQUEST);
        String id = ask("POST", "api/mask?log=1&keep=account", "").json().get("log").getAsString();
        Seen saved = ask("GET", "api/masked?log=" + id, "");
        assertTrue(saved.head().contains("attachment"));
        assertFalse(saved.body().contains("pass1234"));
        assertTrue(saved.body().contains("ACNO=1234567"));
        assertEquals(400, ask("POST", "api/mask?log=1&keep=password", "").status());
    }

    private void follow(Path file) throws IOException {
        server.close();
        Logs logs = new Logs(StandardCharsets.UTF_8, "gatewayjni");
        logs.follow(file);
        server = new PageServer(0, logs);
        address = URI.create(server.address());
    }

    private static String request(int number) {
        return REQUEST.replace("452107", "45210" + number) + "\n";
    }

    /** Waits for so many rows of a log; their request ids. */
    private String ids(int log, int wanted) throws IOException, InterruptedException {
        JsonObject seen = new JsonObject();
        for (int tries = 0; tries < 200; tries++) {
            seen = ask("GET", "api/rows?from=0&log=" + log, "").json();
            if (seen.get("total").getAsInt() >= wanted) {
                break;
            }
            Thread.sleep(100);
        }
        StringBuilder ids = new StringBuilder();
        seen.getAsJsonArray("rows").forEach(row -> ids.append(' ').append(
                row.getAsJsonObject().get("requestId").getAsString().replaceFirst("^.{9}", "")));
        return ids.toString().strip();
    }

    @Test
    void aLogIsFollowed(@TempDir Path folder) throws IOException, InterruptedException {
        Path file = Files.writeString(folder.resolve("a.log"), "");
        follow(file);
        assertEquals("a.log", ask("GET", "api/start", "").json().get("name").getAsString());
        Files.writeString(file, request(1), StandardOpenOption.APPEND);
        assertEquals("1", ids(1, 1));
        Files.writeString(file, request(2), StandardOpenOption.APPEND);
        assertEquals("1 2", ids(1, 2));
    }

    /** Loggers move a file away and begin another one, or empty it and go on. */
    @Test
    void aFileThatBeginsAnewIsFollowedOn(@TempDir Path folder)
            throws IOException, InterruptedException {
        Path file = Files.writeString(folder.resolve("a.log"), request(1) + "a line without an end");
        follow(file);
        assertEquals("1", ids(1, 1));
        Files.move(file, folder.resolve("a.log.1"));
        Thread.sleep(500);
        Files.writeString(file, request(2) + request(3));
        assertEquals("1 2 3", ids(1, 3));
        Files.writeString(file, request(4));
        assertEquals("1 2 3 4", ids(1, 4));
    }

    @Test
    void aLogIsReadAgainInAnotherCharset(@TempDir Path folder)
            throws IOException, InterruptedException {
        Path file = folder.resolve("a.log");
        Files.write(file, "F=7|68=E002|M2=密碼錯誤|\n".getBytes(Charset.forName("Big5")));
        follow(file);
        ids(1, 1);
        assertTrue(ask("GET", "api/rows?log=1&from=0", "").body().contains("broken-bytes"));
        assertEquals("2", ask("POST", "api/charset?log=1&charset=Big5", "").json().get("log")
                                  .getAsString());
        ids(2, 1);
        String rows = ask("GET", "api/rows?log=2&from=0", "").body();
        assertTrue(rows.contains("密碼錯誤") && !rows.contains("broken-bytes"), rows);
        assertEquals("2", ask("GET", "api/start", "").json().get("log").getAsString());
        assertEquals(400, ask("GET", "api/rows?log=1&from=0", "").status());
        Files.writeString(file, request(4), StandardOpenOption.APPEND);
        ids(2, 2);
        for (String name : new String[] {"", "none-such", "../x"}) {
            assertEquals(400, ask("POST", "api/charset?log=2&charset=" + name, "").status(), name);
        }
        String dropped = new String("F=7|68=E002|M2=密碼錯誤|\n".getBytes("Big5"), "ISO-8859-1");
        Seen opened = send("POST", address.getPath() + "api/log?from=file",
                dropped.getBytes("ISO-8859-1"), "Host: " + address.getAuthority());
        assertEquals("UTF-8", opened.json().get("charset").getAsString());
        ask("POST", "api/charset?charset=Big5&log=" + opened.json().get("log").getAsString(), "");
        assertTrue(ask("GET", "api/rows?log=4&from=0", "").body().contains("密碼錯誤"));
    }
}
