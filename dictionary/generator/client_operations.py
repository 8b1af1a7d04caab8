"""The operations of the typed layer: their arguments, and the calls of the natives."""

from .java_text import constant_name, filled, javadoc, quoted, java_source

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
SESSION = {"market", "platform", "seqNo", "serialNo", "localIP"}


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
    return tuple([
        quoted(argument["name"]), f"Argument.Type.{_type(argument)}",
        "null" if usual is None else quoted(usual),
        str(low).replace("-2147483648", "Integer.MIN_VALUE"),
        str(high), quoted(pattern), quoted(argument["purpose"] + unit)])


def _own(operation):
    """The arguments of an operation behind those of the session."""
    return [each for each in operation["arguments"]
            if "forms" not in operation or each["name"] not in SESSION]


def _named_arguments(whole):
    """For each distinct argument its constant; for each operation the constants of its own."""
    names, used, lists = {}, set(), {}
    for operation in whole["operations"]:
        lists[operation["name"]] = own = []
        for argument in operation["arguments"]:
            text = _argument(operation["name"], argument)
            if text not in names:
                name = base = constant_name(argument["name"])
                number = 1
                while name in used:
                    number += 1
                    name = f"{base}_{number}"
                used.add(name)
                names[text] = name
            if argument in _own(operation):
                own.append(names[text])
    return names, lists


def arguments(whole):
    names, _ = _named_arguments(whole)
    lines = ["/** The arguments of all natives. */", "final class Arguments {"]
    for text, name in names.items():
        lines.append(filled(f"    static final Argument {name} = new Argument(", text, ");", 12))
    return java_source("\n".join(lines + ["", "    private Arguments() {}", "}"]))


def operation_enum(whole):
    _, lists = _named_arguments(whole)
    rows = []
    for operation in whole["operations"]:
        pieces = [quoted(text) for text in (operation["name"], operation["title"],
                                             operation["class"],
                                             " ".join(operation.get("answeredBy", [])))]
        pieces += [f"Arguments.{name}" for name in lists[operation["name"]]]
        rows.append(javadoc(operation["title"], "    ") + "\n"
                    + filled(f"    {constant_name(operation['name'])}(", pieces, ")", 12))
    return java_source(OPERATION % ",\n".join(rows), [
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


def natives(whole):
    encoders, decoders = [], []
    for operation in whole["operations"]:
        case = f"            case {constant_name(operation['name'])}:\n"
        if "forms" in operation:
            values = [_value(place, argument) for place, argument in enumerate(_own(operation))]
            values += [] if operation.get("status") is False else ["status"]
            session = ["market", "session.platform().number()", "session.sequence()",
                       "session.serialNumber()", "session.localAddress()"]
            encoders.append(case + filled(
                f"                return gatewayjni.{operation['name']}(", session + values, ");",
                24))
        else:
            market = "market, " if operation["arguments"][0]["name"] == "market" else ""
            decoders.append(f"{case}                return gatewayjni.{operation['name']}"
                            f"({market}reply, status);")
    return java_source(NATIVES % ("\n".join(encoders), "\n".join(decoders)),
                   ["com.brindlex.kernel.quorvane.NativeLibrary",
                    "com.brindlex.kernel.quorvane.gatewayjni"])


def _value(place, argument):
    return {
        "TEXT": f"(String) v[{place}]",
        "INT": f"(Integer) v[{place}]",
        "SMALL": f"((Integer) v[{place}]).byteValue()",
        "BYTE_LETTER": f"(byte) ((Character) v[{place}]).charValue()",
        "LETTER": f"(Character) v[{place}]",
    }[_type(argument)]


NATIVES = """
/**
 * Calls the natives. Loads the library at every call, which says each time what is missing; the host
 * class alone would say it once, and then be a class that is not there.
 */
final class Natives {
    private Natives() {}

    static String encode(
            Operation operation, int market, Session session, Object[] v, int[] status) {
        NativeLibrary.load();
        switch (operation) {
%s
            default:
                throw new IllegalArgumentException(operation + " builds no request");
        }
    }

    static String decode(Operation operation, int market, String reply, int[] status) {
        NativeLibrary.load();
        switch (operation) {
%s
            default:
                throw new IllegalArgumentException(operation + " reads no reply");
        }
    }
}
"""
