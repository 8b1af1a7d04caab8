package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.gatewayjni.AuthEncode;
import static com.brindlex.kernel.quorvane.gatewayjni.GetTotalAccountEncode;

import com.brindlex.kernel.quorvane.simulator.Line;
import com.brindlex.kernel.quorvane.typed.Accounts;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Result;

/** Login: accepted, refused, with the gateway down, without an address. */
final class DemoLogin {
    static final String BRANCH = "9A01";
    static final String IDENTITY = "A123456789&1234567";
    static final String PASSWORD = "pass1234";
    static final String ADDRESS = "192.168.1.20";

    private static final String ACCOUNTS =
            "<S>@台北證券@1234567@9A01@Y!<S>@台北複委託@0009876@9A01@Y!<F>@期貨@7654321@F001@Y!";

    private DemoLogin() {}

    static Stage.Encoder login(String identity, String password, String address) {
        return (sequence, status) -> AuthEncode(
                Stage.MARKET, Stage.PLATFORM, sequence, Stage.SERIAL, address, BRANCH, identity, password, status);
    }

    static void play(Stage stage) {
        stage.screen.title("Login");
        stage.showHeader(true);
        Result result = stage.ask("Log in with ID number and account",
                login(IDENTITY, PASSWORD, ADDRESS), Operation.AUTH_DECODE, 1);
        stage.sections(result, 3, 1);
        stage.field(result.rows(), 1, Accounts.ACCOUNT, "0009876");
        stage.showHeader(false);
        stage.ask("List all accounts",
                (sequence, status) -> GetTotalAccountEncode(Stage.MARKET, Stage.PLATFORM, sequence,
                        Stage.SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, status),
                Operation.GET_TOTAL_ACCOUNT_DECODE, 1, "3!" + ACCOUNTS);
        stage.ask("A wrong password", login(IDENTITY, "letmein1", ADDRESS), Operation.AUTH_DECODE, -1, "密碼錯誤");
        stage.ask("An unknown account", login("A123456789&5555555", PASSWORD, ADDRESS),
                Operation.AUTH_DECODE, -1, "查無此帳號");
        onBadLines(stage);
        stage.refusedHere("A device without network address", login(IDENTITY, PASSWORD, ""),
                "[CLIENT] 無法取得IP，請確認網路連線是否正常！");
        stage.refusedHere("An account text without '&'", login("1234567", PASSWORD, ADDRESS),
                "[CLIENT] 身分證字號及帳號有誤！");
    }

    private static void onBadLines(Stage stage) {
        stage.gateway().setLine(Line.GATEWAY_DOWN);
        stage.ask("The gateway cannot reach its host", login(IDENTITY, PASSWORD, ADDRESS),
                Operation.AUTH_DECODE, -1, "[GATEWAY]主機連線失敗");
        stage.gateway().setLine(Line.BROKER_TIMEOUT);
        stage.ask("The broker's host does not answer", login(IDENTITY, PASSWORD, ADDRESS),
                Operation.AUTH_DECODE, -1, "[BROKER]主機連線失敗");
        stage.gateway().setLine(Line.UP);
    }
}
