// The fuzz target of the reply readers: the tokenizers and the record index against the plain
// reader, on memory of the reply's exact size.

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <iterator>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "gateway/core/gateway_pub.h"
#include "gateway/core/reply_reader.h"
#include "tests/fuzz/execution_counts.h"
#include "tests/fuzz/fuzz_call.h"
#include "tests/fuzz/plain_reader.h"

namespace gateway_fuzz {
namespace {

using gateway_tests::TArguments;
using gateway_tests::TExport;

/// An input's arguments: a choice of bound, whether blanks are skipped, a tag, the reply.
constexpr TExport kReaders = {"Readers", "bbSS", nullptr, 0};

constexpr size_t kBounds[] = {1, 2, 3, 5, 8, 16, 20, 40, 64, 128, 200, 218, 400, 512, 1024, 8192};

/// The marks of a record, "00" and "01", are no fields of it.
const char* const kRowTags[] = {"67", "68", "M2", "17", "751", "75", "W5", "18", "M22"};
constexpr CTagTable kTable({{"67"},
                            {"68", Blanks::kSkipped},
                            {"M2"},
                            {"17", Blanks::kSkipped},
                            {"751", Blanks::kSkipped},
                            {"75"},
                            {"W5"},
                            {"18", Blanks::kSkipped},
                            {"M22"}});

[[noreturn]] void Different(const char* what, std::string_view read, std::string_view plain) {
  std::fprintf(stderr, "%s:\n  read  [%.*s]\n  plain [%.*s]\n", what, static_cast<int>(read.size()),
               read.data(), static_cast<int>(plain.size()), plain.data());
  std::abort();
}

void Expect(const char* what, std::string_view read, std::string_view plain) {
  if (read != plain) Different(what, read, plain);
}
void ExpectNumber(const char* what, size_t read, size_t plain) {
  if (read != plain) Different(what, std::to_string(read), std::to_string(plain));
}

/// A text in a heap block that ends with its terminator.
using TBlock = std::unique_ptr<char[]>;
TBlock Copy(const std::string& text) {
  TBlock block(new char[text.size() + 1]);
  std::memcpy(block.get(), text.c_str(), text.size() + 1);
  return block;
}

/// A buffer of `size` bytes that was used before.
TBlock Buffer(size_t size) {
  TBlock block(new char[size]);
  std::memset(block.get(), '#', size);
  return block;
}

void CheckToken(const std::string& tag, const std::string& reply, size_t bound, bool skipBlank) {
  CGatewayPub gateway;
  const TBlock text = Copy(reply);
  const TBlock out = Buffer(bound);
  const int length =
      gateway.GetToken(tag.c_str(), text.get(), out.get(), static_cast<int>(bound), skipBlank);
  const TPlainToken plain = PlainToken(tag, reply, bound, skipBlank);
  Expect("GetToken", out.get(), plain.m_Text);
  ExpectNumber("GetToken's length", static_cast<size_t>(length), plain.m_nLength);
  Expect("GetToken's reply", text.get(), reply);
}

void CheckSubStrings(const std::string& reply, size_t bound) {
  CGatewayPub gateway;
  const TBlock text = Copy(reply);
  const TBlock out = Buffer(bound);
  int pos = 0;
  for (int turn = 0; turn < 64 && static_cast<size_t>(pos) < reply.size(); ++turn) {
    const TPlainRecord plain = PlainRecord(reply, static_cast<size_t>(pos), bound);
    gateway.GetSubString(text.get(), pos, out.get(), static_cast<int>(bound));
    Expect("GetSubString", out.get(), plain.m_Text);
    ExpectNumber("GetSubString's place", static_cast<size_t>(pos), plain.m_nNext);
  }
}

void CheckRecords(const std::string& reply, size_t bound, size_t valueBound) {
  const TBlock text(new char[reply.size()]);  // the walker needs no terminator
  std::copy(reply.begin(), reply.end(), text.get());
  CRecordWalker walker({text.get(), reply.size()}, bound);
  CRecord record(kTable);
  for (const std::string& plain : PlainRecords(reply, bound)) {
    if (!walker.Next(record)) Different("the walk ends early", "", plain);
    ExpectNumber("an empty record", record.Empty() ? 1 : 0, plain.empty() ? 1 : 0);
    for (int row = 0; row < static_cast<int>(std::size(kRowTags)); ++row) {
      const TPlainToken token =
          PlainToken(kRowTags[row], plain, valueBound, kTable.SkipsBlanks(row));
      Expect(kRowTags[row], record.Text(row, valueBound), token.m_Text);
      ExpectNumber(kRowTags[row], record.Has(row) ? 1 : 0, token.m_nLength > 0 ? 1 : 0);
    }
  }
  if (walker.Next(record)) Different("the walk goes on", record.Text(8, 99), "");
  if (!record.Empty()) Different("the end is an empty record", record.Text(8, 99), "");
}

void CheckFields(const std::string& reply, const std::string& separator, size_t bound) {
  if (separator.empty()) return;
  CGatewayPub gateway;
  const TBlock text = Copy(reply);
  const TBlock out = Buffer(bound);
  char* cursor = text.get();
  TPlainField plain = {"", reply};
  for (int turn = 0; turn < 16 && !plain.m_Rest.empty(); ++turn) {
    plain = PlainField(plain.m_Rest, separator);
    out[0] = '\0';
    gateway.GetFieldString(&cursor, separator.c_str(), out.get(), static_cast<int>(bound));
    Expect("GetFieldString", out.get(), PlainBounded(plain.m_Text, bound));
    Expect("GetFieldString's rest", cursor, plain.m_Rest);
  }
}

/// A part of an identity field as its buffer holds it: one that does not fit leaves it as it was.
std::string PartOf(const std::string& part, size_t bound) {
  return part.empty() || part.size() >= bound ? "old" : part;
}

void CheckIdentity(const std::string& field, size_t bound) {
  if (bound < sizeof "old") return;
  CGatewayPub gateway;
  const TBlock text = Copy(field);
  const TBlock first = Buffer(bound);
  const TBlock second = Buffer(bound);
  std::strcpy(first.get(), "old");
  std::strcpy(second.get(), "old");
  const int size = static_cast<int>(bound);
  const int found =
      gateway.SeparateDataFromUiField(text.get(), first.get(), size, second.get(), size);
  const size_t at = field.find('&');
  ExpectNumber("an identity field", found != 0 ? 1 : 0, at == std::string::npos ? 0 : 1);
  const bool split = at != std::string::npos;
  Expect("its first part", first.get(), split ? PartOf(field.substr(0, at), bound) : "old");
  Expect("its second part", second.get(), split ? PartOf(field.substr(at + 1), bound) : "old");
}

void CheckTransport(const std::string& reply) {
  CGatewayPub gateway;
  const TBlock text = Copy(reply);
  char message[64] = "old";
  int status = 1;
  gateway.CheckError(text.get(), &status, message, sizeof message);
  const EPlainTransport plain = PlainTransport(reply);
  const char* const expected = plain == EPlainTransport::kOk            ? ""
                               : plain == EPlainTransport::kGatewayDown ? "[GATEWAY]主機連線失敗"
                                                                        : "[BROKER]主機連線失敗";
  Expect("CheckError", message, expected);
  ExpectNumber("CheckError's status", status == -1 ? 1 : 0, *expected == '\0' ? 0 : 1);
}

void CheckReply(const TArguments& arguments) {
  const size_t bound = kBounds[static_cast<size_t>(arguments[0].m_nNumber & 15)];
  const size_t valueBound = kBounds[static_cast<size_t>(arguments[0].m_nNumber >> 4 & 15)];
  const bool skipBlank = (arguments[1].m_nNumber & 1) != 0;
  const std::string tag = arguments[2].m_Text.value_or("");
  const std::string reply = arguments[3].m_Text.value_or("");
  // What has a bar in it is no tag.
  if (tag.find('|') == std::string::npos) CheckToken(tag, reply, valueBound, skipBlank);
  CheckToken("68", reply, valueBound, skipBlank);
  CheckSubStrings(reply, bound);
  CheckRecords(reply, bound, valueBound);
  CheckFields(reply, tag, valueBound);
  CheckIdentity(reply, valueBound);
  CheckTransport(reply);
}

}  // namespace

TRows FuzzRows() {
  return {&kReaders, 1};
}

}  // namespace gateway_fuzz

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  gateway_fuzz::OpenCounts();
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  using namespace gateway_fuzz;
  const TFuzzCall call = ReadCall(FuzzRows(), data, size);
  CheckReply(call.m_Arguments);
  CountExecution(0);
  return 0;
}
