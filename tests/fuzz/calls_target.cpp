// The fuzz target of the exports: each input is one call of one of them.

#include <cstdio>
#include <cstdlib>
#include <optional>
#include <string>
#include <string_view>

#include "tests/fuzz/execution_counts.h"
#include "tests/fuzz/fuzz_call.h"
#include "tests/fuzz/lean_host.h"
#include "tests/fuzz/lent_memory.h"
#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_fuzz {
namespace {

using gateway_tests::AllExports;
using gateway_tests::kExportCount;
using gateway_tests::SetClock;
using gateway_tests::TArgument;
using gateway_tests::TArguments;
using gateway_tests::TExport;

/// The entry points, looked up once.
void* s_pEntryPoints[kExportCount];

/// Prints what the call does in a host that keeps all of it.
void PrintRecord(const TFuzzCall& call) {
  TArguments arguments;
  for (const TFuzzArgument& argument : call) {
    TArgument copy{argument.m_chLetter, argument.m_nNumber, std::nullopt};
    if (argument.m_chLetter == 'S' && !argument.m_bNull) copy.m_Text = argument.m_Text;
    arguments.push_back(copy);
  }
  const gateway_tests::TOutcome outcome = gateway_tests::CRecordingHost().CallAt(
      s_pEntryPoints[call.m_nRow], AllExports()[call.m_nRow], arguments);
  for (const std::string& event : outcome.m_Events) std::fprintf(stderr, "  %s\n", event.c_str());
  std::fprintf(stderr, "  status %d\n", outcome.m_Status.value_or(0));
}

[[noreturn]] void Broken(const TFuzzCall& call, const char* rule, const TAnswer& answer) {
  const std::string_view name = AllExports()[call.m_nRow].m_szName;
  std::fprintf(stderr, "%.*s: %s\nresult: %.*s\n", static_cast<int>(name.size()), name.data(), rule,
               static_cast<int>(answer.m_Result.size()), answer.m_Result.data());
  for (const char* const turn : {"first", "second"}) {
    std::fprintf(stderr, "the call, a %s time in the recording host:\n", turn);
    PrintRecord(call);
  }
  std::abort();
}

bool StartsWith(std::string_view text, std::string_view start) {
  return text.substr(0, start.size()) == start;
}

bool EndsWith(std::string_view text, std::string_view end) {
  return text.size() >= end.size() && text.substr(text.size() - end.size()) == end;
}

/// Characters that the result may have at most. The last argument may be a text: a reply, or the
/// message of a certificate.
size_t ResultBound(const TExport& row, const TFuzzCall& call) {
  constexpr size_t kRequest = 4095;
  const size_t text = call.m_Arguments[call.m_nArguments - 1].m_Text.size();
  if (row.IsDecoder()) return kRequest + 8 * text;
  // Four characters of Base64 for three of the message, and a line end behind every 1024.
  if (row.m_szName == "RegisterCertEncode") return kRequest + 2 * text;
  return kRequest;
}

/// What holds for every answer.
void CheckAnswer(const TExport& row, const TFuzzCall& call, const TAnswer& answer) {
  if (answer.m_szViolation != nullptr) Broken(call, answer.m_szViolation, answer);
  const std::string_view result = answer.m_Result;
  if (result.size() > ResultBound(row, call)) Broken(call, "the result is too long", answer);
  if (row.IsDecoder() || !row.HasStatus()) return;
  const bool request = StartsWith(result, "F=");
  if (answer.m_nStatus == 1 && !request) Broken(call, "no request, and status 1", answer);
  // A message stands alone, or, for futures orders, behind the header.
  if (answer.m_nStatus == -1 && request && !EndsWith(result, "[CLIENT]傳入的參數錯誤")) {
    Broken(call, "a request, and status -1", answer);
  }
}

}  // namespace

TRows FuzzRows() {
  return {AllExports(), kExportCount};
}

}  // namespace gateway_fuzz

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  using namespace gateway_fuzz;
  gateway_tests::EnterMarketTimeZone();
  for (size_t row = 0; row < kExportCount; ++row) {
    s_pEntryPoints[row] = AllExports()[row].EntryPoint();
  }
  OpenCounts();
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  using namespace gateway_fuzz;
  static CLeanHost s_Host;
  if (size > kMaxInput) return 0;
  const TFuzzCall call = ReadCall(FuzzRows(), data, size);
  const TExport& row = AllExports()[call.m_nRow];
  void* const entryPoint = s_pEntryPoints[call.m_nRow];
  SetClock(static_cast<std::time_t>(call.Clock()));
  const TAnswer first = s_Host.Call(entryPoint, row, call);
  CheckAnswer(row, call, first);
  const TAnswer second = s_Host.Call(entryPoint, row, call);
  CheckAnswer(row, call, second);
  if (second.m_nDigest != first.m_nDigest) {
    Broken(call, "the same call answers differently", second);
  }
  CountExecution(call.m_nRow);
  return 0;
}
