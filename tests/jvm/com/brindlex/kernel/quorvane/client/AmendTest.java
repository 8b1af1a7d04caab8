package com.brindlex.kernel.quorvane.client;

import static com.brindlex.kernel.quorvane.client.Fixtures.ask;
import static com.brindlex.kernel.quorvane.client.Fixtures.futures;
import static com.brindlex.kernel.quorvane.client.Fixtures.gateway;
import static com.brindlex.kernel.quorvane.client.Fixtures.refused;
import static com.brindlex.kernel.quorvane.client.Fixtures.stockOrder;
import static com.brindlex.kernel.quorvane.client.Fixtures.stocks;
import static com.brindlex.kernel.quorvane.client.Fixtures.tag;
import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.simulator.Gateway;
import java.math.BigDecimal;
import java.util.List;
import org.junit.jupiter.api.Test;

/** What the books list can be cancelled and changed from its row, and the gateway takes it. */
final class AmendTest {
    private static final Contract NEAR = Contract.futures("TXF", "202401");
    private static final Contract FAR = Contract.futures("TXF", "202402");
    private static final Contract CALL = Contract.option("TXO", "202401", CallPut.CALL, "23000.5");
    private static final Contract PUT = Contract.option("TXO", "202402", CallPut.PUT, "22000");

    private final Gateway gateway = gateway();

    private StockOrder place(StockOrderBuilder order) {
        ask(gateway, order.build());
        StockOrders book = stockBook();
        return book.get(book.size() - 1);
    }

    private StockOrders stockBook() {
        return ask(gateway, stocks().stockOrders(TradeDate.today()));
    }

    private FuturesOrder place(FuturesOrderBuilder order) {
        ask(gateway, order.live().quantity(3).build());
        FuturesOrders book = futuresBook();
        return book.get(book.size() - 1);
    }

    private FuturesOrders futuresBook() {
        return ask(gateway, futures().futuresOrders(TradeDate.today()));
    }

    private static FuturesOrderBuilder order() {
        return futures().futuresOrder().price(Price.of("100.25"));
    }

    @Test
    void aStockOrderIsChangedAndCancelledInBothForms() {
        for (Signature signature : Signature.values()) {
            for (StockOrderBuilder order : List.of(stockOrder(),
                         stockOrder().quantity(Quantity.oddLotShares(8)),
                         stockOrder().price(Price.LIMIT_UP),
                         stockOrder().orderKind(OrderKind.of(3)),
                         stockOrder().orderKind(OrderKind.of(8)),
                         stockOrder().orderKind(OrderKind.of(5)))) {
                StockOrder placed = place(order);
                Quantity less = placed.orderedQuantity() == 8 ? Quantity.oddLotShares(3)
                                                              : Quantity.lots(1, 1000);
                ask(gateway, filled(stocks().changeQuantity(placed, less), placed, signature));
                StockOrder changed = last(stockBook());
                assertEquals(less.shares(), changed.cancelledQuantity());
                ask(gateway, filled(stocks().cancel(changed), changed, signature));
                assertEquals(OrderStatus.CANCELLED, last(stockBook()).state().value());
            }
        }
    }

    private static Request<Confirmation> filled(
            StockAmendment amendment, StockOrder order, Signature signature) {
        OrderType type = order.type().value();
        if (type == OrderType.KIND_1_3_BUY) {
            amendment.orderKind(OrderKind.of(3));
        }
        if (type == OrderType.KIND_5) {
            amendment.side(Side.BUY);
        }
        if (type == OrderType.KIND_5 || type == OrderType.KIND_8_BUY) {
            amendment.tradeType(TradeType.LOTS);
        }
        return (signature == Signature.BARE ? amendment.flag13('0') : amendment.sharesPerLot(1000))
                .signature(signature).build();
    }

    private static <R> R last(List<R> rows) {
        return rows.get(rows.size() - 1);
    }

    @Test
    void whatTheStockBookDoesNotShowMustBeGiven() {
        StockOrder plain = place(stockOrder());
        assertEquals(List.of("flag13"), refused(() -> stocks().cancel(plain).build()));
        assertEquals(List.of("unit"), refused(
                () -> stocks().cancel(plain).signature(Signature.TAG_PL).build()));
        assertEquals(List.of("unit"), refused(() -> stocks().cancel(plain).sharesPerLot(1500)
                .signature(Signature.TAG_PL).build()));
        assertEquals(List.of("quantity"), refused(
                () -> stocks().changeQuantity(plain, Quantity.lots(3)).flag13('0').build()));
        assertEquals(List.of("quantity"), refused(() -> stocks()
                .changeQuantity(plain, Quantity.oddLotShares(3)).flag13('0').build()));
        StockOrder margin = place(stockOrder().orderKind(OrderKind.of(3)));
        assertEquals(List.of("orderKind"),
                refused(() -> stocks().cancel(margin).flag13('0').build()));
        assertEquals(List.of("orderKind"), refused(() -> stocks().cancel(margin).flag13('0')
                .orderKind(OrderKind.of(2)).build()));
        StockOrder kind5 = place(stockOrder().orderKind(OrderKind.of(5)));
        assertEquals(List.of("side", "tradeType"),
                refused(() -> stocks().cancel(kind5).flag13('0').build()));
    }

    @Test
    void aFuturesOrderIsChangedAndCancelledInBothForms() {
        for (Signature signature : Signature.values()) {
            for (FuturesOrderBuilder order : List.of(order().buy(NEAR), order().sell(CALL),
                         order().buy(CALL).sell(PUT), order().sell(CALL).sell(CALL),
                         order().buy(NEAR).sell(FAR).flagW3('1'),
                         order().buy(NEAR).price(Price.RANGE_MARKET)
                                 .timeInForce(TimeInForce.IMMEDIATE_OR_CANCEL))) {
                FuturesOrder placed = place(order);
                ask(gateway, filled(futures().changeQuantity(placed, 1)).signature(signature)
                        .build());
                FuturesOrder changed = last(futuresBook());
                assertEquals(1, changed.cancelledQuantity());
                ask(gateway, filled(futures().changePrice(changed, Price.of("99.5")))
                        .signature(signature).build());
                ask(gateway, filled(futures().cancel(last(futuresBook()))).signature(signature)
                        .build());
                assertEquals(3, last(futuresBook()).cancelledQuantity());
            }
        }
    }

    private static FuturesAmendment filled(FuturesAmendment amendment) {
        return amendment.secondCommodity("TXF");
    }

    @Test
    void aNewPriceIsAlwaysSigned() {
        FuturesOrder placed = place(order().buy(NEAR));
        Request<?> change = futures().changePrice(placed, Price.of("99.5"))
                .signature(Signature.BARE).build();
        assertEquals(Operation.FUT_SUBMIT_ORDER_ENCODE1, change.operation());
        assertTrue(change.text().matches("(?s).*\\|PL=S!!.*,3,99\\.5000,F0001"));
        ask(gateway, change);
        assertEquals(Price.of("99.5"), last(futuresBook()).price());
    }

    @Test
    void whatTheFuturesBookDoesNotShowMustBeGiven() {
        FuturesOrder spread = place(order().buy(NEAR).sell(FAR));
        assertEquals(List.of("secondCommodity"),
                refused(() -> futures().cancel(spread).build()));
        assertEquals(List.of("quantity"), refused(
                () -> futures().changeQuantity(spread, 4).secondCommodity("TXF").build()));
        // flag W3 is none that the book knows: sides are not shown, the product is another order's
        FuturesOrder odd = place(order().sell(CALL).flagW3('7'));
        assertEquals(List.of("legs"), refused(() -> futures().cancel(odd).build()));
        ask(gateway, futures().cancel(odd).leg(Side.SELL, CALL).build());
        assertEquals(3, last(futuresBook()).cancelledQuantity());
    }

    @Test
    void aStrikePriceOfTheBookIsThatOfTheOrder() {
        Request<FuturesOrders> book = futures().futuresOrders(TradeDate.today());
        String record = "|00=1|68=0000|67=1|46=G1|36=F1|33=%s|V9=%s|29=202401|W0=202401|V8=C|W1=P"
                + "|34=450.5|W2=460|32=B|EL=S|70=2|47=0|37=0|41=0|N6=1|27=2|31=7.5|22=090000|21=20240115"
                + "|44=20240115|JV=Y|O4=0|V5=0|MT=0|01=|00=2|67=900001|68=0000|01=";
        for (String commodity : List.of("MSO", "GTO", "TEO", "TXO")) {
            FuturesOrder order = book.read(String.format(record, commodity, commodity)).orThrow()
                    .get(0);
            assertEquals(0, new BigDecimal("450.5").compareTo(order.strike1()), commodity);
            assertEquals(0, new BigDecimal("460").compareTo(order.strike2()), commodity);
            Request<?> cancel = futures().cancel(order).build();
            assertEquals("450.5", tag(cancel, "34"));
            assertEquals("460", tag(cancel, "W2"));
        }
    }
}
