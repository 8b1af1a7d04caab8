package com.brindlex.kernel.quorvane.client;

import java.util.List;
import org.jetbrains.annotations.Nullable;

/** What new and amended futures orders have in common. */
final class FuturesTerms {
    private FuturesTerms() {}

    /** Writes one leg or two, and what they make together. */
    static void legs(Draft<?> draft, List<Side> sides, List<Contract> contracts) {
        int legs = contracts.size();
        if (legs < 1 || legs > 2) {
            draft.refuse("legs", "must be one or two, not " + legs);
        }
        for (int i = 0; i < legs && i < 2; i++) {
            Terms.side(draft, "side" + (i + 1), sides.get(i));
            contracts.get(i).fill(draft, i + 1);
        }
        boolean option = legs > 0 && contracts.get(0).isOption();
        if (legs == 2 && contracts.get(1).isOption() != option) {
            draft.refuse("legs", "must be two options or two futures");
        }
        draft.set("orderKind", legs == 2 ? option ? 3 : 4 : option ? 2 : 1);
    }

    /** Writes price type and price; a spread or combination may cost nothing. */
    static void price(Draft<?> draft, @Nullable Price price, int legs) {
        if (price == null) {
            draft.refuse("price", "must be given");
        } else if (price.isWord()) {
            int type = price.equals(Price.MARKET) ? 1 : price.equals(Price.RANGE_MARKET) ? 3 : -1;
            if (type < 0) {
                draft.refuse("price", "of a futures order cannot be " + price.word().label());
            } else {
                draft.set("priceType", type);
            }
        } else {
            draft.set("priceType", 2);
            Terms.amount(draft, price, 4, legs == 2 ? 0 : 1);
        }
    }

    /** Writes a time in force; nothing when there is none. */
    static void timeInForce(Draft<?> draft, @Nullable TimeInForce time) {
        if (time == TimeInForce.UNKNOWN) {
            draft.refuse("timeInForce", "must have a name");
        } else if (time != null) {
            draft.set("timeInForce", time.code().charAt(0));
        }
    }
}
