// The fuzz target of the decoders: each input is a reply, decoded as it is and once more as the
// plain readers see it: the values that the dictionary's tables name, in their order, and nothing
// else. Both must come out alike, however the reply is arranged. A bound that is too large is seen
// so; one too small is not, for it treats both alike: the cases of tests/vectors at the bounds do.

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string_view>

#include "tests/fuzz/execution_counts.h"
#include "tests/fuzz/fuzz_call.h"
#include "tests/fuzz/lean_host.h"
#include "tests/fuzz/lent_memory.h"
#include "tests/fuzz/plain_reader.h"
#include "tests/fuzz/reply_tables.h"
#include "tests/support/surroundings.h"

namespace gateway_fuzz {
namespace {

using gateway_tests::AllExports;
using gateway_tests::Export;
using gateway_tests::kExportCount;

constexpr size_t kNowhere = std::string_view::npos;
constexpr size_t kDecoders = sizeof kTables / sizeof *kTables;

Export s_rows[kDecoders];
void* s_pEntryPoints[kDecoders];

// The reply that says the same plainly.
class CPlainReply {
 public:
  CPlainReply(const Table& table, std::string_view reply) {
    const Field* open = nullptr;
    for (const Field* field = table.head; field->tag != nullptr; ++field) {
      // One that is missing is told to be, or it would be found in a record.
      const PlainToken token = Read(*field, reply);
      Put(*field, token);
      if (!token.text.empty() && token.text != " ") continue;
      // One text is read both ways: as it stands, and without the blank ones before it.
      const PlainToken next = Read({field->tag, field->bound, true}, reply);
      if (next.text == " ") {
        open = field;  // stands for itself at the end of a reply alone
      } else if (next.length > 0) {
        Put(*field, next);
      }
    }
    if (open == nullptr) Put("|");
    if (table.record[0].tag != nullptr) PutRecords(table, reply);
    if (open != nullptr) Put(*open, {" ", 1});
  }

  std::string_view Text() const { return {m_chText, m_nSize}; }

 private:
  static PlainToken Read(const Field& field, std::string_view text) {
    const size_t bound = field.bound == kUnbounded ? SIZE_MAX : field.bound;
    return ReadPlainToken(field.tag, text, bound, field.skipBlank);
  }

  void PutRecords(const Table& table, std::string_view reply) {
    const size_t bound = table.recordSize == kUnbounded ? SIZE_MAX : table.recordSize;
    if (table.onlyFirst) return PutRecord(table, ReadPlainRecord(reply, 0, bound).text);
    size_t pos = 0;
    std::string_view record;
    while (PlainNextRecord(reply, bound, pos, record)) {
      PutRecord(table, record);
      if (record.empty() ? table.endsAtEmptyRecord : EndsList(table, record)) return;
    }
  }

  static bool EndsList(const Table& table, std::string_view record) {
    if (table.endMark == 0) return false;
    const Field* field = table.record;
    while (std::string_view(field->tag) != "67") ++field;
    return Number(Read(*field, record).text) >= table.endMark;
  }

  void PutRecord(const Table& table, std::string_view record) {
    if (record.empty()) return Put("|01=");  // a closing mark alone is such a one
    Put("|00=");
    const Field* blank = nullptr;
    for (const Field* field = table.record; field->tag != nullptr; ++field) {
      const PlainToken token = Read(*field, record);
      if (token.length == 0) continue;
      if (field->skipBlank && token.text == " ") {
        blank = field;  // stands for itself at the end of a record alone
      } else {
        Put(*field, token);
      }
    }
    if (blank != nullptr) Put(*blank, {" ", 1});
    Put("|01=1");
  }

  void Put(const Field& field, const PlainToken& token) {
    Put("|");
    Put(field.tag);
    Put("=");
    Put(token.text);
    // A value that does not fit its buffer is not the same as none.
    for (size_t i = token.text.size(); i < token.length; ++i) Put("#");
  }

  void Put(std::string_view text) {
    if (text.size() > sizeof m_chText - m_nSize) std::abort();
    if (!text.empty()) std::memcpy(m_chText + m_nSize, text.data(), text.size());
    m_nSize += text.size();
  }

  // As C reads a number: saturating in 64 bits, then the lower 32 of them.
  static int Number(std::string_view text) {
    char digits[32] = {};
    text.copy(digits, sizeof digits - 1);
    return static_cast<int>(static_cast<unsigned>(std::strtoll(digits, nullptr, 10)));
  }

  size_t m_nSize = 0;
  char m_chText[size_t{1} << 17];
};

[[noreturn]] void Different(const Table& table, std::string_view reply, std::string_view plain,
                            const Answer& read, const Answer& wanted) {
  const auto print = [](const char* what, std::string_view text) {
    std::fprintf(stderr, "  %s [%.*s]\n", what, static_cast<int>(text.size()), text.data());
  };
  std::fprintf(stderr, "%s reads a reply otherwise than the tables say\n", table.decoder);
  print("reply ", reply);
  print("plain ", plain);
  print("result", read.result);
  print("plain ", wanted.result);
  std::fprintf(stderr, "  status %d, plain %d\n", read.status, wanted.status);
  std::abort();
}

// The answer to a reply that never came; null for one that is to be read.
const Failure* FailureOf(const Table& table, std::string_view reply) {
  if (reply.empty()) return &table.failures[2];
  const PlainTransport transport = JudgePlainTransport(reply);
  if (transport == PlainTransport::kOk) return nullptr;
  const Failure& failure = table.failures[transport == PlainTransport::kGatewayDown ? 0 : 1];
  // Some decoders do not look, and read what is there.
  return PlainFind(failure.text, "主機連線失敗", 0) != kNowhere ? &failure : nullptr;
}

void CheckReply(FuzzCall call) {
  static CLeanHost s_Host;
  static CLeanHost s_PlainHost;
  const Table& table = kTables[call.row];
  FuzzArgument& argument = call.arguments[call.argumentCount - 1];
  argument.null = false;
  const std::string_view reply = argument.text;
  const Answer read = s_Host.Call(s_pEntryPoints[call.row], s_rows[call.row], call);

  Answer wanted{};
  const Failure* const failure = FailureOf(table, reply);
  if (failure != nullptr) {
    wanted.status = failure->status;
    wanted.result = failure->text;
    if (!SameText(read.result, wanted.result) || read.status != wanted.status) {
      Different(table, reply, {}, read, wanted);
    }
    return;
  }
  const CPlainReply plain(table, reply);
  argument.text = plain.Text();
  wanted = s_PlainHost.Call(s_pEntryPoints[call.row], s_rows[call.row], call);
  if (!SameText(read.result, wanted.result) || read.status != wanted.status) {
    Different(table, reply, plain.Text(), read, wanted);
  }
}

}  // namespace

Rows FuzzRows() {
  return {s_rows, kDecoders};
}

}  // namespace gateway_fuzz

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  using namespace gateway_fuzz;
  gateway_tests::EnterMarketTimeZone();
  for (size_t row = 0; row < kDecoders; ++row) {
    s_rows[row] = *gateway_tests::FindExport(kTables[row].decoder);
    s_pEntryPoints[row] = s_rows[row].EntryPoint();
  }
  OpenCounts();
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  using namespace gateway_fuzz;
  if (size > kMaxInput) return 0;
  const FuzzCall call = ReadCall(FuzzRows(), data, size);
  gateway_tests::SetClock(static_cast<std::time_t>(call.Clock()));
  CheckReply(call);
  CountExecution(call.row);
  return 0;
}
