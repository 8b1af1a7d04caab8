"""The call table of the tests: what each native method takes."""

from . import load, words

ROWS = "tests/support/call_rows.inc"
COUNT = "tests/support/call_count.h"
LETTERS = {"int": "I", "String": "S", "byte": "B", "char": "C"}


def files(whole):
    operations = whole["operations"]
    count = f"""// {words.GENERATED}
#ifndef TESTS_SUPPORT_CALL_COUNT_H_
#define TESTS_SUPPORT_CALL_COUNT_H_

#include <cstddef>

namespace gateway_tests {{

inline constexpr size_t kExportCount = {len(operations)};

}}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_CALL_COUNT_H_
"""
    return {ROWS: _rows(operations), COUNT: count}


def _rows(operations):
    lines = [f"""// {words.GENERATED}
// Row<TYPES>(NAME, ARGUMENTS, KEPT): one for each native method: what it takes (I int, S String,
// B byte, C char, Status the status array), its name, the names of its arguments but for the status
// array, and how many of its last strings it never releases. Saved inputs of fuzz targets name a
// method by its number here: a new operation goes to the end of the dictionary."""]
    group = None
    for operation in operations:
        if operation["group"] != group:
            group = operation["group"]
            lines.append(f"// {words.sentence(group)}")
        lines += _row(operation)
    return "\n".join(lines) + "\n"


def _row(operation):
    types = [LETTERS[one["type"]] for one in operation["arguments"]]
    if operation.get("status", True):
        types.append("Status")
    names = words.filled(" ".join(one["name"] for one in operation["arguments"]), "", width=90)
    lines = words.filled(f"Row<{', '.join(types)}>(", "", "    ")
    lines.append(f'    "{operation["name"]}",')
    quoted = [f'    "{name} "' for name in names[:-1]] + [f'    "{names[-1]}"']
    kept = f", {operation['keptStrings']}" if "keptStrings" in operation else ""
    return lines + quoted[:-1] + [quoted[-1] + kept + "),"]
