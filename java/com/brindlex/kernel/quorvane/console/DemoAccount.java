package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoLogin.ADDRESS;
import static com.brindlex.kernel.quorvane.console.DemoLogin.BRANCH;
import static com.brindlex.kernel.quorvane.console.DemoLogin.IDENTITY;
import static com.brindlex.kernel.quorvane.console.DemoLogin.PASSWORD;
import static com.brindlex.kernel.quorvane.console.Stage.MARKET;
import static com.brindlex.kernel.quorvane.console.Stage.PLATFORM;
import static com.brindlex.kernel.quorvane.console.Stage.SERIAL;

import com.brindlex.kernel.quorvane.gatewayjni;

/** Bank balance, password change and account opening. */
final class DemoAccount {
    static final String NEW_PASSWORD = "better 5678";

    private DemoAccount() {}

    static void play(Stage stage) {
        stage.screen.title("Account maintenance");
        String balance = stage.ask("Balance of the linked bank account",
                (sequence, status) -> gatewayjni.QueryBankRemainEncode(
                        MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH, IDENTITY, PASSWORD, status),
                gatewayjni::QueryBankRemainDecode, 1);
        stage.record(ResultLayout.BALANCE, ResultLayout.list(balance));
        stage.field(ResultLayout.list(balance), 0, 4, "1250000");
        stage.ask("Change the password to one that is too short", change("abc"),
                gatewayjni::ChangePasswordDecode, -1, "[GATEWAY]新密碼不符規定(E007)");
        stage.ask("Change the password to one with a blank", change(NEW_PASSWORD),
                gatewayjni::ChangePasswordDecode, 1, "");
        stage.ask("Log in with the old password", DemoLogin.login(IDENTITY, PASSWORD, ADDRESS),
                gatewayjni::AuthDecode, -1, "密碼錯誤");
        stage.ask("Log in with the new one", DemoLogin.login(IDENTITY, NEW_PASSWORD, ADDRESS),
                gatewayjni::AuthDecode, 1);
        stage.ask("Apply for an account", open("C211112222&"), gatewayjni::OpenAccountDecode, 1, "");
        stage.ask("Apply for an account that exists", open("A123456789&"),
                gatewayjni::OpenAccountDecode, -1, "[GATEWAY]客戶已開戶(E007)");
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
