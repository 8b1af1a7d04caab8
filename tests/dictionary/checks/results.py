"""Takes results apart by the tables of the dictionary."""

import re


def count(reply, result):
    """How many records a result has, in all sections."""
    if reply["result"] == "sections":
        return sum(int(each) for each in re.findall(r"<\d>!(\d+)!", result))
    return int(result.partition("!")[0] or 0)


def rows(reply, result):
    """For each table the first row as {column: text}, or null when the table has none."""
    return [_row(table, record) if record is not None else None
            for table, record in zip(reply.get("tables", []), _records(reply, result))]


def problems(reply, result):
    """What does not stand where the tables have it."""
    out = []
    for table, record in zip(reply.get("tables", []), _records(reply, result)):
        if record is None:
            continue
        fields = _fields(table, record)
        columns = table["columns"]
        positions = _count_positions(table)
        if len(fields) != positions:
            out.append(f"{table['name']} has {positions} positions, the result {len(fields)}")
            continue
        for each in columns:
            if "empty" in each:
                filled = [text for text in fields[each["at"]:each["at"] + each["empty"]] if text]
                if filled:
                    out.append(f"{table['name']}: {filled[0]!r} at an empty position")
    return out


def _records(reply, result):
    """The first record of each table."""
    tables = reply.get("tables", [])
    if reply["result"] == "record":
        return [result.removesuffix("!")]
    if reply["result"] == "sections":
        found = []
        for table in tables:
            section = re.search(re.escape(table["mark"]) + r"!(\d+)!([^!]*)", result)
            found.append(section[2] if section and section[1] != "0" else None)
        return found
    records = result.split("!")[1:-1]
    last = [each for each in records if each.startswith("<M>@")]
    first = [each for each in records if not each.startswith("<M>@")]
    return [found[0] if found else None for found in (first, last)]


def _row(table, record):
    """{column: text}: pieces between '@', then between '&', then between '|'."""
    texts = {}
    fields = _fields(table, record)
    for position, columns in _positions(table["columns"]):
        field = fields[position] if position < len(fields) else ""
        parts = [[]]
        for column in columns:
            if column.get("join") == "&":
                parts.append([])
            parts[-1].append(column)
        for part, text in zip(parts, field.split("&", len(parts) - 1) + [""] * len(parts)):
            pieces = text.split("|", len(part) - 1) + [""] * len(part)
            for column, piece in zip(part, pieces):
                texts[column["name"]] = piece
    return texts


def _fields(table, record):
    """The fields of a record, an empty one where the record leaves one out."""
    fields = record.split("@")
    if table.get("last"):  # the rest is free text
        return [fields[0], "@".join(fields[1:])]
    for column in table["columns"]:
        short = _count_positions(table) - len(fields)
        if column.get("mayBeMissing") and short:
            another = column["form"] == "code" and "&" in fields[column["at"]]
            if another or column["form"] != "code":
                fields.insert(column["at"], "")
    return fields


def _count_positions(table):
    return max(each["at"] + each.get("empty", 1) for each in table["columns"])


def _positions(columns):
    found = {}
    for column in columns:
        if "empty" not in column:
            found.setdefault(column["at"], []).append(column)
    return found.items()
