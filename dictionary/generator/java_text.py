"""Java sources of the typed layer as text."""

import re

from . import words

PACKAGE = "com.brindlex.kernel.quorvane.client"
MARK = f"// {words.GENERATED}"
JZG = " (JZG)"


def java_source(body, imports=()):
    lines = [MARK, f"package {PACKAGE};", ""]
    lines += [f"import {name};" for name in sorted(imports)]
    return "\n".join(lines + (["", ""] if imports else [""])) + body.strip("\n") + "\n"


def quoted(text):
    return '"' + text.replace("\\", "\\\\").replace('"', '\\"').replace("\n", "\\n") + '"'


def filled(head, pieces, tail, indent):
    """HEAD, the pieces with commas between them, and TAIL, on lines within the page; a text that is
    too long for a line goes on in the next."""
    lines, line, first = [], head, True
    for place, piece in enumerate(pieces):
        end = tail if place + 1 == len(pieces) else ","
        parts = _parts(piece, words.WIDTH - indent - len(end) - 3)
        for number, part in enumerate(parts):
            text = part + (end if number + 1 == len(parts) else "")
            blank = "" if first or line.endswith("(") else " "
            if len(line + blank + text) > words.WIDTH:
                lines.append(line)
                line, blank = " " * indent, ""
            line += blank + ("+ " if number else "") + text
            first = False
    return "\n".join(lines + [line])


def _parts(piece, width):
    """A text in quotes, cut between words into texts that are no longer."""
    if len(piece) <= width or not piece.startswith('"'):
        return [piece]
    cut = piece.rindex(" ", 0, width - 1) + 1
    return [piece[:cut] + '"'] + _parts('"' + piece[cut:], width)


def constant_name(name):
    """orderDate, ReNewCertEncode -> ORDER_DATE, RE_NEW_CERT_ENCODE."""
    words = re.sub(r"(?<=[a-z0-9])(?=[A-Z])|(?<=[A-Z])(?=[A-Z][a-z])", "_", name)
    return words.upper()


def class_name(title):
    return "".join(word[:1].upper() + word[1:] for word in re.split(r"[ -]", title))


def javadoc(text, indent=""):
    text = re.sub(r"`([^`]*)`", r"{@code \1}", text[:1].upper() + text[1:])
    line = f"{indent}/** {text.rstrip('.')}. */"
    if len(line) <= 100:
        return line
    words, lines, current = text.rstrip(".").split(" "), [], f"{indent} *"
    for word in words:
        if len(current) + 1 + len(word) > 99:
            lines.append(current)
            current = f"{indent} *"
        current += " " + word
    return "\n".join([f"{indent}/**"] + lines + [current + ".", f"{indent} */"])


def wrapped(javadoc):
    """A documentation comment within 100 columns."""
    out = []
    for line in javadoc.split("\n"):
        while len(line) > 100:
            cut = line.rindex(" ", 0, 100)
            out.append(line[:cut])
            line = " * " + line[cut + 1:]
        out.append(line)
    if len(out) > 1 and out[0].startswith("/** "):
        out = ["/**", " * " + out[0][4:]] + out[1:]
        if out[-1].endswith("*/") and out[-1].strip() != "*/":
            out[-1:] = [out[-1][:-2].rstrip(), " */"]
    return "\n".join(out)
