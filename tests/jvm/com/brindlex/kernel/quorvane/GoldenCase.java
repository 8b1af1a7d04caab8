package com.brindlex.kernel.quorvane;

import java.io.ByteArrayOutputStream;
import java.io.IOException;
import java.nio.ByteBuffer;
import java.nio.charset.CharacterCodingException;
import java.nio.charset.StandardCharsets;
import java.nio.file.DirectoryStream;
import java.nio.file.Files;
import java.nio.file.Path;
import java.time.LocalDateTime;
import java.time.ZoneId;
import java.time.format.DateTimeFormatter;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.HashMap;
import java.util.List;
import java.util.Map;
import java.util.TreeMap;

/** One golden case; the format is described in {@code tests/vectors/README.md}. */
final class GoldenCase {
    private static final DateTimeFormatter CLOCK = DateTimeFormatter.ofPattern("yyyy-MM-dd HH:mm:ss");
    private static final ZoneId MARKET = ZoneId.of("Asia/Taipei");
    /** The names of each method's arguments, in their order. */
    private static final Map<String, List<String>> ARGUMENT_NAMES = new HashMap<>();

    static {
        for (String method : Surroundings.argumentNames()) {
            List<String> words = Arrays.asList(method.split(" "));
            ARGUMENT_NAMES.put(words.get(0), words.subList(1, words.size()));
        }
    }

    final String title;
    final Path file;
    final int line;
    String operation;
    LocalDateTime clock;
    final List<Object> arguments = new ArrayList<>();
    /** Null when the method has no status array. */
    Integer status = 1;
    String result;
    /** Null when the case says nothing about log lines. */
    List<String> logLines;

    /** Values of arguments by name: what is usual in the file, and what the case gives. */
    private final Map<String, Object> values;

    private GoldenCase(String title, Path file, int line, Map<String, Object> usual) {
        this.title = title;
        this.file = file;
        this.line = line;
        this.values = new HashMap<>(usual);
        this.clock = (LocalDateTime) usual.get("clock");
    }

    /** The local time of the case in seconds since 1970. */
    long epochSecond() {
        return clock.atZone(MARKET).toEpochSecond();
    }

    /** The platform row that the case passes; 0 for a decoder. */
    int platformRow() {
        boolean encoder = arguments.size() > 2 && arguments.get(1) instanceof Integer;
        return encoder ? (Integer) arguments.get(1) : 0;
    }

    /** All cases of the files {@code *.txt} of a directory, by file name. */
    static TreeMap<String, List<GoldenCase>> readAll(Path directory) throws IOException {
        TreeMap<String, List<GoldenCase>> all = new TreeMap<>();
        try (DirectoryStream<Path> files = Files.newDirectoryStream(directory, "*.txt")) {
            for (Path file : files) {
                all.put(file.getFileName().toString(), read(file));
            }
        }
        return all;
    }

    private static List<GoldenCase> read(Path file) throws IOException {
        List<GoldenCase> cases = new ArrayList<>();
        Map<String, Object> usual = new HashMap<>();
        int number = 0;
        for (String text : Files.readAllLines(file, StandardCharsets.UTF_8)) {
            ++number;
            String key = firstWord(text);
            String value = behind(key, text);
            if (text.isEmpty() || text.charAt(0) == '#') {
                continue;
            } else if (key.equals("usual")) {
                String name = firstWord(value);
                String given = behind(name, value);
                usual.put(name, name.equals("clock") ? LocalDateTime.parse(given, CLOCK)
                        : argument(given));
            } else if (key.equals("==")) {
                cases.add(new GoldenCase(value, file, number, usual));
            } else {
                cases.get(cases.size() - 1).take(key, value);
            }
        }
        cases.forEach(GoldenCase::setArguments);
        return cases;
    }

    private static String firstWord(String text) {
        int blank = text.indexOf(' ');
        return blank < 0 ? text : text.substring(0, blank);
    }

    private static String behind(String word, String text) {
        return text.substring(Math.min(text.length(), word.length() + 1));
    }

    private void take(String key, String value) throws CharacterCodingException {
        switch (key) {
            case "op":
                operation = value;
                break;
            case "clock":
                clock = LocalDateTime.parse(value, CLOCK);
                break;
            case "status":
                status = Integer.valueOf(value);
                break;
            case "result":
                result = unescape(value);
                break;
            case "log":
                if (logLines == null) {
                    logLines = new ArrayList<>();
                }
                logLines.add(unescape(value));
                break;
            default:
                values.put(key, argument(value));
        }
    }

    private void setArguments() {
        for (String name : ARGUMENT_NAMES.get(operation)) {
            if (!values.containsKey(name)) {
                throw new IllegalArgumentException(title + ": no value for " + name);
            }
            arguments.add(values.get(name));
        }
        if (!Natives.hasStatus(operation)) {
            status = null;
        }
    }

    private static Object argument(String text) throws CharacterCodingException {
        String type = firstWord(text);
        String value = behind(type, text);
        boolean quoted = value.length() == 3 && value.startsWith("'") && value.endsWith("'");
        switch (type) {
            case "null":
                return null;
            case "str":
                return unescape(value);
            case "int":
                return Integer.valueOf(value);
            case "byte":
                return quoted ? (byte) value.charAt(1) : Byte.parseByte(value);
            case "char":
                return quoted ? value.charAt(1) : (char) Integer.parseInt(value);
            default:
                throw new IllegalArgumentException("not understood: " + text);
        }
    }

    private static String unescape(String text) throws CharacterCodingException {
        if (text.indexOf('\\') < 0) {
            return text;
        }
        byte[] in = text.getBytes(StandardCharsets.UTF_8);
        ByteArrayOutputStream out = new ByteArrayOutputStream();
        for (int i = 0; i < in.length; ++i) {
            if (in[i] != '\\') {
                out.write(in[i]);
                continue;
            }
            switch (in[++i]) {
                case 'n':
                    out.write('\n');
                    break;
                case 'r':
                    out.write('\r');
                    break;
                case 't':
                    out.write('\t');
                    break;
                case 's':
                    out.write(' ');
                    break;
                case '\\':
                    out.write('\\');
                    break;
                case 'x':
                    out.write(Integer.parseInt(new String(in, i + 1, 2, StandardCharsets.US_ASCII), 16));
                    i += 2;
                    break;
                default:
                    throw new IllegalArgumentException("unknown escape in " + text);
            }
        }
        ByteBuffer bytes = ByteBuffer.wrap(out.toByteArray());
        return StandardCharsets.UTF_8.newDecoder().decode(bytes).toString();
    }
}
