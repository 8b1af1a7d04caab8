"""Writes requests by the forms of the dictionary: what the library must write, in its own words."""

import base64
import re

from generator import load

from . import library

REQUEST_ID = library.CLOCK["now"]
IDENTITY_PART = 40
REFERENCE_PART = {"CGatewayStk": 40, "CGatewayFut": 48}


def matches(condition, value):
    """Whether a value is one of "0 2", or none of "not 0 2"."""
    wanted = condition.split()
    if wanted[0] == "not":
        return value not in wanted[1:]
    return value in wanted


def within(lengths, length):
    """Whether a length is among "2-7", "0-1 8-39", "any"."""
    for part in lengths.split():
        low, _, high = part.partition("-")
        if part == "any" or int(low) <= length <= int(high or low):
            return True
    return False


def forms_of(operation, values):
    return [form for form in operation["forms"]
            if all(matches(condition, values[name])
                   for name, condition in form.get("when", {}).items())]


def number(text):
    """The number that a text begins with, as C reads it."""
    found = re.match(r"\s*[-+]?\d+", text)
    return int(found[0]) if found else 0


def _decimal(value, places):
    """Both parts keep the sign, as C's division has it."""
    whole = abs(value) // 10**places * (-1 if value < 0 else 1)
    return f"{whole}.{value - whole * 10**places:0{places}d}"


class Writer:
    """Writes the request of one operation with these values."""

    def __init__(self, whole, operation, values):
        self.whole = whole
        self.operation = operation
        self.values = dict(values, localIP=values["localIP"][:64])
        if len(values["serialNo"]) >= 20:  # a full one has no end of its own
            self.values["serialNo"] = values["serialNo"][:20] + self.values["localIP"]
        self.header = load.by_name(whole["headers"])[operation["header"]]
        self.codes = load.by_name(whole["codes"])

    def names_user(self):
        """Whether the header has a block for this identity."""
        return self._identity() is not None

    def has_form(self):
        """Whether the dictionary has a form, and one alone, for these values."""
        return len(forms_of(self.operation, self.values)) == 1 and self._identity() is not None

    def header_text(self):
        """The header of values that have a form."""
        header = self.header["begin"] + self._identity() + self.header.get("end", "")
        if "orderDate" in self.header and self.values["orderDate"]:
            header += self.header["orderDate"]
        return self._fill(header)

    def request(self):
        """The request of values that have a form."""
        form = forms_of(self.operation, self.values)[0]
        text = self.header_text() + self._fill(self._pieces(form["body"]))
        return text.replace(" ", "%20") if self.operation.get("blanksEscaped") else text

    def _identity(self):
        rows = self.header["identity"]
        if not rows:
            return ""
        first, second = self._parts("identity")
        order = self.operation["header"].startswith("order")
        if order and not second:
            second = first
        if not order and "&" not in self.values["identity"] and self.values["identity"]:
            return None
        for row in rows:
            if within(row["first"], len(first)) and within(row["second"], len(second)):
                return row["text"]
        return None

    def _parts(self, name):
        limit = IDENTITY_PART if name == "identity" else REFERENCE_PART[self.operation["class"]]
        parts = (self.values[name].split("&") + [""])[:2]
        return [part if len(part) < limit else "" for part in parts]

    def _pieces(self, text):
        pieces = load.by_name(self.whole["pieces"])
        while "<" in text:
            text = re.sub(r"<(\w+)>", lambda m: pieces[m[1]]["text"], text, count=1)
        return text

    def _fill(self, text):
        return re.sub(r"\{(\w+)(?:\|(\w+))?\}", lambda m: self._value(m[1], m[2]), text)

    def _value(self, name, conversion):
        if conversion is not None:
            return getattr(self, "_" + conversion)(name)
        if name == "key":
            return self._fill(self.header["key"])
        if name == "function" and "function" in self.operation:
            return self.operation["function"]
        if name == "combination":
            return self._combination()
        if name == "requestId":
            return REQUEST_ID + f"{int(self.values['seqNo']) % 2**32 % 100:02d}"
        return library.CLOCK.get(name) or self.values[name]

    # The conversions of the dictionary, by their names.

    def _requestKind(self, name):
        futures = 100 if self.operation["class"] == "CGatewayFut" else 0
        return "S" if 0 <= int(self.values[name]) + futures <= 100 else "F"

    def _edition(self, name):
        rows = load.by_name(self.codes["platforms"]["values"], "code")
        row = rows.get(self.values[name])
        return row["wire"] if row else "NO DEFINE"

    def _first(self, name):
        return self._parts(name)[0]

    def _second(self, name):
        return self._parts(name)[1]

    def _secondOrFirst(self, name):
        first, second = self._parts(name)
        return second or first

    def _firstAccount(self, name):
        return f"{number(self._parts(name)[0]):07d}"

    def _secondAccount(self, name):
        return f"{number(self._parts(name)[1]):07d}"

    def _base64(self, name):
        text = self.values[name].encode()
        if len(text) < 3:
            return "===="
        encoded = base64.b64encode(text).decode()
        lines = [encoded[i:i + 1024] for i in range(0, len(encoded), 1024)]
        return "\r\n".join(lines) + ("\r\n" if len(lines[-1]) == 1024 else "")

    def _western(self, name):
        date = number(self.values[name])
        return f"{date + 19110000 if date else 0:08d}"

    def _otherCalendar(self, name):
        date = self.values[name]
        year = {6: 2, 7: 3, 8: 4}[len(date)]
        moved = int(date[:year]) + (-1911 if year == 4 else 1911)
        return f"{moved:04d}"[-4 if year < 4 else 0:].lstrip("0" if year == 4 else "") + date[year:]

    def _shares(self, name):
        odd = self.values["tradeType"] == "2"
        return str(int(self.values[name]) * (1 if odd else int(self.values["unit"])))

    def _hundredths(self, name):
        return _decimal(int(self.values[name]), 2)

    def _changed(self, name):
        return "0" if self.values["tradeType"] == "3" else self.values[name]

    def _limit(self, name):
        if self.values["priceType"] in ("1", "3"):
            return "00000000.000000"
        return _decimal(int(self.values[name]), 4)

    def _fillOrKill(self, name):
        return "1" if self.values[name] == "F" else "0"

    def _immediateOrCancel(self, name):
        return "1" if self.values[name] == "I" else "0"

    def _period(self, name):
        return load.by_name(self.codes["periods"]["values"], "code")[self.values[name]]["wire"]

    def _marginQuery(self, name):
        rows = load.by_name(self.codes["marginQueryTypes"]["values"], "code")
        return rows.get(self.values[name], {"wire": self.values[name]})["wire"]

    def _combination(self):
        """The code of the first row of the table whose words hold."""
        order = self.values
        facts = {
            "futures spread": order["orderKind"] == "4",
            "two options": order["orderKind"] == "3",
            "equal sides": order["side1"] == order["side2"],
            "unlike sides": order["side1"] != order["side2"],
            "one commodity": order["commodity1"] == order["commodity2"],
            "two commodities": order["commodity1"] != order["commodity2"],
            "one call/put": order["callPut1"] == order["callPut2"],
            "call and put": order["callPut1"] != order["callPut2"],
            "one month": order["month1"] == order["month2"],
            "two months": order["month1"] != order["month2"],
        }
        for row in self.codes["combinations"]["values"]:
            if all(facts[word] for word in row["label"].split(", ")):
                return row["code"]
        return ""
