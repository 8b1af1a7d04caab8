"""Faults put into copies of the dictionary and of the library: ten wrong tags, sizes, columns, names
of arguments and codes on each side. Each must fail a check that names it."""

import json
import random
import re

from generator import layout

from . import library
from .workshop import Workshop

EACH = 10


def run(_, __, ___):
    found = library.Findings()
    with Workshop() as copy:
        said = copy.build()
        if found.expect(not said, f"the copy does not build: {said[:500]}"):
            draw = random.Random(13)
            for kind in DICTIONARY_FAULTS:
                _try_dictionary(found, copy, kind, draw)
            for kind in SOURCE_FAULTS:
                _try_sources(found, copy, kind, draw)
    return found.finish("faults")


def _try_dictionary(found, copy, kind, draw):
    """One fault at a time in a file of the dictionary; the file is put back afterwards."""
    file, places, spoil, checks = DICTIONARY_FAULTS[kind]
    path = f"dictionary/{file}.json"
    text = copy.read(path)
    chosen = draw.sample(list(places(json.loads(text))), EACH)
    for place in chosen:
        whole = json.loads(text)
        names, only = spoil(_at(whole, place))
        copy.write(path, layout.text(whole))
        _expect_named(found, copy, checks, f"dictionary, {kind} {names}", names,
                      only or _owner(whole, place))
    copy.write(path, text)


def _try_sources(found, copy, kind, draw):
    """One fault at a time in a source; what must be built anew is."""
    pattern, spoil, checks, builds, folder = SOURCE_FAULTS[kind]
    places = [(str(path.relative_to(copy.top)), match)
              for path in sorted(copy.top.glob(folder)) if path.suffix in (".cpp", ".h")
              for match in re.finditer(pattern, path.read_text(encoding="utf-8"))
              if kind != "argument" or _is_of_operation(match)]
    for path, match in draw.sample(places, EACH):
        text = copy.read(path)
        spoilt, names = spoil(match)
        copy.write(path, text[:match.start()] + spoilt + text[match.end():])
        said = copy.build() if builds else ""
        if found.expect(not said, f"{path}: {spoilt} does not build: {said[:200]}"):
            _expect_named(found, copy, checks, f"{path}: {match[0]} as {spoilt}", names,
                          _decoders(text))
        copy.write(path, text)


def _expect_named(found, copy, checks, what, names, only):
    said = ""
    for check in checks:
        if check == "generated":
            said = copy.generate("--check").stdout
        else:
            said = copy.check(check, {"DICTIONARY_ONLY": only})
        if any(name in said for name in names):
            break
    found.expect(any(name in said for name in names),
                 f"{what}: no check names one of {names}; the last says {said[:300]!r}")


def _is_of_operation(match):
    """Whether the argument is one of an operation, not of what they are made of."""
    return re.search(r"(En|De)code[12]?$", re.findall(r"(\w+)\(", match.string[:match.start()])[-1])


def _decoders(text):
    """A pattern of the operations that a source defines; of all for a header that they share."""
    prefix = "Fut" if "CGatewayFut::" in text else ""
    names = {prefix + name for name in re.findall(r"::(\w+(?:En|De)code\w*)\(", text)}
    return "|".join(sorted(names | {"QueryFinanceDecode"} if prefix else names))


def _at(whole, place):
    for key in place:
        whole = whole[key]
    return whole


def _owner(whole, place):
    """The operation that a place belongs to, or all."""
    if place[0] in ("replies", "operations"):
        one = whole[place[0]][place[1]]
        return one.get("decoder") or one["name"]
    return ""


# Where faults go, as paths into the files, and what they do there.


def _read_tags(whole):
    for i, reply in enumerate(whole["replies"]):
        for j, _ in enumerate(reply.get("record", {}).get("tags", [])):
            yield "replies", i, "record", "tags", j


def _bounds(whole):
    for place in _read_tags(whole):
        if _at(whole, place).get("bound", 4096) < 200:
            yield place


def _columns(whole):
    for i, reply in enumerate(whole["replies"]):
        for j, table in enumerate(reply.get("tables", [])):
            for k, column in enumerate(table["columns"][:-1]):
                if "empty" not in column and column["tags"]:
                    yield "replies", i, "tables", j, "columns", k


def _arguments(whole):
    for i, operation in enumerate(whole["operations"]):
        for j, argument in enumerate(operation["arguments"]):
            if isinstance(argument, dict) and not argument.get("unread"):
                yield "operations", i, "arguments", j


def _codes(whole):
    judged = ("orderTypes", "settlementTypes", "legCodes", "currencies", "acceptances",
              "changeable", "priceWords", "orderStates", "timeInForce")
    for i, table in enumerate(whole["tables"]):
        if table["name"] in judged:
            for j, _ in enumerate(table["values"]):
                yield "tables", i, "values", j


def _spoil_tag(row):
    tag = row["tag"]
    row["tag"] = "Z" + tag[-1]
    return [f"tag {tag}", f"tag {row['tag']}", f"has {row['tag']}", row["tag"]], None


def _spoil_size(row):
    row["bound"] += 1
    return [f"tag {row['tag']} "], None


def _spoil_column(column):
    column["tags"] = ["44"] if column["tags"] != ["44"] else ["46"]
    return [f"column {column['name']}", f", {column['name']}:"], None


def _spoil_argument(argument):
    name = argument["name"]
    argument["name"] = name + "x"
    return [name], None


def _spoil_code(row):
    code = row["code"]
    row["code"] = code[:-1] + ("Q" if code[-1] != "Q" else "R")
    return [code, row["code"]], "|".join(
        ["QueryOrder", "QueryReply", "Payment", "FutQuery", "FutSubmit", "SubmitOrderDecode"])


DICTIONARY_FAULTS = {
    "tag": ("replies", _read_tags, _spoil_tag, ["sources"]),
    "size": ("replies", _bounds, _spoil_size, ["sources"]),
    "column": ("replies", _columns, _spoil_column, ["replies"]),
    "argument": ("operations", _arguments, _spoil_argument, ["sources", "requests"]),
    "code": ("codes", _codes, _spoil_code, ["codes"]),
}


def _source_tag(match):
    return f'{{k{match[1]}, "Z9", {match[3]}', [f"tag {match[2]}", "tag Z9"]


def _source_size(match):
    return f'{{k{match[1]}, "{match[2]}", {int(match[3]) - 1}', [f"tag {match[2]} "]


def _source_name(match):
    return match[0].replace(match[1], match[1] + "x"), [match[1]]


def _source_column(match):
    """Another field is shown."""
    return f"record.Text({match[2]}), record.Text({match[1]})", ["column"]


def _source_code(match):
    return match[0].replace(match[1], str(int(match[1]) + 100)), [match[1], "gives"]


SOURCE_FAULTS = {
    "tag": (r'\{k(\w+), "(\w+)", (\d+)', _source_tag, ["sources"], False, "gateway/*/*.cpp"),
    "size": (r'\{k(\w+), "(\w+)", (\d+)', _source_size, ["sources"], False, "gateway/*/*.cpp"),
    "column": (r"record\.Text\((\w+)\),\s*record\.Text\((\w+)\)", _source_column, ["replies"], True,
               "gateway/*/*.cpp"),
    "argument": (r"(?:const char\*|char|int|long) (stockCode|orderKind|tradeType|price|quantity|"
                 r"side|startDate|endDate|certMsg|newPassword|queryType)(?=[,)])", _source_name,
                 ["sources"], False, "gateway/*/gateway_*.h"),
    "code": (r"(?:\)|kEveryNumber), (\d+), \d+\}", _source_code, ["codes"], True, "gateway/stock/*"),
}
