// The one frame of every entry point. It owns what the VM lends for one call - the characters of
// the strings, the elements of the status array - and gives it back in the host's order:
//
//   1. the characters of every string, in parameter order; the status elements
//   2. a gateway object of the operation's class, filled with the session data
//   3. the operation's method, its result made well-formed and logged
//   4. the strings released in the same order, then the status copied back
//   5. the result as a new Java string, "" for a null result; last the object goes
//
// A null string is handed on as a null text and a null status array as an integer of the frame's
// own, both without asking the VM. When the VM cannot lend what it is asked for, it has raised an
// error already: nothing is built, what was lent is released and the call returns null, so that the
// error surfaces in Java and no half-read order leaves the library.
#ifndef QUORVANE_JNI_ENTRY_FRAME_H_
#define QUORVANE_JNI_ENTRY_FRAME_H_

#include <jni.h>

#include <cstddef>
#include <cstdint>
#include <type_traits>
#include <utility>

#include "gateway/core/gateway_pub.h"

// What the host passes first to every encoder.
struct HostSession {
  jint market;
  jint platform;
  jint seqNo;
  jstring serialNo;
  jstring localIP;
};

// The two texts of a HostSession stand before an operation's own strings.
inline constexpr size_t kSessionTexts = 2;

// How an export departs from the frame; each departure is told at the export that has it.
struct FrameOptions {
  const char* opening = nullptr;    // logged before the VM is asked for anything
  size_t loggedText = SIZE_MAX;     // operation string logged just before the method runs
  const char* stepLabel = nullptr;  // logged with a step number around the result and releases
  size_t keptTexts = 0;             // strings at the end of the list that are never released
  bool logsResult = true;
};

// What the VM lends for one call, and how it is given back: everything in the frame that does not
// depend on the operation.
class CEntryCall {
 public:
  static constexpr size_t kMaxTexts = 15;

  // The operation's `count` strings outlive the call.
  CEntryCall(JNIEnv* env, const FrameOptions& options, const jstring* strings, size_t count)
      : m_pEnv(env), m_options(options), m_strings(strings), m_nTexts(count) {}
  CEntryCall(const CEntryCall&) = delete;
  CEntryCall& operator=(const CEntryCall&) = delete;

  // Asks for the characters of the strings, then for the elements of `status` (null for none).
  // False when the VM could not lend them all: what it lent is given back, the call returns null.
  bool Borrow(jintArray status);

  // A borrowed text, by the string's place.
  const char* Text(size_t i) const { return m_texts[i]; }

  // The element that the method writes.
  int* Status() { return m_pElements != nullptr ? m_pElements : &m_nOwnStatus; }

  // Stores the session data in the object, its texts being the first two borrowed.
  void FillSession(CGatewayPub& object, const HostSession& session) const;

  // Makes the result, in place, a text that the VM takes, logs it, gives everything back and makes
  // the Java string.
  jstring Finish(char* result);

 private:
  bool GiveBack(size_t count);  // false
  void Release(size_t i);
  void LogStep() {
    if (m_options.stepLabel != nullptr) WriteStep();
  }
  void WriteStep();

  JNIEnv* m_pEnv;
  const FrameOptions m_options;
  const jstring* m_strings;
  size_t m_nTexts;
  const char* m_texts[kMaxTexts];
  jintArray m_status = nullptr;
  jint* m_pElements = nullptr;
  jint m_nOwnStatus = 0;
  int m_nStep = 0;
};

// A Java argument as its method takes it; strings were borrowed before and are found by place.
inline const char* MethodArgument(const CEntryCall& call, size_t place, jstring) {
  return call.Text(place);
}
inline jint MethodArgument(const CEntryCall&, size_t, jint value) {
  return value;
}
inline char MethodArgument(const CEntryCall&, size_t, jbyte value) {
  return static_cast<char>(value);
}
inline char MethodArgument(const CEntryCall&, size_t, jchar value) {
  return static_cast<char>(static_cast<unsigned char>(value & 0xff));  // the low byte alone
}

inline void Collect(jstring*& at, jstring string) {
  *at++ = string;
}
template <class NoString>
void Collect(jstring*&, NoString) {}

// Calls `method` with the Java arguments `args` converted one for one and, where it has one
// parameter more, the status pointer last.
template <class Gateway, class... Parameters, size_t... kAt, class... Args>
char* CallMethod(Gateway& object, char* (Gateway::*method)(Parameters...), CEntryCall& call,
                 std::index_sequence<kAt...>, Args... args) {
  if constexpr (sizeof...(Parameters) == sizeof...(Args)) {
    return (object.*method)(MethodArgument(call, kSessionTexts + kAt, args)...);
  } else {
    return (object.*method)(MethodArgument(call, kSessionTexts + kAt, args)..., call.Status());
  }
}

// The frame of an encoder. `args` are its operation parameters in Java order, strings first.
template <class Gateway, class... Parameters, class... Args>
jstring Encode(JNIEnv* env, const FrameOptions& options, const HostSession& session,
               char* (Gateway::*method)(Parameters...), jintArray status, Args... args) {
  constexpr size_t kTexts = (kSessionTexts + ... + (std::is_same_v<Args, jstring> ? 1 : 0));
  static_assert(kTexts <= CEntryCall::kMaxTexts, "an entry point has at most kMaxTexts strings");
  jstring strings[kTexts] = {session.serialNo, session.localIP};
  jstring* at = strings + kSessionTexts;
  (Collect(at, args), ...);
  CEntryCall call(env, options, strings, kTexts);
  if (!call.Borrow(status)) return nullptr;
  Gateway object;
  call.FillSession(object, session);
  return call.Finish(CallMethod(object, method, call, std::index_sequence_for<Args...>(), args...));
}

// The frame of a decoder: of the session data it has none but, in one export, the market.
template <class Gateway>
jstring Decode(JNIEnv* env, char* (Gateway::*method)(const char*, int*), jstring reply,
               jintArray status, const FrameOptions& options = {}, jint market = 0) {
  CEntryCall call(env, options, &reply, 1);
  if (!call.Borrow(status)) return nullptr;
  Gateway object;
  object.m_nMarket = market;
  return call.Finish((object.*method)(call.Text(0), call.Status()));
}

// An export's linkage, return type and name.
#define GATEWAY_EXPORT(operation) \
  extern "C" JNIEXPORT jstring JNICALL Java_com_brindlex_kernel_quorvane_gatewayjni_##operation

// What every encoder takes first, and what most take next: as Java parameters, and as arguments.
#define SESSION_PARAMETERS jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP
#define SESSION                                \
  HostSession {                                \
    market, platform, seqNo, serialNo, localIP \
  }
#define LOGIN_PARAMETERS jstring branch, jstring identity, jstring password
#define LOGIN branch, identity, password

// The export of an operation that keeps to the frame: its name, its method, its own Java parameters
// in parentheses, and the same as arguments.
#define ENCODER(operation, method, parameters, ...) \
  ENCODER_OF(SESSION, operation, method, parameters, __VA_ARGS__)
#define ENCODER_OF(session, operation, method, parameters, ...)                                  \
  GATEWAY_EXPORT(operation)                                                                      \
  (JNIEnv * env, jclass, SESSION_PARAMETERS, WITHOUT_PARENTHESES parameters, jintArray status) { \
    return Encode(env, FrameOptions(), session, &method, status, __VA_ARGS__);                   \
  }
#define WITHOUT_PARENTHESES(...) __VA_ARGS__

// NOLINTBEGIN(bugprone-macro-parentheses): a member is pointed to by its name alone
#define DECODER(operation, method)                                                   \
  GATEWAY_EXPORT(operation)(JNIEnv * env, jclass, jstring reply, jintArray status) { \
    return Decode(env, &method, reply, status);                                      \
  }
// NOLINTEND(bugprone-macro-parentheses)

#endif  // QUORVANE_JNI_ENTRY_FRAME_H_
