package com.brindlex.kernel.quorvane.simulator;

import com.brindlex.kernel.quorvane.client.Brokerage;
import java.time.Clock;
import java.time.Duration;
import java.time.LocalDate;
import java.time.LocalDateTime;
import java.util.ArrayList;
import java.util.LinkedHashMap;
import java.util.List;
import java.util.Map;

/** What a gateway was built with: who trades what, when, and within which limits. */
final class World {
    Clock clock = Clock.systemDefaultZone();

    /** How far a device's clock may be from the gateway's; null when nobody looks. */
    Duration tolerance;

    Brokerage brokerage = Brokerage.STANDARD;
    String notice = "";
    Hours stockHours = Hours.ALWAYS;
    Hours futuresHours = Hours.ALWAYS;
    long maxLots = Long.MAX_VALUE;
    long maxContracts = 100;
    final List<Customer> customers = new ArrayList<>();
    final Map<String, ListedStock> stocks = new LinkedHashMap<>();
    final Map<String, ListedProduct> products = new LinkedHashMap<>();

    World copy() {
        World other = new World();
        other.clock = clock;
        other.tolerance = tolerance;
        other.brokerage = brokerage;
        other.notice = notice;
        other.stockHours = stockHours;
        other.futuresHours = futuresHours;
        other.maxLots = maxLots;
        other.maxContracts = maxContracts;
        other.customers.addAll(customers);
        other.stocks.putAll(stocks);
        other.products.putAll(products);
        return other;
    }

    LocalDateTime now() {
        return LocalDateTime.now(clock);
    }

    LocalDate today() {
        return LocalDate.now(clock);
    }

    /** The stock behind a code, or the refusal of an order for it. */
    ListedStock stock(String code) throws Refusal {
        ListedStock stock = stocks.get(code);
        if (stock == null) {
            throw Refusal.rejected("無此股票代號");
        }
        return stock;
    }

    /** The product behind a commodity id, or the refusal of an order for it. */
    ListedProduct product(String commodity) throws Refusal {
        ListedProduct product = products.get(commodity);
        if (product == null) {
            throw Refusal.rejected("無此商品代號");
        }
        return product;
    }
}
