package com.brindlex.kernel.quorvane.simulator;

import java.math.BigDecimal;
import java.time.LocalDate;
import java.time.LocalDateTime;
import java.util.ArrayList;
import java.util.List;

/** Takes futures and options orders, changes and cancels them, and lets the exchange fill them. */
final class FuturesDesk {
    private final CustomerBook customers;
    private final OrderBook<FuturesOrder> orders = new OrderBook<>();
    private final List<FuturesFill> fills = new ArrayList<>();
    private final FuturesLists lists;

    FuturesDesk(CustomerBook customers, LocalDate today) {
        this.customers = customers;
        this.lists = new FuturesLists(orders, fills, today);
    }

    String answer(Request request, LocalDateTime now) throws Refusal {
        Account account = customers.party(request).account;
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

    private String enter(Request request, Account account, LocalDateTime now) throws Refusal {
        FuturesRules.check(request);
        FuturesOrder order = new FuturesOrder(request, account, orders.next(), now);
        if (lists.margin(account).needed(order) > lists.margin(account).available()) {
            throw Refusal.rejected("保證金不足");
        }
        orders.add(order);
        return accepted(request, order, now);
    }

    private String change(Request request, Account account, LocalDateTime now) throws Refusal {
        FuturesRules.check(request);
        FuturesOrder order = orders.named(request, account);
        if (!order.leg1.sameContract(new FuturesLeg(request, true))) {
            throw Refusal.rejected("與原委託不符");
        }
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
        return Reply.order(request).field("39", " ").field("19", order.n6.equals("0") ? 'X' : 'S')
                .field("46", order.gatewayNumber).field("44", Texts.date(now.toLocalDate()))
                .field("MT", "0").field("K1", "").text();
    }

    void fill(String number, long contracts, String price1, String price2, LocalDateTime at) {
        FuturesOrder order = orders.existing(number);
        boolean whole = contracts == order.open() || !order.fillOrKill.equals("1");
        if (contracts <= 0 || contracts > order.open() || !whole) {
            throw new IllegalArgumentException("the order cannot be filled so: " + number);
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
