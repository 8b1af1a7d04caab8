package com.brindlex.kernel.quorvane.simulator;

import java.time.LocalDate;
import java.util.List;
import java.util.Map;

/** Answers order book, fills, positions, credit and settlement of a securities account. */
final class StockLists {
    private final OrderBook<StockOrder> orders;
    private final List<StockFill> fills;
    private final StockHoldings holdings;
    private final World world;

    StockLists(OrderBook<StockOrder> orders, List<StockFill> fills, World world) {
        this.orders = orders;
        this.fills = fills;
        this.holdings = new StockHoldings(world.today());
        this.world = world;
    }

    String answer(Request request, TradingAccount account, LocalDate today) throws Refusal {
        switch (request.kind()) {
            case STOCK_ORDER_BOOK:
                request.number("28");
                return orders.list(request, account, Period.of(request));
            case STOCK_FILLS:
                return fillList(request, account);
            case STOCK_POSITIONS:
                return positions(request, account);
            case STOCK_CREDIT:
                return credit(request);
            default:
                return settlement(request, account, today);
        }
    }

    /** Shares that can be sold: held for cash, less what open orders already sell. */
    long sellable(TradingAccount account, String code) {
        StockHoldings.Held holding = holdings.of(account, fills).get(code);
        long shares = holding == null ? 0 : holding.cash();
        for (StockOrder order : orders) {
            boolean sells = order.side == 'S' && order.kind == 0;
            if (sells && order.account == account && order.stock.code.equals(code)) {
                shares -= order.open();
            }
        }
        return shares;
    }

    /** What the account's purchases of the day may cost, those that wait for their fill included. */
    long spent(TradingAccount account, LocalDate today) {
        long spent = 0;
        for (StockOrder order : orders) {
            if (order.account == account && order.entered.toLocalDate().equals(today)) {
                spent += order.cost();
            }
        }
        return spent;
    }

    private String fillList(Request request, TradingAccount account) throws Refusal {
        if (!request.get("57").equals("2")) {
            throw Refusal.malformed("57");
        }
        Period period = Period.ofWestern(request);
        Reply reply = Reply.query(request);
        for (StockFill fill : fills) {
            if (fill.order.account == account && period.contains(fill.at)) {
                fill.write(reply);
            }
        }
        return reply.list();
    }

    private String positions(Request request, TradingAccount account) throws Refusal {
        Map<String, StockHoldings.Held> held = holdings.of(account, fills);
        Reply reply = Reply.query(request);
        holdings.write(held, reply, world.brokerage);
        return reply.list();
    }

    private String credit(Request request) throws Refusal {
        ListedStock stock = world.stocks.get(request.get("29"));
        if (stock == null || !stock.hasCredit()) {
            throw new Refusal(Refusal.Reason.NO_DATA);
        }
        return Reply.query(request)
                .record()
                .field("29", stock.code)
                .field("76", stock.marginQuota)
                .field("77", stock.shortQuota)
                .field("B8", "60")
                .field("B9", "90")
                .field("A0", "Y")
                .field("A1", "Y")
                .field("A2", "N")
                .close()
                .end()
                .text();
    }

    private String settlement(Request request, TradingAccount account, LocalDate today) throws Refusal {
        if (!request.get("H4").equals("1")) {
            throw Refusal.malformed("H4");
        }
        Period period = request.get("SDATE").length() == 1
                ? new Period(today.minusDays(daysBack(request)), today)
                : Period.of(request);
        Reply reply = Reply.query(request);
        for (StockFill fill : fills) {
            if (fill.order.account == account && period.contains(fill.at)) {
                fill.writeSettlement(reply, world.brokerage);
            }
        }
        return reply.list();
    }

    /** Period codes; there is no code 3. */
    private static int daysBack(Request request) throws Refusal {
        if (!request.get("EDATE").isEmpty()) {
            throw Refusal.malformed("EDATE");
        }
        switch (request.get("SDATE")) {
            case "1":
                return 0;
            case "2":
                return 1;
            case "4":
                return 7;
            case "5":
                return 30;
            case "6":
                return 90;
            case "7":
                return 180;
            default:
                throw Refusal.malformed("SDATE");
        }
    }
}
