package com.brindlex.kernel.quorvane.simulator;

import java.math.BigDecimal;
import java.time.LocalDateTime;
import java.util.ArrayList;
import java.util.List;

/** Takes stock orders, changes and cancels them, and lets the exchange fill them. */
final class StockDesk {
    private final CustomerBook customers;
    private final World world;
    private final StockLists lists;
    private final OrderBook<StockOrder> orders = new OrderBook<>();
    private final List<StockFill> fills = new ArrayList<>();

    StockDesk(CustomerBook customers, World world) {
        this.customers = customers;
        this.world = world;
        this.lists = new StockLists(orders, fills, world);
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

    private String enter(Request request, TradingAccount account, LocalDateTime now) throws Refusal {
        ListedStock stock = StockRules.checkNew(request, world);
        StockOrder order = new StockOrder(request, account, stock, orders.next(), now);
        boolean covered = order.kind != 0 || order.side == 'B'
                || order.ordered <= lists.sellable(account, stock.code);
        if (!covered) {
            throw Refusal.rejected("庫存不足");
        }
        world.stockHours.check(order.isReservation(), now.toLocalTime());
        // the difference, since the limit may be as large as a number can be
        long left = account.buyingLimit - lists.spent(account, now.toLocalDate());
        if (order.cost() > left) {
            throw Refusal.rejected("超過買進額度");
        }
        orders.add(order);
        return accepted(request, order.gatewayNumber, order.isReservation() ? 'X' : 'S', now);
    }

    private String cancel(Request request, StockOrder order, LocalDateTime now) throws Refusal {
        StockRules.checkChange(request, order);
        world.stockHours.check(order.isReservation(), now.toLocalTime());
        if (order.open() == 0) {
            throw Refusal.rejected("委託已無剩餘數量");
        }
        order.cancelled += order.open();
        return accepted(request, order.gatewayNumber, 'S', now);
    }

    /** The quantity of a change is what is taken off the order. */
    private String reduce(Request request, StockOrder order, LocalDateTime now) throws Refusal {
        StockRules.checkChange(request, order);
        world.stockHours.check(order.isReservation(), now.toLocalTime());
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
        order.checkFill(shares, "shares");
        if (worse) {
            throw new IllegalArgumentException("The order " + number + " cannot be filled at a price"
                    + " worse than its limit, " + BigDecimal.valueOf(order.limit(), 2) + ".");
        }
        order.filled += shares;
        fills.add(new StockFill(order, shares, price, at));
    }

    void fail(String number, String text) {
        orders.existing(number).fail(text);
    }
}
