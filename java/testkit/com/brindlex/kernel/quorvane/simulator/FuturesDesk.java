package com.brindlex.kernel.quorvane.simulator;

import java.math.BigDecimal;
import java.time.LocalDateTime;
import java.util.ArrayList;
import java.util.List;

/** Takes futures and options orders, changes and cancels them, and lets the exchange fill them. */
final class FuturesDesk {
    private final CustomerBook customers;
    private final World world;
    private final OrderBook<FuturesOrder> orders = new OrderBook<>();
    private final List<FuturesFill> fills = new ArrayList<>();
    private final FuturesLists lists;

    FuturesDesk(CustomerBook customers, World world) {
        this.customers = customers;
        this.world = world;
        this.lists = new FuturesLists(orders, fills, world.today());
    }

    String answer(Request request, LocalDateTime now) throws Refusal {
        TradingAccount account = customers.party(request).account;
        switch (request.kind()) {
            case FUTURES_NEW:
            case FUTURES_NEW_1:
                return enter(request, account, now);
            case FUTURES_CHANGE:
            case FUTURES_CHANGE_1:
                return change(request, account, now);
            default:
                return lists.answer(request, account);
        }
    }

    private String enter(Request request, TradingAccount account, LocalDateTime now) throws Refusal {
        FuturesRules.check(request, world);
        FuturesOrder order = new FuturesOrder(request, account, orders.next(), world);
        if (lists.margin(account).needed(order) > lists.margin(account).available()) {
            throw Refusal.rejected("保證金不足");
        }
        world.futuresHours.check(order.isReservation(), now.toLocalTime());
        orders.add(order);
        return accepted(request, order, now);
    }

    private String change(Request request, TradingAccount account, LocalDateTime now) throws Refusal {
        FuturesRules.check(request, world);
        FuturesOrder order = orders.named(request, account);
        if (!order.leg1.sameContract(new FuturesLeg(request, true, world))) {
            throw Refusal.rejected("與原委託不符");
        }
        world.futuresHours.check(order.isReservation(), now.toLocalTime());
        if (order.open() == 0) {
            throw Refusal.rejected("委託已無剩餘口數");
        }
        apply(request, order);
        return accepted(request, order, now);
    }

    /** The quantity of a change is what is taken off the order. */
    private static void apply(Request request, FuturesOrder order) throws Refusal {
        switch (request.function()) {
            case 'A':
                order.price = request.get("31");
                break;
            case 'C':
                long less = request.number("37");
                if (less == 0 || less > order.open()) {
                    throw Refusal.rejected("改量口數錯誤");
                }
                order.reduced += less;
                break;
            default:
                order.cancelled += order.open();
                break;
        }
    }

    private static String accepted(Request request, FuturesOrder order, LocalDateTime now) {
        return Reply.order(request).field("39", " ").field("19", order.isReservation() ? 'X' : 'S')
                .field("46", order.gatewayNumber).field("44", Texts.date(now.toLocalDate()))
                .field("MT", "0").field("K1", "").text();
    }

    void fill(String number, long contracts, String price1, String price2, LocalDateTime at) {
        FuturesOrder order = orders.existing(number);
        order.checkFill(contracts, "contracts");
        if (order.fillOrKill.equals("1") && contracts != order.open()) {
            throw new IllegalArgumentException("The order " + number + " is filled whole or not at"
                    + " all: fill its " + order.open() + " contracts at once.");
        }
        order.filled += contracts;
        fills.add(new FuturesFill(order, contracts, new BigDecimal(price1),
                price2.isEmpty() ? BigDecimal.ZERO : new BigDecimal(price2), at));
        if (order.atOnce()) {
            order.cancelled += order.open();
        }
    }

    void fail(String number, String text) {
        orders.existing(number).fail(text);
    }
}
