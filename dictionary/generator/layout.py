"""How the dictionary's files are laid out: one line an argument, tag, column, code or message, so
that a change shows as the lines that it touches."""

import json

WIDTH = 100
LONG = 220  # a row with lists in it that is longer goes on several lines


def text(value):
    """The file of a value, with its last line feed."""
    return _block(value, 0) + "\n"


def _line(value):
    return json.dumps(value, ensure_ascii=False)


def _is_scalar(value):
    return not isinstance(value, (dict, list))


def _is_row(value):
    """A row of a table: an object of plain values, or of lists and objects of them."""
    if not isinstance(value, dict):
        return False
    if any(isinstance(each, list) for each in value.values()) and len(_line(value)) > LONG:
        return False
    return all(
        _is_scalar(each)
        or (isinstance(each, dict) and all(map(_is_scalar, each.values())))
        or (isinstance(each, list) and all(map(_is_scalar, each)))
        for each in value.values()
    )


def _block(value, indent):
    line = _line(value)
    if _is_scalar(value):
        return line
    if isinstance(value, list) and all(map(_is_scalar, value)) and len(line) + indent < WIDTH:
        return line
    inner = " " * (indent + 2)
    if isinstance(value, list):
        parts = [_line(each) if _is_row(each) else _block(each, indent + 2) for each in value]
        opening, closing = "[]"
    else:
        parts = [f"{_line(key)}: {_block(each, indent + 2)}" for key, each in value.items()]
        opening, closing = "{}"
    if not parts:
        return line
    return opening + "\n" + ",\n".join(inner + part for part in parts) + "\n" + " " * indent + closing
