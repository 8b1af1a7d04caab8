"""What the replies to each request read as in the typed layer."""

from . import client_rows
from .java_text import JZG, class_name, constant_name, filled, java_source


def reply_types(whole):
    shapes, out = client_rows.shapes(whole), []
    for reply in whole["replies"]:
        java, body = _result(reply, shapes)
        judge = ("NOBODY" if reply["answers"]["refusal"]["status"] == 1
                 else "DECODER_OF_ORDERS" if _is_receipt(reply) else "DECODER")
        operation = constant_name(reply["decoder"])
        out.append(REPLY_TYPE % {"java": java, "constant": operation.replace("_DECODE", ""),
                                 "operation": operation, "judge": judge, "body": body,
                                 "layout": _layout(reply)})
    names = filled("        ", [constant_name(reply["decoder"]).replace("_DECODE", "")
                                for reply in whole["replies"]], ",", 8)
    return java_source("/** What reads the replies to each kind of request. */\nfinal class ReplyTypes {"
                   + "".join(out) + ALL % names + "}")


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
    private static final ReplyType<?>[] ALL = {
%s
    };

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
    shapes = [_shape(table) for table in tables]
    return filled("new Layout(", [f"Layout.Kind.{reply['result'].upper()}", first] + shapes, ")",
                  28)


def _shape(table):
    """The constant of a table's layout."""
    name = class_name(table["name"].removesuffix(JZG))
    return f"{name}.SHAPE{'_JZG' if JZG in table['name'] else ''}"


def _result(reply, shapes):
    """What a decoder's result reads as, and how."""
    if reply["result"] == "empty":
        return "Confirmation", "Confirmation.DONE"
    if reply["result"] == "text":
        return "CertificateText", "new CertificateText(text)"
    table = reply["tables"][0]
    name = class_name(table["name"].removesuffix(JZG))
    shape = f"{name}.{'SHAPE_JZG' if table['name'].endswith(JZG) else 'SHAPE'}"
    if len(reply["tables"]) > 1 and reply["result"] == "list" or name == "Account":
        return "Accounts", "new Accounts(text)"
    if reply["result"] == "sections":
        java = "StockPositions" if reply["decoder"].startswith("Query") else "FuturesPositions"
        if java == "FuturesPositions":
            return java, f"new {java}(text)"
        return java, f"new {java}(text, {'true' if table['name'].endswith(JZG) else 'false'})"
    if reply["result"] == "record":
        return name, f"{shape}.row(text, 0, Math.max(0, text.length() - 1))"
    if shapes[name]["list"]:
        return name + "s", f"new {name}s({shape}, text)"
    return name, f"{shape}.row(text, 2, Math.max(2, text.length() - 1))"
