"""The tags that decoders read, as the fuzz targets write them."""

from . import words

PATH = "tests/fuzz/wire_tags.inc"


def files(whole):
    tags = {row["tag"] for reply in whole["replies"]
            for row in reply.get("replyTags", []) + reply.get("record", {}).get("tags", [])}
    lines = words.filled(", ".join(f'"{tag}"' for tag in sorted(tags)) + ",", "    ")
    return {PATH: "\n".join([f"// {words.GENERATED}"] + lines) + "\n"}
