"""What the console knows of the protocol: names of tags, scenes, messages, payloads, refusals."""

import re

from . import load, words

# What arguments are called in words, where their names are not enough.
SPOKEN = {"serialNo": "serial number", "localIP": "device address", "today": "date",
          "function": "order function", "flagW3": "W3 flag", "callPut": "call/put",
          "month": "contract month", "strike": "strike price"}

PATH = "java/console/com/brindlex/kernel/quorvane/console/Dictionary.java"


def files(whole):
    return {PATH: f"""// {words.GENERATED}
package com.brindlex.kernel.quorvane.console;

/** The dictionary as the console reads it: rows of texts. */
final class Dictionary {{
    /** By scene: tags with what each is called. */
    static final String[][] TAGS = {{
{_rows(_tags(whole))}    }};

    /** By scene: its operations. */
    static final String[][] SCENES = {{
{_rows(_scenes(whole))}    }};

    /** By scene: the functions of its queries. */
    static final String[][] QUERIES = {{
{_rows(_queries(whole))}    }};

    /** By operation: what it refuses with. */
    static final String[][] REFUSALS = {{
{_rows(_refusals(whole))}    }};

    /** The messages that the library makes itself, without their source, in English. */
    static final String[][] MESSAGES = {{
{_rows(_messages(whole))}    }};

    /**
     * The values of signature payloads: market, function letter (* for any other) and the sign
     * between two values, then the name of each value.
     */
    static final String[][] PAYLOADS = {{
{_rows(_payloads(whole))}    }};

    private Dictionary() {{}}
}}
"""}


def _rows(rows):
    out = []
    for row in rows:
        text = "{" + ", ".join(map(words.java_string, row)) + "},"
        out += _filled(row, text)
    return "".join(line + "\n" for line in out)


def _filled(row, text):
    """A row on one line, or several; no text is broken."""
    if len(text) + 8 <= words.WIDTH:
        return ["        " + text]
    lines, line = [], "        {"
    for i, each in enumerate(row):
        piece = words.java_string(each) + (", " if i + 1 < len(row) else "},")
        if len(line + piece.rstrip()) > words.WIDTH:
            lines.append(line.rstrip())
            line = "                "
        line += piece
    return lines + [line]


def _tags(whole):
    for scene in whole["scenes"]:
        row = [words.constant(scene["name"])]
        for tag in load.scene_tags(whole, scene["name"]).values():
            row += [tag["tag"], tag["label"].replace("`", "")]
        yield row


def _scenes(whole):
    for scene in whole["scenes"]:
        yield [words.constant(scene["name"])] + [
            one["name"] for one in whole["operations"] if one["scene"] == scene["name"]]


def _queries(whole):
    for scene in whole["scenes"]:
        functions = []
        for one in whole["operations"]:
            found = re.search(r"FUNC=(\w+)", one["forms"][0]["body"]) if "forms" in one else None
            if found and one["scene"] == scene["name"] and found[1] not in functions:
                functions.append(found[1])
        if functions:
            yield [words.constant(scene["name"])] + functions


def _refusals(whole):
    messages = load.by_name(whole["messages"], "id")
    for one in whole["operations"]:
        yield [one["name"]] + [messages[each]["text"] for each in one["refusals"]]


def _messages(whole):
    seen = {}
    for message in whole["messages"]:
        if message["source"] == "library":
            bare = re.sub(r"^(\[\w+\] ?|\w+Encode\(\))", "", message["text"])
            seen.setdefault(bare, message["english"])
    return list(map(list, seen.items()))


def _payloads(whole):
    """One row for each number of values of a market, function and sign."""
    rows = {}
    for operation in whole["operations"]:
        for form in operation.get("forms", []):
            if "!!" in form["body"]:
                key = (operation["class"] == "CGatewayFut" and "F" or "S",
                       _letter(operation, form), "," if "PL=S!!" in form["body"] else "_")
                names = _names(whole, operation, form)
                rows.setdefault((key, len(names)), []).append(names)
    for (key, _), alternatives in rows.items():
        merged = [_merged(list(names)) for names in zip(*alternatives)]
        yield ["".join(key)] + merged


def _letter(operation, form):
    letter = operation.get("function") or form["when"]["function"]
    return "*" if letter.startswith("not") else letter


def _names(whole, operation, form):
    payload = form["body"].split("!!")[1]
    sign = "," if "PL=S!!" in form["body"] else "_"
    key = load.by_name(whole["headers"])[operation["header"]]["key"]
    return [_name(each) for each in payload.replace("{key}", key).split(sign)]


def _name(text):
    if text == "{branch}-{identity|secondOrFirst}":
        return "branch and second part of the identity"
    found = re.fullmatch(r"\{(\w+)(?:\|(\w+))?\}", text)
    if not found:
        return "(empty)" if text == "" else "(always " + text + ")"
    name, conversion = found.groups()
    if name == "identity":
        return ("first" if conversion == "first" else "second") + " part of the identity"
    if name == "orderReference":
        return "order number"
    leg = re.fullmatch(r"(\w+?)([12])", name)
    return f"{_spoken(leg[1])}, leg {leg[2]}" if leg else _spoken(name)


def _spoken(name):
    return SPOKEN.get(name) or words.spaced(name)


def _merged(names):
    """One name for a place: what it is where it is something."""
    known = list(dict.fromkeys(each for each in names if not each.startswith("(")))
    if len(known) > 1:
        return ", ".join(known[:-1]) + " or " + known[-1]
    if not known:
        return "(empty)" if "(empty)" in names else names[0]
    return known[0] if len(set(names)) == 1 or "(empty)" not in names else f"({known[0]})"
