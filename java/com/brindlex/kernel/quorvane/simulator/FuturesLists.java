package com.brindlex.kernel.quorvane.simulator;

import java.time.LocalDate;
import java.util.ArrayList;
import java.util.List;

/** Answers order book, fills, positions and margin of a futures account. */
final class FuturesLists {
    private final List<FuturesOrder> orders;
    private final List<FuturesFill> fills;
    private final LocalDate today;

    FuturesLists(List<FuturesOrder> orders, List<FuturesFill> fills, LocalDate today) {
        this.orders = orders;
        this.fills = fills;
        this.today = today;
    }

    String answer(Request request, Account account) throws Refusal {
        switch (request.kind()) {
            case FUTURES_ORDER_BOOK:
                return orderBook(request, account);
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

    FuturesMargin margin(Account account) {
        return new FuturesMargin(
                openPositions(account), fillsOf(account, LocalDate.MIN, LocalDate.MAX));
    }

    private String orderBook(Request request, Account account) throws Refusal {
        LocalDate first = westernDate(request, "SDATE");
        LocalDate last = westernDate(request, "EDATE");
        request.number("28");
        Reply reply = Reply.query(request);
        for (FuturesOrder order : orders) {
            LocalDate day = order.entered.toLocalDate();
            if (order.account == account && !day.isBefore(first) && !day.isAfter(last)) {
                order.write(reply);
            }
        }
        return reply.list();
    }

    private String fillList(Request request, Account account) throws Refusal {
        LocalDate first = westernDate(request, "SDATE");
        LocalDate last = westernDate(request, "EDATE");
        Reply reply = Reply.query(request);
        for (FuturesFill fill : fillsOf(account, first, last)) {
            fill.write(reply);
        }
        return reply.list();
    }

    private static LocalDate westernDate(Request request, String tag) throws Refusal {
        if (request.get(tag).length() != 8) {
            throw Refusal.malformed(tag);
        }
        return Texts.date(request.get(tag), tag);
    }

    private String positions(Request request, Account account) throws Refusal {
        Reply reply = Reply.query(request);
        for (FuturesPosition position : openPositions(account)) {
            position.write(reply);
        }
        return reply.list();
    }

    private List<FuturesFill> fillsOf(Account account, LocalDate first, LocalDate last) {
        List<FuturesFill> own = new ArrayList<>();
        for (FuturesFill fill : fills) {
            if (fill.order.account == account && fill.within(first, last)) {
                own.add(fill);
            }
        }
        return own;
    }

    /** Plays the session's fills: the other side closes first, what is left opens or adds. */
    private List<FuturesPosition> openPositions(Account account) {
        List<FuturesPosition> open = new ArrayList<>();
        for (FuturesFill fill : fillsOf(account, today, LocalDate.MAX)) {
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
