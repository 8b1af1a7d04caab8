package com.brindlex.kernel.quorvane.simulator;

/** Login, account list, account opening, password change and bank balance. */
final class AccountDesk {
    private static final int MIN_PASSWORD = 6;
    private static final int MAX_CODE = 255;

    private final CustomerBook customers;
    private String notice;

    AccountDesk(CustomerBook customers, World world) {
        this.customers = customers;
        this.notice = world.notice;
    }

    /** Sets the notice that a login brings; the empty text for none. */
    void setNotice(String text) {
        notice = text;
    }

    String login(Request request) throws Refusal {
        return accounts(request, notice);
    }

    String accountList(Request request) throws Refusal {
        return accounts(request, "");
    }

    private String accounts(Request request, String message) throws Refusal {
        Customer customer = customers.customer(request);
        Reply reply = Reply.query(request).field("M3", message);
        for (TradingAccount account : customer.accounts) {
            // the number travels in two parts; leading zeros are the reader's business
            String digits = account.number.replaceFirst("^0+", "");
            int half = digits.length() - Math.min(2, digits.length());
            reply.record()
                    .field("07", account.market)
                    .field("M5", account.label)
                    .field("16", account.branch)
                    .field("17", digits.substring(0, half))
                    .field("18", digits.substring(half))
                    .field("69", account.active ? "Y" : "N")
                    .close();
        }
        return reply.end().text();
    }

    String openAccount(Request request) throws Refusal {
        request.text("NAME");
        request.text("ADDRESS");
        request.text("TEL");
        if (!request.get("IDNO").matches("[A-Z][0-9]{7,9}")) {
            throw Refusal.rejected("身分證字號錯誤");
        }
        if (request.number("TIME") > MAX_CODE || request.number("ITEM") > MAX_CODE) {
            throw Refusal.malformed("TIME");
        }
        if (customers.byId(request.get("IDNO")) != null) {
            throw Refusal.rejected("客戶已開戶");
        }
        return Reply.query(request).text();
    }

    String changePassword(Request request) throws Refusal {
        Customer customer = customers.customer(request);
        if (!request.get("54").equals(customers.password(customer))) {
            throw new Refusal(Refusal.Reason.WRONG_PASSWORD);
        }
        String wanted = request.text("55");
        if (wanted.length() < MIN_PASSWORD || wanted.equals(customers.password(customer))) {
            throw Refusal.rejected("新密碼不符規定");
        }
        customers.setPassword(customer, wanted);
        return Reply.query(request).text();
    }

    String bankBalance(Request request) throws Refusal {
        Customer customer = customers.customer(request);
        return Reply.query(request).record().field("PN", customer.bankBalance).close().end().text();
    }
}
