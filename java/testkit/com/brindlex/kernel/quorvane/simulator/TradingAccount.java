package com.brindlex.kernel.quorvane.simulator;

import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import org.jetbrains.annotations.NotNull;

/**
 * A trading account of a {@link Customer}, as it stands when the gateway opens. Never changes: each
 * method gives another account.
 *
 * <pre>{@code
 * TradingAccount.securities("9A01", "1234567").holds(Holding.of("2330").cash(3000))
 * TradingAccount.futures("F001", "7654321").balance(1_500_000)
 * }</pre>
 */
public final class TradingAccount {
    private static final long BALANCE = 1500000;

    final char market;
    final String branch;
    final String number;
    final String label;

    /** Whether the account may trade; a blocked one is listed and refuses orders. */
    final boolean active;

    final List<Holding> holdings;
    final long balance;
    final long buyingLimit;

    private TradingAccount(char market, String branch, String number, String label, boolean active,
            List<Holding> holdings, long balance, long buyingLimit) {
        this.market = market;
        this.branch = branch;
        this.number = number;
        this.label = label;
        this.active = active;
        this.holdings = holdings;
        this.balance = balance;
        this.buyingLimit = buyingLimit;
    }

    private static TradingAccount of(char market, String branch, String number, String label) {
        if (!branch.matches("[0-9A-Za-z]{1,8}")) {
            throw new IllegalArgumentException("The branch of an account is letters and digits, such"
                    + " as \"9A01\", not \"" + branch + "\".");
        }
        if (!number.matches("[0-9]{2,7}")) {
            throw new IllegalArgumentException("The number of an account is 2 to 7 digits, such as"
                    + " \"1234567\", not \"" + number + "\".");
        }
        return new TradingAccount(market, branch, number, label, true, Collections.emptyList(),
                BALANCE, Long.MAX_VALUE);
    }

    /**
     * An account for stocks.
     *
     * @param branch the branch that keeps it, as in {@code Credentials}
     * @param number 2 to 7 digits; leading zeros do not tell accounts apart
     */
    @NotNull
    public static TradingAccount securities(@NotNull String branch, @NotNull String number) {
        return of('S', branch, number, "證券");
    }

    /** An account for futures and options, with a margin balance of 1,500,000. */
    @NotNull
    public static TradingAccount futures(@NotNull String branch, @NotNull String number) {
        return of('F', branch, number, "期貨");
    }

    /** What the account is called in the list of accounts. */
    @NotNull
    public TradingAccount label(@NotNull String text) {
        return new TradingAccount(
                market, branch, number, text, active, holdings, balance, buyingLimit);
    }

    /** An account that is listed and refuses orders and queries. */
    @NotNull
    public TradingAccount blocked() {
        return new TradingAccount(
                market, branch, number, label, false, holdings, balance, buyingLimit);
    }

    /** What the account holds of one more stock. */
    @NotNull
    public TradingAccount holds(@NotNull Holding holding) {
        if (market != 'S') {
            throw new IllegalArgumentException("A futures account holds no stocks: give the holding"
                    + " of " + holding.stockCode + " to a TradingAccount.securities(...).");
        }
        List<Holding> more = new ArrayList<>(holdings);
        more.add(holding);
        return new TradingAccount(market, branch, number, label, active,
                Collections.unmodifiableList(more), balance, buyingLimit);
    }

    /** The balance of the margin account behind a futures account, in whole units. */
    @NotNull
    public TradingAccount balance(long amount) {
        return new TradingAccount(
                market, branch, number, label, active, holdings, amount, buyingLimit);
    }

    /** What the stock purchases of a day may come to, open and filled, in whole units. */
    @NotNull
    public TradingAccount buyingLimit(long amount) {
        return new TradingAccount(
                market, branch, number, label, active, holdings, balance, amount);
    }

    /** The number as a decimal one, so that leading zeros do not matter. */
    boolean hasNumber(String text) {
        return text.matches("[0-9]{1,18}") && Long.parseLong(text) == Long.parseLong(number);
    }

    @Override
    public String toString() {
        return market + " " + branch + "-" + number;
    }
}
