"""Every encoder against the dictionary, both ways: each form of its requests is built by the
library and compared byte by byte; what the dictionary has no form for, the library refuses; what it
says then is what the dictionary lists; arguments that count as unread change nothing, others do."""

import itertools

from generator import load

from . import forms, library

IDENTITIES = [
    "A123456789&1234567", "1234567&A123456789", "1234567&", "A12345678&", "X&A123456789", "&",
    "A123456789&123456789", "12&", "&1234567", "ABCDEFGH&12", "A123456789", "1234567", "X&Y", "X",
    "ABCDEFGHIJK&1234567890", "123456789012&123456789012", "A" * 40 + "&1234567",
    "1234567&" + "B" * 40, "A" * 41 + "&" + "B" * 41]
WORDS = {
    "certMsg": ["a", "ab", "abc", "x" * 768, "y" * 800],
    "orderReference": ["W0001", "&G0001", "W" * 39 + "&" + "G" * 39, "W" * 47 + "&" + "G" * 47,
                       "W" * 48 + "&G", "W&" + "G" * 48],
    "orderDate": ["", "990115"],
    "date": ["1130115", "20240115", "990115"],
    "startDate": ["1130101", "990101"],
    "timeInForce": ["R", "I", "F", "X"],
    "password": ["two words"],
    "commodity2": ["TXP"], "month2": ["202401"], "callPut2": ["P"], "side2": ["B"],
    "market": ["0", "1", "99", "100", "101", "-1"],
    "seqNo": ["0", "9", "123", "-1"],
    "queryType": ["0", "1", "2", "3", "4", "5", "-1"],
    "localIP": ["1.2.3.4"],
}
HOSTILE = {
    "String": ["", "X", "12345", "X&Y", "x" * 4096],
    "number": ["0", "1", "2", "5", "6", "7", "9", "10", "255"],
    "letter": ["X", " "],
    "int": ["0", "-1", "7"],
}


def run(whole, program, _):
    found = library.Findings()
    lib = library.Library(program)
    messages = load.by_name(whole["messages"], "id")
    for operation in library.operations(whole, True):
        calls = list(_calls(whole, operation))
        listed = {messages[each]["text"]: each for each in operation["refusals"]}
        seen = set()
        for (_, values), (status, result, _) in zip(calls, lib.ask(calls)):
            writer = forms.Writer(whole, operation, values)
            refused = status == "-1" or result.startswith("[")
            if refused:
                text = _message(operation, result)
                seen.add(text)
                _judge_refusal(found, whole, operation, writer, listed.get(text))
            else:
                _judge_request(found, operation, writer, result)
        for text in seen - set(listed):
            found.expect(False, f"{operation['name']} says {text!r}, which is not listed")
        for text in set(listed) - seen:
            found.expect(False, f"{operation['name']} never says {listed[text]} ({text})")
        _judge_unread(found, lib, whole, operation)
        _judge_codes(found, lib, whole, operation)
    return found.finish("requests")


def _judge_request(found, operation, writer, result):
    if not found.expect(writer.has_form(),
                        f"{operation['name']} writes {result!r}, for which there is no form"):
        return
    expected = writer.request()
    if result == expected:
        return
    wrong = next(i for i, (a, b) in enumerate(zip(expected + "\0", result + "\1")) if a != b)
    tag = expected[:wrong].rpartition("|")[2].partition("=")[0]
    found.expect(False, f"{operation['name']}: tag {tag}: the dictionary has {expected[wrong - 5:][:60]!r}, "
                        f"the library {result[wrong - 5:][:60]!r}")


def _judge_refusal(found, whole, operation, writer, message):
    """A refusal has the reason that its message tells."""
    values = writer.values
    arguments = {one["name"]: one for one in operation["arguments"]}

    def unlisted(name):
        return values[name] not in library.codes_of(whole, arguments[name], operation)

    reasons = {
        "noAddress": lambda: not values["localIP"],
        "identityUnsplit": lambda: not writer.names_user(),
        "identityLengths": lambda: not writer.names_user(),
        "stockCodeTooLong": lambda: len(values["stockCode"]) > 6,
        "quantity": lambda: int(values["quantity"]) <= 0,
        "orderKind": lambda: unlisted("orderKind"),
        "priceKind": lambda: unlisted("priceKind"),
        "tradeType": lambda: unlisted("tradeType"),
        "dateRange": lambda: not (forms.number(values["startDate"]) and
                                  forms.number(values["endDate"])),
    }
    long = any(len(value) > 3000 for value in values.values())
    empty = any(not values[name] for name, one in arguments.items()
                if one["type"] == "String" and not one.get("unread"))
    if message == "badParameters" and "futuresOrderKinds" in str(operation["arguments"]):
        empty = empty or unlisted("orderKind")
    holds = reasons.get(message, lambda: long or empty)()
    found.expect(holds, f"{operation['name']} says {message} of {values}")


def _message(operation, result):
    """A refusal without the header that stands before it, or the trade type behind it."""
    if "|24=5|V4=" in result:
        return result[result.rindex("[") if "[" in result else 0:]
    return result.partition("|")[0]


def _calls(whole, operation):
    """Calls that reach every form, every identity, every code, and hostile values one by one."""
    base = library.usual(operation)
    arguments = {one["name"]: one for one in operation["arguments"]}
    axes = []
    for name in sorted({name for form in operation["forms"] for name in form.get("when", {})}):
        conditions = {form.get("when", {}).get(name, "") for form in operation["forms"]}
        values = {value for each in conditions for value in each.split() if value != "not"}
        values |= {"D", "X"} if library.is_letter(arguments[name]) else {"7"}
        axes.append([(name, value) for value in sorted(values)])
    bases = [dict(base, **dict(each)) for each in itertools.product(*axes)]
    for one in bases:
        yield operation, one
        for identity in IDENTITIES:
            if "identity" in one:
                yield operation, dict(one, identity=identity)
        for argument in operation["arguments"]:
            yield from _varied(whole, operation, one, argument)
    legs = [name for name in ("side2", "commodity2", "callPut2", "month2") if name in base]
    for one, chosen in itertools.product(bases, itertools.product((0, 1), repeat=len(legs))):
        if legs:
            changed = {name: WORDS[name][0] for name, each in zip(legs, chosen) if each}
            yield operation, dict(one, **changed)


def _varied(whole, operation, base, argument):
    name = argument["name"]
    kind = argument.get("kind") or argument["type"]
    values = WORDS.get(name, []) + HOSTILE.get(kind, [])
    codes = library.codes_of(whole, argument, operation)
    values = values + [code for code in codes if code.isalnum()]
    if argument.get("codes") == "markets":
        values = WORDS["market"]
    for value in values:
        if name in ("date", "startDate", "endDate") and value in HOSTILE["String"][1:]:
            if value != HOSTILE["String"][-1]:
                continue  # a date that is none is handed on
        if name == "identity" and len(value) > 1000:
            continue
        yield operation, dict(base, **{name: value})


def _judge_unread(found, lib, whole, operation):
    """Arguments that the dictionary calls unread change nothing; every other one does."""
    calls = []
    for argument in operation["arguments"]:
        for one in _bases(operation):
            calls.append((argument, one))
            for value in _other_values(argument):
                calls.append((argument, dict(one, **{argument["name"]: value})))
    answers = lib.ask([(operation, values) for _, values in calls])
    differing = set()
    base = None
    for (argument, values), (status, result, _) in zip(calls, answers):
        if base is None or base[0] is not argument or values in _bases(operation):
            base = (argument, result)
        elif result != base[1]:
            differing.add(argument["name"])
    for argument in operation["arguments"]:
        read = argument["name"] in differing
        found.expect(read != argument.get("unread", False),
                     f"{operation['name']}: {argument['name']} is "
                     + ("read" if read else "not read"))


def _bases(operation):
    base = library.usual(operation)
    two = dict(base, orderKind="3") if "side2" in base else base
    change = dict(two, function="C") if "side2" in base else base
    dates = dict(base, periodOrStartDate="1130101") if "periodOrStartDate" in base else base
    return [base, two, change, dates]


def _other_values(argument):
    if library.is_letter(argument):
        return ["S", "C", "1"]
    if argument.get("codes") == "markets":
        return ["101", "0"]
    if argument["type"] == "String":
        return ["", "7654321", "7654321&A987654321", "3"]
    return ["5", "1"]


def _judge_codes(found, lib, whole, operation):
    """Of a stock order's kinds and types, the library takes those of the tables and no others."""
    base = library.usual(operation)
    for argument in operation["arguments"]:
        if argument.get("codes") not in ("orderKinds", "priceKinds", "tradeTypes", "futuresOrderKinds"):
            continue
        if operation["header"] not in ("order", "order1") or argument.get("unread"):
            continue
        taken = lib.ask([(operation, dict(base, **{argument["name"]: str(i)})) for i in range(12)])
        library_takes = [str(i) for i, (status, _, _) in enumerate(taken) if status == "1"]
        listed = library.codes_of(whole, argument, operation)
        found.expect(library_takes == listed,
                     f"{operation['name']}: {argument['name']} may be {' '.join(library_takes)}, "
                     f"the table {argument['codes']} has {' '.join(listed)}")
