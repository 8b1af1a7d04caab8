#!/usr/bin/env python3
"""The evidence of fuzzing: what all sittings over the same sources have played, added up.

scripts/assurance/fuzz_rows.py digest: prints what stands for the sources.
scripts/assurance/fuzz_rows.py add DIGEST TARGET WORKERS SECONDS FINDINGS <EXECUTIONS: one sitting
more; EXECUTIONS are the lines "executions EXPORT NUMBER" of tests/fuzz/replay_main.cpp. What was
counted of other sources is dropped. Refuses where files differ from the commit, or from DIGEST.
scripts/assurance/fuzz_rows.py left: prints "MINUTES TARGET" for each target that has not had what
it must have.
"""

import sys

from evidence import changed, digest, keep, kept, told

SECTION = "fuzzing"
MILLION = 1000000

# What each target must have had, and the executions a second that two processors give it: a guess
# until it was measured here.
GOALS = {"calls": (210 * MILLION, 100000), "calls-memory": (30 * MILLION, 40000),
         "readers": (60 * MILLION, 100000), "readers-memory": (3 * MILLION, 20000),
         "records": (10 * MILLION, 40000), "calls-afl": (30 * MILLION, 20000)}
EXPORTS = ("calls", "calls-memory")
EACH = MILLION // 2  # executions of every export

TEXT = """## Fuzzing

Each execution is one call through a host that checks all it does, one in four made twice and
compared (`calls`), one reply read by the library's readers and by plain ones (`readers`), or one
reply decoded as it is and as plain readers and the dictionary's tables see it (`records`): under the
address and undefined behaviour sanitizers, or the memory sanitizer (`-memory`). A driver of our own
chooses by the code that an input reaches; `-afl` is AFL++ doing so. Only executions of the sources
that are named above count; the fewest are those of the export that had least.

| target | sittings | processors | time | executions | of | reached | fewest | findings |
|---|---|---|---|---|---|---|---|---|
"""


def rows():
    """By target, of the sources as they are."""
    data = kept(SECTION)
    return data["rows"] if data.get("digest") == digest(SECTION) else {}


def executions(row):
    return sum(row["executions"].values())


def fewest_of_exports(all_rows):
    """The least that any export had in all runs of calls, with its name."""
    counts = {}
    for target in EXPORTS:
        for name, number in all_rows.get(target, {}).get("executions", {}).items():
            counts[name] = counts.get(name, 0) + number
    return min(((number, name) for name, number in counts.items()), default=(0, "any"))


def missing(all_rows):
    """What the goals lack, in words."""
    words = []
    for target, (goal, _) in GOALS.items():
        had = executions(all_rows[target]) if target in all_rows else 0
        if had < goal:
            words.append(f"{target} had {had / MILLION:.1f} of {goal / MILLION:.0f} million")
    number, name = fewest_of_exports(all_rows)
    if number < EACH:
        words.append(f"{name} had {number} of {EACH}")
    findings = sum(row["findings"] for row in all_rows.values())
    if findings:
        words.append(f"{findings} findings")
    return "; ".join(words)


def lines_of(all_rows):
    text = TEXT
    for target, row in sorted(all_rows.items()):
        counts = row["executions"]
        name = min(counts, key=counts.get)
        reached = sum(1 for number in counts.values() if number)
        goal = GOALS[target][0] if target in GOALS else 0
        text += (f"| {target} | {row['sittings']} | {row['workers']} | {told(row['seconds'])} | "
                 f"{executions(row)} | {goal} | {reached} of {len(counts)} | {counts[name]} of "
                 f"{name} | {row['findings']} |\n")
    number, name = fewest_of_exports(all_rows)
    text += (f"\nIn all {sum(map(executions, all_rows.values()))} executions. Of the exports, {name} "
             f"had the fewest: {number}.\n")
    return text.rstrip("\n").split("\n")


def add(target, workers, seconds, findings, counts):
    all_rows = rows()
    row = all_rows.setdefault(target, {"sittings": 0, "workers": workers, "seconds": 0,
                                       "findings": 0, "executions": {}})
    row["sittings"] += 1
    row["workers"] = workers
    row["seconds"] += seconds
    row["findings"] += findings
    for name, number in counts.items():
        row["executions"][name] = row["executions"].get(name, 0) + number
    keep(SECTION, {"seconds": sum(r["seconds"] for r in all_rows.values()),
                   "missed": missing(all_rows), "text": lines_of(all_rows), "rows": all_rows})


def seconds_left_of(target, all_rows):
    goal, rate = GOALS[target]
    row = all_rows.get(target)
    had = executions(row) if row else 0
    measured = row or kept(SECTION).get("rows", {}).get(target)
    if measured and measured["seconds"]:
        rate = executions(measured) / measured["seconds"]
    left = max(goal - had, 0) / max(rate, 1)
    if target == EXPORTS[0] and not left and fewest_of_exports(all_rows)[0] < EACH:
        left = 600
    return left


def seconds_left():
    all_rows = rows()
    return sum(seconds_left_of(target, all_rows) for target in GOALS)


def main():
    if sys.argv[1:] == ["left"]:
        for target in GOALS:
            if left := seconds_left_of(target, rows()):
                print(int(left / 60) + 1, target)
    elif sys.argv[1:] == ["digest"]:
        print(digest(SECTION))
    else:
        if changed(SECTION) or sys.argv[2] != digest(SECTION):
            sys.exit("\n".join(["scripts/fuzz: not kept, the sources differ from the commit:",
                                *changed(SECTION)]))
        _, _, _, target, workers, seconds, findings = sys.argv
        lines = (line.split() for line in sys.stdin)
        counts = {words[1]: int(words[2]) for words in lines
                  if words[:1] == ["executions"] and words[1] != "all"}
        add(target, int(workers), int(seconds), int(findings), counts)


if __name__ == "__main__":
    main()
