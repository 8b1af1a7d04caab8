package com.brindlex.kernel.quorvane.simulator;

import java.util.ArrayList;
import java.util.List;

/** The broker's customers, and who a request speaks for. */
public final class CustomerBook {
    private final List<Customer> customers = new ArrayList<>();

    /** Who was recognised: the customer and, for orders and lists, the account. */
    static final class Party {
        final Customer customer;
        final Account account;

        Party(Customer customer, Account account) {
            this.customer = customer;
            this.account = account;
        }
    }

    /** Two customers: one with three accounts and one with an account that is blocked. */
    static CustomerBook sample() {
        CustomerBook book = new CustomerBook();
        book.customers.add(new Customer("A123456789", "王小明", "19800101", "pass1234", 1250000)
                .with('S', "9A01", "1234567", "台北證券", true)
                .with('S', "9A01", "0009876", "台北複委託", true)
                .with('F', "F001", "7654321", "期貨", true));
        book.customers.add(new Customer("B298765432", "陳美玲", "19751231", "secret99", 80000)
                .with('S', "9A02", "2222222", "台中證券", false));
        return book;
    }

    /** The customer behind an ID number, or null. */
    Customer byId(String idNumber) {
        for (Customer customer : customers) {
            if (customer.idNumber.equals(idNumber)) {
                return customer;
            }
        }
        return null;
    }

    /** Checks ID number, account and password; any market and branch will do. */
    Customer customer(Request request) throws Refusal {
        return recognise(request, false).customer;
    }

    /** As {@link #customer}, and finds the account of the request's market at its branch. */
    Party party(Request request) throws Refusal {
        return recognise(request, true);
    }

    private Party recognise(Request request, boolean needsAccount) throws Refusal {
        Customer customer = find(request);
        if (customer == null) {
            throw new Refusal(Refusal.Reason.UNKNOWN_ACCOUNT);
        }
        if (!customer.password.equals(request.get("PWD"))) {
            throw new Refusal(Refusal.Reason.WRONG_PASSWORD);
        }
        return new Party(customer, needsAccount ? account(customer, request) : null);
    }

    private Customer find(Request request) {
        String account = request.get("ACNO");
        for (Customer customer : customers) {
            boolean idFits = namesId(request) ? customer.idNumber.equals(request.get("IDNO"))
                                              : !account.isEmpty();
            boolean accountFits = account.isEmpty();
            for (Account own : customer.accounts) {
                accountFits |= own.hasNumber(account);
            }
            if (idFits && accountFits) {
                return customer;
            }
        }
        return null;
    }

    /**
     * An order that names an account alone sends that account in the place of the ID number too.
     */
    private static boolean namesId(Request request) {
        return request.has("IDNO") && !request.get("IDNO").equals(request.get("ACNO"));
    }

    private static Account account(Customer customer, Request request) throws Refusal {
        Account found = null;
        for (Account own : customer.accounts) {
            boolean named = request.get("ACNO").isEmpty() || own.hasNumber(request.get("ACNO"));
            if (named && own.market == request.market() && found == null) {
                found = own;
            }
        }
        if (found == null) {
            throw new Refusal(Refusal.Reason.UNKNOWN_ACCOUNT);
        }
        if (!found.branch.equals(request.get("BHNO"))) {
            throw new Refusal(Refusal.Reason.WRONG_BRANCH);
        }
        if (!found.active) {
            throw Refusal.rejected("帳號已停用");
        }
        return found;
    }
}
