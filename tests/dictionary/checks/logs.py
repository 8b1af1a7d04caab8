"""What each operation logs, line by line: a call by the examples of the dictionary."""

import re

from generator import load

from . import forms, library, replies

# Long enough for any buffer on the way, in a field that no decoder reads.
UNREAD = "zz=" + "x" * 100_000 + "|"
MANY = 3000


def run(whole, program, _):
    found = library.Findings()
    lib = library.Library(program)
    for operation in whole["operations"]:
        values = example(whole, operation, lib, found)
        result = _judge(whole, operation, values, lib, found)
        if not load.is_encoder(operation):
            long = dict(values, reply=values["reply"] + UNREAD)
            found.expect(_judge(whole, operation, long, lib, found) == result,
                         f"{operation['name']} reads the field that nobody reads")
    _judge_long_result(whole, lib, found)
    return found.finish("logs")


def _judge(whole, operation, values, lib, found):
    """Holds the log lines of one call against the dictionary; its result."""
    status, result, logged = lib.ask([(operation, values)])[0]
    known = facts(whole, operation, values, status, result)
    expected = [re.sub(r"\{([^}]*)\}", lambda m, known=known: known.get(m[1], m[0]), line)
                for line in operation["logs"]]
    found.expect(logged == expected, f"{operation['name']} logs {_differing(logged, expected)}; "
                                     f"the dictionary has {_differing(expected, logged)}")
    return result


def _judge_long_result(whole, lib, found):
    """A long list with a cut character in each record is mended to its end, and logged so."""
    operation = load.by_name(whole["operations"])["FutQueryReplyDecode"]
    records = "|00=1|67=1|68=0000|51=12345中|01=" * MANY
    _, result, logged = lib.ask([(operation, {"reply": "|68=0000" + records})])[0]
    found.expect(result.count("&12345?@") == MANY and result in logged,
                 f"{operation['name']} mends {result.count('&12345?@')} of {MANY} cut characters")


def example(whole, operation, lib, found):
    """The values of one good call."""
    values = library.usual(operation)
    if not load.is_encoder(operation):
        reply = load.by_name(whole["replies"], "decoder")[operation["name"]]
        values["reply"] = replies.Decoder(whole, operation, reply, lib, found).line()
    return values


def facts(whole, operation, values, status, result):
    """What the names in log lines stand for."""
    known = dict(values, status=status, result=result, export=operation["export"])
    if load.is_encoder(operation):
        writer = forms.Writer(whole, operation, values)
        known["header"] = writer.header_text()
        first, _, second = values.get("identity", "").partition("&")
        known.update({"identity|first": first, "identity|second": second})
        known["length"] = str(len(values.get("certMsg", "")))
    else:
        known["length"] = str(len(values["reply"]))
        for tag, value in re.findall(r"\|(\w+)=([^|]*)", values["reply"]):
            known.setdefault("tag " + tag, value)
    return known


def _differing(lines, others):
    return [line for line in lines if line not in others][:3] or f"{len(lines)} lines"
