package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoLogin.ADDRESS;
import static com.brindlex.kernel.quorvane.console.DemoLogin.BRANCH;
import static com.brindlex.kernel.quorvane.console.DemoLogin.IDENTITY;
import static com.brindlex.kernel.quorvane.console.DemoLogin.PASSWORD;
import static com.brindlex.kernel.quorvane.console.Stage.MARKET;
import static com.brindlex.kernel.quorvane.console.Stage.PLATFORM;
import static com.brindlex.kernel.quorvane.console.Stage.SERIAL;

import com.brindlex.kernel.quorvane.gatewayjni;
import com.brindlex.kernel.quorvane.typed.BankBalance;
import com.brindlex.kernel.quorvane.typed.Operation;
import com.brindlex.kernel.quorvane.typed.Result;

/** Bank balance, password change and account opening. */
final class DemoAccount {
    static final String NEW_PASSWORD = "better 5678";

    private DemoAccount() {}

    static void play(Stage stage) {
        stage.screen.title("Account maintenance");
        Result balance = stage.ask("Balance of the linked bank account",
                (sequence, status) -> gatewayjni.QueryBankRemainEncode(
                        MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, status),
                Operation.QUERY_BANK_REMAIN_DECODE, 1);
        stage.record(balance.rows());
        stage.field(balance.rows(), 0, BankBalance.BALANCE, "1250000");
        stage.ask("Change the password to one that is too short", change("abc"),
                Operation.CHANGE_PASSWORD_DECODE, -1, "[GATEWAY]新密碼不符規定(E007)");
        stage.ask("Change the password to one with a blank", change(NEW_PASSWORD),
                Operation.CHANGE_PASSWORD_DECODE, 1, "");
        stage.ask("Log in with the old password", DemoLogin.login(IDENTITY, PASSWORD, ADDRESS),
                Operation.AUTH_DECODE, -1, "密碼錯誤");
        stage.ask("Log in with the new one", DemoLogin.login(IDENTITY, NEW_PASSWORD, ADDRESS),
                Operation.AUTH_DECODE, 1);
        stage.ask("Apply for an account", open("C211112222&"), Operation.OPEN_ACCOUNT_DECODE, 1, "");
        stage.ask("Apply for an account that exists", open("A123456789&"),
                Operation.OPEN_ACCOUNT_DECODE, -1, "[GATEWAY]客戶已開戶(E007)");
    }

    private static Stage.Encoder change(String wanted) {
        return (sequence, status) -> gatewayjni.ChangePasswordEncode(
                MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, wanted, status);
    }

    private static Stage.Encoder open(String identity) {
        return (sequence, status) -> gatewayjni.OpenAccountEncode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS, "",
                identity, "", "林大同", "台北市中正區1號", "02-12345678", (byte) 2, (byte) 1, status);
    }
}
