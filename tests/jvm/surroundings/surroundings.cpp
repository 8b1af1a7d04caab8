// What the tests in a Java virtual machine put around the library: loaded in front of all others
// (LD_PRELOAD), this object answers the library's calls of `time` and `__android_log_write`, for a
// thread that asked for it and only until that thread is done. The machine keeps its own clock.

#include <jni.h>

#include <ctime>
#include <string>
#include <vector>

#include "tests/support/call_table.h"

namespace {

thread_local bool t_bActive = false;
thread_local std::time_t t_tClock = 0;
thread_local std::vector<std::string> t_LogLines;

// A Java String[] of modified UTF-8 texts; null when the machine ran out of memory.
jobjectArray MakeArray(JNIEnv* env, const std::vector<std::string>& texts) {
  jclass string = env->FindClass("java/lang/String");
  if (string == nullptr) return nullptr;
  jobjectArray array = env->NewObjectArray(static_cast<jsize>(texts.size()), string, nullptr);
  for (size_t i = 0; array != nullptr && i < texts.size(); ++i) {
    jstring text = env->NewStringUTF(texts[i].c_str());
    if (text == nullptr) return nullptr;
    env->SetObjectArrayElement(array, static_cast<jsize>(i), text);
    if (env->ExceptionCheck()) return nullptr;
    env->DeleteLocalRef(text);
  }
  return array;
}

}  // namespace

extern "C" {

__attribute__((visibility("default"))) std::time_t time(std::time_t* out) noexcept {
  std::time_t now = t_tClock;
  if (!t_bActive) {
    std::timespec real{};
    clock_gettime(CLOCK_REALTIME, &real);
    now = real.tv_sec;
  }
  if (out != nullptr) *out = now;
  return now;
}

__attribute__((visibility("default"))) int __android_log_write(int priority, const char* tag,
                                                               const char* text) {
  if (!t_bActive) return 1;
  const bool expected = priority == 3 && tag != nullptr && std::string(tag) == "gatewayjni";
  if (expected && text != nullptr) {
    t_LogLines.emplace_back(text);
  } else {
    t_LogLines.emplace_back("a null text, another priority or another tag");
  }
  return 1;
}

JNIEXPORT void JNICALL Java_com_brindlex_kernel_quorvane_Surroundings_enter(JNIEnv*, jclass,
                                                                            jlong clock) {
  t_tClock = static_cast<std::time_t>(clock);
  t_LogLines.clear();
  t_bActive = true;
}

JNIEXPORT jobjectArray JNICALL Java_com_brindlex_kernel_quorvane_Surroundings_leave(JNIEnv* env,
                                                                                    jclass) {
  t_bActive = false;
  return MakeArray(env, t_LogLines);
}

JNIEXPORT jobjectArray JNICALL
Java_com_brindlex_kernel_quorvane_Surroundings_nativeMethods(JNIEnv* env, jclass) {
  std::vector<std::string> methods;
  for (const auto& row : gateway_tests::AllExports()) {
    methods.push_back(std::string(row.name) + row.Descriptor());
  }
  return MakeArray(env, methods);
}

JNIEXPORT jobjectArray JNICALL
Java_com_brindlex_kernel_quorvane_Surroundings_argumentNames(JNIEnv* env, jclass) {
  std::vector<std::string> methods;
  for (const auto& row : gateway_tests::AllExports()) {
    methods.push_back(std::string(row.name).append(" ").append(row.argumentNames));
  }
  return MakeArray(env, methods);
}

}  // extern "C"
