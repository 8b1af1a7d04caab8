package com.brindlex.kernel.quorvane.console;

import com.brindlex.kernel.quorvane.client.Accounts;
import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.Requests;
import com.brindlex.kernel.quorvane.simulator.Line;

/** Login: accepted, refused, with the gateway down, without an address. */
final class DemoLogin {
    static final Credentials USER =
            Credentials.of("9A01", "A123456789", "1234567", "pass1234");

    private static final String ACCOUNTS =
            "<S>@台北證券@1234567@9A01@Y!<S>@台北複委託@0009876@9A01@Y!<F>@期貨@7654321@F001@Y!";

    private DemoLogin() {}

    static void play(Stage stage) {
        stage.screen.title("Login");
        stage.showHeader(true);
        Accounts accounts =
                stage.ask("Log in with ID number and account", () -> stage.as(USER).login());
        stage.table(accounts, 3);
        stage.value("the second account", "0009876", accounts.get(1).account());
        stage.value("a notice", true, !accounts.notice().isEmpty());
        stage.showHeader(false);
        stage.ask("List all accounts", () -> stage.as(USER).accounts(), "3!" + ACCOUNTS);
        stage.fails("A wrong password",
                () -> stage.as(USER.withPassword("letmein1")).login(), "[GATEWAY]密碼錯誤(E002)");
        stage.fails("An unknown account", () -> stage.as(Credentials.of("9A01", USER.idNumber(),
                        "5555555", USER.password())).login(),
                "[GATEWAY]查無此帳號(E003)");
        onBadLines(stage);
        stage.refusedHere("A device without network address",
                () -> Requests.of(Stage.SESSION.withLocalAddress(""), USER).login(), "localIP");
        stage.refusedHere("An account that is none and a password that forges a field",
                () -> stage.as(Credentials.ofAccount("9A01", "12-34", "x|PWD=y")).login(),
                "account", "password");
    }

    private static void onBadLines(Stage stage) {
        stage.gateway().setLine(Line.GATEWAY_DOWN);
        stage.fails("The gateway cannot reach its host", () -> stage.as(USER).login(),
                "[GATEWAY]主機連線失敗");
        stage.gateway().setLine(Line.BROKER_TIMEOUT);
        stage.fails("The broker's host does not answer", () -> stage.as(USER).login(),
                "[BROKER]主機連線失敗");
        stage.gateway().setLine(Line.UP);
    }
}
