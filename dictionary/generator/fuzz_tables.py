"""What decoders read of a reply, as the differential fuzz target holds it against the library."""

from . import words

PATH = "tests/fuzz/reply_tables.inc"
UNBOUNDED = 0


def files(whole):
    lines = [f"// {words.GENERATED}", "// One row a decoder; its members are told where it is included."]
    for reply in whole["replies"]:
        record = reply.get("record", {})
        flags = [record.get("endsAtEmptyRecord", False), record.get("only") == "first"]
        lines += [f'{{"{reply["decoder"]}", {record.get("size", UNBOUNDED)},'
                  f' {record.get("endMark", 0)},'
                  f' {", ".join(str(flag).lower() for flag in flags)},']
        lines += _tags(reply.get("replyTags", [])) + _tags(record.get("tags", []))
        answers = [reply["answers"][name] for name in ("gatewayError", "brokerTimeout", "empty")]
        rows = [f'{{{answer["status"]}, "{answer["text"]}"}}' for answer in answers]
        lines += [f" {{{rows[0]},", f"  {rows[1]},", f"  {rows[2]}}}}},"]
    return {PATH: "\n".join(lines) + "\n"}


def _tags(rows):
    if not rows:
        return [" {},"]
    texts = ", ".join(
        f'{{"{row["tag"]}", {row.get("bound", UNBOUNDED)}, '
        f'{str(row.get("blanks") == "skipped").lower()}}}' for row in rows)
    lines = words.filled(texts, "  ")
    lines[0] = " {" + lines[0].lstrip()
    lines[-1] += "},"
    return lines
