"""Every decoder against the dictionary, both ways: which tags it reads and which columns each
changes, the size that bounds each value and the record, where the list ends, what stands at each
position, and what it makes of replies that are none."""

import re

from generator import load

from . import library, results

# Texts that a field may hold: what one of them changes, the field is read for.
TEXTS = ["", " ", "0", "1", "2", "3", "4", "5", "1000", "5000", "B", "S", "C", "P", "E", "X", "Y",
         "N", "-", "20240120", "全部取消"]
STRANGERS = ["ZZ", "02", "M1", "753", "V7", "X1", "46A", "H5"]
PAD = "zz"
BASES_PER_TAG = 1


def run(whole, program, _):
    found = library.Findings()
    lib = library.Library(program)
    for operation in library.operations(whole, False):
        reply = load.by_name(whole["replies"], "decoder")[operation["name"]]
        one = Decoder(whole, operation, reply, lib, found)
        one.judge_answers()
        one.judge_positions()
        one.judge_tags()
        one.judge_bounds()
        one.judge_end()
    return found.finish("replies")


class Decoder:
    """One decoder and what the dictionary says of it."""

    def __init__(self, whole, operation, reply, lib, found):
        self.whole = whole
        self.operation = operation
        self.name = operation["name"]
        self.reply = reply
        self.lib = lib
        self.found = found
        named = load.scene_tags(whole, operation["scene"])
        self.record = reply.get("record", {})
        self.rows = {row["tag"]: row for row in reply.get("replyTags", [])}
        self.record_rows = {row["tag"]: row for row in self.record.get("tags", [])}
        self.head = {tag: named[tag].get("example", "") for tag in self.rows}
        self.fields = {tag: named[tag].get("example", "") for tag in self.record_rows}
        self.columns = [
            dict(column, table=i) for i, table in enumerate(reply.get("tables", []))
            for column in table["columns"] if "empty" not in column]
        self.tags = sorted({row["tag"] for group in whole["groups"] for row in group["tags"]})

    def line(self, head=None, fields=None, before="", behind="", end=True):
        """A reply: the fields of the whole reply, one record, the end mark."""
        text = "".join(f"|{tag}={value}" for tag, value in (head or self.head).items())
        text += before
        if self.record_rows:
            text += self.record_text(fields)
        text += behind
        if end and "endMark" in self.record:
            text += f"|00=0|67={self.record['endMark']}|68=0000|01=1"
        return text + "|"

    def record_text(self, fields=None):
        body = "".join(f"|{tag}={value}" for tag, value in (fields or self.fields).items())
        return "|00=0" + body + "|01=1"

    def ask(self, lines):
        base = library.usual(self.operation)
        answers = self.lib.ask([(self.operation, dict(base, reply=line)) for line in lines])
        return [(status, result) for status, result, _ in answers]

    def parsed(self, answer):
        """{column: text} of the first row of each table; none for another answer."""
        status, result = answer
        return results.rows(self.reply, result) if status == "1" else None

    def judge_answers(self):
        cases = self.whole["failureReplies"]
        for case, (status, text) in zip(cases, self.ask([case["reply"] for case in cases])):
            said = self.reply["answers"][case["name"]]
            self.found.expect(
                (str(said["status"]), said["text"]) == (status, text),
                f"{self.name} answers {case['name']} with {status} {text!r}; the dictionary has "
                f"{said['status']} {said['text']!r}")

    def judge_positions(self):
        """The result of the example reads by the tables, and every column shows something."""
        shown = {}
        for answer in self.ask([self.line(*each) for each in self._bases()]):
            for table, row in enumerate(self.parsed(answer) or []):
                for name, text in (row or {}).items():
                    shown[table, name] = shown.get((table, name)) or text
        result = self.ask([self.line()])[0][1]
        self.found.expect(result == self.reply["exampleResult"],
                          f"{self.name}: the columns of the example read {result!r}; the "
                          f"dictionary has {self.reply['exampleResult']!r}")
        problems = results.problems(self.reply, result)
        for problem in problems:
            self.found.expect(False, f"{self.name}: {problem}")
        for column in self.columns:
            self.found.expect(shown.get((column["table"], column["name"])),
                              f"{self.name}: column {column['name']} shows nothing")

    def _bases(self):
        """The example, the dictionary's other cases, and the example with each text in each
        field."""
        yield self.head, self.fields
        for case in self.record.get("cases", []):
            yield self.head, dict(self.fields, **case)
        for tag in self.head:
            for text in TEXTS:
                yield dict(self.head, **{tag: text}), self.fields
        for tag in self.fields:
            for text in TEXTS:
                yield self.head, dict(self.fields, **{tag: text})

    def _telling_bases(self):
        """Of the bases those that differ in what they show, a few for each tag."""
        bases = list(self._bases())
        cases = 1 + len(self.record.get("cases", []))
        kept, per_tag = dict(enumerate(bases[:cases])), {}
        for base, answer in zip(bases, self.ask([self.line(*base) for base in bases])):
            tag = next((t for t in base[1] if base[1][t] != self.fields[t]), "")
            shape = re.sub(r"[1-9]\d*", "7", answer[1])
            if answer[0] == "1" and shape not in kept and per_tag.get(tag, 0) < BASES_PER_TAG:
                kept[shape] = base
                per_tag[tag] = per_tag.get(tag, 0) + 1
        return list(kept.values()) or bases[:1]

    def judge_tags(self):
        """Which columns a tag changes, with each other tag as it may be."""
        changed = {}
        bases = self._telling_bases()
        frames = {"67", "68", "M2"} if self.record_rows else {"68", "M2", "39", "K1", "19"}
        for place, known in (("head", self.rows), ("fields", self.record_rows)):
            if not known:
                continue
            for tag in self.tags + STRANGERS:
                if tag in frames or tag in ("00", "01"):
                    continue
                self._note_changes(changed, bases if tag in known else bases[:1], place, tag)
        for column in self.columns:
            key = (column["table"], column["name"])
            seen = {tag for tag, columns in changed.items() if key in columns}
            listed = set(column["tags"]) - frames
            for tag in sorted(seen - listed):
                self.found.expect(False, f"{self.name}: tag {tag} changes column {column['name']}")
            for tag in sorted(listed - seen):
                self.found.expect(False, f"{self.name}: tag {tag} never changes column "
                                         f"{column['name']}")
        read = set(changed)
        for tag in sorted(read - set(self.rows) - set(self.record_rows)):
            self.found.expect(False, f"{self.name} reads tag {tag}, which the dictionary lacks")
        for tag in sorted((set(self.rows) | set(self.record_rows)) - read - frames):
            self.found.expect(False, f"{self.name} does not read tag {tag}")

    def _note_changes(self, changed, bases, place, tag):
        lines = []
        for head, fields in bases:
            for text in TEXTS:
                one = dict(head) if place == "head" else dict(fields)
                one[tag] = text
                lines.append(self.line(*((one, fields) if place == "head" else (head, one))))
        lines = [self.line(*base) for base in bases] + lines
        answers = self.ask(lines)
        size = (len(lines) - len(bases)) // len(bases)
        for i, base in enumerate(answers[:len(bases)]):
            before = self.parsed(base)
            for answer in answers[len(bases) + i * size:len(bases) + (i + 1) * size]:
                if answer == base:
                    continue
                after = self.parsed(answer)
                changed.setdefault(tag, set())
                for table, (old, new) in enumerate(zip(before or [], after or [])):
                    for name in set(old or {}) & set(new or {}):
                        if old[name] != new[name]:
                            changed[tag].add((table, name))

    def judge_bounds(self):
        """A value one byte shorter than its bound is read, one of the bound reads as absent."""
        for place, known in (("head", self.rows), ("fields", self.record_rows)):
            for tag, row in known.items():
                base = dict(self.head if place == "head" else self.fields)

                def with_text(text):
                    base[tag] = text
                    return self.line(**{place: dict(base)})
                bound = row.get("bound")
                size = self.record.get("size")
                longest = bound - 1 if bound else size - 200 if size else 700
                if size and bound and bound >= size:
                    continue  # the record bounds it
                texts = ["", "0" * (longest - 1) + "7", "0" * longest + "7"]
                absent, fits, large = self.ask([with_text(text) for text in texts])
                if fits == absent:
                    continue  # nobody sees how long it may be
                if bound:
                    self.found.expect(large == absent,
                                      f"{self.name}: tag {tag} is read with {bound} bytes and more")
                else:
                    self.found.expect(large != absent, f"{self.name}: tag {tag} has a bound")
            for tag, row in known.items():
                self._judge_bound_is_reached(place, tag, row)

    def _judge_bound_is_reached(self, place, tag, row):
        """Where a short text shows, one of the whole bound shows."""
        bound = row.get("bound")
        size = self.record.get("size")
        if not bound or (size and bound >= size) or tag in ("68", "67", "39", "19"):
            return
        base = dict(self.head if place == "head" else self.fields)

        def with_text(text):
            return self.line(**{place: dict(base, **{tag: text})})
        absent, short, fits = self.ask([with_text(text)
                                        for text in ("", "07", "0" * (bound - 2) + "7")])
        if short != absent:
            self.found.expect(fits != absent, f"{self.name}: tag {tag} of {bound - 1} bytes is "
                                              f"not read")

    def judge_end(self):
        if not self.record_rows:
            return
        self._judge_record_size()
        if "endMark" not in self.record:
            return
        mark = self.record["endMark"]
        for number, ends in ((mark, True), (mark - 1, False)):
            fields = dict(self.fields, **{"67": str(number)})
            line = self.record_text() + self.record_text(fields)
            count = self._count(self.line(before=line, end=False).replace(line, line, 1))
            plain = self._count(self.line(before=self.record_text()))
            self.found.expect((count < plain + 1) == ends,
                              f"{self.name}: a sequence of {number} "
                              + ("does not end" if ends else "ends") + " the list")
        large = self.record_text(dict(self.fields, **{PAD: "x" * self.record["size"]}))
        once = self._count(self.line())
        behind = self._count(self.line(before=self.record_text() + large))
        stops = behind == once
        self.found.expect(stops == self.record.get("endsAtEmptyRecord", False),
                          f"{self.name}: a record that is too long "
                          + ("ends the list" if stops else "is passed over"))

    def _judge_record_size(self):
        size = self.record.get("size")
        if size is None:
            return
        room = size - len(self.record_text().removesuffix("|01=1")) - len(f"|{PAD}=")
        lines = [self.line(fields=dict(self.fields, **{PAD: "x" * each}))
                 for each in (1, room - 1, room)]
        small, fits, large = self.ask(lines)
        self.found.expect(fits == small, f"{self.name}: a record of {size - 1} bytes is not read")
        self.found.expect(large != small, f"{self.name}: a record of {size} bytes is read")

    def _count(self, line):
        return results.count(self.reply, self.ask([line])[0][1])
