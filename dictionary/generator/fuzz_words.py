"""The tags that decoders read and the sizes of their buffers, as the fuzz targets write them."""

from . import words

TAGS = "tests/fuzz/wire_tags.inc"
BOUNDS = "tests/fuzz/wire_bounds.inc"


def files(whole):
    rows = [row for reply in whole["replies"]
            for row in reply.get("replyTags", []) + reply.get("record", {}).get("tags", [])]
    tags = sorted({row["tag"] for row in rows})
    bounds = sorted({(row["tag"], row["bound"]) for row in rows if "bound" in row})
    return {TAGS: _list(f'"{tag}"' for tag in tags),
            BOUNDS: _list(f'{{"{tag}", {bound}}}' for tag, bound in bounds)}


def _list(items):
    lines = words.filled(", ".join(items) + ",", "    ")
    return "\n".join([f"// {words.GENERATED}"] + lines) + "\n"
