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
using gateway_tests::Argument;
using gateway_tests::Arguments;
using gateway_tests::Export;
using gateway_tests::kExportCount;
using gateway_tests::SetClock;

// One call in so many is made twice, and must do the same again.
constexpr unsigned kTwice = 4;

// The entry points, looked up once.
void* s_pEntryPoints[kExportCount];

// Prints what the call does in a host that keeps all of it.
void PrintRecord(const FuzzCall& call) {
  Arguments arguments;
  for (const FuzzArgument& argument : call) {
    Argument copy{argument.letter, argument.number, std::nullopt};
    if (argument.letter == 'S' && !argument.null) copy.text = argument.text;
    arguments.push_back(copy);
  }
  const gateway_tests::Outcome outcome = gateway_tests::CRecordingHost().CallAt(
      s_pEntryPoints[call.row], AllExports()[call.row], arguments);
  for (const std::string& event : outcome.events) std::fprintf(stderr, "  %s\n", event.c_str());
  std::fprintf(stderr, "  status %d\n", outcome.status.value_or(0));
}

[[noreturn]] void Broken(const FuzzCall& call, const char* rule, const Answer& answer) {
  const std::string_view name = AllExports()[call.row].name;
  std::fprintf(stderr, "%.*s: %s\nresult: %.*s\n", static_cast<int>(name.size()), name.data(), rule,
               static_cast<int>(answer.result.size()), answer.result.data());
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

// Characters that the result may have at most. The last argument may be a text: a reply, or the
// message of a certificate.
size_t ResultBound(const Export& row, const FuzzCall& call) {
  constexpr size_t kRequest = 4095;
  const size_t text = call.arguments[call.argumentCount - 1].text.size();
  if (row.IsDecoder()) return kRequest + 8 * text;
  // Four characters of Base64 for three of the message, and a line end behind every 1024.
  if (row.name == "RegisterCertEncode") return kRequest + 2 * text;
  return kRequest;
}

// What holds for every answer.
void CheckAnswer(const Export& row, const FuzzCall& call, const Answer& answer) {
  if (answer.violation != nullptr) Broken(call, answer.violation, answer);
  const std::string_view result = answer.result;
  if (result.size() > ResultBound(row, call)) Broken(call, "the result is too long", answer);
  if (row.IsDecoder() || !row.HasStatus()) return;
  const bool request = StartsWith(result, "F=");
  if (answer.status == 1 && !request) Broken(call, "no request, and status 1", answer);
  // A message stands alone, or, for futures orders, behind the header.
  if (answer.status == -1 && request && !EndsWith(result, "[CLIENT]傳入的參數錯誤")) {
    Broken(call, "a request, and status -1", answer);
  }
}

}  // namespace

Rows FuzzRows() {
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
  const FuzzCall call = ReadCall(FuzzRows(), data, size);
  const Export& row = AllExports()[call.row];
  void* const entryPoint = s_pEntryPoints[call.row];
  SetClock(static_cast<std::time_t>(call.Clock()));
  const Answer first = s_Host.Call(entryPoint, row, call);
  CheckAnswer(row, call, first);
  CountExecution(call.row);
  if (call.moment % kTwice != 0) return 0;
  const Answer second = s_Host.Call(entryPoint, row, call);
  CheckAnswer(row, call, second);
  if (second.digest != first.digest) {
    Broken(call, "the same call answers differently", second);
  }
  return 0;
}
