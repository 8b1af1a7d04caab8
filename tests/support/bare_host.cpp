#include "tests/support/bare_host.h"

namespace gateway_tests {
namespace {

const char* JNICALL GetText(JNIEnv*, jstring text, jboolean*) {
  return reinterpret_cast<const char*>(text);
}
void JNICALL ReleaseText(JNIEnv*, jstring, const char*) {}
jint* JNICALL GetNumbers(JNIEnv*, jintArray numbers, jboolean*) {
  return reinterpret_cast<jint*>(numbers);
}
void JNICALL ReleaseNumbers(JNIEnv*, jintArray, jint*, jint) {}
jstring JNICALL NewText(JNIEnv*, const char* text) {
  return BareText(text);
}

JNINativeInterface_ MakeTable() {
  JNINativeInterface_ table{};
  table.GetStringUTFChars = GetText;
  table.ReleaseStringUTFChars = ReleaseText;
  table.GetIntArrayElements = GetNumbers;
  table.ReleaseIntArrayElements = ReleaseNumbers;
  table.NewStringUTF = NewText;
  return table;
}

}  // namespace

JNIEnv* BareHost() {
  static const JNINativeInterface_ s_Table = MakeTable();
  static JNIEnv s_Env{&s_Table};
  return &s_Env;
}

}  // namespace gateway_tests
