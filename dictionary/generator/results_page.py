"""The results: each decoder's columns by position, and the code tables."""

from . import load, words
from .markdown import block, code, link, paragraph, table

SHAPES = {"empty": "empty, the status says it all", "text": "one text as the gateway sent it",
          "record": "one record", "list": "a list", "sections": "lists behind numbered marks"}


def lines(whole):
    forms = {form["name"]: form["label"] for form in whole["forms"]}
    operations = load.by_name(whole["operations"])
    for reply in whole["replies"]:
        name = reply["decoder"]
        yield from [f"## {name}", ""]
        title = words.sentence(operations[name]["title"])
        yield from paragraph(f"{link(name, 'operations.md', title)} "
                             f"{words.sentence(SHAPES[reply['result']])}")
        for one in reply.get("tables", []):
            yield from _table(one, forms)
        if reply.get("tables"):
            yield from ["Example:", ""] + block([reply["exampleResult"]])
    yield from ["## Codes", ""]
    for codes in whole["codes"]:
        yield from _codes(codes)


def _table(one, forms):
    positions = max(each["at"] + each.get("empty", 1) for each in one["columns"])
    mark = code(one["mark"]) + " " if "mark" in one else ""
    yield from [f"{mark}**{one['name']}**, {positions} positions", ""]
    yield from table(["Position", "Column", "Form", "Tags", "Meaning"],
                     (_column(each, forms) for each in one["columns"]))


def _column(column, forms):
    if "empty" in column:
        last = column["at"] + column["empty"] - 1
        return [str(column["at"]) if column["empty"] == 1 else f"{column['at']} to {last}", "", "",
                "", "always empty"]
    place = str(column["at"])
    if "join" in column:
        place += f", behind {code(column['join'])}"
    form = forms[column["form"]]
    if "codes" in column:
        form = link(column["codes"], "", form if column["form"] != "code" else column["codes"])
    missing = "; the field may be missing" if column.get("mayBeMissing") else ""
    return [place, code(column["name"]), form, " ".join(column["tags"]), column["meaning"] + missing]


def _codes(codes):
    yield from [f"### {codes['name']}", ""]
    yield from paragraph(codes["title"] + (" " + codes["note"] if "note" in codes else ""))
    heads = {"code": "Code", "label": "Meaning", "name": "Named value", "wire": "On the wire",
             "shows": "Shown as", "from": "Made from", "when": "When", "books": "Order book of",
             "only": "Only"}
    shown = [key for key in heads if any(key in row for row in codes["values"])]
    yield from table([heads[key] for key in shown],
                     ([_cell(key, row) for key in shown] for row in codes["values"]))


def _cell(key, row):
    value = row.get(key, "")
    if isinstance(value, dict):
        return ", ".join(f"{name} {each}" for name, each in value.items())
    return code(value) if key in ("code", "name", "wire", "shows") else value
