"""The library's tables against the dictionary, both ways: the rows of each decoder (name, tag, size,
order) and the texts of the messages. What calls cannot show stands here."""

import re
from pathlib import Path

from generator import load

from . import library

TOP = Path(__file__).resolve().parent.parent.parent.parent
SIZES = {"CGatewayPub::kBufferSize": 4096}
ROW = re.compile(r'\{k(\w+), "(\w+)", ([\w:]+)(, Blanks::kSkipped)?\}')
FIELD = re.compile(r'constexpr ReplyField k\w+ = \{"(\w+)", ([\w:]+)(, Blanks::kSkipped)?\}')
TEXT = re.compile(r'constexpr (?:char|std::string_view) (k\w+)(?:\[\])? =\s*"([^"]*)"')
CODE_TABLES = ("orderStates", "priceWords")


def run(whole, _, __, top=TOP):
    found = library.Findings()
    files = {path: path.read_text(encoding="utf-8")
             for path in sorted(Path(top).glob("gateway/*/*")) if path.suffix in (".cpp", ".h")}
    _judge_tables(found, whole, files)
    _judge_messages(found, whole, files)
    _judge_arguments(found, whole, files)
    return found.finish("sources")


def _judge_arguments(found, whole, files):
    """The methods of the gateway classes name their arguments as the dictionary does."""
    headers = {name: text for path, text in files.items() if path.suffix == ".h"
               for name in re.findall(r"^class (\w+)", text, re.M)}
    session = {one["name"] for one in whole["argumentSets"]["session"]}
    for operation in whole["operations"]:
        where = f"{operation['class']}::{operation['method']}"
        declared = _declaration(headers[operation["class"]], operation["method"])
        if not found.expect(declared, f"{where} is not declared"):
            continue
        names = [each.split()[-1].lstrip("*") for each in declared[1].split(",")]
        said = [one["name"] for one in operation["arguments"] if one["name"] not in session]
        if operation.get("status", True):
            said.append("status")
        for name, listed in zip(names, said):
            found.expect(name == listed,
                         f"{where} calls an argument {name}; the dictionary calls it {listed}")
        found.expect(len(names) == len(said), f"{where} has {len(names)} arguments; the "
                                              f"dictionary has {len(said)}")


def _declaration(header, method):
    """The argument list of a method that is declared by itself, or by the type that several
    share: `using Encoder = char*(...);` and `Encoder First, Second;`."""
    alone = re.search(rf"char\* {method}\(([^)]*)\)", header)
    shared = re.search(rf"^ *(\w+) (?:\w+, )*{method}(?:, \w+)*;", header, re.M)
    if alone or not shared:
        return alone
    return re.search(rf"using {shared[1]} = char\*\(([^)]*)\)", header)


def _judge_tables(found, whole, files):
    """The decoders of one file share its rows."""
    replies = load.by_name(whole["replies"], "decoder")
    for path, text in files.items():
        readers = [one for one in whole["operations"]
                   if not load.is_encoder(one) and f"{one['class']}::{one['method']}(" in text]
        if not readers:
            continue
        judged = "AnswerWithoutRecords(" in text  # by what the reply as a whole says
        shared = "".join(files[each] for each in files if judged and each.suffix == ".h")
        names = load.scene_tags(whole, readers[0]["scene"])
        rows = [row for row in ROW.findall(text) if row[2] != "kNotRead"]
        records = [replies[one["name"]].get("record", {}) for one in readers]
        _judge_rows(found, path.name, rows, records, names)
        fields = FIELD.findall(text) + FIELD.findall(shared)
        _judge_fields(found, path.name, fields, [replies[one["name"]] for one in readers])


def _judge_rows(found, where, rows, records, names):
    size = max((record.get("size", 0) for record in records), default=0) or None
    order = [row[1] for row in rows]
    for record in records:
        listed = [row["tag"] for row in record.get("tags", [])]
        here = [tag for tag in order if tag in listed]
        found.expect(listed == here, f"{where}: the dictionary reads the tags "
                                     f"{_first_difference(listed, here)} in another order")
    for name, tag, bound, skipped in rows:
        said = [row for record in records for row in record.get("tags", []) if row["tag"] == tag]
        if not found.expect(said, f"{where} reads tag {tag}; the dictionary does not"):
            continue
        called = names[tag]["name"]
        found.expect(name == called[0].upper() + called[1:],
                     f"{where}: tag {tag} is k{name}; the dictionary calls it {called}")
        here = None if bound in ("kRecord", "kUnbounded") else int(bound)
        for row in said:
            there = row.get("bound")
            found.expect(here == (None if there == size else there),
                         f"{where}: tag {tag} has {bound} bytes; the dictionary has {there}")
            found.expect(bool(skipped) == ("blanks" in row),
                         f"{where}: tag {tag}, blanks skipped on one side")
    for tag in {row["tag"] for record in records for row in record.get("tags", [])} - set(order):
        found.expect(False, f"{where} has no row for tag {tag}")


def _first_difference(left, right):
    for one, other in zip(left + [""], right + [""]):
        if one != other:
            return f"{one or 'nothing'} and {other or 'nothing'}"
    return ""


def _judge_fields(found, where, fields, replies):
    """The fields of the whole reply."""
    rows = [row for reply in replies for row in reply.get("replyTags", [])]
    for tag, bound, _ in fields:
        said = [row["bound"] for row in rows if row["tag"] == tag]
        found.expect(said, f"{where} reads tag {tag} of the whole reply; the dictionary does not")
        for each in said:
            size = SIZES.get(bound) or int(bound)
            found.expect(size == each,
                         f"{where}: tag {tag} has {size} bytes; the dictionary has {each}")
    for tag in {row["tag"] for row in rows} - {tag for tag, _, _ in fields}:
        found.expect(False, f"{where} does not read tag {tag} of the whole reply")


def _judge_messages(found, whole, files):
    """Every constant of a messages.h stands in the dictionary with its text, and every message of
    the library names a constant that is there."""
    here = {}
    for path, text in files.items():
        if path.name == "messages.h":
            here.update(TEXT.findall(text))
    listed = {row["cpp"]: row["text"] for row in whole["messages"] if "cpp" in row}
    words = {row["code"] for table in whole["codes"] if table["name"] in CODE_TABLES
             for row in table["values"]}
    for name, text in listed.items():
        found.expect(here.get(name) == text,
                     f"messages: {name} is {here.get(name)!r}; the dictionary has {text!r}")
    for name, text in here.items():
        found.expect(name in listed or text in words,
                     f"messages: {name} ({text}) stands nowhere in the dictionary")
