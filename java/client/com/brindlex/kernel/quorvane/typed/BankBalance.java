package com.brindlex.kernel.quorvane.typed;

import java.math.BigDecimal;

/** The balance of the linked bank account. */
public final class BankBalance {
    /** Balance of the bank account. */
    public static final Column<BigDecimal> BALANCE =
            Column.of("balance", "PN", Form.DECIMAL, "balance of the bank account");

    /** One row. */
    public static final Table TABLE = Table.of("bank balance").skip(4).add(BALANCE).skip(1).build();

    private BankBalance() {}
}
