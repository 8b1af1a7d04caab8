package com.brindlex.kernel.quorvane.client;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.simulator.Gateway;
import java.math.BigDecimal;
import java.nio.charset.StandardCharsets;
import java.util.Base64;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;
import java.util.Random;
import java.util.function.Function;
import org.junit.jupiter.api.Test;

/**
 * Random programs over the typed interface: whatever is built either is refused with a reason, or
 * goes out whole, parses back to the same values and is understood by the gateway.
 */
class RandomProgramTest {
    private static final int ROUNDS = 6000;
    private static final String[] BAD = {"", "|", "a|b", "\0", "\n", "%20", "\ud83d", "x".repeat(5000)};
    private static final int[] NUMBERS = {0, -1, 1, 2, 5, 999, 1000, 2147484, Integer.MAX_VALUE,
        Integer.MIN_VALUE, 255, 256};

    private final Random random = new Random(15);
    private final Gateway gateway = Fixtures.gateway();

    /** What the request must carry, by tag. */
    private Map<String, String> wanted;

    private int built;
    private int refused;

    private boolean rarely() {
        return random.nextInt(25) == 0;
    }

    @SafeVarargs
    private final <T> T one(T... values) {
        return values[random.nextInt(values.length)];
    }

    private String text(String tag, String... good) {
        String text = rarely() ? one(BAD) : one(good);
        wanted.put(tag, text);
        return text;
    }

    private int number(int... good) {
        return rarely() ? NUMBERS[random.nextInt(NUMBERS.length)] : good[random.nextInt(good.length)];
    }

    private TradeDate day() {
        return TradeDate.of(1905 + random.nextInt(1100), 1 + random.nextInt(12),
                1 + random.nextInt(28));
    }

    private static String western(TradeDate day) {
        return String.valueOf(day.yyyymmdd());
    }

    private Requests requests() {
        Session session = Session.of(text("SN", "SN0001", "S", "ABCDEFGHIJ123456789", "a-b_c,d"),
                text("IP", "10.0.0.1", "::1", "fe80::1%wlan0"))
                .withMarket(Market.of(random.nextInt(201)))
                .withPlatform(Platform.of(number(0, 5, 10, 14))).withSequence(random.nextInt(200));
        return Requests.of(session, user());
    }

    private Credentials user() {
        String branch = text("BHNO", "9A01", "F001", "9A00");
        String password = text("PWD", "pass1234", "a b", "ä=&_,!", "中文", "%2 0");
        String idNumber = text("IDNO", "A123456789", "A12345678", "12345678");
        String account = text("ACNO", "1234567", "7654321", "0009876", "12");
        switch (random.nextInt(4)) {
            case 0:
                wanted.remove("ACNO");
                return Credentials.ofIdNumber(branch, idNumber, password);
            case 1:
                wanted.remove("IDNO");
                return Credentials.ofAccount(branch, account, password);
            default:
                return Credentials.of(branch, idNumber, account, password);
        }
    }

    private Price price(boolean futures, int decimals) {
        if (random.nextInt(4) == 0) {
            Price word = Price.of(one(PriceWord.MARKET, PriceWord.RANGE_MARKET, PriceWord.FLAT,
                    PriceWord.LIMIT_UP, PriceWord.LIMIT_DOWN));
            wanted.put(futures ? "27" : "M8", futures ? word.equals(Price.MARKET) ? "1" : "3"
                    : word.equals(Price.FLAT) ? "5" : word.equals(Price.LIMIT_UP) ? "9" : "1");
            wanted.put("31", futures ? "00000000.000000" : "0");
            return word;
        }
        BigDecimal amount = new BigDecimal(random.nextInt(1_000_000) - 20_000)
                .movePointLeft(random.nextInt(decimals + (rarely() ? 2 : 1)));
        wanted.put(futures ? "27" : "M8", futures ? "2" : "0");
        wanted.put("31", amount.setScale(decimals + 1).setScale(decimals, java.math.RoundingMode.DOWN)
                .toPlainString());
        return Price.of(amount);
    }

    private Request<?> stockOrder() {
        StockOrderBuilder order = requests().stockOrder();
        if (!rarely()) {
            order.order(side("32"), text("29", "2330", "0050", "00632R", "6547"));
        }
        boolean odd = random.nextInt(3) == 0;
        int lot = random.nextInt(5) == 0 ? number(100, 10) : 1000;
        int count = number(1, 2, 37, 499);
        order.quantity(odd ? Quantity.oddLotShares(count, lot) : Quantity.lots(count, lot));
        wanted.put("30", String.valueOf(odd ? count : (long) count * lot));
        wanted.put("UT", String.valueOf(lot));
        wanted.put("28", odd ? "2" : "0");
        if (random.nextInt(5) == 0) {
            int type = number(0, 2, 3);
            order.tradeType(TradeType.of(type));
            wanted.put("28", String.valueOf(type));
        }
        if (random.nextInt(8) != 0) {
            order.price(price(false, 2));
        } else {
            wanted.put("31", "");
        }
        order.handling(handling());
        int kind = number(0, 0, 1, 2, 3, 4, 5, 8);
        wanted.put("27", String.valueOf(kind));
        wanted.put("13", "x");
        order.orderKind(OrderKind.of(kind)).flag13('x').signature(one(Signature.values()));
        return order.build();
    }

    private Handling handling() {
        int number = number(0, 1, 1, 7);
        wanted.put("N6", String.valueOf(number));
        return Handling.of(number);
    }

    private Side side(String tag) {
        Side side = rarely() ? Side.UNKNOWN : one(Side.BUY, Side.SELL);
        wanted.put(tag, side.code());
        return side;
    }

    private Contract contract(boolean first) {
        String commodity = text(first ? "33" : "V9", "TXF", "TXO", "MXF", "TEO");
        String month = text(first ? "29" : "W0", "202401", "202402", "202401W2");
        boolean option = commodity.endsWith("O");
        CallPut callPut = one(CallPut.CALL, CallPut.PUT);
        String strike = one("18000", "18000.5", "0.5");
        wanted.put(first ? "V8" : "W1", option ? callPut.code() : "");
        wanted.put(first ? "34" : "W2", option ? strike : "");
        return option ? Contract.option(commodity, month, callPut, new BigDecimal(strike).setScale(2))
                      : Contract.futures(commodity, month);
    }

    private Request<?> futuresOrder() {
        FuturesOrderBuilder order = requests().futuresOrder();
        order.leg(side("32"), contract(true));
        if (random.nextInt(3) == 0) {
            order.leg(side("EL"), contract(false));
        }
        if (!rarely()) {
            int contracts = number(1, 2, 99);
            wanted.put("30", String.valueOf(contracts));
            order.quantity(contracts);
        }
        order.price(price(true, 4)).handling(handling()).signature(one(Signature.values()));
        if (random.nextBoolean()) {
            TimeInForce time = one(TimeInForce.values());
            order.timeInForce(time);
            wanted.put("O4", time == TimeInForce.FILL_OR_KILL ? "1" : "0");
            wanted.put("V5", time == TimeInForce.IMMEDIATE_OR_CANCEL ? "1" : "0");
        }
        return order.flagW3(one(' ', '0', '1')).build();
    }

    private Request<?> certificate() {
        Requests requests = requests();
        String message = text("MSG", "abc", "中文憑證", "KEY=" + "x".repeat(1500));
        String birth = text("BIRTH", "19800101", "69/01/01");
        return this.<Function<Requests, Request<?>>>one(
                ask -> ask.applyForCertificate(birth, message),
                ask -> ask.renewCertificate(birth, message),
                ask -> ask.revokeCertificate(birth, message),
                ask -> plain(ask.registerCertificate(message)),
                ask -> plain(ask.certificateStatus(message))).apply(requests);
    }

    /** A request that names nobody and has no date of birth. */
    private Request<?> plain(Request<?> request) {
        List.of("BHNO", "IDNO", "ACNO", "PWD", "BIRTH").forEach(wanted::remove);
        return request;
    }

    private Request<?> query() {
        Requests requests = requests();
        TradeDate first = day();
        TradeDate last = day();
        switch (random.nextInt(6)) {
            case 0:
                wanted.put("SDATE", first.rocText());
                wanted.put("EDATE", first.rocText());
                return requests.stockOrders(first);
            case 1:
                wanted.put("SDATE", western(first));
                wanted.put("EDATE", western(last));
                return requests.stockFills(first, last);
            case 2:
                wanted.put("SDATE", western(first));
                wanted.put("EDATE", western(last));
                return requests.futuresFills(first, last);
            case 3:
                return requests.creditFigures(text("29", "2330", "00632R"));
            case 4:
                return requests.changePassword(text("55", "other", "a b", "中"));
            default:
                wanted.remove("BHNO");
                wanted.remove("PWD");
                return requests.openAccount(text("NAME", "王小明", "O'Neil & Co"),
                        text("ADDRESS", "台北市 中正區1號"), text("TEL", "02-1234"),
                        ContactTime.of(number(0, 1, 200)), AccountItem.of(number(0, 3)));
        }
    }

    /** The fields of a request; a tag that stands twice has its first value. */
    private static Map<String, String> parse(String request) {
        Map<String, String> fields = new LinkedHashMap<>();
        // an ID block stands behind the function without a bar
        String text = request.replaceFirst("\\|14=(\\w)15=", "|14=$1|15=");
        for (String field : text.split("\\|")) {
            int sign = field.indexOf('=');
            if (sign > 0) {
                fields.putIfAbsent(field.substring(0, sign),
                        field.substring(sign + 1).replaceFirst("!!.*", ""));
            }
        }
        return fields;
    }

    private void assertArrived(Request<?> request) {
        Map<String, String> fields = parse(request.text());
        boolean order = request.text().startsWith("F=1|");
        wanted.forEach((tag, value) -> {
            String there = fields.get(tag);
            String sent = there == null ? null
                    : tag.equals("MSG") ? new String(Base64.getMimeDecoder().decode(there),
                              StandardCharsets.UTF_8)
                    : order ? there : there.replace("%20", " ");
            boolean account = tag.equals("ACNO") || tag.equals("IDNO");
            // queries pad an account; an order by account alone names it in both places
            boolean padded = account && sent != null && sent.endsWith(value);
            assertTrue(value.equals(sent) || padded, () -> tag + " should be '" + value + "', is '"
                    + sent + "' in " + request.text());
        });
    }

    private void assertUnderstood(Request<?> request) {
        String reply = gateway.answer(request.text());
        assertFalse(reply.contains("E001") || reply.contains("電文格式錯誤")
                        || reply.contains("簽章資料不符"), () -> request.text() + "\n" + reply);
        assertNotNull(request.read(reply).outcome());
    }

    @Test
    void whateverIsBuiltArrives() {
        for (int round = 0; round < ROUNDS; round++) {
            wanted = new LinkedHashMap<>();
            try {
                Request<?> request = switch (random.nextInt(4)) {
                    case 0 -> stockOrder();
                    case 1 -> futuresOrder();
                    case 2 -> certificate();
                    default -> query();
                };
                assertArrived(request);
                assertUnderstood(request);
                built++;
            } catch (InvalidRequestException refusal) {
                refused++;
                assertFalse(refusal.problems().isEmpty());
                for (Problem problem : refusal.problems()) {
                    assertFalse(problem.argument().isEmpty(), problem::toString);
                    assertFalse(problem.reason().isEmpty());
                }
            }
        }
        assertTrue(built > ROUNDS / 4 && refused > ROUNDS / 4, built + " built, " + refused);
        assertEquals(ROUNDS, built + refused);
    }
}
