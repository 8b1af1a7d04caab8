"""The codes of the typed layer: enums where a result shows a word, numbers elsewhere."""

from .java_text import javadoc, quoted, java_source, wrapped

# Codes that go out as their numbers, each behind a type of its own.
NUMBER_CODES = [
    ("OrderKind", "Order kind of a stock order (tag 27).", "orderKinds"),
    ("TradeType", "Trade type of a stock order (tag 28).", "tradeTypes"),
    ("Platform", "Client edition: what tag 11 sends.", "platforms"),
    ("SettlementPeriod", "Period of a settlement list, 1 to 6.", "periods"),
    ("MarginQuery", "Query type of the margin account.", "marginQueryTypes"),
    ("OrderSelection", "Which futures orders to list (tag 28).", None),
    ("ContactTime", "Code of a time at the opening of an account (tag TIME).", None),
    ("AccountItem", "Code of an item at the opening of an account (tag ITEM).", None),
]
ENUMS = {"stockFunctions": "StockFunction"}


def enum(name, table):
    facts = name == "OrderType"
    rows = []
    for value in table["values"]:
        extra = ""
        if facts:
            source = value["from"]
            side = {"B": "B", "not B": "S"}.get(source.get("side"), "")
            extra = (f", {quoted(source['orderKind'])}, "
                     f"{quoted(source.get('tradeType', ''))}, {quoted(side)}")
        constant = value.get("name") or "CODE_" + value["code"]
        rows.append(f"{javadoc(value['label'], '    ')}\n"
                    f"    {constant}({quoted(value['code'])}, {quoted(value['label'])}{extra}),")
    empty = ', "", "", ""' if facts else ""
    rows.append(f'    /** A code without a name. */\n    UNKNOWN("", "not known"{empty});')
    note = f"\n *\n * <p>{table['note']}" if table.get("note") else ""
    head = javadoc(table["title"].split("; the text is the code")[0])
    if note:
        head = "/**\n * " + table["title"].replace('"', "'") + note.replace('"', "'") + "\n */"
    return java_source(ENUM % {
        "head": wrapped(head), "name": name, "rows": "\n".join(rows),
        "fields": FACT_FIELDS if facts else "", "parameters": FACT_PARAMETERS if facts else "",
        "sets": FACT_SETS if facts else "", "methods": FACT_METHODS if facts else "",
    }, ["org.jetbrains.annotations.NotNull"])


FACT_FIELDS = """    private final String kinds;
    private final String tradeTypes;
    private final String side;
"""
FACT_PARAMETERS = ", String kinds, String tradeTypes, String side"
FACT_SETS = """        this.kinds = kinds;
        this.tradeTypes = tradeTypes;
        this.side = side;
"""
FACT_METHODS = """
    /** The order kinds that are shown so, with blanks between. */
    String kinds() {
        return kinds;
    }

    /** The trade types that are shown so; empty where they do not count. */
    String tradeTypes() {
        return tradeTypes;
    }

    /** The side; empty where it does not count. */
    String side() {
        return side;
    }
"""
ENUM = """
%(head)s
public enum %(name)s implements Coded {
%(rows)s

    private final String code;
    private final String label;
%(fields)s
    %(name)s(String code, String label%(parameters)s) {
        this.code = code;
        this.label = label;
%(sets)s    }
%(methods)s
    @Override
    @NotNull
    public String code() {
        return code;
    }

    @Override
    @NotNull
    public String label() {
        return label;
    }
}
"""


def number_code(name, title, table):
    constants, seen = [], set()
    for value in table["values"] if table else []:
        constant = value.get("name")
        if name == "Platform" and value.get("wire"):
            constant = value["wire"].replace(" ", "_")
        if constant and constant not in seen:
            seen.add(constant)
            constants.append(f"{javadoc(value['label'], '    ')}\n"
                             f"    public static final {name} {constant} = "
                             f"new {name}({value['code']});\n")
    note = table.get("note") if table else None
    note = " " + (note or "What a number stands for is the broker's.")
    head = wrapped(f"/** {title}{note} Never changes. */")
    return java_source(NUMBER_CODE % {"head": head, "name": name, "constants": "\n".join(constants)},
                   ["org.jetbrains.annotations.NotNull"])


NUMBER_CODE = """
%(head)s
public final class %(name)s extends NumberCode {
%(constants)s
    private %(name)s(int number) {
        super(number);
    }

    /** The code of a number; whether it can be sent is told when a request is built. */
    @NotNull
    public static %(name)s of(int number) {
        return new %(name)s(number);
    }
}
"""
