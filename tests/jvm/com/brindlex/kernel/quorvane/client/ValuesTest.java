package com.brindlex.kernel.quorvane.client;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertFalse;
import static org.junit.jupiter.api.Assertions.assertNotEquals;
import static org.junit.jupiter.api.Assertions.assertThrows;

import java.math.BigDecimal;
import java.util.List;
import java.util.function.Supplier;
import java.util.stream.Stream;
import org.junit.jupiter.api.Test;
import org.junit.jupiter.params.ParameterizedTest;
import org.junit.jupiter.params.provider.MethodSource;

/** Values that say the same are equal, those that do not are not, and each says what it is. */
class ValuesTest {
    /** Ways to make one value, and a value that is another. */
    private record Same(List<Supplier<?>> ways, Object other, String shown) {}

    private static Same same(Object other, String shown, Supplier<?>... ways) {
        return new Same(List.of(ways), other, shown);
    }

    static Stream<Same> values() {
        Session session = Session.of("SN", "::1");
        return Stream.of(
                same(Price.of("600.51"), "600.5", () -> Price.of("600.5"), () -> Price.of("600.50"),
                        () -> Price.of(new BigDecimal("6005E-1")), () -> Price.parse("60050", 2)),
                same(Price.LIMIT_DOWN, "漲停價", () -> Price.LIMIT_UP,
                        () -> Price.of(PriceWord.LIMIT_UP), () -> Price.parse("漲停價", 2)),
                same(Price.of("1"), "0", () -> Price.of("0.00"), () -> Price.of(BigDecimal.ZERO)),
                same(Price.of("9"), "100", () -> Price.of("1E+2".replace("1E+2", "100")),
                        () -> Price.of(new BigDecimal("1E+2"))),
                same(Quantity.lots(2, 100), "2 lots of 1000", () -> Quantity.lots(2),
                        () -> Quantity.lots(2, 1000)),
                same(Quantity.lots(37), "37 shares", () -> Quantity.oddLotShares(37),
                        () -> Quantity.oddLotShares(37, 1000)),
                same(Contract.futures("TXF", "202402"), "TXF 202401",
                        () -> Contract.futures("TXF", "202401")),
                same(Contract.option("TXO", "202401", CallPut.PUT, "18000"),
                        "TXO 202401 call 18000",
                        () -> Contract.option("TXO", "202401", CallPut.CALL, "18000"),
                        () -> Contract.option("TXO", "202401", CallPut.CALL,
                                new BigDecimal("18000.0000"))),
                same(OrderKind.of(4), "3", () -> OrderKind.of(3)),
                same(TradeType.of(3), "3", () -> OrderKind.of(3)),
                same(Handling.LIVE, "0", () -> Handling.RESERVATION, () -> Handling.of(0)),
                same(Market.FUTURES, "securities 1", () -> Market.SECURITIES, () -> Market.of(1)),
                same(Platform.QVPHONE, "0", () -> Platform.NO_DEFINE, () -> Platform.of(0)),
                same(session.withSequence(1),
                        "Session(securities 1, platform 0, STANDARD, sequence 0, SN, ::1)",
                        () -> session, () -> Session.of("SN", "::1")),
                same(Credentials.of("9A01", "A123456789", "1234567", "other"),
                        "Credentials(branch 9A01, account 1234567)",
                        () -> Credentials.of("9A01", "A123456789", "1234567", "secret"),
                        () -> Credentials.of("9A01", "A123456789", "1234567", "x")
                                .withPassword("secret")),
                same(TradeDate.of(2024, 1, 16), "2024-01-15", () -> TradeDate.of(2024, 1, 15),
                        () -> TradeDate.parse("1130115"), () -> TradeDate.parse("20240115")),
                same(TradeTime.of(9, 0, 1), "09:00:00", () -> TradeTime.of(9, 0, 0),
                        () -> TradeTime.parse("090000123")),
                same(Failure.of("[GATEWAY]x(2)"), "[GATEWAY]x(1)",
                        () -> Failure.of("[GATEWAY]x(1)")),
                same(new Problem("a", "b"), "a must be given",
                        () -> new Problem("a", "must be given")));
    }

    @ParameterizedTest
    @MethodSource("values")
    void equalOrNot(Same same) {
        Object first = same.ways.get(0).get();
        for (Supplier<?> way : same.ways) {
            assertEquals(first, way.get());
            assertEquals(first.hashCode(), way.get().hashCode());
            assertEquals(same.shown, way.get().toString());
        }
        assertNotEquals(first, same.other);
        assertNotEquals(same.other, first);
        assertFalse(first.equals(null) || first.equals("?"));
    }

    @Test
    void whatIsNoneIsSaid() {
        for (Runnable wrong : List.<Runnable>of(() -> Price.of("12,5"), () -> Price.of(""),
                     () -> Price.of("1e5"), () -> Price.of(PriceWord.UNKNOWN),
                     () -> Contract.option("TXO", "202401", CallPut.CALL, "x"),
                     () -> Market.of(-1), () -> Market.of(201), () -> TradeDate.of(2023, 2, 29),
                     () -> TradeTime.of(9, 60, 0))) {
            assertThrows(IllegalArgumentException.class, wrong::run);
        }
    }
}
