package com.brindlex.kernel.quorvane.console.timeline;

import java.util.Locale;

/**
 * Chooses rows of a timeline; what is null chooses nothing.
 *
 * @param account the account or ID number
 * @param instrument the stock or the commodity
 * @param operation a part of the operation's name or title
 * @param failures whether only what a person should look at is wanted
 */
public record RowFilter(String account, String instrument, String operation, boolean failures) {
    /** Whether a row is wanted. */
    public boolean takes(Row row) {
        return (account == null || row.account().equals(account) || row.idNumber().equals(account))
                && (instrument == null || row.instrument().equalsIgnoreCase(instrument))
                && (operation == null || holds(row.operation()) || holds(row.title()))
                && (!failures || row.isFailure());
    }

    private boolean holds(String name) {
        return name.toLowerCase(Locale.ROOT).contains(operation.toLowerCase(Locale.ROOT));
    }
}
