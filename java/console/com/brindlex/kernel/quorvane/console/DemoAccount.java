package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoLogin.USER;

import com.brindlex.kernel.quorvane.client.AccountItem;
import com.brindlex.kernel.quorvane.client.BankBalance;
import com.brindlex.kernel.quorvane.client.Confirmation;
import com.brindlex.kernel.quorvane.client.ContactTime;
import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.Request;
import java.math.BigDecimal;

/** Bank balance, password change and account opening. */
final class DemoAccount {
    static final Credentials NEW_USER = USER.withPassword("better 5678");

    private DemoAccount() {}

    static void play(Stage stage) {
        stage.screen.title("Account maintenance");
        BankBalance balance = stage.ask(
                "Balance of the linked bank account", () -> stage.as(USER).bankBalance());
        stage.record(balance);
        stage.value("balance", new BigDecimal("1250000"), balance.bankBalance());
        stage.fails("Ask for the balance with a wrong password",
                () -> stage.as(USER.withPassword("letmein1")).bankBalance(),
                "[GATEWAY]密碼錯誤(E002)");
        stage.fails("Change the password to one that is too short",
                () -> stage.as(USER).changePassword("abc"), "[GATEWAY]新密碼不符規定(E007)");
        stage.ask("Change the password to one with a blank",
                () -> stage.as(USER).changePassword(NEW_USER.password()), "");
        stage.fails("Log in with the old password", () -> stage.as(USER).login(),
                "[GATEWAY]密碼錯誤(E002)");
        stage.ask("Log in with the new one", () -> stage.as(NEW_USER).login());
        stage.ask("Apply for an account", () -> open(stage, "C211112222"), "");
        stage.fails("Apply for an account that exists", () -> open(stage, USER.idNumber()),
                "[GATEWAY]客戶已開戶(E007)");
    }

    private static Request<Confirmation> open(Stage stage, String idNumber) {
        return stage.as(Credentials.ofIdNumber("", idNumber, ""))
                .openAccount("林大同", "台北市中正區1號", "02-12345678", ContactTime.of(2),
                        AccountItem.of(1));
    }
}
