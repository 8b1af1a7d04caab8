#ifndef TESTS_SUPPORT_FORBIDDEN_CALLS_H_
#define TESTS_SUPPORT_FORBIDDEN_CALLS_H_

#include <jni.h>

namespace gateway_tests {

// A table of VM functions each of which ends the program with its name. A host puts its own in
// the places of the few that it serves.
JNINativeInterface_ ForbiddenCalls();

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_FORBIDDEN_CALLS_H_
