package com.brindlex.kernel.quorvane.simulator;

import java.time.LocalDate;
import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import org.jetbrains.annotations.NotNull;

/**
 * A customer of the broker, as it stands when the gateway opens. Never changes: each method gives
 * another customer.
 */
public final class Customer {
    private static final LocalDate BIRTH_DATE = LocalDate.of(1980, 1, 1);

    final String idNumber;
    final String password;
    final LocalDate birthDate;
    final long bankBalance;
    final List<TradingAccount> accounts;

    private Customer(String idNumber, String password, LocalDate birthDate, long bankBalance,
            List<TradingAccount> accounts) {
        this.idNumber = idNumber;
        this.password = password;
        this.birthDate = birthDate;
        this.bankBalance = bankBalance;
        this.accounts = accounts;
    }

    /**
     * A customer without accounts, born on 1980-01-01.
     *
     * @param idNumber a letter and 7 to 9 digits
     * @param password what a login must name
     */
    @NotNull
    public static Customer of(@NotNull String idNumber, @NotNull String password) {
        if (!idNumber.matches("[A-Z][0-9]{7,9}")) {
            throw new IllegalArgumentException("The ID number of a customer is a capital letter and 7"
                    + " to 9 digits, such as \"A123456789\", not \"" + idNumber + "\".");
        }
        return new Customer(idNumber, password, BIRTH_DATE, 0, Collections.emptyList());
    }

    /** The date that certificate requests must name. */
    @NotNull
    public Customer birthDate(@NotNull LocalDate date) {
        return new Customer(idNumber, password, date, bankBalance, accounts);
    }

    /** The balance of the linked bank account, in whole units. */
    @NotNull
    public Customer bankBalance(long amount) {
        return new Customer(idNumber, password, birthDate, amount, accounts);
    }

    /** One more account. */
    @NotNull
    public Customer account(@NotNull TradingAccount account) {
        for (TradingAccount own : accounts) {
            if (own.market == account.market && own.hasNumber(account.number)) {
                throw new IllegalArgumentException("The customer " + idNumber + " has the account "
                        + own + " already: give the other one another number.");
            }
        }
        List<TradingAccount> more = new ArrayList<>(accounts);
        more.add(account);
        return new Customer(idNumber, password, birthDate, bankBalance,
                Collections.unmodifiableList(more));
    }
}
