#ifndef TESTS_SUPPORT_RECORDING_HOST_H_
#define TESTS_SUPPORT_RECORDING_HOST_H_

#include <jni.h>

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/call_table.h"
#include "tests/support/guarded_block.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {

/// One Java argument: a text (or null) for 'S', a number for 'i', 'b' and 'c'.
struct TArgument {
  char m_chLetter = 'i';
  int64_t m_nNumber = 0;
  std::optional<std::string> m_Text;

  static TArgument Int(int64_t value) { return {'i', value, std::nullopt}; }
  static TArgument Byte(int64_t value) { return {'b', value, std::nullopt}; }
  static TArgument Char(int64_t value) { return {'c', value, std::nullopt}; }
  static TArgument Text(std::string_view text) { return {'S', 0, std::string(text)}; }
  static TArgument Null() { return {'S', 0, std::nullopt}; }
};
using TArguments = std::vector<TArgument>;

/// What a call did.
struct TOutcome {
  /// The returned string; empty when a null reference came back.
  std::optional<std::string> m_Result;
  /// status[0] afterwards; empty when the export takes no status array or a null one was passed.
  std::optional<int32_t> m_Status;
  /// VM calls and log lines in their order, as "GetStringUTFChars 1", "log text",
  /// "ReleaseIntArrayElements", "NewStringUTF text". Strings are numbered from 1 by their place
  /// among the call's string arguments.
  std::vector<std::string> m_Events;
  /// The log lines alone.
  std::vector<std::string> m_LogLines;
  /// Everything that no entry point may do; empty for a good call.
  std::vector<std::string> m_Violations;
  /// Number of VM calls that can fail (characters, elements, new string).
  int m_nFallibleCalls = 0;

  /// True when all of that holds for any good call: a result, no violation, a status of 1 or -1.
  bool IsSound() const;
};

/// A virtual machine that serves one entry point at a time and writes down what it does. Only the
/// five VM functions that entry points need exist; any other ends the program with its name.
/// One host serves one thread.
class CRecordingHost : private ILogListener {
 public:
  /// `placement` says where the characters and elements that the host hands out lie.
  explicit CRecordingHost(EPlacement placement = EPlacement::kHeap);
  ~CRecordingHost() override;
  CRecordingHost(const CRecordingHost&) = delete;
  CRecordingHost& operator=(const CRecordingHost&) = delete;

  /// The nth VM call (from 1) that can fail fails in each following call; 0 for none.
  void FailCall(int nth) { m_nFailing = nth; }
  /// Passes null instead of a status array.
  void PassNullStatus(bool null) { m_bNullStatus = null; }
  /// Without a record no event and no log line is kept (for timing); violations still are.
  void KeepRecord(bool keep) { m_bKeepRecord = keep; }

  /// Calls `row` with `arguments`, which must fit its shape without the status array.
  TOutcome Call(const TExport& row, const TArguments& arguments);

  /// Calls another function of the row's shape in place of the library's.
  TOutcome CallAt(void* entryPoint, const TExport& row, const TArguments& arguments);

 private:
  struct TEnvironment;
  struct TText;
  struct TStatus;
  friend struct THostFunctions;

  void OnLog(int priority, const char* tag, const char* text) override;
  void Note(std::string_view what, std::string_view detail);
  void Violation(std::string text);
  bool MustFail(const char* function);
  std::vector<jvalue> MakeValues(const TExport& row, const TArguments& arguments);
  void Finish(const TExport& row, jstring returned);

  EPlacement m_ePlacement;
  int m_nFailing = 0;
  bool m_bNullStatus = false;
  bool m_bKeepRecord = true;
  bool m_bExceptionPending = false;
  std::unique_ptr<TEnvironment> m_pEnvironment;
  std::vector<std::unique_ptr<TText>> m_Texts;
  std::unique_ptr<TStatus> m_pStatus;
  std::unique_ptr<TText> m_pResult;
  TOutcome m_Outcome;
};

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_RECORDING_HOST_H_
