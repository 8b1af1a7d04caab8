package com.brindlex.kernel.quorvane.simulator;

import java.time.LocalDate;
import java.util.ArrayList;
import java.util.List;

/** Answers order book, fills, positions and margin of a futures account. */
final class FuturesLists {
    private final OrderBook<FuturesOrder> orders;
    private final List<FuturesFill> fills;
    private final Period session;

    FuturesLists(OrderBook<FuturesOrder> orders, List<FuturesFill> fills, LocalDate today) {
        this.orders = orders;
        this.fills = fills;
        this.session = new Period(today, LocalDate.MAX);
    }

    String answer(Request request, TradingAccount account) throws Refusal {
        switch (request.kind()) {
            case FUTURES_ORDER_BOOK:
                request.number("28");
                return orders.list(request, account, Period.ofWestern(request));
            case FUTURES_FILLS:
                return fillList(request, account);
            case FUTURES_POSITIONS:
                return positions(request, account);
            default:
                if (!request.get("28").matches("-?[0-9]{1,10}")) {
                    throw Refusal.malformed("28");
                }
                return margin(account).reply(request);
        }
    }

    FuturesMargin margin(TradingAccount account) {
        return new FuturesMargin(
                account.balance, openPositions(account), fillsOf(account, session));
    }

    private String fillList(Request request, TradingAccount account) throws Refusal {
        Reply reply = Reply.query(request);
        for (FuturesFill fill : fillsOf(account, Period.ofWestern(request))) {
            fill.write(reply);
        }
        return reply.list();
    }

    private String positions(Request request, TradingAccount account) throws Refusal {
        Reply reply = Reply.query(request);
        for (FuturesPosition position : openPositions(account)) {
            position.write(reply);
        }
        return reply.list();
    }

    private List<FuturesFill> fillsOf(TradingAccount account, Period period) {
        List<FuturesFill> own = new ArrayList<>();
        for (FuturesFill fill : fills) {
            if (fill.order.account == account && period.contains(fill.at)) {
                own.add(fill);
            }
        }
        return own;
    }

    /** Plays the session's fills: the other side closes first, what is left opens or adds. */
    private List<FuturesPosition> openPositions(TradingAccount account) {
        List<FuturesPosition> open = new ArrayList<>();
        for (FuturesFill fill : fillsOf(account, session)) {
            long left = fill.contracts;
            for (FuturesPosition position : open) {
                if (position.opposite(fill)) {
                    left = position.shrink(left);
                }
            }
            open.removeIf(position -> position.contracts() == 0);
            if (left > 0) {
                add(open, fill, left);
            }
        }
        return open;
    }

    private static void add(List<FuturesPosition> open, FuturesFill fill, long contracts) {
        for (FuturesPosition position : open) {
            if (position.sameSide(fill)) {
                position.grow(fill, contracts);
                return;
            }
        }
        open.add(new FuturesPosition(fill, contracts));
    }
}
