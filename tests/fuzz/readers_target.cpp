// The fuzz target of the reply readers: the tokenizers and the record index against the plain
// reader, on memory of the reply's exact size.

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <iterator>
#include <string>
#include <string_view>

#include "gateway/core/gateway_pub.h"
#include "gateway/core/reply_reader.h"
#include "tests/fuzz/execution_counts.h"
#include "tests/fuzz/fuzz_call.h"
#include "tests/fuzz/lent_memory.h"
#include "tests/fuzz/plain_reader.h"

namespace gateway_fuzz {
namespace {

using gateway_tests::Export;

// An input's arguments: a choice of bound, whether blanks are skipped, a tag, the reply.
constexpr Export kReaders = {"Readers", "bbSS", "bound skipBlank tag reply", nullptr, 0};

constexpr size_t kBounds[] = {1, 2, 3, 5, 8, 16, 20, 40, 64, 128, 200, 218, 400, 512, 1024, 8192};

// The marks of a record, "00" and "01", are no fields of it.
constexpr TagRow kRows[] = {{0, "67", 8},
                            {1, "68", 5, Blanks::kSkipped},
                            {2, "M2", 40},
                            {3, "17", 3, Blanks::kSkipped},
                            {4, "751", 2, Blanks::kSkipped},
                            {5, "75", 16},
                            {6, "W5", kUnbounded},
                            {7, "18", 1, Blanks::kSkipped},
                            {8, "M22", 64}};
constexpr CTagTable kTable(kRows);

[[noreturn]] void Different(const char* what, std::string_view read, std::string_view plain) {
  std::fprintf(stderr, "%s:\n  read  [%.*s]\n  plain [%.*s]\n", what, static_cast<int>(read.size()),
               read.data(), static_cast<int>(plain.size()), plain.data());
  std::abort();
}

void Expect(const char* what, std::string_view read, std::string_view plain) {
  if (!SameText(read, plain)) Different(what, read, plain);
}
void ExpectNumber(const char* what, size_t read, size_t plain) {
  if (read != plain) Different(what, std::to_string(read), std::to_string(plain));
}

void CheckToken(std::string_view tag, std::string_view reply, size_t bound, bool skipBlank) {
  CGatewayPub gateway;
  const CLent lentTag(tag);
  const CLent text(reply);
  const CLent out(bound);
  const int length =
      gateway.GetToken(lentTag.get(), text.get(), out.get(), static_cast<int>(bound), skipBlank);
  const PlainToken plain = ReadPlainToken(tag, reply, bound, skipBlank);
  Expect("GetToken", out.get(), plain.text);
  ExpectNumber("GetToken's length", static_cast<size_t>(length), plain.length);
  Expect("GetToken's reply", text.get(), reply);
}

void CheckSubStrings(std::string_view reply, size_t bound) {
  CGatewayPub gateway;
  const CLent text(reply);
  const CLent out(bound);
  int pos = 0;
  for (int turn = 0; turn < 16 && static_cast<size_t>(pos) < reply.size(); ++turn) {
    const PlainRecord plain = ReadPlainRecord(reply, static_cast<size_t>(pos), bound);
    gateway.GetSubString(text.get(), pos, out.get(), static_cast<int>(bound));
    Expect("GetSubString", out.get(), plain.text);
    ExpectNumber("GetSubString's place", static_cast<size_t>(pos), plain.next);
  }
}

void CheckRecord(const CRecord& record, std::string_view plain) {
  ExpectNumber("an empty record", record.Empty() ? 1 : 0, plain.empty() ? 1 : 0);
  for (const TagRow& row : kRows) {
    const PlainToken token =
        ReadPlainToken(row.tag, plain, row.bound, row.blanks == Blanks::kSkipped);
    Expect(row.tag, record.Text(row.field), token.text);
    ExpectNumber(row.tag, record.Has(row.field) ? 1 : 0, token.length > 0 ? 1 : 0);
  }
}

void CheckRecords(std::string_view reply, size_t bound) {
  const CLent text(reply, CLent::End::kBare);  // the walker needs no terminator
  CRecordWalker walker({text.get(), reply.size()}, bound);
  CRecord record(kTable);
  size_t pos = 0;
  std::string_view plain;
  while (PlainNextRecord(reply, bound, pos, plain)) {
    if (!walker.Next(record)) Different("the walk ends early", "", plain);
    CheckRecord(record, plain);
  }
  if (walker.Next(record)) Different("the walk goes on", record.Text(8), "");
  if (!record.Empty()) Different("the end is an empty record", record.Text(8), "");
}

void CheckFields(std::string_view reply, std::string_view separator, size_t bound) {
  if (separator.empty()) return;
  CGatewayPub gateway;
  const CLent text(reply);
  const CLent lentSeparator(separator);
  const CLent out(bound);
  char* cursor = text.get();
  PlainField plain = {"", reply};
  for (int turn = 0; turn < 16 && !plain.rest.empty(); ++turn) {
    plain = ReadPlainField(plain.rest, separator);
    out.get()[0] = '\0';
    gateway.GetFieldString(&cursor, lentSeparator.get(), out.get(), static_cast<int>(bound));
    Expect("GetFieldString", out.get(), PlainBounded(plain.text, bound));
    Expect("GetFieldString's rest", cursor, plain.rest);
  }
}

// A part of an identity field as its buffer holds it: one that does not fit leaves it as it was.
std::string_view PartOf(std::string_view part, size_t bound) {
  return part.empty() || part.size() >= bound ? "old" : part;
}

void CheckIdentity(std::string_view field, size_t bound) {
  if (bound < sizeof "old") return;
  CGatewayPub gateway;
  const CLent text(field);
  const CLent first(bound);
  const CLent second(bound);
  std::strcpy(first.get(), "old");
  std::strcpy(second.get(), "old");
  const int size = static_cast<int>(bound);
  const int found =
      gateway.SeparateDataFromUiField(text.get(), first.get(), size, second.get(), size);
  const size_t at = PlainFind(field, "&", 0);
  const bool split = at != std::string_view::npos;
  ExpectNumber("an identity field", found != 0 ? 1 : 0, split ? 1 : 0);
  Expect("its first part", first.get(), split ? PartOf(field.substr(0, at), bound) : "old");
  Expect("its second part", second.get(), split ? PartOf(field.substr(at + 1), bound) : "old");
}

void CheckTransport(std::string_view reply) {
  CGatewayPub gateway;
  const CLent text(reply);
  char message[64] = "old";
  int status = 1;
  gateway.CheckError(text.get(), &status, message, sizeof message);
  const PlainTransport plain = JudgePlainTransport(reply);
  const char* const expected = plain == PlainTransport::kOk            ? ""
                               : plain == PlainTransport::kGatewayDown ? "[GATEWAY]主機連線失敗"
                                                                       : "[BROKER]主機連線失敗";
  Expect("CheckError", message, expected);
  ExpectNumber("CheckError's status", status == -1 ? 1 : 0, *expected == '\0' ? 0 : 1);
}

void CheckReply(const FuzzCall& call) {
  const FuzzArgument* const arguments = call.arguments;
  const size_t bound = kBounds[static_cast<size_t>(arguments[0].number & 15)];
  const size_t valueBound = kBounds[static_cast<size_t>(arguments[0].number >> 4 & 15)];
  const bool skipBlank = (arguments[1].number & 1) != 0;
  const std::string_view tag = arguments[2].text;
  const std::string_view reply = arguments[3].text;
  // What has a bar in it is no tag.
  if (PlainFind(tag, "|", 0) == std::string_view::npos) {
    CheckToken(tag, reply, valueBound, skipBlank);
  }
  CheckToken("68", reply, valueBound, skipBlank);
  CheckSubStrings(reply, bound);
  CheckRecords(reply, bound);
  CheckFields(reply, tag, valueBound);
  CheckIdentity(reply, valueBound);
  CheckTransport(reply);
}

}  // namespace

Rows FuzzRows() {
  return {&kReaders, 1};
}

}  // namespace gateway_fuzz

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  gateway_fuzz::OpenCounts();
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  using namespace gateway_fuzz;
  if (size > kMaxInput) return 0;
  CheckReply(ReadCall(FuzzRows(), data, size));
  CountExecution(0);
  return 0;
}
