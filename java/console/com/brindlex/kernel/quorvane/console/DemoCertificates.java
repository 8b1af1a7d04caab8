package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoAccount.NEW_PASSWORD;
import static com.brindlex.kernel.quorvane.console.DemoLogin.ADDRESS;
import static com.brindlex.kernel.quorvane.console.DemoLogin.BRANCH;
import static com.brindlex.kernel.quorvane.console.DemoLogin.IDENTITY;
import static com.brindlex.kernel.quorvane.console.Stage.MARKET;
import static com.brindlex.kernel.quorvane.console.Stage.PLATFORM;
import static com.brindlex.kernel.quorvane.console.Stage.SERIAL;

import com.brindlex.kernel.quorvane.gatewayjni;
import com.brindlex.kernel.quorvane.typed.Operation;
import java.time.LocalDate;
import java.time.format.DateTimeFormatter;

/** The life of a certificate, from its application to its revocation. */
final class DemoCertificates {
    private static final String MESSAGE = "A123456789;KEY=MFwwDQYJKoZIhvcNAQEBBQADSwAwSAJBAK";
    private static final String BIRTH = "19800101";

    /** One of the encoders that take nothing but the message. */
    private interface Plain {
        String encode(int market, int platform, int sequence, String serial, String address, String message,
                int[] status);
    }

    /** One of the encoders that speak for the holder. */
    private interface Holder {
        String encode(int market, int platform, int sequence, String serial, String address, String branch,
                String identity, String password, String birth, String message, int[] status);
    }

    private DemoCertificates() {}

    static void play(Stage stage) {
        stage.screen.title("The life of a certificate");
        LocalDate end = LocalDate.now(stage.clock).plusDays(365);
        stage.ask("Apply with a wrong date of birth", holder(gatewayjni::ApplyCertEncode, "19800102"),
                Operation.APPLY_CERT_DECODE, -1, "[CERT]E007 出生日期錯誤");
        stage.ask("Apply", holder(gatewayjni::ApplyCertEncode, BIRTH),
                Operation.APPLY_CERT_DECODE, 1, state("已核發", end));
        stage.ask("Ask for its state", plain(gatewayjni::GetCertStatusEncode),
                Operation.GET_CERT_STATUS_DECODE, 1, state("已核發", end));
        stage.ask("Confirm that it is installed", plain(gatewayjni::InstallCertOKEncode),
                Operation.INSTALL_CERT_OK_DECODE, 1, state("已安裝", end));
        stage.ask("Confirm that it is opened", plain(gatewayjni::OpenCertEncode),
                Operation.OPEN_CERT_DECODE, 1, state("已開通", end));
        LocalDate later = end.plusDays(365);
        stage.ask("Renew", holder(gatewayjni::ReNewCertEncode, BIRTH),
                Operation.RENEW_CERT_DECODE, 1, state("已開通", later));
        stage.ask("Fetch", plain(gatewayjni::GetCertEncode), Operation.GET_CERT_DECODE, 1, state("已開通", later));
        stage.ask("Fetch, the form for long messages", plain(gatewayjni::GetCertEncode2),
                Operation.GET_CERT_DECODE, 1, state("已開通", later));
        stage.ask("Register", plain(gatewayjni::RegisterCertEncode),
                Operation.REGISTER_CERT_DECODE, 1, state("已開通", later));
        stage.ask("Revoke", holder(gatewayjni::RevokeCertEncode, BIRTH),
                Operation.REVOKE_CERT_DECODE, 1, state("已廢止", later));
        stage.ask("Fetch what was revoked", plain(gatewayjni::GetCertEncode),
                Operation.GET_CERT_DECODE, -1, "[CERT]E007 憑證狀態不符 已廢止");
        stage.refusedHere("Fetch with an empty message",
                (sequence, status) -> gatewayjni.GetCertEncode(
                        MARKET, PLATFORM, sequence, SERIAL, ADDRESS, "", status),
                "GetCertEncode()傳入的參數錯誤");
    }

    private static String state(String text, LocalDate end) {
        return "SN=00000001;STATE=" + text + ";UNTIL=" + end.format(DateTimeFormatter.BASIC_ISO_DATE);
    }

    private static Stage.Encoder plain(Plain encoder) {
        return (sequence, status) ->
                encoder.encode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS, MESSAGE, status);
    }

    private static Stage.Encoder holder(Holder encoder, String birth) {
        return (sequence, status) -> encoder.encode(MARKET, PLATFORM, sequence, SERIAL, ADDRESS, BRANCH,
                IDENTITY, NEW_PASSWORD, birth, MESSAGE, status);
    }
}
