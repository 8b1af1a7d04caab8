package com.brindlex.kernel.quorvane.client;

import java.math.BigDecimal;
import java.util.ArrayList;
import java.util.List;
import org.jetbrains.annotations.Nullable;

/** The legs of an order as its row of the futures book shows them. */
final class BookLegs {
    private final FuturesOrder order;
    private final BookFacts<FuturesOrder> facts;
    private final List<Side> sides = new ArrayList<Side>();
    private final List<Contract> contracts = new ArrayList<Contract>();
    private String missing;

    BookLegs(FuturesOrder order, BookFacts<FuturesOrder> facts, @Nullable String secondCommodity) {
        this.order = order;
        this.facts = facts;
        Code<Product> product = facts.value("legs", FuturesOrder.PRODUCT);
        Side first = side(FuturesOrder.LEG_CODE1);
        // without a side the kind of product is that of the order before
        if (first == null || product == null || product.is(Product.UNKNOWN)) {
            missing = "legs";
            return;
        }
        boolean option =
                product.is(Product.OPTION) || product.is(Product.OPTION_COMBINATION);
        add(first, contract(option, order.text(FuturesOrder.COMMODITY1), FuturesOrder.MONTH1,
                FuturesOrder.CALL_PUT1, FuturesOrder.STRIKE1));
        if (product.is(Product.OPTION_COMBINATION)) {
            add(side(FuturesOrder.LEG_CODE2), contract(true, order.text(FuturesOrder.COMMODITY2),
                    FuturesOrder.MONTH2, FuturesOrder.CALL_PUT2, FuturesOrder.STRIKE2));
        } else if (product.is(Product.FUTURES_SPREAD) && secondCommodity == null) {
            missing = "secondCommodity";
        } else if (product.is(Product.FUTURES_SPREAD)) {
            add(side(FuturesOrder.LEG_CODE2), contract(false, secondCommodity, FuturesOrder.MONTH2,
                    FuturesOrder.CALL_PUT2, FuturesOrder.STRIKE2));
        }
    }

    private void add(@Nullable Side side, @Nullable Contract contract) {
        if (side == null || contract == null) {
            missing = "legs";
        }
        sides.add(side);
        contracts.add(contract);
    }

    /** The side of a leg: odd codes buy, even ones sell; null when none is shown. */
    @Nullable
    private Side side(Column<FuturesOrder, Code<LegCode>> column) {
        Code<LegCode> shown = facts.value("legs", column);
        if (shown == null || shown.is(LegCode.UNKNOWN)) {
            return null;
        }
        return Integer.parseInt(shown.code()) % 2 == 1 ? Side.BUY : Side.SELL;
    }

    @Nullable
    private Contract contract(boolean option, String commodity, Column<FuturesOrder, String> month,
            Column<FuturesOrder, Code<CallPut>> callPut, Column<FuturesOrder, BigDecimal> strike) {
        String shownMonth = order.text(month);
        if (commodity.isEmpty() || shownMonth.isEmpty()) {
            return null;
        }
        if (!option) {
            return Contract.futures(commodity, shownMonth);
        }
        Code<CallPut> kind = facts.value("legs", callPut);
        BigDecimal price = facts.value("legs", strike);
        return kind == null || price == null
                ? null : Contract.option(commodity, shownMonth, kind.value(), price);
    }

    /** What is not shown, {@code legs} or {@code secondCommodity}; null when all is. */
    @Nullable
    String missing() {
        return missing;
    }

    List<Side> sides() {
        return sides;
    }

    List<Contract> contracts() {
        return contracts;
    }
}
