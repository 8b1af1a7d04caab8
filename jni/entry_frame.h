// The one frame of every entry point. It owns what the VM lends for one call - the characters of
// the strings, the elements of the status array - and gives it back in the host's order:
//
//   1. the characters of every string, in parameter order; the status elements
//   2. a gateway object of the operation's class, filled with the session data
//   3. the operation's method, its result logged
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

#include "gateway/core/log.h"
#include "gateway/core/text_writer.h"

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

// The session of a futures encoder: the same Java value serves both markets, and above 100 the
// request goes to futures.
inline constexpr jint kFuturesMarketOffset = 100;
inline HostSession FuturesSession(HostSession session) {
  session.market = WrapAdd(session.market, kFuturesMarketOffset);
  return session;
}

// Characters of the host's strings, in parameter order.
template <size_t N>
class CHostTexts {
 public:
  CHostTexts(JNIEnv* env, const jstring (&strings)[N]) : m_pEnv(env) {
    for (size_t i = 0; i < N && m_bLent; ++i) {
      m_strings[i] = strings[i];
      if (strings[i] == nullptr) continue;
      m_texts[i] = env->GetStringUTFChars(strings[i], nullptr);
      m_bLent = m_texts[i] != nullptr;
    }
  }
  CHostTexts(const CHostTexts&) = delete;
  CHostTexts& operator=(const CHostTexts&) = delete;

  // False when the VM could not lend one of them; the later ones were not asked for then.
  bool Lent() const { return m_bLent; }

  const char* operator[](size_t i) const { return m_texts[i]; }

  void Release(size_t i) {
    if (m_texts[i] != nullptr) m_pEnv->ReleaseStringUTFChars(m_strings[i], m_texts[i]);
    m_texts[i] = nullptr;
  }

  // Gives back whatever was lent; the call that cannot go on returns what this returns.
  jstring ReleaseAll() {
    for (size_t i = 0; i < N; ++i) Release(i);
    return nullptr;
  }

 private:
  JNIEnv* m_pEnv;
  jstring m_strings[N] = {};
  const char* m_texts[N] = {};
  bool m_bLent = true;
};

// The element of the host's status array that the method writes.
class CHostStatus {
 public:
  CHostStatus(JNIEnv* env, jintArray array) : m_pEnv(env), m_array(array) {
    if (array != nullptr) m_pElements = env->GetIntArrayElements(array, nullptr);
  }
  CHostStatus(const CHostStatus&) = delete;
  CHostStatus& operator=(const CHostStatus&) = delete;

  bool Lent() const { return m_array == nullptr || m_pElements != nullptr; }

  int* Pointer() { return m_pElements != nullptr ? m_pElements : &m_nOwn; }

  void Release() {
    if (m_pElements != nullptr) m_pEnv->ReleaseIntArrayElements(m_array, m_pElements, 0);
    m_pElements = nullptr;
  }

 private:
  JNIEnv* m_pEnv;
  jintArray m_array;
  jint* m_pElements = nullptr;
  jint m_nOwn = 0;
};

// For an export without a status array: nothing is asked of the VM.
class CNoStatus {
 public:
  CNoStatus(JNIEnv*, jintArray) {}
  static bool Lent() { return true; }
  static void Release() {}
};

// Numbers the log lines of an export that has a step label; the others log nothing.
class CStepLog {
 public:
  explicit CStepLog(const char* label) : m_pLabel(label) {}

  void Next() {
    if (m_pLabel == nullptr) return;
    char scratch[64];
    CTextWriter line(scratch, sizeof scratch);
    line.Append(WIRE("%s%d"), m_pLabel, m_nStep++);
    debuglog(line.Text());
  }

 private:
  const char* m_pLabel;
  int m_nStep = 0;
};

// Runs one call. `fill(object, texts)` stores the session data; `call(object, texts, status)` runs
// the method and returns its text, owned by the object.
template <class Gateway, class Status, size_t N, class Fill, class Call>
jstring RunEntry(JNIEnv* env, const jstring (&strings)[N], jintArray statusArray,
                 const FrameOptions& options, const Fill& fill, const Call& call) {
  if (options.opening != nullptr) debuglog(options.opening);
  CHostTexts<N> texts(env, strings);
  if (!texts.Lent()) return texts.ReleaseAll();
  Status status(env, statusArray);
  if (!status.Lent()) return texts.ReleaseAll();

  Gateway object;
  fill(object, texts);
  const char* const result = call(object, texts, status);

  CStepLog steps(options.stepLabel);
  steps.Next();
  if (options.logsResult) debuglog(result);
  steps.Next();
  for (size_t i = 0; i + options.keptTexts < N; ++i) {
    texts.Release(i);
    steps.Next();
  }
  status.Release();
  steps.Next();
  return env->NewStringUTF(result == nullptr ? "" : result);
}

// A Java argument as its method takes it; strings were fetched before and are found by position.
template <size_t N>
const char* MethodArgument(const CHostTexts<N>& texts, size_t position, jstring) {
  return texts[position];
}
template <size_t N>
jint MethodArgument(const CHostTexts<N>&, size_t, jint value) {
  return value;
}
template <size_t N>
char MethodArgument(const CHostTexts<N>&, size_t, jbyte value) {
  return static_cast<char>(value);
}
template <size_t N>
char MethodArgument(const CHostTexts<N>&, size_t, jchar value) {
  return static_cast<char>(static_cast<unsigned char>(value & 0xff));  // the low byte alone
}

// Calls `method` with the Java arguments `args` converted one for one, and the status pointer last
// unless the export has no status.
template <class Gateway, class... Parameters, size_t N, class Status, size_t... kAt, class... Args>
const char* CallMethod(Gateway& object, char* (Gateway::*method)(Parameters...),
                       const CHostTexts<N>& texts, Status& status, std::index_sequence<kAt...>,
                       Args... args) {
  if constexpr (std::is_same_v<Status, CNoStatus>) {
    return (object.*method)(MethodArgument(texts, kSessionTexts + kAt, args)...);
  } else {
    return (object.*method)(MethodArgument(texts, kSessionTexts + kAt, args)..., status.Pointer());
  }
}

inline void Collect(jstring*& at, jstring string) {
  *at++ = string;
}
template <class NoString>
void Collect(jstring*&, NoString) {}

// The frame of an encoder. `args` are its operation parameters in Java order, strings first.
template <class Status, class Gateway, class... Parameters, class... Args>
jstring RunEncoder(JNIEnv* env, const FrameOptions& options, const HostSession& session,
                   char* (Gateway::*method)(Parameters...), jintArray statusArray, Args... args) {
  constexpr size_t kTexts = (kSessionTexts + ... + (std::is_same_v<Args, jstring> ? 1 : 0));
  jstring strings[kTexts] = {session.serialNo, session.localIP};
  jstring* at = strings + kSessionTexts;
  (Collect(at, args), ...);
  const auto fill = [&](Gateway& object, const CHostTexts<kTexts>& texts) {
    object.m_nMarket = session.market;
    object.m_nPlatform = session.platform;
    object.m_nSeqNo = session.seqNo;
    object.setSerialNumber(texts[0]);
    object.setLocalIP(texts[1]);
    if (options.loggedText < kTexts) debuglog(texts[kSessionTexts + options.loggedText]);
  };
  const auto call = [&](Gateway& object, const CHostTexts<kTexts>& texts, Status& status) {
    return CallMethod(object, method, texts, status, std::index_sequence_for<Args...>(), args...);
  };
  return RunEntry<Gateway, Status>(env, strings, statusArray, options, fill, call);
}

// An encoder whose status goes into the host's array.
template <class Gateway, class... Parameters, class... Args>
jstring Encode(JNIEnv* env, const HostSession& session, char* (Gateway::*method)(Parameters...),
               jintArray status, Args... args) {
  return RunEncoder<CHostStatus>(env, FrameOptions(), session, method, status, args...);
}

// The frame of a decoder: of the session data it has none but, in one export, the market.
template <class Gateway>
jstring Decode(JNIEnv* env, char* (Gateway::*method)(const char*, int*), jstring reply,
               jintArray statusArray, const FrameOptions& options = {}, jint market = 0) {
  const jstring strings[] = {reply};
  const auto fill = [&](Gateway& object, const CHostTexts<1>&) { object.m_nMarket = market; };
  const auto call = [&](Gateway& object, const CHostTexts<1>& texts, CHostStatus& status) {
    return (object.*method)(texts[0], status.Pointer());
  };
  return RunEntry<Gateway, CHostStatus>(env, strings, statusArray, options, fill, call);
}

// An export's linkage, return type and name.
#define GATEWAY_EXPORT(operation) \
  extern "C" JNIEXPORT jstring JNICALL Java_com_brindlex_kernel_quorvane_gatewayjni_##operation

#endif  // QUORVANE_JNI_ENTRY_FRAME_H_
