"""What the console knows of the protocol: names of tags, scenes, messages, refusals."""

import re

from . import load, words

PATH = "java/console/com/brindlex/kernel/quorvane/console/Dictionary.java"


def files(whole):
    return {PATH: f"""// {words.GENERATED}
package com.brindlex.kernel.quorvane.console;

/** The dictionary as the console reads it: rows of texts. */
final class Dictionary {{
    /** By scene: tags with what each is called. */
    static final String[][] TAGS = {{
{rows(_tags(whole))}    }};

    /** By scene: its operations. */
    static final String[][] SCENES = {{
{rows(_scenes(whole))}    }};

    /** By scene: the functions of its queries. */
    static final String[][] QUERIES = {{
{rows(_queries(whole))}    }};

    /** By operation: what it refuses with. */
    static final String[][] REFUSALS = {{
{rows(_refusals(whole))}    }};

    /** The messages that the library makes itself, without their source, in English. */
    static final String[][] MESSAGES = {{
{rows(_messages(whole))}    }};

    private Dictionary() {{}}
}}
"""}


def rows(rows):
    out = []
    for row in rows:
        text = "{" + ", ".join(map(words.java_string, row)) + "},"
        out += _filled(row, text)
    return "".join(line + "\n" for line in out)


def _filled(row, text):
    """A row on one line, or several; no text is broken."""
    if len(text) + 8 <= words.WIDTH:
        return ["        " + text]
    lines, line = [], "        {"
    for i, each in enumerate(row):
        piece = words.java_string(each) + (", " if i + 1 < len(row) else "},")
        if len(line + piece.rstrip()) > words.WIDTH:
            lines.append(line.rstrip())
            line = "                "
        line += piece
    return lines + [line]


def _tags(whole):
    for scene in whole["scenes"]:
        row = [words.constant(scene["name"])]
        for tag in load.scene_tags(whole, scene["name"]).values():
            row += [tag["tag"], tag["label"].replace("`", "")]
        yield row


def _scenes(whole):
    for scene in whole["scenes"]:
        yield [words.constant(scene["name"])] + [
            one["name"] for one in whole["operations"] if one["scene"] == scene["name"]]


def _queries(whole):
    for scene in whole["scenes"]:
        functions = []
        for one in whole["operations"]:
            found = re.search(r"FUNC=(\w+)", one["forms"][0]["body"]) if "forms" in one else None
            if found and one["scene"] == scene["name"] and found[1] not in functions:
                functions.append(found[1])
        if functions:
            yield [words.constant(scene["name"])] + functions


def _refusals(whole):
    messages = load.by_name(whole["messages"], "id")
    for one in whole["operations"]:
        yield [one["name"]] + [messages[each]["text"] for each in one["refusals"]]


def _messages(whole):
    seen = {}
    for message in whole["messages"]:
        if message["source"] == "library":
            bare = re.sub(r"^(\[\w+\] ?|\w+Encode\(\))", "", message["text"])
            seen.setdefault(bare, message["english"])
    return list(map(list, seen.items()))
