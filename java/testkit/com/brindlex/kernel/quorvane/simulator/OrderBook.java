package com.brindlex.kernel.quorvane.simulator;

import java.util.ArrayList;
import java.util.Iterator;
import java.util.List;

/** The orders of one desk, in the order of their entry. */
final class OrderBook<T extends BookedOrder> implements Iterable<T> {
    private static final int MAX_NUMBER = 9999;

    private final List<T> orders = new ArrayList<>();

    /** The sequence number of the next order. */
    int next() throws Refusal {
        if (orders.size() == MAX_NUMBER) {
            throw Refusal.rejected("委託書號已滿");
        }
        return orders.size() + 1;
    }

    void add(T order) {
        orders.add(order);
    }

    /** The order that a change or cancellation names; it must be the account's own. */
    T named(Request request, TradingAccount account) throws Refusal {
        T order = find(request.get("36"));
        if (order == null || order.account != account
                || !order.gatewayNumber.equals(request.get("46"))) {
            throw Refusal.rejected("查無此委託");
        }
        return order;
    }

    /** The order that the exchange acts on. */
    T existing(String number) {
        T order = find(number);
        if (order == null) {
            List<String> numbers = new ArrayList<>();
            orders.forEach(each -> numbers.add(each.number));
            throw new IllegalArgumentException("There is no order " + number + " in the book, which"
                    + " has " + (numbers.isEmpty() ? "none yet" : String.join(", ", numbers)) + ".");
        }
        return order;
    }

    private T find(String number) {
        for (T order : orders) {
            if (order.number.equals(number)) {
                return order;
            }
        }
        return null;
    }

    /** The reply to an order book query: the account's orders of a period. */
    String list(Request request, TradingAccount account, Period period) throws Refusal {
        Reply reply = Reply.query(request);
        for (T order : orders) {
            if (order.account == account && period.contains(order.entered)) {
                order.write(reply);
            }
        }
        return reply.list();
    }

    @Override
    public Iterator<T> iterator() {
        return orders.iterator();
    }
}
