"""The host class gatewayjni with its Javadoc."""

import re

from . import load, words

PATH = "java/client/com/brindlex/kernel/quorvane/gatewayjni.java"

HEAD = """package com.brindlex.kernel.quorvane;

/**
 * The message codec between the trading application and a broker's gateway.
 *
 * <p>For each operation an <em>encoder</em> turns the user's input into one request string, and a
 * <em>decoder</em> turns the gateway's reply into one compact result string that the screen lays
 * out. The library holds no connection and no state: sending and receiving is the caller's, and
 * calls from several threads run side by side.
 *
 * <h2>Every encoder</h2>
 *
 * takes five leading parameters ({@code market}, {@code platform}, {@code seqNo}, {@code serialNo},
 * {@code localIP}), then those of the operation, and last {@code status}. Futures encoders add 100
 * to {@code market}, so that one market code of the caller serves both sides.
 *
 * <h2>The identity text</h2>
 *
 * holds an ID number and an account, in either order, joined by {@code &}:
 * {@code "A123456789&1234567"}. ID numbers have 8 to 10 characters, accounts 2 to 7 digits. A part
 * may be empty: {@code "1234567&"} names the account alone. The {@code &} must be there for queries
 * and account operations; order requests also take a lone account or ID number.
 *
 * <h2>Results and status</h2>
 *
 * {@code status[0]} is 1 for success and -1 for failure. On failure the returned text is the
 * message to show, in Traditional Chinese, usually with its source in front: {@code [CLIENT]} this
 * device, {@code [GATEWAY]} the gateway, {@code [BROKER]} the broker's host, {@code [CERT]} the
 * certificate office. In results {@code @} separates fields, {@code !} ends a record and
 * {@code count!} opens a list; {@code <n>!count!} opens a section.
 *
 * <p>Every encoder may refuse with
 *
%s
 *
 * <h2>Arguments</h2>
 *
 * A {@code null} text counts as an empty one. {@code status} must be an array of at least one
 * element. Nothing is thrown. Characters travel as UTF-8; {@code |} separates the fields of a
 * request and must not stand in a text. A {@code byte} that counts is unsigned.
 *
 * <p>The library writes requests, replies and results, passwords included, to the Android debug log
 * under the tag {@code gatewayjni} unless it was built without logging.
 */
public final class gatewayjni {
    static {
        %s;
    }

    // Everything is static.
    private gatewayjni() {}
"""

STATUS = ("status", "int[]", "at least one element; element 0 receives 1 for success, -1 for failure")
LOADING = 'NativeLibrary.load()'


# Refusals that the class tells of once.
SHARED = ("noAddress", "identityUnsplit", "identityLengths", "badParameters")


def files(whole):
    out = ["// " + words.GENERATED, HEAD % (_shared_refusals(whole), LOADING)]
    group = None
    for operation in whole["operations"]:
        if operation["group"] != group:
            group = operation["group"]
            out.append(f"    // {group[0].upper()}{group[1:]}.\n")
        out.append(_method(whole, operation) + "\n")
    out[-1] = out[-1].rstrip("\n")
    return {PATH: "\n".join(out) + "\n}\n"}


def _shared_refusals(whole):
    messages = load.by_name(whole["messages"], "id")
    lines = [" * <ul>"]
    for each in SHARED:
        text = f"<li>\"{messages[each]['text']}\": {messages[each]['english']}</li>"
        lines += words.filled(_javadoc(text), " * ")
    return "\n".join(lines + [" * </ul>"])


def _method(whole, operation):
    doc = _request_doc(whole, operation) if load.is_encoder(operation) else _reply_doc(whole, operation)
    parameters = [(one["name"], one["type"], _purpose(one)) for one in operation["arguments"]]
    if operation.get("status", True):
        parameters.append(STATUS)
    lines = ["    /**"]
    for paragraph in doc:
        lines += paragraph
    lines.append("     *")
    for name, _, purpose in parameters:
        lines += _tag(f"@param {name} {_javadoc(purpose)}")
    lines += _tag("@return " + _javadoc(_returned(operation)))
    for other in _others(whole, operation):
        lines.append(f"     * @see #{other}")
    lines.append("     */")
    opening = f"    public static native String {operation['name']}("
    declared = ", ".join(f"{kind} {name}" for name, kind, _ in parameters) + ");"
    if len(opening + declared) <= words.WIDTH:
        return "\n".join(lines + [opening + declared])
    return "\n".join(lines + [opening] + words.filled(declared, " " * 12))


def _request_doc(whole, operation):
    function = re.search(r"FUNC=(\w+)(?:\|FUNC1=(\w))?", operation["forms"][0]["body"])
    called = f" (function {', '.join(filter(None, function.groups()))})" if function else ""
    yield _paragraph(f"Builds a request: {operation['title']}{called}.", first=True)
    details = list(operation["details"])
    if operation.get("blanksEscaped"):
        details.append("Every blank of the request is sent as `%20`.")
    for each in details:
        yield _paragraph(each)
    messages = load.by_name(whole["messages"], "id")
    own = [messages[each] for each in operation["refusals"] if each not in SHARED]
    if own:
        said = "; ".join(f'"{each["text"]}" ({each["english"]})' for each in own)
        yield _paragraph(f"Refuses with {said}.")


def _reply_doc(whole, operation):
    reply = load.by_name(whole["replies"], "decoder")[operation["name"]]
    yield _paragraph(f"Reads a reply: {operation['title']}.", first=True)
    for each in operation["details"]:
        yield _paragraph(each)
    for table in reply.get("tables", []):
        mark = f"`{table['mark']}` " if "mark" in table else ""
        yield _paragraph(f"{mark}Positions of a record, {table['name']}:")
        yield _columns(table)
    if "noData" in reply["answers"] and reply["answers"]["noData"]["status"] == 1:
        yield _paragraph(f"Nothing to show (code 5001) reads `{reply['answers']['noData']['text']}`.")


def _columns(table):
    lines = ["     * <ol start=\"0\">"]
    for position in range(max(each["at"] + each.get("empty", 1) for each in table["columns"])):
        here = [each for each in table["columns"]
                if each["at"] <= position < each["at"] + each.get("empty", 1)]
        text = "".join((f" `{each['join']}` " if "join" in each else "") + each.get(
            "meaning", "always empty") for each in here)
        lines += _wrapped("<li>" + _javadoc(text) + "</li>")
    return lines + ["     * </ol>"]


def _purpose(argument):
    note = f" ({argument['note']})" if "note" in argument else ""
    unit = f", {argument['unit']}" if "unit" in argument else ""
    return argument["purpose"] + unit + note


def _returned(operation):
    if load.is_encoder(operation):
        if not operation.get("status", True):
            return "the request to send, or the message described above"
        return "the request to send, or the message to show when `status[0]` is -1"
    return "the result, or the message to show when `status[0]` is -1"


def _others(whole, operation):
    if load.is_encoder(operation):
        return operation["answeredBy"]
    return [one["name"] for one in whole["operations"]
            if operation["name"] in one.get("answeredBy", [])]


def _paragraph(text, first=False):
    opening = [] if first else ["     *"]
    return opening + _wrapped(("" if first else "<p>") + _javadoc(text))


def _wrapped(text):
    return words.filled(text, "     * ")


def _tag(text):
    return words.filled(text, "     * ", "     *         ")


def _javadoc(text):
    """Backticks become code, names of methods links; what HTML would take for a mark is escaped."""
    pieces = re.split(r"`([^`]*)`", text)
    for i, piece in enumerate(pieces):
        if i % 2:
            pieces[i] = "{@code " + piece + "}"
        else:
            piece = re.sub(r"&(?![lga]\w*;)", "&amp;", piece)
            piece = re.sub(r"<(?!/?(li|p)>)", "&lt;", piece)
            pieces[i] = re.sub(r"\b([A-Z]\w+(?:Encode[12]?|Decode(?:JZG)?))\b(?!\()", r"{@link #\1}",
                               piece)
    return "".join(pieces)
