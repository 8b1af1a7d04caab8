// The fuzz target of the exports: each input is one call of one of them.

#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>

#include "tests/fuzz/execution_counts.h"
#include "tests/fuzz/fuzz_call.h"
#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_fuzz {
namespace {

using gateway_tests::AllExports;
using gateway_tests::CRecordingHost;
using gateway_tests::kExportCount;
using gateway_tests::SetClock;
using gateway_tests::TArgument;
using gateway_tests::TArguments;
using gateway_tests::TExport;
using gateway_tests::TOutcome;

/// The entry points, looked up once.
void* s_pEntryPoints[kExportCount];

[[noreturn]] void Broken(const TExport& row, const char* rule, const TOutcome& outcome) {
  std::fprintf(stderr, "%.*s: %s\n", static_cast<int>(row.m_szName.size()), row.m_szName.data(),
               rule);
  for (const std::string& violation : outcome.m_Violations) {
    std::fprintf(stderr, "  %s\n", violation.c_str());
  }
  std::fprintf(stderr, "  result: %s\n", outcome.m_Result.value_or("(null)").c_str());
  std::abort();
}

bool StartsWith(std::string_view text, std::string_view start) {
  return text.substr(0, start.size()) == start;
}

bool EndsWith(std::string_view text, std::string_view end) {
  return text.size() >= end.size() && text.substr(text.size() - end.size()) == end;
}

/// Length of the last argument, a text: a reply, or the message of a certificate.
size_t LastTextSize(const TArguments& arguments) {
  const TArgument& last = arguments.back();
  return last.m_Text.has_value() ? last.m_Text->size() : 0;
}

/// Characters that the result may have at most.
size_t ResultBound(const TExport& row, const TArguments& arguments) {
  constexpr size_t kRequest = 4095;
  if (row.IsDecoder()) return kRequest + 8 * LastTextSize(arguments);
  // Four characters of Base64 for three of the message, and a line end behind every 1024.
  if (row.m_szName == "RegisterCertEncode") return kRequest + 2 * LastTextSize(arguments);
  return kRequest;
}

/// What holds for every answer. That the result ends, and is not the host's own text, is seen by
/// the address sanitizer when the host copies it: the strings were released before.
void CheckAnswer(const TExport& row, const TArguments& arguments, const TOutcome& outcome) {
  if (!outcome.IsSound()) Broken(row, "the call is not sound", outcome);
  const std::string& result = *outcome.m_Result;
  if (result.size() > ResultBound(row, arguments)) Broken(row, "the result is too long", outcome);
  if (row.IsDecoder() || !row.HasStatus()) return;
  const bool request = StartsWith(result, "F=");
  if (outcome.m_Status == 1 && !request) Broken(row, "no request, and status 1", outcome);
  // A message stands alone, or, for futures orders, behind the header.
  if (outcome.m_Status == -1 && request && !EndsWith(result, "[CLIENT]傳入的參數錯誤")) {
    Broken(row, "a request, and status -1", outcome);
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
  const TFuzzCall call = ReadCall(FuzzRows(), data, size);
  const TExport& row = AllExports()[call.m_nRow];
  SetClock(static_cast<std::time_t>(call.Clock()));
  CRecordingHost host;
  const TOutcome first = host.CallAt(s_pEntryPoints[call.m_nRow], row, call.m_Arguments);
  CheckAnswer(row, call.m_Arguments, first);
  const TOutcome second = host.CallAt(s_pEntryPoints[call.m_nRow], row, call.m_Arguments);
  if (second.m_Events != first.m_Events || second.m_Status != first.m_Status) {
    Broken(row, "the same call answers differently", second);
  }
  CountExecution(call.m_nRow);
  return 0;
}
