#include "tests/fuzz/lean_host.h"

#include <cstring>

#include "tests/fuzz/lent_memory.h"
#include "tests/support/forbidden_calls.h"
#include "tests/support/modified_utf8.h"

// Of the sanitizers' runtimes; absent where there is none.
extern "C" __attribute__((weak)) int __sanitizer_install_malloc_and_free_hooks(
    void (*onMalloc)(const volatile void*, size_t), void (*onFree)(const volatile void*));

namespace gateway_fuzz {
namespace {

using gateway_tests::Export;

// Not a value that any entry point writes.
constexpr jint kUntouched = 0x5A5A;

// Blocks that this thread allocated and did not free since the call began; the fuzzer has a thread
// of its own that allocates when it likes.
thread_local int64_t t_nBlocks = 0;

void OnMalloc(const volatile void* block, size_t) {
  if (block != nullptr) ++t_nBlocks;
}
void OnFree(const volatile void* block) {
  if (block != nullptr) --t_nBlocks;
}

// Each step can be taken back, so that two words differ in what comes out when they differ.
void Mix(uint64_t& digest, uint64_t word) {
  digest = (digest ^ word) * 0x9E3779B97F4A7C15U;
  digest ^= digest >> 29;
}

}  // namespace

// The five functions that exist.
struct LeanFunctions {
  static CLeanHost& HostOf(JNIEnv* env) { return *static_cast<CLeanHost::Environment*>(env)->host; }

  static const char* JNICALL GetStringUTFChars(JNIEnv* env, jstring string, jboolean* isCopy) {
    CLeanHost& host = HostOf(env);
    const size_t number = host.Find(string);
    host.Note('G', number);
    if (isCopy != nullptr) host.Violation("GetStringUTFChars: is-copy pointer given");
    if (number == host.m_nTexts || host.m_texts[number].null) {
      host.Violation("GetStringUTFChars: not a string of this call");
      return nullptr;
    }
    CLeanHost::Text& text = host.m_texts[number];
    if (text.characters != nullptr) {
      host.Violation("GetStringUTFChars: string held twice");
      return text.characters;
    }
    text.characters = LendText(text.text);
    return text.characters;
  }

  static void JNICALL ReleaseStringUTFChars(JNIEnv* env, jstring string, const char* characters) {
    CLeanHost& host = HostOf(env);
    const size_t number = host.Find(string);
    host.Note('R', number);
    if (number == host.m_nTexts || host.m_texts[number].characters == nullptr) {
      host.Violation("ReleaseStringUTFChars: string is not held");
      return;
    }
    CLeanHost::Text& text = host.m_texts[number];
    const size_t size = text.text.size();
    if (characters != text.characters) {
      host.Violation("ReleaseStringUTFChars: not the pointer handed out");
    }
    if (!SameText({text.characters, size}, text.text) || text.characters[size] != '\0') {
      host.Violation("ReleaseStringUTFChars: the characters were written to");
    }
    TakeBack(text.characters, size + 1);
    text.characters = nullptr;
    text.released = true;
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
    if (!gateway_tests::IsModifiedUtf8(characters)) host.Violation("NewStringUTF: ill-formed text");
    // That the text ends, and was not released before, is for the address sanitizer to see.
    const size_t size = std::strlen(characters);
    if (size > CLeanHost::kMaxResult) {
      host.Violation("NewStringUTF: a text of no reason");
      return nullptr;
    }
    std::memcpy(host.m_szResult, characters, size);
    host.m_answer.result = {host.m_szResult, size};
    host.m_bResultMade = true;
    host.NoteText('N', host.m_answer.result);
    return host.ResultHandle();
  }
};

CLeanHost::CLeanHost() : m_table(gateway_tests::ForbiddenCalls()) {
  m_table.GetStringUTFChars = &LeanFunctions::GetStringUTFChars;
  m_table.ReleaseStringUTFChars = &LeanFunctions::ReleaseStringUTFChars;
  m_table.GetIntArrayElements = &LeanFunctions::GetIntArrayElements;
  m_table.ReleaseIntArrayElements = &LeanFunctions::ReleaseIntArrayElements;
  m_table.NewStringUTF = &LeanFunctions::NewStringUTF;
  m_environment.functions = &m_table;
  m_environment.host = this;
  Forbid(m_chHandles, sizeof m_chHandles);
  if (__sanitizer_install_malloc_and_free_hooks != nullptr) {
    __sanitizer_install_malloc_and_free_hooks(&OnMalloc, &OnFree);
  }
}

Answer CLeanHost::Call(void* entryPoint, const Export& row, const FuzzCall& call) {
  jvalue values[FuzzCall::kMaxArguments + 1];
  Begin(row, call, values);
  gateway_tests::ListenToLog(this);
  t_nBlocks = 0;
  const jstring returned = row.call(entryPoint, &m_environment, values);
  if (t_nBlocks > 0) Violation("memory was never freed");
  if (t_nBlocks < 0) Violation("memory of another was freed");
  gateway_tests::ListenToLog(nullptr);
  Finish(row, returned);
  return m_answer;
}

void CLeanHost::Begin(const Export& row, const FuzzCall& call, jvalue* values) {
  m_nTexts = 0;
  m_bResultMade = false;
  m_pElements = nullptr;
  m_nStatus = kUntouched;
  m_answer = {1, {}, 0, nullptr};
  for (const FuzzArgument& argument : call) {
    jvalue& value = *values++;
    if (argument.letter == 'i') {
      value.i = static_cast<jint>(argument.number);
    } else if (argument.letter == 'b') {
      value.b = static_cast<jbyte>(argument.number);
    } else if (argument.letter == 'c') {
      value.c = static_cast<jchar>(argument.number);
    } else {
      value.l = argument.null ? nullptr : static_cast<jobject>(Handle(m_nTexts));
      m_texts[m_nTexts++] = {argument.text, argument.null, false, nullptr};
    }
  }
  if (row.HasStatus()) values->l = StatusHandle();
}

void CLeanHost::Finish(const Export& row, jstring returned) {
  if (!m_bResultMade) Violation("there is no result");
  if (returned != ResultHandle()) Violation("the returned string is not the one made");
  if (m_pElements != nullptr) Violation("the status elements were never released");
  m_answer.status = row.HasStatus() ? m_nStatus : 1;
  if (m_answer.status != 1 && m_answer.status != -1) Violation("the status is not 1 or -1");
  Note('s', static_cast<uint32_t>(m_answer.status));
  const size_t firstKept = m_nTexts - static_cast<size_t>(row.keptStrings);
  for (size_t i = 0; i < m_nTexts; ++i) {
    const Text& text = m_texts[i];
    if (i < firstKept && text.characters != nullptr) Violation("a string was never released");
    if (i >= firstKept && text.released) {
      Violation("a string was released that this export keeps");
    }
    if (text.characters != nullptr) TakeBack(text.characters, text.text.size() + 1);
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
  if (m_answer.violation == nullptr) m_answer.violation = text;
}

void CLeanHost::Note(char event, uint64_t number) {
  Mix(m_answer.digest, static_cast<uint64_t>(event));
  Mix(m_answer.digest, number);
}

void CLeanHost::NoteText(char event, std::string_view text) {
  Note(event, text.size());
  uint64_t digest = m_answer.digest;
  size_t at = 0;
  for (; text.size() - at >= sizeof(uint64_t); at += sizeof(uint64_t)) {
    Mix(digest, WordAt(text.data() + at));
  }
  uint64_t rest = 0;
  for (; at < text.size(); ++at) rest = rest << 8 | static_cast<uint8_t>(text[at]);
  Mix(digest, rest);
  m_answer.digest = digest;
}

}  // namespace gateway_fuzz
