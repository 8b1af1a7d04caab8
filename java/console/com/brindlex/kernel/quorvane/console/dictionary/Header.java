package com.brindlex.kernel.quorvane.console.dictionary;

import java.util.List;

/**
 * What opens a request.
 *
 * @param begin the fields up to the identity
 * @param identity the identity block, by the lengths of the two parts
 * @param end the fields behind it; null when there are none
 * @param orderDate the field for an order date that is given; null when it has none
 * @param key the order key that the signature payload begins with; null when it has none
 */
public record Header(String name, String title, String begin, List<Identity> identity, String end,
        String orderDate, String key) {
    /** An identity block, for parts of such lengths. */
    public record Identity(String first, String second, String text) {}
}
