#ifndef TESTS_FUZZ_LEAN_HOST_H_
#define TESTS_FUZZ_LEAN_HOST_H_

#include <jni.h>

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "tests/fuzz/fuzz_call.h"
#include "tests/support/call_table.h"
#include "tests/support/surroundings.h"

namespace gateway_fuzz {

// What a call did, in as much as a fuzz target asks.
struct Answer {
  // Stands for every VM call with all it passed, every log line, the result and the status, in
  // their order: two calls that differ anywhere differ here.
  uint64_t digest;
  // The returned string. It lies in the host until its next call.
  std::string_view result;
  // status[0] afterwards; 1 where the export takes no status array.
  int32_t status;
  // The first thing that no entry point may do, or null.
  const char* violation;
};

// A virtual machine like gateway_tests::CRecordingHost, with the same rules, for hundreds of
// millions of calls: it allocates nothing, lends texts from a ring of poisoned memory, keeps a
// digest of the record, and counts what the library allocates and frees within the call.
class CLeanHost : private gateway_tests::CLogListener {
 public:
  CLeanHost();
  CLeanHost(const CLeanHost&) = delete;
  CLeanHost& operator=(const CLeanHost&) = delete;

  // Calls the function of the row's shape.
  Answer Call(void* entryPoint, const gateway_tests::Export& row, const FuzzCall& call);

 private:
  static constexpr size_t kMaxTexts = 16;
  static constexpr size_t kHandleSize = 8;
  // A decoder's result is at most some times as long as the longest reply.
  static constexpr size_t kMaxResult = size_t{1} << 18;

  // A Java string of the call, by its place among the call's string arguments.
  struct Text {
    std::string_view text;
    bool null;
    bool released;
    char* characters;  // null while not held
  };
  struct Environment : JNIEnv {
    CLeanHost* host;
  };
  friend struct LeanFunctions;

  void OnLog(int priority, const char* tag, const char* text) override;
  void Begin(const gateway_tests::Export& row, const FuzzCall& call, jvalue* values);
  void Finish(const gateway_tests::Export& row, jstring returned);
  void Violation(const char* text);
  void Note(char event, uint64_t number);
  void NoteText(char event, std::string_view text);

  // Handles are places that nobody may look into: the strings', the status array's, the result's.
  void* Handle(size_t number) { return m_chHandles + number * kHandleSize; }
  jintArray StatusHandle() { return static_cast<jintArray>(Handle(kMaxTexts)); }
  jstring ResultHandle() { return static_cast<jstring>(Handle(kMaxTexts + 1)); }
  // The number of a string of this call, or m_nTexts.
  size_t Find(jstring handle);

  alignas(kHandleSize) char m_chHandles[(kMaxTexts + 2) * kHandleSize];
  JNINativeInterface_ m_table;
  Environment m_environment;
  size_t m_nTexts = 0;
  Text m_texts[kMaxTexts];
  jint m_nStatus = 0;
  jint* m_pElements = nullptr;  // null while not held
  bool m_bResultMade = false;
  Answer m_answer{};
  char m_szResult[kMaxResult];
};

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_LEAN_HOST_H_
