package com.brindlex.kernel.quorvane.simulator;

import java.time.LocalDate;
import java.time.LocalDateTime;
import java.util.ArrayList;
import java.util.List;

/** Takes stock orders, changes and cancels them, and lets the exchange fill them. */
final class StockDesk {
    private final CustomerBook customers;
    private final StockLists lists;
    private final OrderBook<StockOrder> orders = new OrderBook<>();
    private final List<StockFill> fills = new ArrayList<>();

    StockDesk(CustomerBook customers, Brokerage brokerage, LocalDate today) {
        this.customers = customers;
        this.lists = new StockLists(orders, fills, new StockHoldings(today), brokerage);
    }

    String answer(Request request, LocalDateTime now) throws Refusal {
        CustomerBook.Party party = customers.party(request);
        switch (request.kind()) {
            case STOCK_NEW:
            case STOCK_NEW_1:
                return enter(request, party.account, now);
            case STOCK_NOTICE:
                request.letter("14", "IDC");
                request.number("28");
                return accepted(request, "", 'S', now);
            case STOCK_CANCEL:
            case STOCK_CANCEL_1:
                return cancel(request, orders.named(request, party.account), now);
            case STOCK_CHANGE:
            case STOCK_CHANGE_1:
                return reduce(request, orders.named(request, party.account), now);
            default:
                return lists.answer(request, party.account, now.toLocalDate());
        }
    }

    private String enter(Request request, Account account, LocalDateTime now) throws Refusal {
        Stock stock = StockRules.checkNew(request);
        StockOrder order = new StockOrder(request, account, stock, orders.next(), now);
        boolean covered = order.kind != 0 || order.side == 'B'
                || order.ordered <= lists.sellable(account, stock.code);
        if (!covered) {
            throw Refusal.rejected("庫存不足");
        }
        orders.add(order);
        return accepted(request, order.gatewayNumber, order.n6 == 0 ? 'X' : 'S', now);
    }

    private String cancel(Request request, StockOrder order, LocalDateTime now) throws Refusal {
        StockRules.checkChange(request, order);
        if (order.open() == 0) {
            throw Refusal.rejected("委託已無剩餘數量");
        }
        order.cancelled += order.open();
        return accepted(request, order.gatewayNumber, 'S', now);
    }

    /** The quantity of a change is what is taken off the order. */
    private String reduce(Request request, StockOrder order, LocalDateTime now) throws Refusal {
        StockRules.checkChange(request, order);
        long less = request.number("37");
        if (less == 0 || less > order.open()) {
            throw Refusal.rejected("改量數量錯誤");
        }
        order.reduced += less;
        return accepted(request, order.gatewayNumber, 'S', now);
    }

    private static String accepted(Request request, String number, char code, LocalDateTime now) {
        return Reply.order(request).field("39", " ").field("19", code).field("46", number)
                .field("44", Texts.date(now.toLocalDate())).field("K1", "").text();
    }

    void fill(String number, long shares, long price, LocalDateTime at) {
        StockOrder order = orders.existing(number);
        boolean worse = order.limit() != 0
                && (order.side == 'B' ? price > order.limit() : price < order.limit());
        if (shares <= 0 || shares > order.open() || worse) {
            throw new IllegalArgumentException("the order cannot be filled so: " + number);
        }
        order.filled += shares;
        fills.add(new StockFill(order, shares, price, at));
    }

    void fail(String number, String text) {
        orders.existing(number).fail(text);
    }
}
