package com.brindlex.kernel.quorvane.client;

import com.brindlex.kernel.quorvane.simulator.Gateway;
import java.util.ArrayList;
import java.util.List;
import java.util.function.Supplier;

/** What the tests of the typed layer share: a device, its user, and faults by their arguments. */
final class Fixtures {
    static final String ID_NUMBER = "A123456789";
    static final String PASSWORD = "pass1234";
    static final Session SESSION = Session.of("SN0001", "10.0.0.1");
    static final Credentials USER = Credentials.of("9A01", ID_NUMBER, "1234567", PASSWORD);
    static final Credentials TRADER = Credentials.of("F001", ID_NUMBER, "7654321", PASSWORD);

    private Fixtures() {}

    static Requests stocks() {
        return Requests.of(SESSION, USER);
    }

    static Requests futures() {
        return Requests.of(SESSION, TRADER);
    }

    /** A live order for two lots, complete. */
    static StockOrderBuilder stockOrder() {
        return stocks().stockOrder().buy("2330").quantity(Quantity.lots(2)).price(Price.of("995"))
                .live();
    }

    /** A live order for two contracts, complete. */
    static FuturesOrderBuilder futuresOrder() {
        return futures().futuresOrder().buy(Contract.futures("TXF", "202401")).quantity(2)
                .price(Price.of("22950")).live();
    }

    static Gateway gateway() {
        return Gateway.open();
    }

    /** Sends a request to the simulated gateway and reads the reply. */
    static <T> T ask(Gateway gateway, Request<T> request) {
        return request.read(gateway.answer(request.text())).orThrow();
    }

    /** The arguments that a request is refused for, in order; none when it is built. */
    static List<String> refused(Supplier<?> building) {
        List<String> arguments = new ArrayList<>();
        try {
            building.get();
        } catch (InvalidRequestException refused) {
            refused.problems().forEach(problem -> arguments.add(problem.argument()));
        }
        return arguments;
    }

    /** The value of a tag of a request, without a bare signature; null when it is not there. */
    static String tag(Request<?> request, String tag) {
        for (String field : request.text().replaceFirst("!!.*", "").split("\\|")) {
            if (field.startsWith(tag + "=")) {
                return field.substring(tag.length() + 1);
            }
        }
        return null;
    }
}
