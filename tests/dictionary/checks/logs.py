"""What each operation logs, line by line: a call by the examples of the dictionary."""

import re

from generator import load

from . import forms, library, replies


def run(whole, program, _):
    found = library.Findings()
    lib = library.Library(program)
    for operation in whole["operations"]:
        values = example(whole, operation, lib, found)
        status, result, logged = lib.ask([(operation, values)])[0]
        known = facts(whole, operation, values, status, result)
        expected = [re.sub(r"\{([^}]*)\}", lambda m, known=known: known.get(m[1], m[0]), line)
                    for line in operation["logs"]]
        found.expect(logged == expected, f"{operation['name']} logs {_differing(logged, expected)}; "
                                         f"the dictionary has {_differing(expected, logged)}")
    return found.finish("logs")


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
