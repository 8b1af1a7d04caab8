"""The operations: what all share, then each with what is its own."""

from . import load, words
from .markdown import code, link, paragraph, table

SHARED_SETS = {"session": "Session", "futuresSession": "Futures session", "account": "User",
               "stockTerms": "Terms of a stock order", "futuresTerms": "Terms of a futures order",
               "period": "Period", "certificateHolder": "Certificate of a holder", "reply": "Reply"}
ARGUMENT_HEAD = ["Argument", "Type", "Usual value", "Range", "Meaning and unit"]
COMMON_REFUSALS = 10  # encoders that say it


def lines(whole):
    messages = load.by_name(whole["messages"], "id")
    common = _common(whole)
    yield from ["## What all operations share", ""]
    yield from _common_refusals(whole, messages, common)
    yield from _failures(whole)
    yield from ["### Log lines", ""]
    yield from paragraph("Each operation names the lines that a good call logs, in order; `{result}` "
                         "and the like stand for the value. `{tag 68}` is a value of the reply.")
    yield from ["## Arguments that operations share", ""]
    for name, title in SHARED_SETS.items():
        yield from [f"### {title}", ""]
        yield from table(ARGUMENT_HEAD, map(_argument, whole["argumentSets"][name]))
    yield from ["## All operations", ""]
    yield from table(["Method", "What for", "Counterpart"],
                     ([link(one["name"]), one["title"], _counterparts(whole, one)]
                      for one in whole["operations"]))
    for operation in whole["operations"]:
        yield from _operation(whole, operation, messages, common)


def _common(whole):
    """The refusals that many encoders share."""
    said = [each for one in whole["operations"] for each in one["refusals"]]
    return [each for each in dict.fromkeys(said) if said.count(each) >= COMMON_REFUSALS]


def _common_refusals(whole, messages, common):
    yield from paragraph("These messages the library makes itself, status -1. What only some "
                         "operations say stands at each.")
    yield from table(["Message", "Meaning", "Said by"],
                     ([messages[each]["text"], messages[each]["english"], _sayers(whole, each)]
                      for each in common))


def _sayers(whole, refusal):
    """Who says it: by header where that tells it, else with the exceptions."""
    sayers = [one for one in whole["operations"] if refusal in one["refusals"]]
    encoder = load.is_encoder(sayers[0])
    kind = "encoder" if encoder else "decoder"
    others = [one for one in whole["operations"]
              if load.is_encoder(one) == encoder and one not in sayers]
    headers = sorted({one.get("header", "") for one in sayers})
    if encoder and not {one["header"] for one in others} & set(headers):
        names = ", ".join(link("Header " + name, "wire.md", name) for name in headers)
        return f"every encoder with header {names}"
    return f"every {kind} but " + ", ".join(link(one["name"]) for one in others)


def _failures(whole):
    """One row for each way of answering what is no list of data."""
    cases = whole["failureReplies"]
    yield from ["### Replies that carry no data", ""]
    yield from paragraph("What each decoder makes of them, status and text, as calls of the library "
                         "answer. A page of HTML stands for any text that is no reply.")
    ways = {}
    for reply in whole["replies"]:
        answers = tuple(f"{reply['answers'][case['name']]['status']} "
                        + code(reply["answers"][case["name"]]["text"]) for case in cases)
        ways.setdefault(answers, []).append(link(reply["decoder"]))
    yield from table(["Decoder"] + [case["title"] for case in cases],
                     ([", ".join(names)] + list(map(str.strip, answers))
                      for answers, names in ways.items()))


def _operation(whole, operation, messages, common):
    encoder = load.is_encoder(operation)
    name = operation["name"]
    yield from [f"### {name}", ""]
    page = link(name, "wire.md" if encoder else "results.md",
                "Request" if encoder else "Result and columns")
    counterpart = ("Answer read by " if encoder else "Answers ") + _counterparts(whole, operation)
    yield from paragraph(f"{words.sentence(operation['title'])} {counterpart}. {page}. "
                         f"`{operation['class']}::{operation['method']}`.")
    details = list(operation["details"])
    if operation.get("blanksEscaped"):
        details.append("Every blank of the request is sent as `%20`.")
    for each in details:
        yield from paragraph(each)
    yield from table(ARGUMENT_HEAD, _arguments(operation))
    own = [messages[each] for each in operation["refusals"] if each not in common]
    yield from table(["Own refusal", "Meaning"],
                     ([each["text"], each["english"]] for each in own))
    if operation.get("logs"):
        yield from paragraph("Logs " + ", ".join(map(code, operation["logs"])) + ".")


def _arguments(operation):
    """The sets in the order of the call, and what is the operation's own between them."""
    before = [each for each in operation["sets"] if each in ("session", "futuresSession", "account")]
    for each in before:
        yield _set(each)
    for one in operation["own"]:
        yield _argument(one)
    for each in operation["sets"]:
        if each not in before:
            yield _set(each)
    if operation.get("status", True):
        yield [code("status"), "int[]", "", "", "element 0 receives 1 done, -1 failed"]


def _set(name):
    title = SHARED_SETS[name]
    return [link(title, "", title.lower()), "", "", "", ""]


def _argument(one):
    usual = "required" if one.get("required") else code(one["usual"]) or "empty"
    notes = [one["purpose"]]
    if "unit" in one:
        notes.append(f"({one['unit']})")
    if "codes" in one:
        notes.append(link(one["codes"], "results.md", "codes"))
    if "note" in one:
        notes.append(f"({one['note']})")
    kind = one["type"] + (f" ({one['kind']})" if "kind" in one else "")
    return [code(one["name"]), kind, usual, _range(one), " ".join(notes)]


def _range(one):
    if one.get("unread"):
        return "any"
    if "maxLength" in one:
        return f"{one['maxLength']} characters"
    if "max" not in one:
        return ""
    most = "2^31-1" if one["max"] == 2**31 - 1 else str(one["max"])
    return f"{one['min']} to {most}"


def _counterparts(whole, operation):
    if load.is_encoder(operation):
        return ", ".join(link(each) for each in operation["answeredBy"])
    return ", ".join(link(one["name"]) for one in whole["operations"]
                     if operation["name"] in one.get("answeredBy", []))
