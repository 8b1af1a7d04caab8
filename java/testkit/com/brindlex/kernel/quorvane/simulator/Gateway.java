package com.brindlex.kernel.quorvane.simulator;

import java.time.Clock;
import java.time.LocalDate;
import java.time.LocalDateTime;

/**
 * The gateway: takes a request text, gives the reply text.
 *
 * <p>One gateway is one trading session in memory. Calls may come from several threads; they are
 * answered one after another.
 */
public final class Gateway {
    private final Clock clock;
    private final CustomerBook customers = CustomerBook.sample();
    private final AccountDesk accounts = new AccountDesk(customers);
    private final CertificateOffice certificates = new CertificateOffice(customers);
    private final StockDesk stocks;
    private final FuturesDesk futures;
    private Line line = Line.UP;

    /** Opens a session on the given clock with the standard reply layouts. */
    public Gateway(Clock clock) {
        this(clock, Brokerage.STANDARD);
    }

    /** Opens a session on the given clock and with the reply layouts of a brokerage. */
    public Gateway(Clock clock, Brokerage brokerage) {
        this.clock = clock;
        this.stocks = new StockDesk(customers, brokerage, LocalDate.now(clock));
        this.futures = new FuturesDesk(customers, LocalDate.now(clock));
    }

    /** Takes the way to the host down or brings it up again. */
    public synchronized void setLine(Line line) {
        this.line = line;
    }

    /** Sets the notice that comes with a login; the empty text for none. */
    public synchronized void setNotice(String text) {
        accounts.setNotice(text);
    }

    /**
     * The exchange fills part of a stock order.
     *
     * @param orderNumber number of the order (field 1 of the order book)
     * @param shares shares filled, at most what is open
     * @param hundredths price in hundredths
     */
    public synchronized void fillStock(String orderNumber, long shares, long hundredths) {
        stocks.fill(orderNumber, shares, hundredths, LocalDateTime.now(clock));
    }

    /**
     * The exchange fills part of a futures order.
     *
     * @param orderNumber number of the order (field 1 of the order book)
     * @param contracts contracts filled, at most what is open
     * @param price1 price of leg 1 as text
     * @param price2 price of leg 2 as text, empty for one leg
     */
    public synchronized void fillFutures(
            String orderNumber, long contracts, String price1, String price2) {
        futures.fill(orderNumber, contracts, price1, price2, LocalDateTime.now(clock));
    }

    /** The exchange refuses a stock order after the broker had taken it. */
    public synchronized void failStock(String orderNumber, String text) {
        stocks.fail(orderNumber, text);
    }

    /** The exchange refuses a futures order after the broker had taken it. */
    public synchronized void failFutures(String orderNumber, String text) {
        futures.fail(orderNumber, text);
    }

    /**
     * Answers a request.
     *
     * @param text the request as the library built it
     * @return the reply as the library reads it; a transport marker while the line is down
     */
    public synchronized String answer(String text) {
        if (line.reply != null) {
            return line.reply;
        }
        try {
            Request request = RequestParser.parse(text);
            LocalDateTime now = LocalDateTime.now(clock);
            HeaderCheck.check(request, now);
            return dispatch(request, now);
        } catch (Refusal refusal) {
            return Reply.refusal(text.startsWith("F=1|"), refusal);
        }
    }

    private String dispatch(Request request, LocalDateTime now) throws Refusal {
        switch (request.kind()) {
            case LOGIN:
                return accounts.login(request);
            case ACCOUNT_LIST:
                return accounts.accountList(request);
            case OPEN_ACCOUNT:
                return accounts.openAccount(request);
            case CHANGE_PASSWORD:
                return accounts.changePassword(request);
            case BANK_BALANCE:
                return accounts.bankBalance(request);
            case REGISTER_CERTIFICATE:
            case GET_CERTIFICATE:
            case APPLY_CERTIFICATE:
            case CERTIFICATE_STATUS:
            case RENEW_CERTIFICATE:
            case CERTIFICATE_INSTALLED:
            case CERTIFICATE_OPENED:
            case REVOKE_CERTIFICATE:
                return certificates.answer(request, now.toLocalDate());
            case FUTURES_NEW:
            case FUTURES_NEW_1:
            case FUTURES_CHANGE:
            case FUTURES_CHANGE_1:
            case FUTURES_ORDER_BOOK:
            case FUTURES_FILLS:
            case FUTURES_POSITIONS:
            case FUTURES_MARGIN:
                return futures.answer(request, now);
            default:
                return stocks.answer(request, now);
        }
    }
}
