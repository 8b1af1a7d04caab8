package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Credentials;
import java.time.LocalDate;

/**
 * The ready-made world, for tests that want no other: {@link Gateway#open} opens on it, {@link
 * Gateway#readyMade} begins with it.
 *
 * <table>
 * <caption>Customers</caption>
 * <tr><th>ID number</th><th>Password</th><th>Born</th><th>Bank</th><th>Accounts</th></tr>
 * <tr><td>A123456789</td><td>pass1234</td><td>1980-01-01</td><td>1,250,000</td><td>securities
 * 9A01-1234567 and 9A01-0009876, futures F001-7654321 with a balance of 1,500,000</td></tr>
 * <tr><td>B298765432</td><td>secret99</td><td>1975-12-31</td><td>80,000</td><td>securities
 * 9A02-2222222, blocked</td></tr>
 * </table>
 *
 * <p>Account 1234567 holds 5000 shares of 2317 and 2000 more on margin, 10350 shares of 0050 of
 * which 1000 are pledged, and has sold 1000 shares of 2330 short.
 *
 * <table>
 * <caption>Stocks; prices move within ten percent</caption>
 * <tr><th>Code</th><th>Reference price</th><th>Credit</th></tr>
 * <tr><td>2330</td><td>1000.00</td><td>yes</td></tr>
 * <tr><td>2317</td><td>200.00</td><td>yes</td></tr>
 * <tr><td>0050</td><td>185.00</td><td>yes</td></tr>
 * <tr><td>6547</td><td>50.00</td><td>no</td></tr>
 * </table>
 *
 * <table>
 * <caption>Futures and options; any contract month and strike</caption>
 * <tr><th>Code</th><th>Kind</th><th>Margin of a contract</th></tr>
 * <tr><td>TXF</td><td>futures</td><td>322,000</td></tr>
 * <tr><td>MXF</td><td>futures</td><td>80,500</td></tr>
 * <tr><td>TXO</td><td>options</td><td>82,000</td></tr>
 * <tr><td>TEO</td><td>options</td><td>60,000</td></tr>
 * </table>
 *
 * <p>Both exchanges are always open. One futures order takes at most 100 contracts. A login brings a
 * notice.
 */
public final class ReadyMade {
    private static final String ID_NUMBER = "A123456789";
    private static final String PASSWORD = "pass1234";

    /** The first customer, on the securities account 9A01-1234567. */
    public static final Credentials STOCK_USER =
            Credentials.of("9A01", ID_NUMBER, "1234567", PASSWORD);

    /** The first customer, on the futures account F001-7654321. */
    public static final Credentials FUTURES_USER =
            Credentials.of("F001", ID_NUMBER, "7654321", PASSWORD);

    /** The second customer, whose account 9A02-2222222 is blocked. */
    public static final Credentials BLOCKED_USER =
            Credentials.of("9A02", "B298765432", "2222222", "secret99");

    private ReadyMade() {}

    static GatewayBuilder builder() {
        return new GatewayBuilder(new World())
                .notice("台股交易時間 09:00-13:30，請注意風險")
                .customer(firstCustomer())
                .customer(Customer.of("B298765432", "secret99")
                        .birthDate(LocalDate.of(1975, 12, 31)).bankBalance(80000)
                        .account(TradingAccount.securities("9A02", "2222222").label("台中證券")
                                .blocked()))
                .stock(ListedStock.of("2330", "1000.00"))
                .stock(ListedStock.of("2317", "200.00"))
                .stock(ListedStock.of("0050", "185.00"))
                .stock(ListedStock.of("6547", "50.00").withoutCredit())
                .product(ListedProduct.futures("TXF", 322000))
                .product(ListedProduct.futures("MXF", 80500))
                .product(ListedProduct.options("TXO", 82000))
                .product(ListedProduct.options("TEO", 60000));
    }

    private static Customer firstCustomer() {
        return Customer.of(ID_NUMBER, PASSWORD).bankBalance(1250000)
                .account(TradingAccount.securities("9A01", "1234567").label("台北證券")
                        .holds(Holding.of("2317").cash(5000).margin(2000))
                        .holds(Holding.of("0050").cash(10350).pledged(1000))
                        .holds(Holding.of("2330").shortSold(1000)))
                .account(TradingAccount.securities("9A01", "0009876").label("台北複委託"))
                .account(TradingAccount.futures("F001", "7654321").label("期貨"));
    }
}
