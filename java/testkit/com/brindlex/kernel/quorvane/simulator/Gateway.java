package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Operation;
import com.brindlex.kernel.quorvane.client.TradeDate;
import java.time.LocalDate;
import java.util.ArrayList;
import java.util.List;
import java.util.NoSuchElementException;
import java.util.StringJoiner;
import org.jetbrains.annotations.NotNull;

/**
 * The broker's gateway in a test: takes a request text, gives the reply text, and keeps accounts,
 * orders, fills and positions of one session in memory.
 *
 * <pre>{@code
 * Gateway gateway = Gateway.open();
 * Requests requests = Requests.of(Session.of("SN0001", "10.0.0.1"), ReadyMade.STOCK_USER);
 * Request<Accounts> login = requests.login();
 * Reply<Accounts> reply = login.read(gateway.answer(login.text()));
 * }</pre>
 *
 * <p>{@link #open} opens on the world of {@link ReadyMade}, {@link #readyMade} lets you change that
 * world, {@link #builder} begins with none. Nothing is random: the same requests on the same clock
 * give the same replies. Calls may come from several threads; they are carried out one after another,
 * and one whose reply is delayed holds up no other.
 */
public final class Gateway {
    private final World world;
    private final AccountDesk accounts;
    private final CertificateOffice certificates;
    private final StockDesk stocks;
    private final FuturesDesk futures;
    private final Disturbances disturbances = new Disturbances();
    private final List<RecordedRequest> requests = new ArrayList<>();
    private Line line = Line.UP;

    Gateway(World world) {
        this.world = world;
        CustomerBook customers = new CustomerBook(world);
        accounts = new AccountDesk(customers, world);
        certificates = new CertificateOffice(customers);
        stocks = new StockDesk(customers, world);
        futures = new FuturesDesk(customers, world);
    }

    /** Opens a gateway on the ready-made world, with the clock of the system. */
    @NotNull
    public static Gateway open() {
        return readyMade().build();
    }

    /** Begins with the ready-made world, to change or add to it. */
    @NotNull
    public static GatewayBuilder readyMade() {
        return ReadyMade.builder();
    }

    /** Begins with nobody and nothing. */
    @NotNull
    public static GatewayBuilder builder() {
        return new GatewayBuilder(new World());
    }

    /** The gateway's day, for requests that name one: the device may have another. */
    @NotNull
    public TradeDate today() {
        LocalDate today = world.today();
        return TradeDate.of(today.getYear(), today.getMonthValue(), today.getDayOfMonth());
    }

    /**
     * Answers a request, records it, and lets happen to it what {@link #disturbNext} and {@link
     * #disturbAll} asked for.
     *
     * @param text the request as the library built it
     * @return the reply as the library reads it; the empty text when the thread was interrupted while
     *     the reply was delayed
     */
    @NotNull
    public String answer(@NotNull String text) {
        Disturbance disturbance;
        String reply;
        synchronized (this) {
            Request request = null;
            Refusal malformed = null;
            try {
                request = RequestParser.parse(text);
            } catch (Refusal refusal) {
                malformed = refusal;
            }
            disturbance = line == Line.UP
                    ? disturbances.take(request == null ? null : request.operation())
                    : Disturbance.down(line);
            String carriedOut = !disturbance.arrives ? ""
                    : request == null ? Reply.refusal(text.startsWith("F=1|"), malformed)
                                      : carryOut(request);
            reply = disturbance.change(carriedOut);
            requests.add(new RecordedRequest(text, request, disturbance, reply));
        }
        return disturbance.await() ? reply : "";
    }

    private String carryOut(Request request) {
        try {
            HeaderCheck.check(request, world);
            return dispatch(request);
        } catch (Refusal refusal) {
            return Reply.refusal(request.kind().isOrder(), refusal);
        }
    }

    private String dispatch(Request request) throws Refusal {
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
                return certificates.answer(request, world.today());
            case FUTURES_NEW:
            case FUTURES_NEW_1:
            case FUTURES_CHANGE:
            case FUTURES_CHANGE_1:
            case FUTURES_ORDER_BOOK:
            case FUTURES_FILLS:
            case FUTURES_POSITIONS:
            case FUTURES_MARGIN:
                return futures.answer(request, world.now());
            default:
                return stocks.answer(request, world.now());
        }
    }

    /** Takes the way to the host down or brings it up again. While it is down nothing is done. */
    public synchronized void setLine(@NotNull Line line) {
        this.line = line;
    }

    /** Sets the notice that comes with a login; the empty text for none. */
    public synchronized void setNotice(@NotNull String text) {
        accounts.setNotice(text);
    }

    /** Something happens to the next request; asked for several times, to one after another. */
    public synchronized void disturbNext(@NotNull Disturbance disturbance) {
        disturbances.add(disturbance);
    }

    /**
     * Something happens to the next request of an operation; this comes before what waits for any.
     *
     * @param operation an encoder, such as {@code Operation.SUBMIT_ORDER_ENCODE}
     */
    public synchronized void disturbNext(
            @NotNull Operation operation, @NotNull Disturbance disturbance) {
        disturbances.add(encoder(operation), disturbance);
    }

    /** Something happens to every request, but for those that something else waits for. */
    public synchronized void disturbAll(@NotNull Disturbance disturbance) {
        disturbances.stand(disturbance);
    }

    /** Nothing happens to requests any more. The line stays as it is. */
    public synchronized void calm() {
        disturbances.clear();
    }

    /** Every request that came, in its order. */
    @NotNull
    public synchronized List<RecordedRequest> requests() {
        return new ArrayList<>(requests);
    }

    /** Every request of an operation, in its order; {@code requests(Operation.named("AuthEncode"))}. */
    @NotNull
    public List<RecordedRequest> requests(@NotNull Operation operation) {
        Operation wanted = encoder(operation);
        List<RecordedRequest> own = requests();
        own.removeIf(request -> request.operation() != wanted);
        return own;
    }

    /**
     * The last request of an operation.
     *
     * @throws NoSuchElementException when none came, with those that did
     */
    @NotNull
    public RecordedRequest lastRequest(@NotNull Operation operation) {
        List<RecordedRequest> own = requests(operation);
        if (own.isEmpty()) {
            StringJoiner came = new StringJoiner(", ");
            came.setEmptyValue("nothing");
            requests().forEach(request -> came.add(
                    request.operation() == null ? "a text that is no request"
                                                : request.operation().method()));
            throw new NoSuchElementException(
                    "No request of " + operation.method() + " came; what came: " + came + ".");
        }
        return own.get(own.size() - 1);
    }

    private static Operation encoder(Operation operation) {
        if (!operation.isEncoder()) {
            throw new IllegalArgumentException(operation.method() + " reads replies; requests are"
                    + " known by the encoder that builds them.");
        }
        return operation == Operation.GET_CERT_ENCODE2 ? Operation.GET_CERT_ENCODE : operation;
    }

    /**
     * The exchange fills part of a stock order.
     *
     * @param orderNumber number of the order, {@code StockOrder.orderNumber()}
     * @param shares shares filled, at most what is open
     * @param price the price, such as {@code "994.50"}, not worse than the order's
     * @throws IllegalArgumentException when it cannot be filled so, with the reason
     */
    public synchronized void fillStock(
            @NotNull String orderNumber, long shares, @NotNull String price) {
        stocks.fill(orderNumber, shares, ListedStock.hundredths(price), world.now());
    }

    /**
     * The exchange fills part of a futures order of one leg.
     *
     * @param orderNumber number of the order, {@code FuturesOrder.orderNumber()}
     * @param contracts contracts filled, at most what is open
     * @param price the price, such as {@code "18000"}
     * @throws IllegalArgumentException when it cannot be filled so, with the reason
     */
    public void fillFutures(@NotNull String orderNumber, long contracts, @NotNull String price) {
        fillFutures(orderNumber, contracts, price, "");
    }

    /**
     * The exchange fills part of a futures order.
     *
     * @param price1 the price of leg 1
     * @param price2 the price of leg 2, empty for one leg
     * @see #fillFutures(String, long, String)
     */
    public synchronized void fillFutures(@NotNull String orderNumber, long contracts,
            @NotNull String price1, @NotNull String price2) {
        futures.fill(orderNumber, contracts, price1, price2, world.now());
    }

    /** The exchange refuses a stock order after the broker had taken it. */
    public synchronized void failStock(@NotNull String orderNumber, @NotNull String text) {
        stocks.fail(orderNumber, text);
    }

    /** The exchange refuses a futures order after the broker had taken it. */
    public synchronized void failFutures(@NotNull String orderNumber, @NotNull String text) {
        futures.fail(orderNumber, text);
    }
}
