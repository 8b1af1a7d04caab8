"""What was measured, and of which sources: docs/assurance/SECTION.json, and the page made of them."""

import hashlib
import json
import os
import pathlib
import subprocess
import time

TOP = pathlib.Path(__file__).resolve().parent.parent.parent
KEPT = TOP / "docs/assurance"
PAGE = TOP / "docs/assurance.md"
TESTS = ["tests/unit", "tests/jni", "tests/heap", "tests/support", "tests/vectors",
         "tests/fuzz/reply_tables.h", "tests/fuzz/reply_tables.inc"]
FUZZ = "fuzzing"

# What each section measures with, beside gateway/, jni/ and its own program. In the page's order.
TOOLS = {
    "abi": ["tests/abi", "tests/support", "tests/vectors"],
    "threads": ["tests/jni/thread_test.cpp", "tests/support", "tests/vectors"],
    "coverage": [*TESTS, "scripts/coverage", "tests/uncovered_branches.txt"],
    "mutation": [*TESTS, "scripts/mutate", "tests/equivalent_mutants.txt"],
    "stack": ["tests/jni/stack_test.cpp", "tests/support", "tests/vectors"],
    "time": ["tests/times", "tests/support"],
    FUZZ: ["tests/fuzz", ":!tests/fuzz/corpus", "tests/support"],
}
HEAD = """# Assurance

What was measured, when, and of which sources: `scripts/assure` renews what is stale, and
`scripts/assure --check` fails where something is. Each section names a digest of what it measured:
`gateway/`, `jni/` and its own tools. The pages' data are in `docs/assurance/`.
"""


def git(*arguments):
    return subprocess.run(["git", *arguments], cwd=TOP, check=True, capture_output=True,
                          text=True).stdout


def sources(section):
    return ["gateway", "jni", f"scripts/assurance/sections/{section}", *TOOLS[section]]


def digest(section):
    """Stands for the committed sources of a section."""
    listed = git("ls-files", "-s", "--", *sources(section))
    return hashlib.sha256(listed.encode()).hexdigest()[:12]


def changed(section):
    """Files of the section that differ from the commit."""
    return git("status", "--porcelain", "--", *sources(section)).splitlines()


def kept(section):
    path = KEPT / f"{section}.json"
    return json.loads(path.read_text()) if path.exists() else {}


def stale(section):
    """Why a section is not what it should be; nothing when it is."""
    data = kept(section)
    if not data:
        return "never measured"
    if data["digest"] != digest(section):
        return f"measured {data['digest']}, the sources are {digest(section)}"
    if changed(section):
        return "the sources differ from the commit"
    if data.get("missed"):
        return data["missed"]
    return ""


def told(seconds):
    return f"{seconds:.0f} s" if seconds < 90 else f"{seconds / 60:.0f} min"


def tools():
    versions = []
    for compiler in ("g++", "clang++"):
        try:
            said = subprocess.run([compiler, "--version"], capture_output=True, text=True)
            versions.append(said.stdout.split("\n")[0])
        except FileNotFoundError:
            pass
    return "; ".join(versions) + f"; {os.cpu_count()} processors, {os.uname().machine}"


def keep(section, data):
    """Writes what a section found out, of the sources as they are committed, and the page."""
    commit = git("rev-parse", "--short", "HEAD").strip()
    stamp = {"digest": digest(section), "commit": commit,
             "date": time.strftime("%Y-%m-%d %H:%M UTC", time.gmtime()), "tools": tools()}
    KEPT.mkdir(parents=True, exist_ok=True)
    text = json.dumps({**stamp, **data}, ensure_ascii=False, indent=1)
    (KEPT / f"{section}.json").write_text(text + "\n")
    write_page()


def write_page():
    parts = [HEAD]
    for section in TOOLS:
        if not (data := kept(section)):
            continue
        title, *body = data["text"]
        parts.append(f"{title}\n\nSources {data['digest']}, at commit {data['commit']}, "
                     f"{data['date']}, {told(data['seconds'])}, with {data['tools']}.\n\n"
                     + "\n".join(body).strip() + "\n")
    PAGE.write_text("\n".join(parts))
