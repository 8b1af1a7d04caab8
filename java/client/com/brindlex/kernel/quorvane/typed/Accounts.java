package com.brindlex.kernel.quorvane.typed;

/** The accounts of a user, and the notice that may come with a login. */
public final class Accounts {
    /** Class of the account, in angle brackets. */
    public static final Column<String> ACCOUNT_CLASS =
            Column.of("accountClass", "07", Form.TEXT, "class of the account, in angle brackets");

    /** Label of the account. */
    public static final Column<String> LABEL =
            Column.of("label", "M5", Form.TEXT, "label of the account");

    /** Account number, seven digits. */
    public static final Column<String> ACCOUNT =
            Column.of("account", "17 18", Form.TEXT, "account number, seven digits");

    /** Branch of the account. */
    public static final Column<String> BRANCH =
            Column.of("branch", "16", Form.TEXT, "branch of the account");

    /** Account flag. */
    public static final Column<String> FLAG = Column.of("flag", "69", Form.TEXT, "account flag");

    /** The mark {@code M}. */
    public static final Column<String> NOTICE_MARK =
            Column.of("noticeMark", "", Form.TEXT, "the mark <M>");

    /** Notice of the broker. */
    public static final Column<String> NOTICE =
            Column.of("notice", "M3", Form.TEXT, "notice of the broker");

    /** One row per account. */
    public static final Table TABLE = Table.of("account")
            .add(ACCOUNT_CLASS).add(LABEL).add(ACCOUNT).add(BRANCH).add(FLAG)
            .build();

    /** The notice; its row is there only when there is a notice. */
    public static final Table NOTICES = Table.of("notice")
            .add(NOTICE_MARK).add(NOTICE)
            .gaps(new Table.Gaps() {
                @Override
                public void fill(java.util.List<String> fields) {
                    // the notice is free text: what follows the mark belongs together
                    while (fields.size() > 2) {
                        fields.set(1, fields.get(1) + "@" + fields.remove(2));
                    }
                }
            })
            .build();

    private Accounts() {}
}
