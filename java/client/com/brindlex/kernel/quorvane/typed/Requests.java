package com.brindlex.kernel.quorvane.typed;

/**
 * Opens a request of each kind. Set what it needs by name, then {@code encode()} it:
 *
 * <pre>{@code
 * Encoded order = Requests.stockOrder(session, credentials)
 *         .side(Side.BUY).stockCode("2330").quantityLots(2).priceHundredths(60000)
 *         .encode();
 * }</pre>
 */
public final class Requests {
    private Requests() {}

    /** Asks for login. */
    public static Request login(Session session, Credentials credentials) {
        return new Request(Operation.AUTH_ENCODE, session, credentials);
    }

    /** Asks for the list of all trading accounts. */
    public static Request accountList(Session session, Credentials credentials) {
        return new Request(Operation.GET_TOTAL_ACCOUNT_ENCODE, session, credentials);
    }

    /** Asks for the opening of an account. */
    public static OpenAccountRequest openAccount(Session session) {
        return new OpenAccountRequest(Operation.OPEN_ACCOUNT_ENCODE, session);
    }

    /** Asks for another trading password. */
    public static ChangePasswordRequest changePassword(Session session, Credentials credentials) {
        return new ChangePasswordRequest(Operation.CHANGE_PASSWORD_ENCODE, session, credentials);
    }

    /** Asks for the balance of the linked bank account. */
    public static Request bankBalance(Session session, Credentials credentials) {
        return new Request(Operation.QUERY_BANK_REMAIN_ENCODE, session, credentials);
    }

    /** Asks for the registration of a certificate. */
    public static CertificateRequest registerCertificate(Session session) {
        return new CertificateRequest(Operation.REGISTER_CERT_ENCODE, session);
    }

    /** Asks for a certificate. */
    public static CertificateRequest certificate(Session session) {
        return new CertificateRequest(Operation.GET_CERT_ENCODE, session);
    }

    /** Asks for a certificate, for long messages. */
    public static CertificateRequest certificate2(Session session) {
        return new CertificateRequest(Operation.GET_CERT_ENCODE2, session);
    }

    /** Asks for the state of a certificate. */
    public static CertificateRequest certificateStatus(Session session) {
        return new CertificateRequest(Operation.GET_CERT_STATUS_ENCODE, session);
    }

    /** Asks for the note that a certificate is installed. */
    public static CertificateRequest certificateInstalled(Session session) {
        return new CertificateRequest(Operation.INSTALL_CERT_OK_ENCODE, session);
    }

    /** Asks for the note that a certificate is opened. */
    public static CertificateRequest certificateOpened(Session session) {
        return new CertificateRequest(Operation.OPEN_CERT_ENCODE, session);
    }

    /** Asks for a new certificate. */
    public static CertificateHolderRequest applyForCertificate(
            Session session, Credentials credentials) {
        return new CertificateHolderRequest(Operation.APPLY_CERT_ENCODE, session, credentials);
    }

    /** Asks for the renewal of a certificate. */
    public static CertificateHolderRequest renewCertificate(
            Session session, Credentials credentials) {
        return new CertificateHolderRequest(Operation.RENEW_CERT_ENCODE, session, credentials);
    }

    /** Asks for the revocation of a certificate. */
    public static CertificateHolderRequest revokeCertificate(
            Session session, Credentials credentials) {
        return new CertificateHolderRequest(Operation.REVOKE_CERT_ENCODE, session, credentials);
    }

    /** Asks for a stock order. */
    public static StockOrderRequest stockOrder(Session session, Credentials credentials) {
        return new StockOrderRequest(Operation.SUBMIT_ORDER_ENCODE, session, credentials);
    }

    /** Asks for a stock order, signature in tag PL. */
    public static StockOrderRequest stockOrder1(Session session, Credentials credentials) {
        return new StockOrderRequest(Operation.SUBMIT_ORDER_ENCODE1, session, credentials);
    }

    /** Asks for the short notice of a stock order. */
    public static StockNoticeRequest stockNotice(Session session, Credentials credentials) {
        return new StockNoticeRequest(Operation.SUBMIT_ORDER_ENCODE2, session, credentials);
    }

    /** Asks for the cancellation of a stock order. */
    public static StockChangeRequest cancelStockOrder(Session session, Credentials credentials) {
        return new StockChangeRequest(Operation.CANCEL_ORDER_ENCODE, session, credentials);
    }

    /** Asks for the cancellation of a stock order, signature in tag PL. */
    public static StockChangeRequest cancelStockOrder1(Session session, Credentials credentials) {
        return new StockChangeRequest(Operation.CANCEL_ORDER_ENCODE1, session, credentials);
    }

    /** Asks for a smaller quantity of a stock order. */
    public static StockChangeRequest changeStockOrder(Session session, Credentials credentials) {
        return new StockChangeRequest(Operation.CHANGE_ORDER_ENCODE, session, credentials);
    }

    /** Asks for a smaller quantity of a stock order, signature in tag PL. */
    public static StockChangeRequest changeStockOrder1(Session session, Credentials credentials) {
        return new StockChangeRequest(Operation.CHANGE_ORDER_ENCODE1, session, credentials);
    }

    /** Asks for the stock order book of one day. */
    public static OrderBookRequest stockOrders(Session session, Credentials credentials) {
        return new OrderBookRequest(Operation.QUERY_ORDER_ENCODE, session, credentials);
    }

    /** Asks for the stock fills of a period. */
    public static PeriodRequest stockFills(Session session, Credentials credentials) {
        return new PeriodRequest(Operation.QUERY_REPLY_ENCODE, session, credentials);
    }

    /** Asks for the positions in stocks. */
    public static Request stockPositions(Session session, Credentials credentials) {
        return new Request(Operation.QUERY_INVENTORY_ENCODE, session, credentials);
    }

    /** Asks for the credit figures of a stock. */
    public static CreditRequest creditFigures(Session session, Credentials credentials) {
        return new CreditRequest(Operation.QUERY_CREDIT_INFO_ENCODE, session, credentials);
    }

    /** Asks for the settled trades of a period. */
    public static SettlementRequest settlement(Session session, Credentials credentials) {
        return new SettlementRequest(Operation.PAYMENT_ENCODE, session, credentials);
    }

    /** Asks for a futures or options order. */
    public static FuturesOrderRequest futuresOrder(Session session, Credentials credentials) {
        return new FuturesOrderRequest(Operation.FUT_SUBMIT_ORDER_ENCODE, session, credentials);
    }

    /** Asks for a futures or options order, signature in tag PL. */
    public static FuturesOrderRequest futuresOrder1(Session session, Credentials credentials) {
        return new FuturesOrderRequest(Operation.FUT_SUBMIT_ORDER_ENCODE1, session, credentials);
    }

    /** Asks for the futures order book of one day. */
    public static OrderBookRequest futuresOrders(Session session, Credentials credentials) {
        return new OrderBookRequest(Operation.FUT_QUERY_ORDER_ENCODE, session, credentials);
    }

    /** Asks for the futures fills of a period. */
    public static PeriodRequest futuresFills(Session session, Credentials credentials) {
        return new PeriodRequest(Operation.FUT_QUERY_REPLY_ENCODE, session, credentials);
    }

    /** Asks for the positions in futures and options. */
    public static Request futuresPositions(Session session, Credentials credentials) {
        return new Request(Operation.FUT_QUERY_INVENTORY_ENCODE, session, credentials);
    }

    /** Asks for the margin account. */
    public static MarginRequest margin(Session session, Credentials credentials) {
        return new MarginRequest(Operation.QUERY_FINANCE_ENCODE, session, credentials);
    }
}
