package com.brindlex.kernel.quorvane.console;

import static com.brindlex.kernel.quorvane.console.DemoAccount.NEW_USER;

import com.brindlex.kernel.quorvane.client.CertificateText;
import com.brindlex.kernel.quorvane.client.Request;
import com.brindlex.kernel.quorvane.client.Requests;
import java.time.LocalDate;
import java.time.format.DateTimeFormatter;
import java.util.function.Function;

/** The life of a certificate, from its application to its revocation. */
final class DemoCertificates {
    private static final String MESSAGE = "A123456789;KEY=MFwwDQYJKoZIhvcNAQEBBQADSwAwSAJBAK";
    private static final String BIRTH = "19800101";

    private final Stage stage;

    private DemoCertificates(Stage stage) {
        this.stage = stage;
    }

    static void play(Stage stage) {
        stage.screen.title("The life of a certificate");
        DemoCertificates demo = new DemoCertificates(stage);
        LocalDate end = LocalDate.now(stage.clock).plusDays(365);
        stage.fails("Apply with a wrong date of birth",
                () -> stage.as(NEW_USER).applyForCertificate("19800102", MESSAGE),
                "[CERT]出生日期錯誤(E007)");
        demo.ask("Apply", ask -> ask.applyForCertificate(BIRTH, MESSAGE), "已核發", end);
        demo.ask("Ask for its state", ask -> ask.certificateStatus(MESSAGE), "已核發", end);
        demo.ask("Confirm that it is installed", ask -> ask.certificateInstalled(MESSAGE), "已安裝",
                end);
        demo.ask("Confirm that it is opened", ask -> ask.certificateOpened(MESSAGE), "已開通", end);
        LocalDate later = end.plusDays(365);
        demo.ask("Renew", ask -> ask.renewCertificate(BIRTH, MESSAGE), "已開通", later);
        demo.ask("Fetch", ask -> ask.fetchCertificate(MESSAGE), "已開通", later);
        demo.ask("Fetch, each step logged", ask -> ask.fetchCertificateLogged(MESSAGE), "已開通",
                later);
        demo.ask("Register", ask -> ask.registerCertificate(MESSAGE), "已開通", later);
        demo.ask("Revoke", ask -> ask.revokeCertificate(BIRTH, MESSAGE), "已廢止", later);
        stage.fails("Fetch what was revoked", () -> stage.as(NEW_USER).fetchCertificate(MESSAGE),
                "[CERT]憑證狀態不符 已廢止(E007)");
        stage.refusedHere("Fetch with an empty message",
                () -> stage.as(NEW_USER).fetchCertificate(""), "certMsg");
    }

    private void ask(String title, Function<Requests, Request<CertificateText>> asking,
            String state, LocalDate end) {
        stage.ask(title, () -> asking.apply(stage.as(NEW_USER)), "SN=00000001;STATE=" + state
                + ";UNTIL=" + end.format(DateTimeFormatter.BASIC_ISO_DATE));
    }
}
