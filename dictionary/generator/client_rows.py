"""The rows of the typed layer, with their columns and the layouts that they come in."""

from .java_text import JZG, class_name, constant_name, filled, javadoc, quoted, java_source

FORMS = {
    "text": ("TEXT", "String"),
    "month": ("MONTH", "String"),
    "count": ("COUNT", "Long"),
    "number": ("NUMBER", "BigDecimal"),
    "hundredths": ("HUNDREDTHS", "BigDecimal"),
    "tenThousandths": ("TEN_THOUSANDTHS", "BigDecimal"),
    "amountOrText": ("AMOUNT_OR_TEXT", "BigDecimal"),
    "price2": ("PRICE_2", "Price"),
    "price4": ("PRICE_4", "Price"),
    "date": ("DATE", "TradeDate"),
    "time": ("TIME", "TradeTime"),
}


def _tables(whole):
    for reply in whole["replies"]:
        for table in reply.get("tables", []):
            yield reply, table


def shapes(whole):
    """For each kind of row its columns, and the patterns of the layouts that it comes in."""
    shapes = {}
    for reply, table in _tables(whole):
        name = class_name(table["name"].removesuffix(JZG))
        shape = shapes.setdefault(name, {
            "title": table["name"].removesuffix(JZG), "columns": [], "patterns": {},
            "last": table.get("last", False),
            "list": _is_list(reply) and not table.get("last")})
        known = {column["name"]: column for column in shape["columns"]}
        for column in table["columns"]:
            if "name" in column and column["name"] not in known:
                shape["columns"].append(column)
        key = "SHAPE_JZG" if table["name"].endswith(JZG) else "SHAPE"
        shape["patterns"][key] = table["columns"]
    for shape in shapes.values():
        places = {column["name"]: place for place, column in enumerate(shape["columns"])}
        for key, columns in shape["patterns"].items():
            pattern = _pattern(columns, places)
            shape["patterns"][key] = _free_last(pattern) if shape["last"] else pattern
    return shapes


def _is_list(reply):
    """Whether a result is a list with a class of its own; that of accounts is written by hand."""
    only = reply.get("record", {}).get("only")
    return (reply["result"] == "list" and only != "first"
            and reply["tables"][0]["name"] != "account")


def _pattern(columns, places):
    """A record with the places of its columns, `0@1|2@?3&4@`."""
    fields = []
    for column in columns:
        if "empty" in column:
            fields += [""] * column["empty"]
        elif "join" in column:
            fields[-1] += column["join"] + str(places[column["name"]])
        else:
            fields.append(("?" if column.get("mayBeMissing") else "") + str(places[column["name"]]))
    return "@".join(fields)


def _free_last(pattern):
    """The pattern of a record of which the last field takes all that is left."""
    head, last = pattern.rsplit("@", 1)
    return f"{head}@*{last}"


def _types(row, column, tables):
    """The form of a column in Java, and what it reads as."""
    if row == "FuturesOrder" and column["name"].startswith("strike"):
        return "Form.BOOK_STRIKE", "BigDecimal"
    if column["form"] == "code":
        name = tables[column["codes"]]["javaName"]
        return f"Form.code({name}.values())", f"Code<{name}>"
    form, java = FORMS[column["form"]]
    return f"Form.{form}", java


def row(name, shape, tables):
    constants, getters, imports = [], [], {"org.jetbrains.annotations.NotNull"}
    for place, column in enumerate(shape["columns"]):
        form, java = _types(name, column, tables)
        constant, text = constant_name(column["name"]), java == "String"
        if java == "BigDecimal":
            imports.add("java.math.BigDecimal")
        if not text:
            imports.add("org.jetbrains.annotations.Nullable")
        constants.append(
            f"{javadoc(column['meaning'], '    ')}\n"
            f"    public static final Column<{name}, {java}> {constant} =\n"
            + filled(f"            new Column<{name}, {java}>(",
                      [str(place), quoted(column["name"]), form, quoted(" ".join(column["tags"])),
                       quoted(column["meaning"])], ");", 20) + "\n")
        empty = "empty when there is none" if text else "null when there is none"
        getters.append(
            f"{javadoc(column['meaning'] + '; ' + empty, '    ')}\n"
            f"    @{'NotNull' if text else 'Nullable'}\n"
            f"    public {java} {column['name']}() {{\n"
            f"        return {'string' if text else 'get'}({constant});\n    }}\n")
    columns = filled("            ", [constant_name(column["name"]) for column in shape["columns"]],
                      ") {", 12)
    shapes = "\n".join(
        SHAPE % {"name": name, "key": key, "title": shape["title"], "pattern": pattern,
                 "columns": columns}
        for key, pattern in shape["patterns"].items())
    head = javadoc(f"one {shape['title']}. Never changes")
    return java_source(
        f"{head}\npublic final class {name} extends Row<{name}> {{\n"
        + "\n".join(constants) + shapes
        + f"\n    private {name}(Shape<{name}> shape, String result, int start, int end) {{\n"
        "        super(shape, result, start, end);\n    }\n\n" + "\n".join(getters) + "}", imports)


SHAPE = """
    static final Shape<%(name)s> %(key)s = new Shape<%(name)s>("%(title)s",
            "%(pattern)s",
%(columns)s
        @Override
        %(name)s row(String text, int start, int end) {
            return new %(name)s(this, text, start, end);
        }
    };
"""


def list_of(name, shape):
    return java_source(LIST % {"name": name, "title": shape["title"]})


LIST = """
/** A list of rows of the kind {@link %(name)s}. Never changes. */
public final class %(name)ss extends Rows<%(name)s> {
    %(name)ss(Shape<%(name)s> shape, String result) {
        super(shape, result, 0, result.length(), 0);
    }
}
"""
