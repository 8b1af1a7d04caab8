package com.brindlex.kernel.quorvane.typed;

/** What every request carries: where it comes from and its number. Never changes. */
public final class Session {
    final int market;
    final int platform;
    final int sequence;
    final String serialNumber;
    final String localAddress;

    private Session(
            int market, int platform, int sequence, String serialNumber, String localAddress) {
        this.market = market;
        this.platform = platform;
        this.sequence = sequence;
        this.serialNumber = serialNumber;
        this.localAddress = localAddress;
    }

    /**
     * A session whose requests have the number 0.
     *
     * @param market market code, 1 for securities; futures requests add 100 by themselves
     * @param platform row of the client edition, 0 to 14
     * @param serialNumber serial number of the device, at most 20 characters
     * @param localAddress address of the device; empty when it has none
     */
    public static Session of(int market, int platform, String serialNumber, String localAddress) {
        return new Session(market, platform, 0, serialNumber, localAddress);
    }

    /** The same session for the request of another number; its last two digits are sent. */
    public Session withSequence(int number) {
        return new Session(market, platform, number, serialNumber, localAddress);
    }

    /** The same session on another market. */
    public Session withMarket(int code) {
        return new Session(code, platform, sequence, serialNumber, localAddress);
    }

    /** The same session from another address: the device changed its network. */
    public Session withLocalAddress(String address) {
        return new Session(market, platform, sequence, serialNumber, address);
    }

    /** Market code. */
    public int market() {
        return market;
    }

    /** Row of the client edition. */
    public int platform() {
        return platform;
    }

    /** Number of the request. */
    public int sequence() {
        return sequence;
    }

    /** Serial number of the device. */
    public String serialNumber() {
        return serialNumber;
    }

    /** Address of the device. */
    public String localAddress() {
        return localAddress;
    }
}
