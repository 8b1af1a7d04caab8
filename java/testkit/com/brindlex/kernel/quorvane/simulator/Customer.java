package com.brindlex.kernel.quorvane.simulator;

import java.util.ArrayList;
import java.util.List;

/** A customer of the broker, with password, accounts and the balance of the linked bank account. */
public final class Customer {
    final String idNumber;
    final String name;
    final String birthDate;
    final List<Account> accounts = new ArrayList<>();
    String password;
    long bankBalance;

    Customer(String idNumber, String name, String birthDate, String password, long bankBalance) {
        this.idNumber = idNumber;
        this.name = name;
        this.birthDate = birthDate;
        this.password = password;
        this.bankBalance = bankBalance;
    }

    Customer with(char market, String branch, String number, String label, boolean active) {
        accounts.add(new Account(market, branch, number, label, active));
        return this;
    }
}
