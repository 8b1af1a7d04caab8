package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.NotNull;

/**
 * Where requests come from: device, client edition, market, brokerage, and the number of the first
 * request. Never changes. What is out of range is told when a request is built.
 */
public final class Session {
    private final Market market;
    private final Platform platform;
    private final Brokerage brokerage;
    private final int sequence;
    private final String serialNumber;
    private final String localAddress;

    private Session(Market market, Platform platform, Brokerage brokerage, int sequence,
            String serialNumber, String localAddress) {
        this.market = market;
        this.platform = platform;
        this.brokerage = brokerage;
        this.sequence = sequence;
        this.serialNumber = serialNumber;
        this.localAddress = localAddress;
    }

    /**
     * A session on the securities market of a brokerage with the usual layouts, from a client
     * without a name of its own, whose first request has the number 0.
     *
     * @param serialNumber serial number of the device, at most 19 characters
     * @param localAddress address of the device, at most 64 characters; without one no request goes
     */
    @NotNull
    public static Session of(@NotNull String serialNumber, @NotNull String localAddress) {
        return new Session(Market.SECURITIES, Platform.NO_DEFINE, Brokerage.STANDARD, 0,
                serialNumber, localAddress);
    }

    /** The same session on another market. */
    @NotNull
    public Session withMarket(@NotNull Market other) {
        return new Session(other, platform, brokerage, sequence, serialNumber, localAddress);
    }

    /** The same session of another client edition. */
    @NotNull
    public Session withPlatform(@NotNull Platform other) {
        return new Session(market, other, brokerage, sequence, serialNumber, localAddress);
    }

    /** The same session at another brokerage. */
    @NotNull
    public Session withBrokerage(@NotNull Brokerage other) {
        return new Session(market, platform, other, sequence, serialNumber, localAddress);
    }

    /** The same session with another number for its next request; the last two digits are sent. */
    @NotNull
    public Session withSequence(int number) {
        return new Session(market, platform, brokerage, number, serialNumber, localAddress);
    }

    /** The same session from another address: the device changed its network. */
    @NotNull
    public Session withLocalAddress(@NotNull String address) {
        return new Session(market, platform, brokerage, sequence, serialNumber, address);
    }

    /** The market. */
    @NotNull
    public Market market() {
        return market;
    }

    /** The client edition. */
    @NotNull
    public Platform platform() {
        return platform;
    }

    /** Whose layouts the replies have. */
    @NotNull
    public Brokerage brokerage() {
        return brokerage;
    }

    /** The number of the next request. */
    public int sequence() {
        return sequence;
    }

    /** Serial number of the device. */
    @NotNull
    public String serialNumber() {
        return serialNumber;
    }

    /** Address of the device. */
    @NotNull
    public String localAddress() {
        return localAddress;
    }

    @Override
    public boolean equals(Object other) {
        return other instanceof Session && ((Session) other).toString().equals(toString());
    }

    @Override
    public int hashCode() {
        return toString().hashCode();
    }

    @Override
    public String toString() {
        return "Session(" + market + ", platform " + platform + ", " + brokerage + ", sequence "
                + sequence + ", " + serialNumber + ", " + localAddress + ")";
    }
}
