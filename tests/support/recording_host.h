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

// One Java argument: a text (or null) for 'S', a number for 'i', 'b' and 'c'.
struct Argument {
  char letter = 'i';
  int64_t number = 0;
  std::optional<std::string> text;

  static Argument Int(int64_t value) { return {'i', value, std::nullopt}; }
  static Argument Byte(int64_t value) { return {'b', value, std::nullopt}; }
  static Argument Char(int64_t value) { return {'c', value, std::nullopt}; }
  static Argument Text(std::string_view text) { return {'S', 0, std::string(text)}; }
  static Argument Null() { return {'S', 0, std::nullopt}; }
};
using Arguments = std::vector<Argument>;

// What a call did.
struct Outcome {
  // The returned string; empty when a null reference came back.
  std::optional<std::string> result;
  // status[0] afterwards; empty when the export takes no status array or a null one was passed.
  std::optional<int32_t> status;
  // VM calls and log lines in their order, as "GetStringUTFChars 1", "log text",
  // "ReleaseIntArrayElements", "NewStringUTF text". Strings are numbered from 1 by their place
  // among the call's string arguments.
  std::vector<std::string> events;
  // The log lines alone.
  std::vector<std::string> logLines;
  // Everything that no entry point may do; empty for a good call.
  std::vector<std::string> violations;
  // Number of VM calls that can fail (characters, elements, new string).
  int fallibleCalls = 0;

  // True when all of that holds for any good call: a result, no violation, a status of 1 or -1.
  bool IsSound() const;
};

// A virtual machine that serves one entry point at a time and writes down what it does. Only the
// five VM functions that entry points need exist; any other ends the program with its name.
// One host serves one thread.
class CRecordingHost : private CLogListener {
 public:
  // `placement` says where the characters and elements that the host hands out lie.
  explicit CRecordingHost(Placement placement = Placement::kHeap);
  ~CRecordingHost() override;
  CRecordingHost(const CRecordingHost&) = delete;
  CRecordingHost& operator=(const CRecordingHost&) = delete;

  // The nth VM call (from 1) that can fail fails in each following call; 0 for none.
  void FailCall(int nth) { m_nFailing = nth; }
  // Passes null instead of a status array.
  void PassNullStatus(bool null) { m_bNullStatus = null; }
  // Without a record no event and no log line is kept (for timing); violations still are.
  void KeepRecord(bool keep) { m_bKeepRecord = keep; }

  // Calls `row` with `arguments`, which must fit its shape without the status array.
  Outcome Call(const Export& row, const Arguments& arguments);

  // Calls another function of the row's shape in place of the library's.
  Outcome CallAt(void* entryPoint, const Export& row, const Arguments& arguments);

 private:
  struct Environment;
  struct Text;
  struct Status;
  friend struct HostFunctions;

  void OnLog(int priority, const char* tag, const char* text) override;
  void Note(std::string_view what, std::string_view detail);
  void Violation(std::string text);
  bool MustFail(const char* function);
  std::vector<jvalue> MakeValues(const Export& row, const Arguments& arguments);
  void Finish(const Export& row, jstring returned);

  Placement m_placement;
  int m_nFailing = 0;
  bool m_bNullStatus = false;
  bool m_bKeepRecord = true;
  bool m_bExceptionPending = false;
  std::unique_ptr<Environment> m_pEnvironment;
  std::vector<std::unique_ptr<Text>> m_texts;
  std::unique_ptr<Status> m_pStatus;
  std::unique_ptr<Text> m_pResult;
  Outcome m_outcome;
};

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_RECORDING_HOST_H_
