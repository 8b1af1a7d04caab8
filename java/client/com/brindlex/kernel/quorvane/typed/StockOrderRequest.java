package com.brindlex.kernel.quorvane.typed;

/** A new stock order. */
public final class StockOrderRequest extends Request {
    StockOrderRequest(Operation operation, Session session, Credentials credentials) {
        super(operation, session, credentials);
    }

    /** Stock code, at most six characters. */
    public StockOrderRequest stockCode(String text) {
        set("stockCode", text);
        return this;
    }

    /** Date of the order; none is sent without it. */
    public StockOrderRequest orderDate(TradeDate day) {
        set("orderDate", day.rocText());
        return this;
    }

    /** Quantity in lots; for board lots. */
    public StockOrderRequest quantityLots(int number) {
        set("quantity", number);
        return this;
    }

    /** Quantity in shares, as an odd lot. */
    public StockOrderRequest quantityOddLotShares(int shares) {
        set("quantity", shares);
        set("tradeType", 2);
        return this;
    }

    /** Shares per lot, 1000 unless set. */
    public StockOrderRequest sharesPerLot(int number) {
        set("unit", number);
        return this;
    }

    /** Limit price in hundredths of the currency unit: 1005 is 10.05. */
    public StockOrderRequest priceHundredths(int number) {
        set("price", number);
        return this;
    }

    /** Buy or sell. */
    public StockOrderRequest side(Side side) {
        set("side", side.letter());
        return this;
    }

    /** Flag of the broker, tag 13. */
    public StockOrderRequest flag13(char flag) {
        set("flag13", flag);
        return this;
    }

    /** Order kind as the broker numbers them: 0 cash, 1 to 5 and 8 the others. */
    public StockOrderRequest orderKind(int number) {
        set("orderKind", number);
        return this;
    }

    /** A price that the exchange sets in place of a limit. */
    public StockOrderRequest price(PriceWord word) {
        set("priceKind", kindOf(word));
        return this;
    }

    /** Trade type: 0 board lots, 2 odd lot, 3 board lots at the fixed price of the session. */
    public StockOrderRequest tradeType(int number) {
        set("tradeType", number);
        return this;
    }

    /** Handling flag of the broker, tag N6. */
    public StockOrderRequest handlingFlag(int number) {
        set("handlingFlag", number);
        return this;
    }

    private static int kindOf(PriceWord word) {
        switch (word) {
            case LIMIT_DOWN:
                return 1;
            case FLAT:
                return 5;
            case LIMIT_UP:
                return 9;
            default:
                throw new IllegalArgumentException("no stock order at the " + word.label());
        }
    }
}
