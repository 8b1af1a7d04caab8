"""The generated part of the typed layer: operations with their arguments, the calls of the natives,
codes, rows and the types of replies, as Java classes of the package `client`."""

import re

from . import words

FOLDER = "java/client/com/brindlex/kernel/quorvane/client"
PACKAGE = "com.brindlex.kernel.quorvane.client"
MARK = f"// {words.GENERATED}"

# What letters a text may have, and how many bytes where no buffer bounds it.
CHARACTERS = {
    "branch": "[0-9A-Za-z]",
    "serialNo": "[!-~]",
    "localIP": "[0-9A-Za-z.:%]",
    "stockCode": "[0-9A-Za-z]",
    "commodity1": "[0-9A-Za-z]",
    "commodity2": "[0-9A-Za-z]",
    "month1": "[0-9A-Z]",
    "month2": "[0-9A-Z]",
    "callPut1": "[CP]",
    "callPut2": "[CP]",
    "strike1": "[0-9.]",
    "strike2": "[0-9.]",
}
LENGTHS = {"branch": 16, "commodity1": 15, "commodity2": 15, "month1": 15, "month2": 15,
           "strike1": 15, "strike2": 15, "callPut1": 1, "callPut2": 1, "tel": 32, "birth": 32,
           "certMsg": 2600}
UNBOUNDED = {"RegisterCertEncode"}
USUAL_LENGTH = 256

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
JZG = " (JZG)"


def files(whole):
    """The generated classes: for each path its text."""
    sources = {
        "Arguments": _arguments(whole),
        "Operation": _operation_enum(whole),
        "Natives": _natives(whole),
        "ReplyTypes": _reply_types(whole),
    }
    for table in whole["codes"]:
        name = table.get("javaName") or ENUMS.get(table["name"])
        if name:
            sources[name] = _enum(name, table)
    tables = {table["name"]: table for table in whole["codes"]}
    for name, title, codes in NUMBER_CODES:
        sources[name] = _number_code(name, title, tables.get(codes))
    shapes = _shapes(whole)
    for name, shape in shapes.items():
        sources[name] = _row(name, shape, tables)
        if shape["list"]:
            sources[name + "s"] = _list(name, shape)
    return {f"{FOLDER}/{name}.java": text for name, text in sources.items()}


def _source(body, imports=()):
    lines = [MARK, f"package {PACKAGE};", ""]
    lines += [f"import {name};" for name in sorted(imports)]
    return "\n".join(lines + ([""] if imports else [])) + body.strip("\n") + "\n"


def _quoted(text):
    return '"' + text.replace("\\", "\\\\").replace('"', '\\"').replace("\n", "\\n") + '"'


def _constant(name):
    """orderDate, ReNewCertEncode -> ORDER_DATE, RE_NEW_CERT_ENCODE."""
    words = re.sub(r"(?<=[a-z0-9])(?=[A-Z])|(?<=[A-Z])(?=[A-Z][a-z])", "_", name)
    return words.upper()


def _class(title):
    return "".join(word[:1].upper() + word[1:] for word in re.split(r"[ -]", title))


def _upper(name):
    return name[:1].upper() + name[1:]


def _javadoc(text, indent=""):
    text = re.sub(r"`([^`]*)`", r"{@code \1}", text[:1].upper() + text[1:])
    line = f"{indent}/** {text.rstrip('.')}. */"
    if len(line) <= 100:
        return line
    words, lines, current = text.rstrip(".").split(" "), [], f"{indent} *"
    for word in words:
        if len(current) + 1 + len(word) > 99:
            lines.append(current)
            current = f"{indent} *"
        current += " " + word
    return "\n".join([f"{indent}/**"] + lines + [current + ".", f"{indent} */"])


# Arguments and operations


def _type(argument):
    if argument["type"] == "byte":
        return "BYTE_LETTER" if argument.get("kind") == "letter" else "SMALL"
    return {"String": "TEXT", "int": "INT", "char": "LETTER"}[argument["type"]]


def _bounds(operation, argument):
    if argument["type"] != "String":
        low = argument.get("min", -(2**31) if argument["type"] == "int" else 0)
        return low, argument.get("max", 2**31 - 1 if argument["type"] == "int" else 255)
    if argument["name"] == "certMsg":
        # the Base64 of fewer bytes carries none of them
        return 3, 2**31 - 1 if operation in UNBOUNDED else LENGTHS["certMsg"]
    if argument["name"] == "serialNo":
        # one that fills its field runs on into the address
        return 0, argument["maxLength"] - 1
    return 0, argument.get("maxLength", LENGTHS.get(argument["name"], USUAL_LENGTH))


def _argument(operation, argument):
    low, high = _bounds(operation, argument)
    if argument["name"] == "market":
        low, high = 0, 200
    usual = argument.get("usual")
    unit = f" ({argument['unit']})" if argument.get("unit") else ""
    pattern = argument.get("characters", CHARACTERS.get(argument["name"], ""))
    return ", ".join([
        _quoted(argument["name"]), f"Argument.Type.{_type(argument)}",
        "null" if usual is None else _quoted(usual), str(low).replace("-2147483648", "Integer.MIN_VALUE"),
        str(high), _quoted(pattern), _quoted(argument["purpose"] + unit)])


def _own(operation):
    """The arguments of an operation behind those of the session."""
    session = {"market", "platform", "seqNo", "serialNo", "localIP"} if "forms" in operation else set()
    return [each for each in operation["arguments"] if each["name"] not in session]


def _named_arguments(whole):
    """For each distinct argument its constant; for each operation the constants of its own."""
    names, used, lists = {}, set(), {}
    for operation in whole["operations"]:
        lists[operation["name"]] = own = []
        for argument in operation["arguments"]:
            text = _argument(operation["name"], argument)
            if text not in names:
                name = base = _constant(argument["name"])
                number = 1
                while name in used:
                    number += 1
                    name = f"{base}_{number}"
                used.add(name)
                names[text] = name
            if argument in _own(operation):
                own.append(names[text])
    return names, lists


def _arguments(whole):
    names, _ = _named_arguments(whole)
    lines = ["/** The arguments of all natives. */", "final class Arguments {"]
    for text, name in names.items():
        lines.append(f"    static final Argument {name} = new Argument({text});")
    return _source("\n".join(lines + ["", "    private Arguments() {}", "}"]))


def _operation_enum(whole):
    _, lists = _named_arguments(whole)
    rows = []
    for operation in whole["operations"]:
        decoders = " ".join(operation.get("answeredBy", []))
        arguments = ", ".join(f"Arguments.{name}" for name in lists[operation["name"]])
        rows.append(
            f"    {_javadoc(operation['title']).strip()}\n"
            f"    {_constant(operation['name'])}({_quoted(operation['name'])}, "
            f"{_quoted(operation['title'])}, {_quoted(operation['class'])},\n"
            f"            {_quoted(decoders)}, {arguments})")
    return _source(OPERATION % ",\n".join(rows), [
        "java.util.ArrayList", "java.util.Arrays", "java.util.Collections", "java.util.List",
        "org.jetbrains.annotations.NotNull", "org.jetbrains.annotations.Nullable"])


OPERATION = """
/** The operations of the library, one for each native method. */
public enum Operation {
%s;

    private final String method;
    private final String title;
    private final String owner;
    private final String answeredBy;
    private final List<Argument> arguments;

    Operation(String method, String title, String owner, String answeredBy, Argument... arguments) {
        this.method = method;
        this.title = title;
        this.owner = owner;
        this.answeredBy = answeredBy;
        this.arguments = Collections.unmodifiableList(Arrays.asList(arguments));
    }

    /** The operation of a native method; null when there is none of this name. */
    @Nullable
    public static Operation named(@NotNull String method) {
        for (Operation operation : values()) {
            if (operation.method.equals(method)) {
                return operation;
            }
        }
        return null;
    }

    /** The arguments that come first in every encoder: those of the session. */
    @NotNull
    public static List<Argument> sessionArguments() {
        return Collections.unmodifiableList(Arrays.asList(Arguments.MARKET, Arguments.PLATFORM,
                Arguments.SEQ_NO, Arguments.SERIAL_NO, Arguments.LOCAL_IP));
    }

    /** The name of the native method. */
    @NotNull
    public String method() {
        return method;
    }

    /** What it is for, in a few words. */
    @NotNull
    public String title() {
        return title;
    }

    /** Whether it builds a request; else it reads a reply. */
    public boolean isEncoder() {
        return method.contains("Encode");
    }

    boolean isFutures() {
        return owner.equals("CGatewayFut");
    }

    boolean isStock() {
        return owner.equals("CGatewayStk");
    }

    /** Its own arguments: behind those of the session, without the status array. */
    @NotNull
    public List<Argument> arguments() {
        return arguments;
    }

    /**
     * How the result of a decoder is put together.
     *
     * @throws IllegalArgumentException when it is an encoder
     */
    @NotNull
    public Layout layout() {
        return ReplyTypes.of(this).layout();
    }

    /** The decoders that read the replies to an encoder's requests; none for a decoder. */
    @NotNull
    public List<Operation> decoders() {
        List<Operation> decoders = new ArrayList<Operation>();
        for (Operation operation : values()) {
            if ((" " + answeredBy + " ").contains(" " + operation.method + " ")) {
                decoders.add(operation);
            }
        }
        return Collections.unmodifiableList(decoders);
    }

    @Override
    @NotNull
    public String toString() {
        return method;
    }
}
"""


def _natives(whole):
    encoders, decoders = [], []
    for operation in whole["operations"]:
        case = f"            case {_constant(operation['name'])}:\n"
        if "forms" in operation:
            values = [_value(place, argument) for place, argument in enumerate(_own(operation))]
            values += [] if operation.get("status") is False or operation["name"] == "SubmitOrderEncode2" else ["status"]
            encoders.append(
                f"{case}                return gatewayjni.{operation['name']}(market,\n"
                "                        session.platform().number(), session.sequence(),\n"
                "                        session.serialNumber(), session.localAddress(),\n"
                f"                        {', '.join(values)});")
        else:
            market = "market, " if operation["arguments"][0]["name"] == "market" else ""
            decoders.append(f"{case}                return gatewayjni.{operation['name']}({market}reply, status);")
    return _source(NATIVES % ("\n".join(encoders), "\n".join(decoders)),
                   ["com.brindlex.kernel.quorvane.gatewayjni"])


def _value(place, argument):
    return {
        "TEXT": f"(String) v[{place}]",
        "INT": f"(Integer) v[{place}]",
        "SMALL": f"((Integer) v[{place}]).byteValue()",
        "BYTE_LETTER": f"(byte) ((Character) v[{place}]).charValue()",
        "LETTER": f"(Character) v[{place}]",
    }[_type(argument)]


NATIVES = """
/** Calls the natives. */
final class Natives {
    private Natives() {}

    static String encode(
            Operation operation, int market, Session session, Object[] v, int[] status) {
        switch (operation) {
%s
            default:
                throw new IllegalArgumentException(operation + " builds no request");
        }
    }

    static String decode(Operation operation, int market, String reply, int[] status) {
        switch (operation) {
%s
            default:
                throw new IllegalArgumentException(operation + " reads no reply");
        }
    }
}
"""


# Codes


def _enum(name, table):
    facts = name == "OrderType"
    rows = []
    for value in table["values"]:
        extra = ""
        if facts:
            source = value["from"]
            side = {"B": "B", "not B": "S"}.get(source.get("side"), "")
            extra = (f", {_quoted(source['orderKind'])}, "
                     f"{_quoted(source.get('tradeType', ''))}, {_quoted(side)}")
        constant = value.get("name") or "CODE_" + value["code"]
        rows.append(f"{_javadoc(value['label'], '    ')}\n"
                    f"    {constant}({_quoted(value['code'])}, {_quoted(value['label'])}{extra}),")
    empty = ', "", "", ""' if facts else ""
    rows.append(f'    /** A code without a name. */\n    UNKNOWN("", "not known"{empty});')
    note = f"\n *\n * <p>{table['note']}" if table.get("note") else ""
    head = _javadoc(table["title"].split("; the text is the code")[0])
    if note:
        head = "/**\n * " + table["title"].replace('"', "'") + note.replace('"', "'") + "\n */"
    return _source(ENUM % {
        "head": _wrapped(head), "name": name, "rows": "\n".join(rows),
        "fields": FACT_FIELDS if facts else "", "parameters": FACT_PARAMETERS if facts else "",
        "sets": FACT_SETS if facts else "", "methods": FACT_METHODS if facts else "",
    }, ["org.jetbrains.annotations.NotNull"])


def _wrapped(javadoc):
    """A documentation comment within 100 columns."""
    out = []
    for line in javadoc.split("\n"):
        while len(line) > 100:
            cut = line.rindex(" ", 0, 100)
            out.append(line[:cut])
            line = " * " + line[cut + 1:]
        out.append(line)
    if len(out) > 1 and out[0].startswith("/** "):
        out = ["/**", " * " + out[0][4:]] + out[1:]
        if out[-1].endswith("*/") and out[-1].strip() != "*/":
            out[-1:] = [out[-1][:-2].rstrip(), " */"]
    return "\n".join(out)


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


def _number_code(name, title, table):
    constants, seen = [], set()
    for value in table["values"] if table else []:
        constant = value.get("name")
        if name == "Platform" and value.get("wire"):
            constant = value["wire"].replace(" ", "_")
        if constant and constant not in seen:
            seen.add(constant)
            constants.append(f"{_javadoc(value['label'], '    ')}\n    public static final {name} {constant} = "
                             f"new {name}({value['code']});\n")
    note = f" {table['note']}" if table and table.get("note") else " What a number stands for is the broker's."
    head = _wrapped(f"/** {title}{note} Never changes. */")
    return _source(NUMBER_CODE % {"head": head, "name": name, "constants": "\n".join(constants)},
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


# Rows


def _tables(whole):
    for reply in whole["replies"]:
        for table in reply.get("tables", []):
            yield reply, table


def _shapes(whole):
    """For each kind of row its columns, and the patterns of the layouts that it comes in."""
    shapes = {}
    for reply, table in _tables(whole):
        name = _class(table["name"].removesuffix(JZG))
        shape = shapes.setdefault(name, {
            "title": table["name"].removesuffix(JZG), "columns": [], "patterns": {},
            "last": table.get("last", False),
            "list": reply["result"] == "list" and reply["record"].get("only") != "first" and reply["tables"][0]["name"] != "account"
            and not table.get("last")})
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


def _row(name, shape, tables):
    constants, getters, imports = [], [], {"org.jetbrains.annotations.NotNull"}
    for place, column in enumerate(shape["columns"]):
        form, java = _types(name, column, tables)
        constant, text = _constant(column["name"]), java == "String"
        if java == "BigDecimal":
            imports.add("java.math.BigDecimal")
        if not text:
            imports.add("org.jetbrains.annotations.Nullable")
        constants.append(
            f"{_javadoc(column['meaning'], '    ')}\n"
            f"    public static final Column<{name}, {java}> {constant} =\n"
            f"            new Column<{name}, {java}>({place}, {_quoted(column['name'])}, {form},\n"
            f"                    {_quoted(' '.join(column['tags']))}, {_quoted(column['meaning'])});\n")
        empty = "empty when there is none" if text else "null when there is none"
        getters.append(
            f"{_javadoc(column['meaning'] + '; ' + empty, '    ')}\n"
            f"    @{'NotNull' if text else 'Nullable'}\n"
            f"    public {java} {column['name']}() {{\n"
            f"        return {'string' if text else 'get'}({constant});\n    }}\n")
    columns = ", ".join(_constant(column["name"]) for column in shape["columns"])
    shapes = "\n".join(
        SHAPE % {"name": name, "key": key, "title": shape["title"], "pattern": pattern, "columns": columns}
        for key, pattern in shape["patterns"].items())
    head = _javadoc(f"one {shape['title']}. Never changes")
    return _source(
        f"{head}\npublic final class {name} extends Row<{name}> {{\n" + "\n".join(constants) + shapes
        + f"\n    private {name}(Shape<{name}> shape, String result, int start, int end) {{\n"
        "        super(shape, result, start, end);\n    }\n\n" + "\n".join(getters) + "}", imports)


SHAPE = """
    static final Shape<%(name)s> %(key)s = new Shape<%(name)s>("%(title)s", "%(pattern)s",
            %(columns)s) {
        @Override
        %(name)s row(String text, int start, int end) {
            return new %(name)s(this, text, start, end);
        }
    };
"""


def _list(name, shape):
    return _source(LIST % {"name": name, "title": shape["title"]})


LIST = """
/** A list of rows of the kind {@link %(name)s}. Never changes. */
public final class %(name)ss extends Rows<%(name)s> {
    %(name)ss(Shape<%(name)s> shape, String result) {
        super(shape, result, 0, result.length(), 0);
    }
}
"""


# What replies read as


def _reply_types(whole):
    shapes, out = _shapes(whole), []
    for reply in whole["replies"]:
        java, body = _result(reply, shapes)
        judge = ("NOBODY" if reply["answers"]["refusal"]["status"] == 1
                 else "DECODER_OF_ORDERS" if _is_receipt(reply) else "DECODER")
        operation = _constant(reply["decoder"])
        out.append(REPLY_TYPE % {"java": java, "constant": operation.replace("_DECODE", ""),
                                 "operation": operation, "judge": judge, "body": body,
                                 "layout": _layout(reply)})
    names = ", ".join(_constant(reply["decoder"]).replace("_DECODE", "") for reply in whole["replies"])
    return _source("/** What reads the replies to each kind of request. */\nfinal class ReplyTypes {"
                   + "\n".join(out) + ALL % names + "}")


def _is_receipt(reply):
    """Whether it is the answer to an order: tag 39 says what became of that."""
    return any(row["tag"] == "39" for row in reply.get("replyTags", []))


REPLY_TYPE = """
    static final ReplyType<%(java)s> %(constant)s =
            new ReplyType<%(java)s>(Operation.%(operation)s,
                    %(layout)s,
                    ReplyType.Judge.%(judge)s) {
                @Override
                %(java)s result(String text) {
                    return %(body)s;
                }
            };
"""
ALL = """
    private static final ReplyType<?>[] ALL = {%s};

    private ReplyTypes() {}

    /** What reads the replies that a decoder reads. */
    static ReplyType<?> of(Operation decoder) {
        for (ReplyType<?> type : ALL) {
            if (type.decoder() == decoder) {
                return type;
            }
        }
        throw new IllegalArgumentException(decoder + " reads no reply");
    }
"""


def _layout(reply):
    """How the result of a decoder is put together, as Java."""
    tables = reply.get("tables", [])
    first = tables[0].get("mark", "<0>").strip("<>") if tables else "0"
    shapes = [f"{_class(table['name'].removesuffix(JZG))}.SHAPE{'_JZG' if JZG in table['name'] else ''}"
              for table in tables]
    return "new Layout(" + ", ".join([f"Layout.Kind.{reply['result'].upper()}", first] + shapes) + ")"


def _result(reply, shapes):
    """What a decoder's result reads as, and how."""
    if reply["result"] == "empty":
        return "Confirmation", "Confirmation.DONE"
    if reply["result"] == "text":
        return "CertificateText", "new CertificateText(text)"
    table = reply["tables"][0]
    name = _class(table["name"].removesuffix(JZG))
    shape = f"{name}.{'SHAPE_JZG' if table['name'].endswith(JZG) else 'SHAPE'}"
    if len(reply["tables"]) > 1 and reply["result"] == "list" or name == "Account":
        return "Accounts", "new Accounts(text)"
    if reply["result"] == "sections":
        java = "StockPositions" if reply["decoder"].startswith("Query") else "FuturesPositions"
        jzg = ", true" if table["name"].endswith(JZG) else ", false" if java == "StockPositions" else ""
        return java, f"new {java}(text{jzg})"
    if reply["result"] == "record":
        return name, f"{shape}.row(text, 0, Math.max(0, text.length() - 1))"
    if shapes[name]["list"]:
        return name + "s", f"new {name}s({shape}, text)"
    return name, f"{shape}.row(text, 2, Math.max(2, text.length() - 1))"
