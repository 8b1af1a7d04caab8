"""Calls of the library, by the names of the dictionary, and what was found wrong."""

import os
import re
import subprocess

from generator import load

CLOCK = {"now": "134521", "today": "20240115"}
_PLAIN = {"\\": "\\\\", "\t": "\\t", "\n": "\\n", "\r": "\\r"}


class Library:
    """The program dictionary_answers, asked for many calls at a time."""

    def __init__(self, program):
        self.program = program

    def ask(self, calls):
        """The answers to (operation, {argument: value}): (status, result, log lines) each."""
        lines = [
            "\t".join([operation["name"]] + [_argument(one, values) for one in operation["arguments"]])
            for operation, values in calls
        ]
        run = subprocess.run(
            [self.program], input="\n".join(lines).encode() + b"\n", capture_output=True, check=False)
        answers = run.stdout.decode("utf-8", "surrogateescape").split("\n")[:-1]
        if run.returncode != 0 or len(answers) != len(lines):
            raise SystemExit(f"{self.program}: {run.stderr.decode()[:300]}")
        return [_answer(answer) for answer in answers]


class Findings:
    """What does not hold; each is printed once."""

    def __init__(self):
        self.found = []
        self.asked = 0

    def expect(self, holds, text):
        self.asked += 1
        if not holds and text not in self.found:
            self.found.append(text)
        return holds

    def finish(self, name):
        """Prints the findings; the exit status."""
        for text in self.found[:40]:
            print(f"{name}: {text[:300]}")
        print(f"{name}: {self.asked} questions, {len(self.found)} findings")
        return 1 if self.found or not self.asked else 0


def usual(operation):
    """Values for all arguments: the examples of the dictionary, else the usual values."""
    return {
        one["name"]: one.get("example", one.get("usual", "")) for one in operation["arguments"]}


def is_letter(argument):
    return argument.get("kind") == "letter"


def operations(whole, encoders):
    """The encoders or decoders; DICTIONARY_ONLY in the environment narrows them by name."""
    only = os.environ.get("DICTIONARY_ONLY", "")
    return [one for one in whole["operations"]
            if load.is_encoder(one) == encoders and re.match(only, one["name"])]


def codes_of(whole, argument, operation):
    """The codes that an argument of an operation may have, or none."""
    table = load.by_name(whole["codes"]).get(argument.get("codes"))
    if table is None:
        return []
    return [
        row["code"] for row in table["values"]
        if operation["name"] in row.get("only", operation["name"]).split()
        and not row.get("listsOnly")]


def _argument(argument, values):
    value = values[argument["name"]]
    if is_letter(argument):
        value = str(ord(value)) if value else "0"
    elif argument["type"] == "byte":
        value = str((int(value) + 128) % 256 - 128)
    return "".join(_PLAIN.get(c, c) for c in value)


def _answer(line):
    fields = []
    for field in line.split("\t"):
        pieces = field.split("\\\\")
        for plain, c in (("\\t", "\t"), ("\\n", "\n"), ("\\r", "\r")):
            pieces = [piece.replace(plain, c) for piece in pieces]
        fields.append("\\".join(pieces))
    return fields[0], fields[1], fields[2:]
