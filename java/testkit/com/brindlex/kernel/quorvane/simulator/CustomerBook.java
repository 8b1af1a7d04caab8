package com.brindlex.kernel.quorvane.simulator;

import java.util.HashMap;
import java.util.List;
import java.util.Map;

/** The broker's customers, and who a request speaks for. */
final class CustomerBook {
    private final List<Customer> customers;
    private final Map<Customer, String> passwords = new HashMap<>();

    /** Who was recognised: the customer and, for orders and lists, the account. */
    static final class Party {
        final Customer customer;
        final TradingAccount account;

        Party(Customer customer, TradingAccount account) {
            this.customer = customer;
            this.account = account;
        }
    }

    CustomerBook(World world) {
        customers = world.customers;
    }

    /** The password that counts now. */
    String password(Customer customer) {
        return passwords.getOrDefault(customer, customer.password);
    }

    void setPassword(Customer customer, String password) {
        passwords.put(customer, password);
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
        if (!password(customer).equals(request.get("PWD"))) {
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
            for (TradingAccount own : customer.accounts) {
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

    private static TradingAccount account(Customer customer, Request request) throws Refusal {
        TradingAccount found = null;
        for (TradingAccount own : customer.accounts) {
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
