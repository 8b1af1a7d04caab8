"""What it takes to add to the protocol: a pair of operations, and a tag of a list, each in a copy of
the tree, by the steps of CONTRIBUTING.md; then the generator and the checks."""

import json

from generator import layout

from . import library
from .workshop import Workshop

PAIR_FILES = 8
TAG_FILES = 4
GOLDEN_FILES = 1  # which the copy does not play

LIMIT = '''// The trading limit of an account.
//
//   request  header |FUNC=19|29=code|01=
//   record   |67=sequence|68=code|29=code|70=limit
//   result   count ! ( 29 @ 70 ! )*
#include "gateway/core/messages.h"
#include "gateway/stock/gateway_stk.h"
#include "gateway/stock/stock_list.h"

namespace {

enum Field { kStockCode = kOwnFields, kOrderedQuantity };

constexpr TagRow kRows[] = {{kSequence, "67", 20},
                            {kResultCode, "68", 20},
                            {kMessage, "M2", kRecord},
                            {kStockCode, "29", 50},
                            {kOrderedQuantity, "70", 50}};
constexpr CListTable kTags(kRows, kStockList);

}  // namespace

char* CGatewayStk::QueryLimitEncode(const char* branch, const char* identity, const char* password,
                                    const char* stockCode, int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.Append(WIRE("|FUNC=19|29=%s|01="), stockCode);
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayStk::QueryLimitDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  if (TransportFailed(text, status)) return m_szBuffer;
  CReplyList limits(text, kTags);
  if (char* const answer = AnswerWithoutData(limits, "0!", status)) return answer;
  CResultText list({m_pData, m_nDataSize, m_nDataLen}, text.size());
  int count = 0;
  for (; limits.NextData(); ++count) {
    list.Append(WIRE("%s@%d!"), limits.Record().Text(kStockCode),
                limits.Record().Number(kOrderedQuantity));
  }
  return FinishList(list, count, status);
}
'''

METHODS = '''  char* QueryLimitEncode(const char* branch, const char* identity, const char* password,
                         const char* stockCode, int* status);
  char* QueryLimitDecode(const char* reply, int* status);

 private:
'''

EXPORTS = '''
ENCODER(QueryLimitEncode, CGatewayStk::QueryLimitEncode, (LOGIN_PARAMETERS, jstring stockCode),
        LOGIN, stockCode)
DECODER(QueryLimitDecode, CGatewayStk::QueryLimitDecode)
'''

def run(_, __, ___):
    found = library.Findings()
    with Workshop() as copy:
        said = copy.build()
        if found.expect(not said, f"the copy does not build: {said[:500]}"):
            _grow(found, copy, _add_tag, TAG_FILES)
            _grow(found, copy, _add_pair, PAIR_FILES)
    return found.finish("growth")


def _grow(found, copy, add, most):
    """The steps by hand, the generator, the checks."""
    before = copy.contents()
    add(copy)
    touched = [path for path, text in copy.contents().items() if before.get(path) != text]
    found.expect(len(touched) + GOLDEN_FILES <= most,
                 f"{add.__name__} touches {touched} and its golden cases")
    stale = copy.generate("--check")
    found.expect(stale.returncode == 1, f"{add.__name__}: nothing that is generated is stale")
    copy.generate()
    settled = copy.generate("--check")
    found.expect(settled.returncode == 0, f"{add.__name__}: {settled.stdout[:300]}")
    said = copy.build()
    found.expect(not said, f"{add.__name__} does not build: {said[:500]}")
    said = copy.compile_client()
    found.expect(not said, f"{add.__name__}, the Java client: {said[:500]}")
    for check in ("schema", "sources", "requests", "replies", "codes", "logs"):
        said = copy.check(check, {"DICTIONARY_ONLY": "QueryLimit|QueryOrder"})
        found.expect(not said, f"{add.__name__}, {check}: {said[-500:]}")


def _rows(copy, path):
    return json.loads(copy.read(path))


def _add_pair(copy):
    """A query of a limit and its answer."""
    operations = _rows(copy, "dictionary/operations.json")
    model = {one["name"]: one for one in operations["operations"]}
    encoder = dict(model["QueryCreditInfoEncode"], name="QueryLimitEncode",
                   method="QueryLimitEncode", scene="stockList", title="trading limit",
                   forms=[{"body": "|FUNC=19|29={stockCode}|01="}],
                   answeredBy=["QueryLimitDecode"])
    decoder = dict(model["QueryCreditInfoDecode"], name="QueryLimitDecode",
                   method="QueryLimitDecode", scene="stockList", title="trading limit", details=[])
    operations["operations"] += [encoder, decoder]
    copy.write("dictionary/operations.json", layout.text(operations))

    replies = _rows(copy, "dictionary/replies.json")
    model = next(one for one in replies["replies"] if one["decoder"] == "QueryReplyDecode")
    record = dict(model["record"])
    record["tags"] = record["tags"][:3] + [{"tag": "29", "bound": 50}, {"tag": "70", "bound": 50}]
    columns = [
        {"at": 0, "name": "stockCode", "form": "text", "tags": ["29"], "meaning": "stock code"},
        {"at": 1, "name": "orderedQuantity", "form": "count", "tags": ["70"], "meaning": "limit"}]
    replies["replies"].append(dict(model, decoder="QueryLimitDecode", record=record,
                                   exampleResult="1!2330@5000!",
                                   tables=[{"name": "limit", "columns": columns}]))
    copy.write("dictionary/replies.json", layout.text(replies))

    copy.replace("gateway/stock/gateway_stk.h", "\n private:\n", "\n" + METHODS)
    copy.write("gateway/stock/limit.cpp", LIMIT)
    exports = copy.read("jni/gatewayjni_stk.cpp")
    copy.write("jni/gatewayjni_stk.cpp", exports + EXPORTS)


def _add_tag(copy):
    """One more column of the stock order book."""
    tags = _rows(copy, "dictionary/tags.json")
    group = next(one for one in tags["groups"] if one["name"] == "stockList")
    group["tags"].append({"tag": "Z7", "name": "flagZ7", "label": "Z7 flag", "example": "7"})
    copy.write("dictionary/tags.json", layout.text(tags))

    replies = _rows(copy, "dictionary/replies.json")
    book = next(one for one in replies["replies"] if one["decoder"] == "QueryOrderDecode")
    book["exampleResult"] = book["exampleResult"][:-1] + "@7!"
    book["record"]["tags"].append({"tag": "Z7", "bound": 50})
    book["tables"][0]["columns"].append(
        {"at": 14, "name": "flagZ7", "form": "text", "tags": ["Z7"], "meaning": "Z7 flag"})
    copy.write("dictionary/replies.json", layout.text(replies))

    path = "gateway/stock/order_book.cpp"
    copy.replace(path, "  kChangeable\n};", "  kChangeable,\n  kFlagZ7\n};")
    copy.replace(path, '{kChangeable, "JV", 50}};', '{kChangeable, "JV", 50},\n    {kFlagZ7, "Z7", 50}};')
    copy.replace(path, '"@%s@%s@%s@%s@%s!"', '"@%s@%s@%s@%s@%s@%s!"')
    copy.replace(path, "!message.empty()));", "!message.empty()), record.Text(kFlagZ7));")
