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
import java.util.List;
import java.util.TreeMap;

/** One golden case; the format is described in {@code tests/vectors/README.md}. */
final class GoldenCase {
    private static final DateTimeFormatter CLOCK = DateTimeFormatter.ofPattern("yyyy-MM-dd HH:mm:ss");
    private static final ZoneId MARKET = ZoneId.of("Asia/Taipei");

    final String title;
    final Path file;
    final int line;
    String operation;
    LocalDateTime clock = LocalDateTime.parse("2024-01-15 13:45:21", CLOCK);
    final List<Object> arguments = new ArrayList<>();
    /** Null when the method has no status array. */
    Integer status;
    String result;
    /** Null when the case says nothing about log lines. */
    List<String> logLines;

    private GoldenCase(String title, Path file, int line) {
        this.title = title;
        this.file = file;
        this.line = line;
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
        int number = 0;
        for (String text : Files.readAllLines(file, StandardCharsets.UTF_8)) {
            ++number;
            if (text.isEmpty() || text.charAt(0) == '#') {
                continue;
            }
            int blank = text.indexOf(' ');
            String key = blank < 0 ? text : text.substring(0, blank);
            String value = blank < 0 ? "" : text.substring(blank + 1);
            if (key.equals("==")) {
                cases.add(new GoldenCase(value, file, number));
            } else {
                cases.get(cases.size() - 1).take(key, value);
            }
        }
        return cases;
    }

    private void take(String key, String value) throws CharacterCodingException {
        switch (key) {
            case "op":
                operation = value;
                break;
            case "clock":
                clock = LocalDateTime.parse(value, CLOCK);
                break;
            case "arg":
                arguments.add(argument(value));
                break;
            case "status":
                status = value.equals("none") ? null : Integer.valueOf(value);
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
                throw new IllegalArgumentException(title + ": not understood: " + key);
        }
    }

    private Object argument(String text) throws CharacterCodingException {
        int blank = text.indexOf(' ');
        String type = blank < 0 ? text : text.substring(0, blank);
        String value = blank < 0 ? "" : text.substring(blank + 1);
        switch (type) {
            case "null":
                return null;
            case "str":
                return unescape(value);
            case "int":
                return Integer.valueOf(value);
            case "byte":
                return Byte.valueOf(value);
            case "char":
                return (char) Integer.parseInt(value);
            default:
                throw new IllegalArgumentException(title + ": no argument type " + type);
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
                case 'z':
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
