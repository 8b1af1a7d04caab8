"""What the documents are made of."""

from . import words


def table(head, rows):
    """Lines of a table; nothing when there are no rows."""
    rows = list(rows)
    if not rows:
        return []
    return [_row(head), _row(["---"] * len(head))] + [_row(row) for row in rows] + [""]


def code(text):
    return f"`{text}`" if text else ""


def link(name, page="", text=None):
    return f"[{text or name}]({page}#{anchor(name)})"


def anchor(title):
    kept = "".join(c for c in title.lower() if c.isalnum() or c in " -_")
    return kept.replace(" ", "-")


def block(lines):
    """Lines of a wire text, as they stand."""
    return ["    " + line.replace("\n", "\\n") for line in lines] + [""]


def paragraph(text):
    return words.filled(text, "") + [""]


def _row(cells):
    return "| " + " | ".join(cell.replace("|", "\\|").replace("\n", "\\n") for cell in cells) + " |"
