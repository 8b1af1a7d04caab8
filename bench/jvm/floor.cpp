// The least that a call costs: natives of the same signatures as the host class's, which take their
// strings, give them back and return a text that was laid ready. Preloaded, this library also drops
// what libquorvane.so logs.
#include <jni.h>

#include <cstdlib>
#include <cstring>

namespace {

char* g_answer = nullptr;

jstring Cross(JNIEnv* env, const jstring* texts, size_t count) {
  constexpr size_t kMost = 16;
  const char* characters[kMost];
  for (size_t i = 0; i < count; ++i) characters[i] = env->GetStringUTFChars(texts[i], nullptr);
  for (size_t i = 0; i < count; ++i) env->ReleaseStringUTFChars(texts[i], characters[i]);
  return env->NewStringUTF(g_answer);
}

}  // namespace

#define BENCH_NATIVE(type, name) \
  extern "C" JNIEXPORT type JNICALL Java_com_brindlex_kernel_quorvane_bench_CrossingFloor_##name

BENCH_NATIVE(void, layReady)(JNIEnv* env, jclass, jstring answer) {
  const char* const text = env->GetStringUTFChars(answer, nullptr);
  free(g_answer);
  g_answer = strdup(text);
  env->ReleaseStringUTFChars(answer, text);
}

BENCH_NATIVE(jstring, decode)(JNIEnv* env, jclass, jstring reply, jintArray) {
  const jstring texts[] = {reply};
  return Cross(env, texts, 1);
}

BENCH_NATIVE(jstring, user)
(JNIEnv* env, jclass, jint, jint, jint, jstring serialNo, jstring localIP, jstring branch,
 jstring identity, jstring password, jintArray) {
  const jstring texts[] = {serialNo, localIP, branch, identity, password};
  return Cross(env, texts, 5);
}

BENCH_NATIVE(jstring, stockOrder)
(JNIEnv* env, jclass, jint, jint, jint, jstring serialNo, jstring localIP, jstring branch,
 jstring identity, jstring password, jstring stockCode, jstring orderDate, jint, jint, jint, jbyte,
 jbyte, jbyte, jbyte, jbyte, jbyte, jintArray) {
  const jstring texts[] = {serialNo, localIP, branch, identity, password, stockCode, orderDate};
  return Cross(env, texts, 7);
}

BENCH_NATIVE(jstring, futuresOrder)
(JNIEnv* env, jclass, jint, jint, jint, jstring serialNo, jstring localIP, jstring branch,
 jstring identity, jstring password, jstring orderRef, jstring orderDate, jstring commodity1,
 jstring commodity2, jstring month1, jstring month2, jstring strike1, jstring strike2,
 jstring callPut1, jstring callPut2, jbyte, jbyte, jbyte, jchar, jchar, jchar, jchar, jchar, jchar,
 jint, jint, jint, jintArray) {
  const jstring texts[] = {serialNo, localIP,   branch,     identity,   password,
                           orderRef, orderDate, commodity1, commodity2, month1,
                           month2,   strike1,   strike2,    callPut1,   callPut2};
  return Cross(env, texts, 15);
}

extern "C" JNIEXPORT int __android_log_write(int, const char*, const char*) {
  return 1;
}
