#ifndef TESTS_SUPPORT_BARE_HOST_H_
#define TESTS_SUPPORT_BARE_HOST_H_

#include <jni.h>

namespace gateway_tests {

// A JNI environment that costs nothing: a jstring is the terminated text itself, a jintArray the
// number itself, and nothing is copied, checked or released. What a call does in it is the
// library's own doing. A text that a call returns dies with the call.
JNIEnv* BareHost();

inline jstring BareText(const char* text) {
  return reinterpret_cast<jstring>(const_cast<char*>(text));
}
inline jintArray BareStatus(jint* status) {
  return reinterpret_cast<jintArray>(status);
}

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_BARE_HOST_H_
