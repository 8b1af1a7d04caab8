"""The dictionary as one value: its files read, argument sets written out, names checked."""

import json
import re
from pathlib import Path

FOLDER = Path(__file__).resolve().parent.parent


class DictionaryError(Exception):
    """What does not hold between the files of the dictionary."""


def read(folder=FOLDER):
    """The dictionary, with each operation's arguments in full and its export named.

    Beside them stand the names of the sets that they come from, and those that are the operation's
    own."""
    folder = Path(folder)
    whole = _json(folder / "dictionary.json")
    for part in whole.pop("parts"):
        whole.update(_json(folder / f"{part}.json"))
    whole["codes"] = whole.pop("tables")
    export = "Java_" + whole["hostClass"].replace(".", "_") + "_"
    for operation in whole["operations"]:
        operation["sets"] = [each[1:] for each in operation["arguments"] if isinstance(each, str)]
        operation["own"] = [each for each in operation["arguments"] if not isinstance(each, str)]
        operation["arguments"] = _expand(operation["arguments"], whole["argumentSets"])
        operation["export"] = export + operation["name"]
    _check(whole)
    return whole


def is_encoder(operation):
    return "forms" in operation


def by_name(rows, key="name"):
    """Rows of the dictionary by their names."""
    return {row[key]: row for row in rows}


def scene_tags(whole, scene):
    """The tags of a scene, each once: a later group has the last word."""
    groups = by_name(whole["groups"])
    tags = {}
    for group in by_name(whole["scenes"])[scene]["groups"]:
        for row in groups[group]["tags"]:
            tags[row["tag"]] = row
    return tags


def _json(path):
    try:
        return json.loads(path.read_text(encoding="utf-8"))
    except ValueError as error:
        raise DictionaryError(f"{path.name}: {error}") from error


def _expand(arguments, sets):
    """Argument sets written out; an argument of a name that is there already takes its place."""
    out = {}
    for each in arguments:
        if not isinstance(each, str):
            out[each["name"]] = dict(each)
        elif each[1:] in sets:
            out.update((argument["name"], argument) for argument in _expand(sets[each[1:]], sets))
        else:
            raise DictionaryError(f"no argument set {each}")
    return list(out.values())


def _unique(rows, what, key="name"):
    names = [row[key] for row in rows]
    for name in names:
        if names.count(name) > 1:
            raise DictionaryError(f"{what} {name} stands twice")
    return set(names)


def _known(name, names, where):
    if name not in names:
        raise DictionaryError(f"{where} names {name}, which the dictionary does not have")


def _check(whole):
    operations = by_name(whole["operations"])
    _unique(whole["operations"], "operation")
    headers = _unique(whole["headers"], "header")
    codes = _unique(whole["codes"], "code table")
    messages = _unique(whole["messages"], "message", "id")
    scenes = _unique(whole["scenes"], "scene")
    replies = _unique(whole["replies"], "reply", "decoder")
    for group in whole["groups"]:
        _unique(group["tags"], f"in tag group {group['name']}: tag", "tag")
    for operation in whole["operations"]:
        where = operation["name"]
        _known(operation["scene"], scenes, where)
        for argument in operation["arguments"]:
            if "codes" in argument:
                _known(argument["codes"], codes, f"{where}, {argument['name']}")
        for refusal in operation["refusals"]:
            _known(refusal, messages, where)
        if is_encoder(operation):
            _known(operation["header"], headers, where)
            for decoder in operation["answeredBy"]:
                _known(decoder, operations, where)
            _check_forms(whole, operation)
        else:
            _known(where, replies, "operations.json")
    for reply in whole["replies"]:
        _known(reply["decoder"], operations, "replies.json")
        _check_reply(whole, reply, operations[reply["decoder"]], codes)


def _check_forms(whole, operation):
    """A form names values, conversions and pieces that are there, and arguments of its own."""
    pieces = by_name(whole["pieces"])
    values = {one["name"] for one in operation["arguments"]} | set(by_name(whole["values"]))
    conversions = set(by_name(whole["conversions"]))
    for form in operation["forms"]:
        where = f"{operation['name']}, a form"
        text = form["body"]
        for piece in re.findall(r"<(\w+)>", text):
            _known(piece, pieces, where)
            text += pieces[piece]["text"]
        for name, conversion in re.findall(r"\{(\w+)\|?(\w*)\}", text):
            _known(name, values, where)
            _known(conversion or "first", conversions, where)
        for name in form.get("when", {}):
            _known(name, values, where)


def _check_reply(whole, reply, operation, codes):
    where = reply["decoder"]
    named = scene_tags(whole, operation["scene"])
    record = reply.get("record", {}).get("tags", [])
    read = {row["tag"] for row in record + reply.get("replyTags", [])}
    for tag in read:
        _known(tag, named, f"{where}: no name for tag; it")
    for table in reply.get("tables", []):
        columns = [column for column in table["columns"] if "empty" not in column]
        _unique(columns, f"{where}: column")
        for column in columns:
            if "codes" in column:
                _known(column["codes"], codes, f"{where}, {column['name']}")
            for tag in column["tags"]:
                if tag not in read:
                    raise DictionaryError(
                        f"{where}, {column['name']}: tag {tag} is not among the tags that are read")
