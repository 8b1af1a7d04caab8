#include "tests/support/recording_host.h"

#include <cstdio>
#include <cstring>
#include <utility>

#include "tests/support/forbidden_calls.h"

namespace gateway_tests {

/// Java strings and arrays are handles to the host; here they point to these.
struct CRecordingHost::TText {
  int m_nNumber = 0;
  std::optional<std::string> m_Text;
  std::optional<CGuardedBlock> m_Characters;
  bool m_bReleased = false;

  jstring Handle() { return reinterpret_cast<jstring>(this); }
};

struct CRecordingHost::TStatus {
  /// Not a value that any entry point writes.
  static constexpr jint kUntouched = 0x5A5A;
  jint m_nElement = kUntouched;
  std::optional<CGuardedBlock> m_Elements;

  jintArray Handle() { return reinterpret_cast<jintArray>(this); }
};

struct CRecordingHost::TEnvironment : JNIEnv {
  CRecordingHost* m_pHost = nullptr;
};

/// The five functions that exist.
struct THostFunctions {
  using TText = CRecordingHost::TText;

  static CRecordingHost& HostOf(JNIEnv* env) {
    return *static_cast<CRecordingHost::TEnvironment*>(env)->m_pHost;
  }

  static TText* Find(CRecordingHost& host, jstring handle) {
    for (const auto& text : host.m_Texts) {
      if (text->Handle() == handle) return text.get();
    }
    return nullptr;
  }

  static const char* JNICALL GetStringUTFChars(JNIEnv* env, jstring string, jboolean* isCopy) {
    CRecordingHost& host = HostOf(env);
    TText* text = Find(host, string);
    host.Note("GetStringUTFChars", text == nullptr ? "?" : std::to_string(text->m_nNumber));
    if (isCopy != nullptr) host.Violation("GetStringUTFChars: is-copy pointer given");
    if (text == nullptr || !text->m_Text.has_value()) {
      host.Violation("GetStringUTFChars: not a string of this call");
      return nullptr;
    }
    if (text->m_Characters.has_value()) host.Violation("GetStringUTFChars: string held twice");
    if (host.MustFail("GetStringUTFChars")) return nullptr;
    text->m_Characters.emplace(host.m_ePlacement, text->m_Text->c_str(), text->m_Text->size() + 1);
    return text->m_Characters->Data();
  }

  static void JNICALL ReleaseStringUTFChars(JNIEnv* env, jstring string, const char* characters) {
    CRecordingHost& host = HostOf(env);
    TText* text = Find(host, string);
    host.Note("ReleaseStringUTFChars", text == nullptr ? "?" : std::to_string(text->m_nNumber));
    if (text == nullptr || !text->m_Characters.has_value()) {
      host.Violation("ReleaseStringUTFChars: string is not held");
      return;
    }
    const CGuardedBlock& block = *text->m_Characters;
    if (characters != block.Data()) {
      host.Violation("ReleaseStringUTFChars: not the pointer handed out");
    }
    if (std::memcmp(block.Data(), text->m_Text->c_str(), block.Size()) != 0) {
      host.Violation("ReleaseStringUTFChars: the characters were written to");
    }
    text->m_Characters.reset();
    text->m_bReleased = true;
  }

  static jint* JNICALL GetIntArrayElements(JNIEnv* env, jintArray array, jboolean* isCopy) {
    CRecordingHost& host = HostOf(env);
    host.Note("GetIntArrayElements", "");
    CRecordingHost::TStatus* status = host.m_pStatus.get();
    if (isCopy != nullptr) host.Violation("GetIntArrayElements: is-copy pointer given");
    if (status == nullptr || array != status->Handle()) {
      host.Violation("GetIntArrayElements: not the array of this call");
      return nullptr;
    }
    if (status->m_Elements.has_value()) host.Violation("GetIntArrayElements: array held twice");
    if (host.MustFail("GetIntArrayElements")) return nullptr;
    status->m_Elements.emplace(host.m_ePlacement, &status->m_nElement, sizeof(jint));
    return reinterpret_cast<jint*>(status->m_Elements->Data());
  }

  static void JNICALL ReleaseIntArrayElements(JNIEnv* env, jintArray array, jint* elements,
                                              jint mode) {
    CRecordingHost& host = HostOf(env);
    host.Note("ReleaseIntArrayElements", mode == 0 ? "" : "mode " + std::to_string(mode));
    CRecordingHost::TStatus* status = host.m_pStatus.get();
    if (status == nullptr || array != status->Handle() || !status->m_Elements.has_value()) {
      host.Violation("ReleaseIntArrayElements: array is not held");
      return;
    }
    const char* const data = status->m_Elements->Data();
    if (reinterpret_cast<const char*>(elements) != data) {
      host.Violation("ReleaseIntArrayElements: not the pointer handed out");
    }
    if (mode != JNI_ABORT) std::memcpy(&status->m_nElement, data, sizeof(jint));
    if (mode != JNI_COMMIT) status->m_Elements.reset();
  }

  static jstring JNICALL NewStringUTF(JNIEnv* env, const char* characters) {
    CRecordingHost& host = HostOf(env);
    if (characters == nullptr) {
      host.Violation("NewStringUTF: null characters");
      return nullptr;
    }
    host.Note("NewStringUTF", characters);
    if (host.m_bExceptionPending) host.Violation("NewStringUTF: an exception is pending");
    if (host.m_pResult != nullptr) host.Violation("NewStringUTF: second result");
    if (host.MustFail("NewStringUTF")) return nullptr;
    host.m_pResult = std::make_unique<TText>();
    host.m_pResult->m_Text = characters;
    return host.m_pResult->Handle();
  }

  static const JNINativeInterface_* Table() {
    static const JNINativeInterface_ s_Table = [] {
      JNINativeInterface_ table = ForbiddenCalls();
      table.GetStringUTFChars = &GetStringUTFChars;
      table.ReleaseStringUTFChars = &ReleaseStringUTFChars;
      table.GetIntArrayElements = &GetIntArrayElements;
      table.ReleaseIntArrayElements = &ReleaseIntArrayElements;
      table.NewStringUTF = &NewStringUTF;
      return table;
    }();
    return &s_Table;
  }
};

bool TOutcome::IsSound() const {
  const bool statusGood = !m_Status.has_value() || *m_Status == 1 || *m_Status == -1;
  return m_Violations.empty() && m_Result.has_value() && statusGood;
}

CRecordingHost::CRecordingHost(EPlacement placement)
    : m_ePlacement(placement), m_pEnvironment(std::make_unique<TEnvironment>()) {
  m_pEnvironment->functions = THostFunctions::Table();
  m_pEnvironment->m_pHost = this;
}

CRecordingHost::~CRecordingHost() = default;

TOutcome CRecordingHost::Call(const TExport& row, const TArguments& arguments) {
  return CallAt(row.EntryPoint(), row, arguments);
}

TOutcome CRecordingHost::CallAt(void* entryPoint, const TExport& row, const TArguments& arguments) {
  m_Outcome = TOutcome();
  m_Texts.clear();
  m_pResult.reset();
  m_bExceptionPending = false;
  m_pStatus = row.HasStatus() && !m_bNullStatus ? std::make_unique<TStatus>() : nullptr;
  if (entryPoint == nullptr) Violation("the library does not export " + row.SymbolName());
  const std::vector<jvalue> values = MakeValues(row, arguments);
  if (m_Outcome.m_Violations.empty()) {
    ListenToLog(this);
    const jstring returned = row.m_pCall(entryPoint, m_pEnvironment.get(), values.data());
    ListenToLog(nullptr);
    Finish(row, returned);
  }
  return std::move(m_Outcome);
}

std::vector<jvalue> CRecordingHost::MakeValues(const TExport& row, const TArguments& arguments) {
  std::string shape;
  for (const TArgument& argument : arguments) shape.push_back(argument.m_chLetter);
  if (row.HasStatus()) shape.push_back('s');
  if (shape != row.m_szShape) Violation("the test passes the arguments " + shape);

  std::vector<jvalue> values(shape.size());
  for (size_t i = 0; i < arguments.size(); ++i) {
    const TArgument& argument = arguments[i];
    switch (argument.m_chLetter) {
      case 'i':
        values[i].i = static_cast<jint>(argument.m_nNumber);
        break;
      case 'b':
        values[i].b = static_cast<jbyte>(argument.m_nNumber);
        break;
      case 'c':
        values[i].c = static_cast<jchar>(argument.m_nNumber);
        break;
      default: {
        auto text = std::make_unique<TText>();
        text->m_nNumber = static_cast<int>(m_Texts.size()) + 1;
        text->m_Text = argument.m_Text;
        values[i].l = argument.m_Text.has_value() ? text->Handle() : nullptr;
        m_Texts.push_back(std::move(text));
      }
    }
  }
  if (row.HasStatus()) values.back().l = m_pStatus != nullptr ? m_pStatus->Handle() : nullptr;
  return values;
}

void CRecordingHost::Finish(const TExport& row, jstring returned) {
  const jstring made = m_pResult != nullptr ? m_pResult->Handle() : nullptr;
  if (returned != made) Violation("the returned string is not the one made");
  if (m_pResult != nullptr) m_Outcome.m_Result = m_pResult->m_Text;
  if (m_pStatus != nullptr) {
    if (m_pStatus->m_Elements.has_value()) Violation("the status elements were never released");
    m_Outcome.m_Status = m_pStatus->m_nElement;
  }
  const size_t firstKept = m_Texts.size() - static_cast<size_t>(row.m_nKeptStrings);
  for (size_t i = 0; i < m_Texts.size(); ++i) {
    const TText& text = *m_Texts[i];
    const std::string name = "string " + std::to_string(text.m_nNumber);
    if (i < firstKept && text.m_Characters.has_value()) Violation(name + " was never released");
    if (i >= firstKept && text.m_bReleased && !m_bExceptionPending) {
      Violation(name + " was released, but this export keeps it");
    }
  }
}

void CRecordingHost::OnLog(int priority, const char* tag, const char* text) {
  if (priority != 3) Violation("log line of priority " + std::to_string(priority));
  if (tag == nullptr || std::strcmp(tag, "gatewayjni") != 0) Violation("log line of another tag");
  if (text == nullptr) {
    Violation("null log line");
    return;
  }
  if (m_bKeepRecord) m_Outcome.m_LogLines.emplace_back(text);
  Note("log", text);
}

void CRecordingHost::Note(std::string_view what, std::string_view detail) {
  if (!m_bKeepRecord) return;
  std::string event(what);
  // A log line keeps its blank also when empty, to differ from no text at all.
  if (!detail.empty() || what == "log") event.append(" ").append(detail);
  m_Outcome.m_Events.push_back(std::move(event));
}

void CRecordingHost::Violation(std::string text) {
  m_Outcome.m_Violations.push_back(std::move(text));
}

bool CRecordingHost::MustFail(const char* function) {
  ++m_Outcome.m_nFallibleCalls;
  // A machine that threw serves no further request; what came before must still be released.
  if (m_bExceptionPending) {
    Violation(std::string(function) + ": an exception is pending");
    return true;
  }
  if (m_Outcome.m_nFallibleCalls != m_nFailing) return false;
  m_bExceptionPending = true;
  return true;
}

}  // namespace gateway_tests
