#include "tests/fuzz/lean_host.h"

#include <cstring>

#include "tests/fuzz/lent_memory.h"
#include "tests/support/forbidden_calls.h"

/// Of the sanitizers' runtimes; absent where there is none.
extern "C" __attribute__((weak)) int __sanitizer_install_malloc_and_free_hooks(
    void (*onMalloc)(const volatile void*, size_t), void (*onFree)(const volatile void*));

namespace gateway_fuzz {
namespace {

using gateway_tests::TExport;

/// Not a value that any entry point writes.
constexpr jint kUntouched = 0x5A5A;

/// Blocks that this thread allocated and did not free since the call began; the fuzzer has a thread
/// of its own that allocates when it likes.
thread_local int64_t t_nBlocks = 0;

void OnMalloc(const volatile void* block, size_t) {
  if (block != nullptr) ++t_nBlocks;
}
void OnFree(const volatile void* block) {
  if (block != nullptr) --t_nBlocks;
}

/// Each step can be taken back, so that two words differ in what comes out when they differ.
void Mix(uint64_t& digest, uint64_t word) {
  digest = (digest ^ word) * 0x9E3779B97F4A7C15U;
  digest ^= digest >> 29;
}

}  // namespace

/// The five functions that exist.
struct TLeanFunctions {
  static CLeanHost& HostOf(JNIEnv* env) {
    return *static_cast<CLeanHost::TEnvironment*>(env)->m_pHost;
  }

  static const char* JNICALL GetStringUTFChars(JNIEnv* env, jstring string, jboolean* isCopy) {
    CLeanHost& host = HostOf(env);
    const size_t number = host.Find(string);
    host.Note('G', number);
    if (isCopy != nullptr) host.Violation("GetStringUTFChars: is-copy pointer given");
    if (number == host.m_nTexts || host.m_Texts[number].m_bNull) {
      host.Violation("GetStringUTFChars: not a string of this call");
      return nullptr;
    }
    CLeanHost::TText& text = host.m_Texts[number];
    if (text.m_pCharacters != nullptr) {
      host.Violation("GetStringUTFChars: string held twice");
      return text.m_pCharacters;
    }
    text.m_pCharacters = LendText(text.m_Text);
    return text.m_pCharacters;
  }

  static void JNICALL ReleaseStringUTFChars(JNIEnv* env, jstring string, const char* characters) {
    CLeanHost& host = HostOf(env);
    const size_t number = host.Find(string);
    host.Note('R', number);
    if (number == host.m_nTexts || host.m_Texts[number].m_pCharacters == nullptr) {
      host.Violation("ReleaseStringUTFChars: string is not held");
      return;
    }
    CLeanHost::TText& text = host.m_Texts[number];
    const size_t size = text.m_Text.size();
    if (characters != text.m_pCharacters) {
      host.Violation("ReleaseStringUTFChars: not the pointer handed out");
    }
    if (!SameText({text.m_pCharacters, size}, text.m_Text) || text.m_pCharacters[size] != '\0') {
      host.Violation("ReleaseStringUTFChars: the characters were written to");
    }
    TakeBack(text.m_pCharacters, size + 1);
    text.m_pCharacters = nullptr;
    text.m_bReleased = true;
  }

  static jint* JNICALL GetIntArrayElements(JNIEnv* env, jintArray array, jboolean* isCopy) {
    CLeanHost& host = HostOf(env);
    host.Note('E', 0);
    if (isCopy != nullptr) host.Violation("GetIntArrayElements: is-copy pointer given");
    if (array != host.StatusHandle()) {
      host.Violation("GetIntArrayElements: not the array of this call");
      return nullptr;
    }
    if (host.m_pElements != nullptr) {
      host.Violation("GetIntArrayElements: array held twice");
      return host.m_pElements;
    }
    host.m_pElements = reinterpret_cast<jint*>(Lend(sizeof(jint)));
    *host.m_pElements = host.m_nStatus;
    return host.m_pElements;
  }

  static void JNICALL ReleaseIntArrayElements(JNIEnv* env, jintArray array, jint* elements,
                                              jint mode) {
    CLeanHost& host = HostOf(env);
    host.Note('e', static_cast<uint64_t>(mode));
    if (array != host.StatusHandle() || host.m_pElements == nullptr) {
      host.Violation("ReleaseIntArrayElements: array is not held");
      return;
    }
    if (elements != host.m_pElements) {
      host.Violation("ReleaseIntArrayElements: not the pointer handed out");
    }
    if (mode != JNI_ABORT) host.m_nStatus = *host.m_pElements;
    if (mode == JNI_COMMIT) return;
    TakeBack(reinterpret_cast<char*>(host.m_pElements), sizeof(jint));
    host.m_pElements = nullptr;
  }

  static jstring JNICALL NewStringUTF(JNIEnv* env, const char* characters) {
    CLeanHost& host = HostOf(env);
    if (characters == nullptr) {
      host.Violation("NewStringUTF: null characters");
      return nullptr;
    }
    if (host.m_bResultMade) host.Violation("NewStringUTF: second result");
    // That the text ends, and was not released before, is for the address sanitizer to see.
    const size_t size = std::strlen(characters);
    if (size > CLeanHost::kMaxResult) {
      host.Violation("NewStringUTF: a text of no reason");
      return nullptr;
    }
    std::memcpy(host.m_szResult, characters, size);
    host.m_Answer.m_Result = {host.m_szResult, size};
    host.m_bResultMade = true;
    host.NoteText('N', host.m_Answer.m_Result);
    return host.ResultHandle();
  }
};

CLeanHost::CLeanHost() : m_Table(gateway_tests::ForbiddenCalls()) {
  m_Table.GetStringUTFChars = &TLeanFunctions::GetStringUTFChars;
  m_Table.ReleaseStringUTFChars = &TLeanFunctions::ReleaseStringUTFChars;
  m_Table.GetIntArrayElements = &TLeanFunctions::GetIntArrayElements;
  m_Table.ReleaseIntArrayElements = &TLeanFunctions::ReleaseIntArrayElements;
  m_Table.NewStringUTF = &TLeanFunctions::NewStringUTF;
  m_Environment.functions = &m_Table;
  m_Environment.m_pHost = this;
  Forbid(m_chHandles, sizeof m_chHandles);
  if (__sanitizer_install_malloc_and_free_hooks != nullptr) {
    __sanitizer_install_malloc_and_free_hooks(&OnMalloc, &OnFree);
  }
}

TAnswer CLeanHost::Call(void* entryPoint, const TExport& row, const TFuzzCall& call) {
  jvalue values[TFuzzCall::kMaxArguments + 1];
  Begin(row, call, values);
  gateway_tests::ListenToLog(this);
  t_nBlocks = 0;
  const jstring returned = row.m_pCall(entryPoint, &m_Environment, values);
  if (t_nBlocks > 0) Violation("memory was never freed");
  if (t_nBlocks < 0) Violation("memory of another was freed");
  gateway_tests::ListenToLog(nullptr);
  Finish(row, returned);
  return m_Answer;
}

void CLeanHost::Begin(const TExport& row, const TFuzzCall& call, jvalue* values) {
  m_nTexts = 0;
  m_bResultMade = false;
  m_pElements = nullptr;
  m_nStatus = kUntouched;
  m_Answer = {1, {}, 0, nullptr};
  for (const TFuzzArgument& argument : call) {
    jvalue& value = *values++;
    if (argument.m_chLetter == 'i') {
      value.i = static_cast<jint>(argument.m_nNumber);
    } else if (argument.m_chLetter == 'b') {
      value.b = static_cast<jbyte>(argument.m_nNumber);
    } else if (argument.m_chLetter == 'c') {
      value.c = static_cast<jchar>(argument.m_nNumber);
    } else {
      value.l = argument.m_bNull ? nullptr : static_cast<jobject>(Handle(m_nTexts));
      m_Texts[m_nTexts++] = {argument.m_Text, argument.m_bNull, false, nullptr};
    }
  }
  if (row.HasStatus()) values->l = StatusHandle();
}

void CLeanHost::Finish(const TExport& row, jstring returned) {
  if (!m_bResultMade) Violation("there is no result");
  if (returned != ResultHandle()) Violation("the returned string is not the one made");
  if (m_pElements != nullptr) Violation("the status elements were never released");
  m_Answer.m_nStatus = row.HasStatus() ? m_nStatus : 1;
  if (m_Answer.m_nStatus != 1 && m_Answer.m_nStatus != -1) Violation("the status is not 1 or -1");
  Note('s', static_cast<uint32_t>(m_Answer.m_nStatus));
  const size_t firstKept = m_nTexts - static_cast<size_t>(row.m_nKeptStrings);
  for (size_t i = 0; i < m_nTexts; ++i) {
    const TText& text = m_Texts[i];
    if (i < firstKept && text.m_pCharacters != nullptr) Violation("a string was never released");
    if (i >= firstKept && text.m_bReleased) {
      Violation("a string was released that this export keeps");
    }
    if (text.m_pCharacters != nullptr) TakeBack(text.m_pCharacters, text.m_Text.size() + 1);
  }
}

size_t CLeanHost::Find(jstring handle) {
  for (size_t i = 0; i < m_nTexts; ++i) {
    if (handle == Handle(i)) return i;
  }
  return m_nTexts;
}

void CLeanHost::OnLog(int priority, const char* tag, const char* text) {
  if (priority != 3) Violation("a log line of another priority");
  if (tag == nullptr || std::strcmp(tag, "gatewayjni") != 0) Violation("a log line of another tag");
  if (text == nullptr) {
    Violation("a null log line");
    return;
  }
  NoteText('L', text);
}

void CLeanHost::Violation(const char* text) {
  if (m_Answer.m_szViolation == nullptr) m_Answer.m_szViolation = text;
}

void CLeanHost::Note(char event, uint64_t number) {
  Mix(m_Answer.m_nDigest, static_cast<uint64_t>(event));
  Mix(m_Answer.m_nDigest, number);
}

void CLeanHost::NoteText(char event, std::string_view text) {
  Note(event, text.size());
  uint64_t digest = m_Answer.m_nDigest;
  size_t at = 0;
  for (; text.size() - at >= sizeof(uint64_t); at += sizeof(uint64_t)) {
    Mix(digest, WordAt(text.data() + at));
  }
  uint64_t rest = 0;
  for (; at < text.size(); ++at) rest = rest << 8 | static_cast<uint8_t>(text[at]);
  Mix(digest, rest);
  m_Answer.m_nDigest = digest;
}

}  // namespace gateway_fuzz
