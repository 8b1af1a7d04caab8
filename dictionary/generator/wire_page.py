"""The wire: headers, the forms of each request, what each decoder reads, tags by scene."""

from . import load, words
from .markdown import block, code, link, paragraph, table


def lines(whole):
    yield from ["## What stands in the forms", ""]
    yield from paragraph("`{name}` is an argument of that name, or one of the values below; behind a "
                         "bar stands how it is written. `<name>` is a piece that forms share.")
    yield from table(["Value", "Meaning"],
                     ([code("{" + row["name"] + "}"), row["meaning"]] for row in whole["values"]))
    yield from table(["Written as", "Meaning"],
                     ([code(row["name"]), row["meaning"]] for row in whole["conversions"]))
    for piece in whole["pieces"]:
        yield from [f"`<{piece['name']}>`", ""]
        yield from block([piece["text"]])
    yield from ["## Headers", ""]
    for header in whole["headers"]:
        yield from _header(header)
    yield from ["## Requests, behind the header", ""]
    for operation in whole["operations"]:
        if load.is_encoder(operation):
            yield from _request(operation)
    yield from ["## What decoders read", ""]
    yield from paragraph("Behind a tag stands the size in bytes that its value must stay below; a "
                         "longer one reads as empty. Without one the record bounds it.")
    yield from table(["Decoder", "Of the whole reply", "Of a record", "Record", "List ends"],
                     map(_reply, whole["replies"]))
    yield from ["## Tags by scene", ""]
    for group in whole["groups"]:
        yield from _group(whole, group)


def _header(header):
    yield from [f"### Header {header['name']}", ""]
    yield from paragraph(words.sentence(header["title"]))
    end = "<identity>" if header["identity"] else ""
    end += header.get("end", "")
    yield from block([header["begin"] + end]
                     + ([header["orderDate"] + "      where there is an order date"]
                        if "orderDate" in header else []))
    yield from table(["Length of the first part", "Of the second", "Identity"],
                     ([row["first"], row["second"], code(row["text"]) or "none"]
                      for row in header["identity"]))
    if "key" in header:
        yield from [f"Order key: {code(header['key'])}", ""]


def _request(operation):
    yield from [f"### {operation['name']}", ""]
    function = f", function {operation['function']}" if "function" in operation else ""
    header = link("Header " + operation["header"], "", operation["header"])
    escaped = " Escaped." if operation.get("blanksEscaped") else ""
    yield from paragraph(f"{words.sentence(link(operation['name'], 'operations.md', operation['title'].capitalize()))} "
                         f"Header {header}{function}.{escaped}")
    for form in operation["forms"]:
        conditions = [f"`{name}` is {_condition(values)}"
                      for name, values in form.get("when", {}).items()]
        if conditions:
            yield from [words.sentence("where " + ", ".join(conditions))[:-1] + ":", ""]
        yield from block([form["body"]])


def _condition(values):
    found = values.split()
    if found[0] == "not":
        return "none of " + ", ".join(found[1:])
    return " or ".join(found)


def _reply(reply):
    record = reply.get("record", {})
    size = str(record.get("size", "")) + (" first only" if record.get("only") else "")
    end = f"67 from {record['endMark']}" if "endMark" in record else ""
    if record.get("endsAtEmptyRecord"):
        end += ", or a record that is empty"
    return [link(reply["decoder"], "results.md"), _tags(reply.get("replyTags", [])),
            _tags(record.get("tags", [])), size.strip(), end]


def _tags(rows):
    return ", ".join(row["tag"] + (f" ({row['bound']}{', blanks skipped' if 'blanks' in row else ''})"
                                   if "bound" in row else "") for row in rows)


def _group(whole, group):
    scenes = [scene["title"] for scene in whole["scenes"] if group["name"] in scene["groups"]]
    title = "Everywhere" if len(scenes) == len(whole["scenes"]) else "; ".join(scenes)
    yield from [f"### {words.spaced(group['name']).capitalize()}", ""]
    yield from paragraph(words.sentence(title))
    yield from table(["Tag", "Name", "Meaning", "Example"],
                     ([code(row["tag"]), code(row["name"]),
                       row["label"] + (f" ({row['note']})" if "note" in row else ""),
                       code(row.get("example", ""))] for row in group["tags"]))
