"""docs/operations.md, docs/results.md and docs/wire.md: text that people write down to a mark, and
below it tables of the dictionary."""

from . import load, operations_page, results_page, wire_page

MARK = "<!-- dictionary/generate writes what follows, from dictionary/*.json: do not edit -->\n"
PAGES = {"docs/operations.md": operations_page, "docs/results.md": results_page,
         "docs/wire.md": wire_page}


def files(whole, top=load.FOLDER.parent):
    out = {}
    for path, page in PAGES.items():
        head = (top / path).read_text(encoding="utf-8").partition(MARK)[0]
        out[path] = head + MARK + "\n" + "\n".join(page.lines(whole)).rstrip("\n") + "\n"
    return out
