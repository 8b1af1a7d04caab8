package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Brokerage;
import java.time.Clock;
import java.time.Duration;
import java.time.LocalTime;
import org.jetbrains.annotations.NotNull;

/**
 * Sets what a {@link Gateway} opens with. {@link Gateway#builder} begins with nothing, {@link
 * Gateway#readyMade} with the world of {@link ReadyMade}. A builder may build several gateways; they
 * share nothing.
 */
public final class GatewayBuilder {
    final World world;

    GatewayBuilder(World world) {
        this.world = world;
    }

    /**
     * The gateway's clock, that of the system unless set. Orders, fills and lists carry its time; what
     * time a request carries does not matter, so that a fixed clock is as good as any.
     *
     * @see Gateway#today
     */
    @NotNull
    public GatewayBuilder clock(@NotNull Clock clock) {
        world.clock = clock;
        return this;
    }

    /**
     * Refuses requests whose time is farther from the gateway's clock than this, as real gateways do:
     * for tests of a device whose clock is wrong. The clock must then run with that of the system.
     */
    @NotNull
    public GatewayBuilder tolerance(@NotNull Duration apart) {
        world.tolerance = apart;
        return this;
    }

    /** Whose layouts the replies have, {@link Brokerage#STANDARD} unless set. */
    @NotNull
    public GatewayBuilder brokerage(@NotNull Brokerage brokerage) {
        world.brokerage = brokerage;
        return this;
    }

    /** The notice that comes with a login; the empty text, as it is unless set, for none. */
    @NotNull
    public GatewayBuilder notice(@NotNull String text) {
        world.notice = text;
        return this;
    }

    /** One more customer; takes the place of one with the same ID number. */
    @NotNull
    public GatewayBuilder customer(@NotNull Customer customer) {
        world.customers.removeIf(other -> other.idNumber.equals(customer.idNumber));
        world.customers.add(customer);
        return this;
    }

    /** One more stock; takes the place of one with the same code. */
    @NotNull
    public GatewayBuilder stock(@NotNull ListedStock stock) {
        world.stocks.put(stock.code, stock);
        return this;
    }

    /** One more futures or options product; takes the place of one with the same code. */
    @NotNull
    public GatewayBuilder product(@NotNull ListedProduct product) {
        world.products.put(product.commodity, product);
        return this;
    }

    /**
     * When the stock exchange takes orders, at any time unless set. Outside, live orders, their
     * changes and cancellations are refused; reservations are taken.
     *
     * @param from the first moment
     * @param to the last moment; before {@code from} it is one of the next day
     */
    @NotNull
    public GatewayBuilder stockHours(@NotNull LocalTime from, @NotNull LocalTime to) {
        world.stockHours = new Hours(from, to);
        return this;
    }

    /** When the futures exchange takes orders, as {@link #stockHours}. */
    @NotNull
    public GatewayBuilder futuresHours(@NotNull LocalTime from, @NotNull LocalTime to) {
        world.futuresHours = new Hours(from, to);
        return this;
    }

    /** The most lots of one stock order, any number unless set. */
    @NotNull
    public GatewayBuilder maxLots(long lots) {
        world.maxLots = lots;
        return this;
    }

    /** The most contracts of one futures order, 100 unless set. */
    @NotNull
    public GatewayBuilder maxContracts(long contracts) {
        world.maxContracts = contracts;
        return this;
    }

    /**
     * Opens the gateway.
     *
     * @throws IllegalStateException when what was set does not go together, with what to do
     */
    @NotNull
    public Gateway build() {
        if (world.customers.isEmpty()) {
            throw new IllegalStateException("A gateway without customers answers nobody: add one by"
                    + " customer(Customer.of(...)), or begin with Gateway.readyMade().");
        }
        for (Customer customer : world.customers) {
            for (TradingAccount account : customer.accounts) {
                account.holdings.forEach(holding -> checkListed(customer, holding));
            }
        }
        return new Gateway(world.copy());
    }

    private void checkListed(Customer customer, Holding holding) {
        if (!world.stocks.containsKey(holding.stockCode)) {
            throw new IllegalStateException("The customer " + customer.idNumber + " holds "
                    + holding.stockCode + ", which is not listed: add it by stock(ListedStock.of(\""
                    + holding.stockCode + "\", ...)).");
        }
    }
}
