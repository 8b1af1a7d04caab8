"""The code tables of results against the library, both ways: what each row is made from gives its
code, and what no row is made from gives none."""

import itertools

from generator import load

from . import forms, library, replies, results

REFUSED = "refused"


def run(whole, program, _):
    found = library.Findings()
    lib = library.Library(program)
    tables = load.by_name(whole["codes"])
    decoders = {}
    for operation in library.operations(whole, False):
        reply = load.by_name(whole["replies"], "decoder")[operation["name"]]
        decoders[operation["name"]] = replies.Decoder(whole, operation, reply, lib, found)
    wanted = set(decoders)
    for name in wanted & {"QueryOrderDecode", "QueryReplyDecode", "PaymentDecode"}:
        _judge_types(found, tables, decoders[name], "type")
    for name in wanted & {"FutQueryOrderDecode", "FutQueryReplyDecode"}:
        _judge_legs(found, tables, decoders[name])
    for name, tag, column in (("FutQueryInventoryDecode", "28", "currency"),
                              ("SubmitOrderDecode", "19", "acceptance"),
                              ("FutSubmitOrderDecode", "19", "acceptance"),
                              ("QueryOrderDecode", "JV", "changeable"),
                              ("FutQueryOrderDecode", "JV", "changeable")):
        if name in wanted:
            _judge_wire(found, tables, decoders[name], tag, column)
    if {"QueryOrderDecode", "FutQueryOrderDecode"} <= wanted:
        _judge_time_in_force(found, tables, decoders["FutQueryOrderDecode"])
        _judge_words(found, tables, decoders)
    for books, name in (("stock", "QueryOrderDecode"), ("futures", "FutQueryOrderDecode")):
        if name in wanted:
            _judge_states(found, tables, decoders[name], books)
    if "QueryOrderDecode" in wanted:
        _judge_markets(found, tables, decoders["QueryOrderDecode"])
    return found.finish("codes")


def _shown(decoder, column, cases):
    """What the column shows of each case {tag: value}; REFUSED where the list is."""
    lines = []
    for case in cases:
        head = {tag: case.get(tag, value) for tag, value in decoder.head.items()}
        lines.append(decoder.line(head, dict(decoder.fields, **case)))
    shown = []
    for status, result in decoder.ask(lines):
        rows = results.rows(decoder.reply, result) if status == "1" else []
        texts = [row[column] for row in rows if row and column in row]
        shown.append(texts[0] if texts else REFUSED)
    return shown


def _judge_types(found, tables, decoder, column):
    name = decoder.name
    table = next(one["codes"] for one in decoder.columns if one["name"] == column)
    rows = [row for row in tables[table]["values"] if row.get("only", name) == name]
    facts = [{"orderKind": str(kind), "tradeType": str(trade), "side": side}
             for kind in range(-1, 30) for trade in range(-1, 6) for side in ("B", "S", "X")]
    cases = [{"27": each["orderKind"], "28": each["tradeType"], "32": each["side"]}
             for each in facts]
    for fact, shown in zip(facts, _shown(decoder, column, cases)):
        codes = [row["code"] for row in rows
                 if all(forms.matches(condition, fact[what])
                        for what, condition in row["from"].items())]
        found.expect(shown == (codes[0] if codes else REFUSED) and len(codes) < 2,
                     f"{name}: {fact} gives {shown}; the table {table} has {codes}")


def _judge_legs(found, tables, decoder):
    book = decoder.name == "FutQueryOrderDecode"
    for option, side, flag in itertools.product((True, False), ("B", "S"),
                                                ("", " ", "0", "1", "2", "3")):
        case = {"V8": "C" if option else "", "EL": "", "V9": "", "32": side, "W3": flag}
        shown = _shown(decoder, "legCode1", [case])[0]
        wanted = [row["code"] for row in tables["legCodes"]["values"]
                  if row["from"]["side"] == side
                  and (flag.strip() or "blank") == row["from"]["flagW3"]
                  and not (book and option and row.get("only") == "futures")]
        if not wanted and not book:
            wanted = [row["code"] for row in tables["legCodes"]["values"]
                      if row["from"] == {"side": side, "flagW3": "blank"}]
        found.expect(shown == (wanted or [""])[0],
                     f"{decoder.name}: side {side}, W3 {flag!r} gives {shown!r}, legCodes {wanted}")


def _judge_wire(found, tables, decoder, tag, column):
    case = {"V8": ""} if column == "currency" else {}  # futures alone show one
    table = next(one["codes"] for one in decoder.columns if one["name"] == column)
    listed = {each: row["code"] for row in tables[table]["values"] for each in row["wire"].split()}
    letters = [chr(c) for c in range(ord("0"), ord("Z") + 1) if chr(c).isalnum()]
    cases = [dict(case, **{tag: letter}) for letter in letters]
    for letter, shown in zip(letters, _shown(decoder, column, cases)):
        wanted = listed.get(letter, "")
        found.expect(shown in (wanted, REFUSED if not wanted else wanted),
                     f"{decoder.name}: tag {tag} {letter} gives {shown!r}; "
                     f"the table {table} has {wanted!r}")


def _judge_time_in_force(found, tables, decoder):
    for row in tables["timeInForce"]["values"]:
        case = dict(pair.split() for pair in row["wire"].split(", "))
        found.expect(_shown(decoder, "timeInForce", [case]) == [row["code"]],
                     f"{decoder.name}: {case} does not give {row['code']}")


def _judge_words(found, tables, decoders):
    """The words for prices are those that some price kind or type shows."""
    words = set()
    for name, table, tag, usual in (("QueryOrderDecode", "priceKinds", "M8", "0"),
                                    ("FutQueryOrderDecode", "priceTypes", "27", "2")):
        kinds = [str(i) for i in range(12)]
        listed = load.by_name(tables[table]["values"], "code")
        for kind, shown in zip(kinds, _shown(decoders[name], "price", [{tag: k} for k in kinds])):
            number = shown.lstrip("-").isdigit()
            words |= set() if number else {shown}
            said = listed.get(kind, {}).get("shows")
            found.expect(said == (None if number else shown),
                         f"{name}: price of {tag} {kind} shows {shown}; {table} has {said}")
    words |= set(_shown(decoders["QueryOrderDecode"], "price", [{"31": "", "M8": "0"}]))
    listed = {row["code"] for row in tables["priceWords"]["values"]}
    found.expect(words == listed, f"words for prices: {sorted(words ^ listed)} stand on one side")


def _judge_states(found, tables, decoder, books):
    """The states that an order book shows are those of the table."""
    listed = {row["code"] for row in tables["orderStates"]["values"] if books in row["books"]}
    cases = []
    for filled, cancelled, flag, text, state, times in itertools.product(
            ("0", "2", "5"), ("0", "3", "5"), ("0", "1"),
            ("", "全部取消", "委託已傳送，等待接收回報！", "WAIT "), ("0", "E"),
            (("0", "0"), ("0", "1"), ("1", "0"))):
        cases.append({"70": "5", "47": filled, "37": cancelled, "41": "0", "N6": flag, "K1": text,
                      "39": state, "O4": times[0], "V5": times[1]})
    cases = [{tag: value for tag, value in case.items() if tag in decoder.fields} for case in cases]
    shown = set()
    usual = library.usual(decoder.operation)
    for market in ("1", "3", "8") if "market" in usual else ("",):
        values = dict(usual, market=market) if market else usual
        lines = [decoder.line(None, dict(decoder.fields, **case)) for case in cases]
        calls = [(decoder.operation, dict(values, reply=line)) for line in lines]
        for status, result, _ in decoder.lib.ask(calls):
            if status == "1":
                shown.add(results.rows(decoder.reply, result)[0]["state"])
    shown.discard("")
    found.expect(shown == listed, f"{decoder.name}: the states {sorted(shown ^ listed)} stand on "
                                  f"one side")


def _judge_markets(found, tables, decoder):
    """The markets that show a sent or waiting order in other words are those of the table."""
    listed = {row["code"] for row in tables["markets"]["values"] if row["code"].isdigit()}
    usual = dict(library.usual(decoder.operation))
    lines = [decoder.line(None, dict(decoder.fields, **{"39": state, "K1": text}))
             for state, text in (("0", "委託已傳送，等待接收回報！"), ("E", "WAIT "))]
    markets = [str(market) for market in range(-128, 600)]
    calls = [(decoder.operation, dict(usual, market=market, reply=line))
             for market in markets for line in lines]
    answers = [result for _, result, _ in decoder.lib.ask(calls)]
    shown = dict(zip(markets, zip(answers[::2], answers[1::2])))
    own = {market for market in markets if shown[market] != shown["0"]}
    found.expect(own == listed, f"{decoder.name}: the markets {sorted(own ^ listed)} stand on one "
                                f"side")
