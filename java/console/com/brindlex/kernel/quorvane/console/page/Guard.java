package com.brindlex.kernel.quorvane.console.page;

import com.sun.net.httpserver.Headers;
import java.nio.charset.StandardCharsets;
import java.security.MessageDigest;
import java.security.SecureRandom;
import java.util.Arrays;
import java.util.Base64;
import java.util.List;
import java.util.Set;

/**
 * Decides whom the server listens to. Other pages of the same browser can send requests to the
 * loopback address too: they know neither the token, nor can they name this host as their own.
 */
final class Guard {
    /** What every answer carries. A text of a log that became markup could do nothing. */
    static final List<String[]> HEADERS = List.of(
            new String[] {"Content-Security-Policy", "default-src 'none'; script-src 'self'; "
                    + "style-src 'self'; connect-src 'self'; base-uri 'none'; form-action 'none'; "
                    + "frame-ancestors 'none'; require-trusted-types-for 'script'"},
            new String[] {"X-Content-Type-Options", "nosniff"},
            new String[] {"Referrer-Policy", "no-referrer"},
            new String[] {"Cross-Origin-Opener-Policy", "same-origin"},
            new String[] {"Cross-Origin-Resource-Policy", "same-origin"},
            new String[] {"Cache-Control", "no-store"});

    private static final int TOKEN_BYTES = 18;

    private final byte[] prefix;
    private final Set<String> hosts;
    private final String token;

    Guard(int port) {
        byte[] random = new byte[TOKEN_BYTES];
        new SecureRandom().nextBytes(random);
        token = Base64.getUrlEncoder().encodeToString(random);
        prefix = ("/" + token + "/").getBytes(StandardCharsets.UTF_8);
        hosts = Set.of("127.0.0.1:" + port, "localhost:" + port);
    }

    String token() {
        return token;
    }

    /** Why a request is refused; null when it is none to refuse. */
    Answer refusal(String method, String path, Headers headers) {
        String host = headers.getFirst("Host");
        if (host == null || headers.get("Host").size() > 1 || !hosts.contains(host)) {
            return Answer.refused(403, "not this host");
        }
        byte[] start = path.getBytes(StandardCharsets.UTF_8);
        byte[] shown = Arrays.copyOf(start, prefix.length);
        if (start.length < prefix.length || !MessageDigest.isEqual(shown, prefix)) {
            return Answer.refused(404, "nothing here: the address is without its token");
        }
        if (!method.equals("GET") && !method.equals("POST")) {
            return Answer.refused(405, "GET and POST alone");
        }
        String origin = headers.getFirst("Origin");
        boolean foreign = origin != null && !origin.equals("http://" + host);
        String site = headers.getFirst("Sec-Fetch-Site");
        foreign |= site != null && !site.equals("same-origin") && !site.equals("none");
        return foreign ? Answer.refused(403, "not from another page") : null;
    }

    /** The path behind the token. */
    String inside(String path) {
        return path.substring(token.length() + 2);
    }
}
