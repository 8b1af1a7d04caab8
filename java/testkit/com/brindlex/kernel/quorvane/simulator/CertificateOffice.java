package com.brindlex.kernel.quorvane.simulator;

import java.nio.charset.StandardCharsets;
import java.time.LocalDate;
import java.util.Base64;
import java.util.EnumSet;
import java.util.LinkedHashMap;
import java.util.Map;
import java.util.Set;

/**
 * Issues, renews, revokes and reports certificates.
 *
 * <p>The message of a request is opaque to the library; here it is the ID number of the holder,
 * optionally followed by ';' and anything else. A certificate takes the road apply, install
 * confirmation, open; it can then be fetched, registered and renewed, and revoked at any time.
 */
final class CertificateOffice {
    private static final int LINE = 1024;
    private static final int VALID_DAYS = 365;

    /** How far a certificate has come. */
    enum State {
        ISSUED("已核發"),
        INSTALLED("已安裝"),
        OPENED("已開通"),
        REVOKED("已廢止");

        final String text;

        State(String text) {
            this.text = text;
        }
    }

    private static final class Certificate {
        final String number;
        State state = State.ISSUED;
        LocalDate validUntil;

        Certificate(String number, LocalDate validUntil) {
            this.number = number;
            this.validUntil = validUntil;
        }

        String text() {
            return "SN=" + number + ";STATE=" + state.text + ";UNTIL=" + Texts.date(validUntil);
        }
    }

    private final CustomerBook customers;
    private final Map<String, Certificate> certificates = new LinkedHashMap<>();
    private int issued;

    CertificateOffice(CustomerBook customers) {
        this.customers = customers;
    }

    String answer(Request request, LocalDate today) throws Refusal {
        String holder = holder(request);
        switch (request.kind()) {
            case APPLY_CERTIFICATE:
                checkHolder(request, holder);
                return apply(request, holder, today);
            case RENEW_CERTIFICATE:
                checkHolder(request, holder);
                return renew(request, own(holder, EnumSet.of(State.INSTALLED, State.OPENED)));
            case REVOKE_CERTIFICATE:
                checkHolder(request, holder);
                return step(request, own(holder, EnumSet.complementOf(EnumSet.of(State.REVOKED))),
                        State.REVOKED);
            case CERTIFICATE_INSTALLED:
                return step(request, own(holder, EnumSet.of(State.ISSUED)), State.INSTALLED);
            case CERTIFICATE_OPENED:
                return step(request, own(holder, EnumSet.of(State.INSTALLED)), State.OPENED);
            case CERTIFICATE_STATUS:
                return good(request, own(holder, EnumSet.allOf(State.class)).text());
            default:
                return good(request, own(holder, EnumSet.of(State.INSTALLED, State.OPENED)).text());
        }
    }

    private String apply(Request request, String holder, LocalDate today) throws Refusal {
        Certificate old = certificates.get(holder);
        if (old != null && old.state != State.REVOKED) {
            throw Refusal.rejected("憑證已存在");
        }
        issued++;
        Certificate fresh =
                new Certificate(String.format("%08d", issued), today.plusDays(VALID_DAYS));
        certificates.put(holder, fresh);
        return good(request, fresh.text());
    }

    private static String renew(Request request, Certificate certificate) {
        certificate.validUntil = certificate.validUntil.plusDays(VALID_DAYS);
        return good(request, certificate.text());
    }

    private static String step(Request request, Certificate certificate, State next) {
        certificate.state = next;
        return good(request, certificate.text());
    }

    private Certificate own(String holder, Set<State> allowed) throws Refusal {
        Certificate certificate = certificates.get(holder);
        if (certificate == null) {
            throw Refusal.rejected("查無憑證");
        }
        if (!allowed.contains(certificate.state)) {
            throw Refusal.rejected("憑證狀態不符 " + certificate.state.text);
        }
        return certificate;
    }

    /** Requests that carry an identity must speak for the holder, with the right birth date. */
    private void checkHolder(Request request, String holder) throws Refusal {
        Customer customer = customers.customer(request);
        if (!customer.idNumber.equals(holder)) {
            throw new Refusal(Refusal.Reason.UNKNOWN_ACCOUNT);
        }
        if (!Texts.date(customer.birthDate).equals(request.get("BIRTH"))) {
            throw Refusal.rejected("出生日期錯誤");
        }
    }

    private String holder(Request request) throws Refusal {
        String message = decode(request.get("MSG"));
        int end = message.indexOf(';');
        String holder = end < 0 ? message : message.substring(0, end);
        if (customers.byId(holder) == null) {
            throw new Refusal(Refusal.Reason.UNKNOWN_ACCOUNT);
        }
        return holder;
    }

    /** Base64 text in lines of 1024 characters, each line ended by CR and LF. */
    private static String decode(String text) throws Refusal {
        String[] lines = text.split("\r\n", -1);
        for (int i = 0; i < lines.length - 1; i++) {
            if (lines[i].length() != LINE) {
                throw Refusal.malformed("MSG");
            }
        }
        try {
            byte[] bytes = Base64.getDecoder().decode(String.join("", lines));
            return new String(bytes, StandardCharsets.UTF_8);
        } catch (IllegalArgumentException wrong) {
            throw Refusal.malformed("MSG");
        }
    }

    private static String good(Request request, String text) {
        return Reply.query(request).record().field("M2", text).close().end().text();
    }
}
