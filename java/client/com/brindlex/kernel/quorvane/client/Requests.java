package com.brindlex.kernel.quorvane.client;

import java.util.concurrent.atomic.AtomicInteger;
import org.jetbrains.annotations.NotNull;
import org.jetbrains.annotations.Nullable;

/**
 * The requests of one user in one session, numbered one after another. May be used by several
 * threads at once.
 *
 * <pre>{@code
 * Requests requests = Requests.of(session, user);
 * Request<StockOrderReceipt> order = requests.stockOrder()
 *         .buy("2330").quantity(Quantity.lots(2)).price(Price.of("600.5")).live().build();
 * Reply<StockOrderReceipt> reply = order.read(send(order.text()));
 * }</pre>
 *
 * <p>Whatever cannot be sent is refused by an {@link InvalidRequestException} that tells all that
 * is wrong, here or by the {@code build()} of what is returned. The first call loads the library;
 * see {@link com.brindlex.kernel.quorvane.NativeLibrary}.
 */
public final class Requests {
    private final Session session;
    private final Credentials user;
    private final AtomicInteger sequence;

    private Requests(Session session, Credentials user) {
        this.session = session;
        this.user = user;
        this.sequence = new AtomicInteger(session.sequence());
    }

    /** The requests of a user; the first has the number of the session. */
    @NotNull
    public static Requests of(@NotNull Session session, @NotNull Credentials user) {
        return new Requests(session, user);
    }

    private Session next() {
        int number = sequence.getAndIncrement();
        return session.withSequence(number < 0 && session.sequence() >= 0
                ? number & Integer.MAX_VALUE : number);
    }

    private <T> Draft<T> open(Operation operation, ReplyType<T> replyType) {
        return new Draft<T>(operation, next(), replyType);
    }

    private <T> Draft<T> asUser(Operation operation, ReplyType<T> replyType) {
        Draft<T> draft = open(operation, replyType);
        user.fill(draft);
        return draft;
    }

    private boolean isJzg() {
        return session.brokerage() == Brokerage.JZG;
    }

    // Accounts

    /** Logs in. */
    @NotNull
    public Request<Accounts> login() {
        return asUser(Operation.AUTH_ENCODE, ReplyTypes.AUTH).build();
    }

    /** Asks for all trading accounts. */
    @NotNull
    public Request<Accounts> accounts() {
        return asUser(Operation.GET_TOTAL_ACCOUNT_ENCODE, ReplyTypes.GET_TOTAL_ACCOUNT).build();
    }

    /** Asks for the opening of an account. */
    @NotNull
    public Request<Confirmation> openAccount(@NotNull String name, @NotNull String address,
            @NotNull String telephone, @NotNull ContactTime time, @NotNull AccountItem item) {
        Draft<Confirmation> draft = open(Operation.OPEN_ACCOUNT_ENCODE, ReplyTypes.OPEN_ACCOUNT);
        user.identify(draft);
        return draft.set("name", name).set("address", address).set("tel", telephone)
                .set("time", time).set("item", item).build();
    }

    /** Asks for another trading password; afterwards requests need credentials with the new one. */
    @NotNull
    public Request<Confirmation> changePassword(@NotNull String newPassword) {
        return asUser(Operation.CHANGE_PASSWORD_ENCODE, ReplyTypes.CHANGE_PASSWORD)
                .set("newPassword", newPassword).build();
    }

    /** Asks for the balance of the linked bank account. */
    @NotNull
    public Request<BankBalance> bankBalance() {
        return asUser(Operation.QUERY_BANK_REMAIN_ENCODE, ReplyTypes.QUERY_BANK_REMAIN).build();
    }

    // Certificates

    /** Registers a certificate; its message may be of any length. */
    @NotNull
    public Request<CertificateText> registerCertificate(@NotNull String message) {
        return certificate(Operation.REGISTER_CERT_ENCODE, ReplyTypes.REGISTER_CERT, message);
    }

    /** Fetches a certificate. */
    @NotNull
    public Request<CertificateText> fetchCertificate(@NotNull String message) {
        return certificate(Operation.GET_CERT_ENCODE, ReplyTypes.GET_CERT, message);
    }

    /** As {@link #fetchCertificate}, with each step in the diagnostic log. */
    @NotNull
    public Request<CertificateText> fetchCertificateLogged(@NotNull String message) {
        return certificate(Operation.GET_CERT_ENCODE2, ReplyTypes.GET_CERT, message);
    }

    /** Asks for the state of a certificate. */
    @NotNull
    public Request<CertificateText> certificateStatus(@NotNull String message) {
        return certificate(Operation.GET_CERT_STATUS_ENCODE, ReplyTypes.GET_CERT_STATUS, message);
    }

    /** Tells that a certificate is installed. */
    @NotNull
    public Request<CertificateText> certificateInstalled(@NotNull String message) {
        return certificate(Operation.INSTALL_CERT_OK_ENCODE, ReplyTypes.INSTALL_CERT_OK, message);
    }

    /** Tells that a certificate is opened. */
    @NotNull
    public Request<CertificateText> certificateOpened(@NotNull String message) {
        return certificate(Operation.OPEN_CERT_ENCODE, ReplyTypes.OPEN_CERT, message);
    }

    /** Applies for a certificate; the date of birth is sent exactly as given. */
    @NotNull
    public Request<CertificateText> applyForCertificate(
            @NotNull String birth, @NotNull String message) {
        return ofHolder(Operation.APPLY_CERT_ENCODE, ReplyTypes.APPLY_CERT, birth, message);
    }

    /** Renews a certificate; the date of birth is sent exactly as given. */
    @NotNull
    public Request<CertificateText> renewCertificate(
            @NotNull String birth, @NotNull String message) {
        return ofHolder(Operation.RE_NEW_CERT_ENCODE, ReplyTypes.RE_NEW_CERT, birth, message);
    }

    /** Revokes a certificate; the date of birth is sent exactly as given. */
    @NotNull
    public Request<CertificateText> revokeCertificate(
            @NotNull String birth, @NotNull String message) {
        return ofHolder(Operation.REVOKE_CERT_ENCODE, ReplyTypes.REVOKE_CERT, birth, message);
    }

    private Request<CertificateText> certificate(
            Operation operation, ReplyType<CertificateText> replyType, String message) {
        return open(operation, replyType).set("certMsg", message).build();
    }

    private Request<CertificateText> ofHolder(Operation operation,
            ReplyType<CertificateText> replyType, String birth, String message) {
        return asUser(operation, replyType).set("birth", birth).set("certMsg", message).build();
    }

    // Stocks

    /** A new stock order, to be filled in. */
    @NotNull
    public StockOrderBuilder stockOrder() {
        return new StockOrderBuilder(next(), user);
    }

    /** The short notice of a stock order: no order, no amendment. */
    @NotNull
    public Request<StockOrderReceipt> stockNotice(
            @NotNull StockFunction function, @NotNull TradeType type) {
        Draft<StockOrderReceipt> draft =
                asUser(Operation.SUBMIT_ORDER_ENCODE2, ReplyTypes.SUBMIT_ORDER);
        if (function == StockFunction.UNKNOWN) {
            draft.refuse("function", "must have a letter");
        } else {
            draft.set("function", function.code().charAt(0));
        }
        return draft.set("tradeType", type).build();
    }

    /** The cancellation of an order of the book, to be filled in where the book is silent. */
    @NotNull
    public StockAmendment cancel(@NotNull StockOrder order) {
        return new StockAmendment(next(), user, order, null);
    }

    /**
     * A change of the quantity of an order of the book, to be filled in where the book is silent.
     *
     * @param quantity what is to be taken off the order
     */
    @NotNull
    public StockAmendment changeQuantity(@NotNull StockOrder order, @NotNull Quantity quantity) {
        return new StockAmendment(next(), user, order, quantity);
    }

    /** The stock order book of a day: lots. */
    @NotNull
    public Request<StockOrders> stockOrders(@NotNull TradeDate day) {
        return stockOrders(day, TradeType.LOTS);
    }

    /** The stock order book of a day, of one trade type. */
    @NotNull
    public Request<StockOrders> stockOrders(@NotNull TradeDate day, @NotNull TradeType type) {
        return asUser(Operation.QUERY_ORDER_ENCODE, ReplyTypes.QUERY_ORDER)
                .set("date", day).set("tradeType", type).build();
    }

    /** The stock fills of a period, both days included. */
    @NotNull
    public Request<StockFills> stockFills(@NotNull TradeDate first, @NotNull TradeDate last) {
        return period(asUser(Operation.QUERY_REPLY_ENCODE, ReplyTypes.QUERY_REPLY), "startDate",
                first, last).build();
    }

    /** The positions in stocks. */
    @NotNull
    public Request<StockPositions> stockPositions() {
        return asUser(Operation.QUERY_INVENTORY_ENCODE,
                isJzg() ? ReplyTypes.QUERY_INVENTORY_JZG : ReplyTypes.QUERY_INVENTORY).build();
    }

    /** The credit figures of a stock. */
    @NotNull
    public Request<CreditFigures> creditFigures(@NotNull String stockCode) {
        return asUser(Operation.QUERY_CREDIT_INFO_ENCODE, ReplyTypes.QUERY_CREDIT_INFO)
                .set("stockCode", stockCode).build();
    }

    /** The settled trades of one of the periods of the broker. */
    @NotNull
    public Request<SettledTrades> settlement(@NotNull SettlementPeriod period) {
        Draft<SettledTrades> draft = settlement();
        if (period.number() < 1 || period.number() > 6) {
            draft.refuse("periodOrStartDate", "must be a period from 1 to 6, not " + period);
        }
        return draft.set("periodOrStartDate", (Object) period.toString()).build();
    }

    /** The settled trades of a period, both days included. */
    @NotNull
    public Request<SettledTrades> settlement(@NotNull TradeDate first, @NotNull TradeDate last) {
        return period(settlement(), "periodOrStartDate", first, last).build();
    }

    private Draft<SettledTrades> settlement() {
        return asUser(Operation.PAYMENT_ENCODE,
                isJzg() ? ReplyTypes.PAYMENT_JZG : ReplyTypes.PAYMENT);
    }

    private static <T> Draft<T> period(
            Draft<T> draft, String start, TradeDate first, TradeDate last) {
        if (first.compareTo(last) > 0) {
            draft.refuse("endDate", "must not lie before " + first + ", as " + last + " does");
        }
        return draft.set(start, first).set("endDate", last);
    }

    // Futures and options

    /** A new order for futures or options, to be filled in. */
    @NotNull
    public FuturesOrderBuilder futuresOrder() {
        return new FuturesOrderBuilder(next(), user);
    }

    /** The cancellation of an order of the book, to be filled in where the book is silent. */
    @NotNull
    public FuturesAmendment cancel(@NotNull FuturesOrder order) {
        return amend(order, FuturesAmendment.Function.CANCEL, null, null);
    }

    /**
     * A change of the quantity of an order of the book, to be filled in where the book is silent.
     *
     * @param contracts what is to be taken off the order
     */
    @NotNull
    public FuturesAmendment changeQuantity(@NotNull FuturesOrder order, int contracts) {
        return amend(order, FuturesAmendment.Function.CHANGE_QUANTITY, contracts, null);
    }

    /**
     * A change of the price of an order of the book, to be filled in where the book is silent. It
     * always has its signature in tag PL, the one form that signs the price.
     */
    @NotNull
    public FuturesAmendment changePrice(@NotNull FuturesOrder order, @NotNull Price price) {
        return amend(order, FuturesAmendment.Function.CHANGE_PRICE, null, price);
    }

    private FuturesAmendment amend(FuturesOrder order, FuturesAmendment.Function function,
            @Nullable Integer quantity, @Nullable Price price) {
        return new FuturesAmendment(next(), user, order, function, quantity, price);
    }

    /** The futures order book of a day: selection 0. */
    @NotNull
    public Request<FuturesOrders> futuresOrders(@NotNull TradeDate day) {
        return futuresOrders(day, OrderSelection.of(0));
    }

    /** The futures order book of a day, of one selection. */
    @NotNull
    public Request<FuturesOrders> futuresOrders(
            @NotNull TradeDate day, @NotNull OrderSelection selection) {
        return asUser(Operation.FUT_QUERY_ORDER_ENCODE, ReplyTypes.FUT_QUERY_ORDER)
                .set("date", day).set("selection", selection).build();
    }

    /** The futures and options fills of a period, both days included. */
    @NotNull
    public Request<FuturesFills> futuresFills(@NotNull TradeDate first, @NotNull TradeDate last) {
        return period(asUser(Operation.FUT_QUERY_REPLY_ENCODE, ReplyTypes.FUT_QUERY_REPLY),
                "startDate", first, last).build();
    }

    /** The open positions in futures and options. */
    @NotNull
    public Request<FuturesPositions> futuresPositions() {
        return asUser(Operation.FUT_QUERY_INVENTORY_ENCODE, ReplyTypes.FUT_QUERY_INVENTORY).build();
    }

    /** The margin account: query type 0. */
    @NotNull
    public Request<MarginAccount> margin() {
        return margin(MarginQuery.of(0));
    }

    /** The margin account of one query type. */
    @NotNull
    public Request<MarginAccount> margin(@NotNull MarginQuery query) {
        return asUser(Operation.QUERY_FINANCE_ENCODE, ReplyTypes.QUERY_FINANCE)
                .set("queryType", query).build();
    }
}
