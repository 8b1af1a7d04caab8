#include "tests/support/recording_host.h"

#include <cstdio>
#include <cstring>
#include <utility>

#include "tests/support/forbidden_calls.h"
#include "tests/support/modified_utf8.h"

namespace gateway_tests {

// Java strings and arrays are handles to the host; here they point to these.
struct CRecordingHost::Text {
  int number = 0;
  std::optional<std::string> text;
  std::optional<CGuardedBlock> characters;
  bool released = false;

  jstring Handle() { return reinterpret_cast<jstring>(this); }
};

struct CRecordingHost::Status {
  // Not a value that any entry point writes.
  static constexpr jint kUntouched = 0x5A5A;
  jint element = kUntouched;
  std::optional<CGuardedBlock> elements;

  jintArray Handle() { return reinterpret_cast<jintArray>(this); }
};

struct CRecordingHost::Environment : JNIEnv {
  CRecordingHost* host = nullptr;
};

// The five functions that exist.
struct HostFunctions {
  using Text = CRecordingHost::Text;

  static CRecordingHost& HostOf(JNIEnv* env) {
    return *static_cast<CRecordingHost::Environment*>(env)->host;
  }

  static Text* Find(CRecordingHost& host, jstring handle) {
    for (const auto& text : host.m_texts) {
      if (text->Handle() == handle) return text.get();
    }
    return nullptr;
  }

  static const char* JNICALL GetStringUTFChars(JNIEnv* env, jstring string, jboolean* isCopy) {
    CRecordingHost& host = HostOf(env);
    Text* text = Find(host, string);
    host.Note("GetStringUTFChars", text == nullptr ? "?" : std::to_string(text->number));
    if (isCopy != nullptr) host.Violation("GetStringUTFChars: is-copy pointer given");
    if (text == nullptr || !text->text.has_value()) {
      host.Violation("GetStringUTFChars: not a string of this call");
      return nullptr;
    }
    if (text->characters.has_value()) host.Violation("GetStringUTFChars: string held twice");
    if (host.MustFail("GetStringUTFChars")) return nullptr;
    text->characters.emplace(host.m_placement, text->text->c_str(), text->text->size() + 1);
    return text->characters->Data();
  }

  static void JNICALL ReleaseStringUTFChars(JNIEnv* env, jstring string, const char* characters) {
    CRecordingHost& host = HostOf(env);
    Text* text = Find(host, string);
    host.Note("ReleaseStringUTFChars", text == nullptr ? "?" : std::to_string(text->number));
    if (text == nullptr || !text->characters.has_value()) {
      host.Violation("ReleaseStringUTFChars: string is not held");
      return;
    }
    const CGuardedBlock& block = *text->characters;
    if (characters != block.Data()) {
      host.Violation("ReleaseStringUTFChars: not the pointer handed out");
    }
    if (std::memcmp(block.Data(), text->text->c_str(), block.Size()) != 0) {
      host.Violation("ReleaseStringUTFChars: the characters were written to");
    }
    text->characters.reset();
    text->released = true;
  }

  static jint* JNICALL GetIntArrayElements(JNIEnv* env, jintArray array, jboolean* isCopy) {
    CRecordingHost& host = HostOf(env);
    host.Note("GetIntArrayElements", "");
    CRecordingHost::Status* status = host.m_pStatus.get();
    if (isCopy != nullptr) host.Violation("GetIntArrayElements: is-copy pointer given");
    if (status == nullptr || array != status->Handle()) {
      host.Violation("GetIntArrayElements: not the array of this call");
      return nullptr;
    }
    if (status->elements.has_value()) host.Violation("GetIntArrayElements: array held twice");
    if (host.MustFail("GetIntArrayElements")) return nullptr;
    status->elements.emplace(host.m_placement, &status->element, sizeof(jint));
    return reinterpret_cast<jint*>(status->elements->Data());
  }

  static void JNICALL ReleaseIntArrayElements(JNIEnv* env, jintArray array, jint* elements,
                                              jint mode) {
    CRecordingHost& host = HostOf(env);
    host.Note("ReleaseIntArrayElements", mode == 0 ? "" : "mode " + std::to_string(mode));
    CRecordingHost::Status* status = host.m_pStatus.get();
    if (status == nullptr || array != status->Handle() || !status->elements.has_value()) {
      host.Violation("ReleaseIntArrayElements: array is not held");
      return;
    }
    const char* const data = status->elements->Data();
    if (reinterpret_cast<const char*>(elements) != data) {
      host.Violation("ReleaseIntArrayElements: not the pointer handed out");
    }
    if (mode != JNI_ABORT) std::memcpy(&status->element, data, sizeof(jint));
    if (mode != JNI_COMMIT) status->elements.reset();
  }

  static jstring JNICALL NewStringUTF(JNIEnv* env, const char* characters) {
    CRecordingHost& host = HostOf(env);
    if (characters == nullptr) {
      host.Violation("NewStringUTF: null characters");
      return nullptr;
    }
    host.Note("NewStringUTF", characters);
    if (!IsModifiedUtf8(characters)) host.Violation("NewStringUTF: ill-formed text");
    if (host.m_bExceptionPending) host.Violation("NewStringUTF: an exception is pending");
    if (host.m_pResult != nullptr) host.Violation("NewStringUTF: second result");
    if (host.MustFail("NewStringUTF")) return nullptr;
    host.m_pResult = std::make_unique<Text>();
    host.m_pResult->text = characters;
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

bool Outcome::IsSound() const {
  const bool statusGood = !status.has_value() || *status == 1 || *status == -1;
  return violations.empty() && result.has_value() && statusGood;
}

CRecordingHost::CRecordingHost(Placement placement)
    : m_placement(placement), m_pEnvironment(std::make_unique<Environment>()) {
  m_pEnvironment->functions = HostFunctions::Table();
  m_pEnvironment->host = this;
}

CRecordingHost::~CRecordingHost() = default;

Outcome CRecordingHost::Call(const Export& row, const Arguments& arguments) {
  return CallAt(row.EntryPoint(), row, arguments);
}

Outcome CRecordingHost::CallAt(void* entryPoint, const Export& row, const Arguments& arguments) {
  m_outcome = Outcome();
  m_texts.clear();
  m_pResult.reset();
  m_bExceptionPending = false;
  m_pStatus = row.HasStatus() && !m_bNullStatus ? std::make_unique<Status>() : nullptr;
  if (entryPoint == nullptr) Violation("the library does not export " + row.SymbolName());
  const std::vector<jvalue> values = MakeValues(row, arguments);
  if (m_outcome.violations.empty()) {
    ListenToLog(this);
    const jstring returned = row.call(entryPoint, m_pEnvironment.get(), values.data());
    ListenToLog(nullptr);
    Finish(row, returned);
  }
  return std::move(m_outcome);
}

std::vector<jvalue> CRecordingHost::MakeValues(const Export& row, const Arguments& arguments) {
  std::string shape;
  for (const Argument& argument : arguments) shape.push_back(argument.letter);
  if (row.HasStatus()) shape.push_back('s');
  if (shape != row.shape) Violation("the test passes the arguments " + shape);

  std::vector<jvalue> values(shape.size());
  for (size_t i = 0; i < arguments.size(); ++i) {
    const Argument& argument = arguments[i];
    switch (argument.letter) {
      case 'i':
        values[i].i = static_cast<jint>(argument.number);
        break;
      case 'b':
        values[i].b = static_cast<jbyte>(argument.number);
        break;
      case 'c':
        values[i].c = static_cast<jchar>(argument.number);
        break;
      default: {
        auto text = std::make_unique<Text>();
        text->number = static_cast<int>(m_texts.size()) + 1;
        text->text = argument.text;
        values[i].l = argument.text.has_value() ? text->Handle() : nullptr;
        m_texts.push_back(std::move(text));
      }
    }
  }
  if (row.HasStatus()) values.back().l = m_pStatus != nullptr ? m_pStatus->Handle() : nullptr;
  return values;
}

void CRecordingHost::Finish(const Export& row, jstring returned) {
  const jstring made = m_pResult != nullptr ? m_pResult->Handle() : nullptr;
  if (returned != made) Violation("the returned string is not the one made");
  if (m_pResult != nullptr) m_outcome.result = m_pResult->text;
  if (m_pStatus != nullptr) {
    if (m_pStatus->elements.has_value()) Violation("the status elements were never released");
    m_outcome.status = m_pStatus->element;
  }
  const size_t firstKept = m_texts.size() - static_cast<size_t>(row.keptStrings);
  for (size_t i = 0; i < m_texts.size(); ++i) {
    const Text& text = *m_texts[i];
    const std::string name = "string " + std::to_string(text.number);
    if (i < firstKept && text.characters.has_value()) Violation(name + " was never released");
    if (i >= firstKept && text.released && !m_bExceptionPending) {
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
  if (m_bKeepRecord) m_outcome.logLines.emplace_back(text);
  Note("log", text);
}

void CRecordingHost::Note(std::string_view what, std::string_view detail) {
  if (!m_bKeepRecord) return;
  std::string event(what);
  // A log line keeps its blank also when empty, to differ from no text at all.
  if (!detail.empty() || what == "log") event.append(" ").append(detail);
  m_outcome.events.push_back(std::move(event));
}

void CRecordingHost::Violation(std::string text) {
  m_outcome.violations.push_back(std::move(text));
}

bool CRecordingHost::MustFail(const char* function) {
  ++m_outcome.fallibleCalls;
  // A machine that threw serves no further request; what came before must still be released.
  if (m_bExceptionPending) {
    Violation(std::string(function) + ": an exception is pending");
    return true;
  }
  if (m_outcome.fallibleCalls != m_nFailing) return false;
  m_bExceptionPending = true;
  return true;
}

}  // namespace gateway_tests
