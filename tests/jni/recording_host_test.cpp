// The recording host itself: each thing that no entry point may do is seen.

#include "tests/support/recording_host.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

namespace gateway_tests {
namespace {

using DecodeFunction = jstring (*)(JNIEnv*, jclass, jstring, jintArray);

Outcome CallDecoder(DecodeFunction function, const Argument& reply = Argument::Text("text"),
                    Placement placement = Placement::kHeap) {
  CRecordingHost host(placement);
  return host.CallAt(reinterpret_cast<void*>(function), *FindExport("AuthDecode"), {reply});
}

// An entry point as it should be; the others below are this one with one mistake.
jstring Good(JNIEnv* env, jclass, jstring reply, jintArray status) {
  const char* text = env->GetStringUTFChars(reply, nullptr);
  jint* elements = env->GetIntArrayElements(status, nullptr);
  elements[0] = static_cast<jint>(std::strlen(text)) - 3;
  env->ReleaseStringUTFChars(reply, text);
  env->ReleaseIntArrayElements(status, elements, 0);
  return env->NewStringUTF("result");
}

TEST(RecordingHost, PassesAGoodCall) {
  const Outcome outcome = CallDecoder(&Good);
  EXPECT_TRUE(outcome.IsSound());
  EXPECT_EQ(outcome.result, "result");
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.fallibleCalls, 3);
}

TEST(RecordingHost, SeesAnIllFormedResult) {
  const Outcome outcome = CallDecoder([](JNIEnv* env, jclass, jstring reply, jintArray) {
    env->ReleaseStringUTFChars(reply, env->GetStringUTFChars(reply, nullptr));
    return env->NewStringUTF("12345\xE4");
  });
  EXPECT_EQ(outcome.violations, std::vector<std::string>{"NewStringUTF: ill-formed text"});
}

TEST(RecordingHost, SeesAStringThatIsNeverReleased) {
  const Outcome outcome = CallDecoder([](JNIEnv* env, jclass, jstring reply, jintArray) {
    env->GetStringUTFChars(reply, nullptr);
    return env->NewStringUTF("");
  });
  EXPECT_EQ(outcome.violations, std::vector<std::string>{"string 1 was never released"});
}

TEST(RecordingHost, SeesElementsThatAreNeverReleased) {
  const Outcome outcome = CallDecoder([](JNIEnv* env, jclass, jstring, jintArray status) {
    env->GetIntArrayElements(status, nullptr)[0] = 1;
    return env->NewStringUTF("");
  });
  EXPECT_EQ(outcome.violations,
            std::vector<std::string>{"the status elements were never released"});
  EXPECT_NE(outcome.status, 1) << "only a release writes back";
}

TEST(RecordingHost, WritesNothingBackWhenElementsAreAbandoned) {
  const Outcome outcome = CallDecoder([](JNIEnv* env, jclass, jstring, jintArray status) {
    jint* elements = env->GetIntArrayElements(status, nullptr);
    elements[0] = 1;
    env->ReleaseIntArrayElements(status, elements, JNI_ABORT);
    return env->NewStringUTF("");
  });
  EXPECT_NE(outcome.status, 1);
  EXPECT_FALSE(outcome.IsSound());
}

TEST(RecordingHost, SeesADoubleReleaseAndAForeignPointer) {
  const Outcome twice = CallDecoder([](JNIEnv* env, jclass, jstring reply, jintArray) {
    const char* text = env->GetStringUTFChars(reply, nullptr);
    env->ReleaseStringUTFChars(reply, text);
    env->ReleaseStringUTFChars(reply, text);
    return env->NewStringUTF("");
  });
  EXPECT_EQ(twice.violations,
            std::vector<std::string>{"ReleaseStringUTFChars: string is not held"});
  const Outcome foreign = CallDecoder([](JNIEnv* env, jclass, jstring reply, jintArray) {
    env->ReleaseStringUTFChars(reply, env->GetStringUTFChars(reply, nullptr) + 1);
    return env->NewStringUTF("");
  });
  EXPECT_EQ(foreign.violations,
            std::vector<std::string>{"ReleaseStringUTFChars: not the pointer handed out"});
}

TEST(RecordingHost, SeesAWriteIntoTheCharacters) {
  const Outcome outcome = CallDecoder([](JNIEnv* env, jclass, jstring reply, jintArray) {
    const char* text = env->GetStringUTFChars(reply, nullptr);
    const_cast<char*>(text)[0] = 'X';
    env->ReleaseStringUTFChars(reply, text);
    return env->NewStringUTF("");
  });
  EXPECT_EQ(outcome.violations,
            std::vector<std::string>{"ReleaseStringUTFChars: the characters were written to"});
}

TEST(RecordingHost, SeesARequestForTheCharactersOfNull) {
  const Outcome outcome = CallDecoder(
      [](JNIEnv* env, jclass, jstring reply, jintArray) {
        env->GetStringUTFChars(reply, nullptr);
        return env->NewStringUTF("");
      },
      Argument::Null());
  EXPECT_EQ(outcome.violations,
            std::vector<std::string>{"GetStringUTFChars: not a string of this call"});
}

TEST(RecordingHost, SeesAResultThatTheMachineDidNotMake) {
  const Outcome outcome =
      CallDecoder([](JNIEnv*, jclass, jstring reply, jintArray) { return reply; });
  EXPECT_EQ(outcome.violations,
            std::vector<std::string>{"the returned string is not the one made"});
}

TEST(RecordingHost, SeesAStringMadeWhileAnExceptionIsPending) {
  CRecordingHost host;
  host.FailCall(1);
  const Outcome outcome = host.CallAt(reinterpret_cast<void*>(static_cast<DecodeFunction>(
                                          [](JNIEnv* env, jclass, jstring reply, jintArray) {
                                            env->GetStringUTFChars(reply, nullptr);
                                            return env->NewStringUTF("");
                                          })),
                                      *FindExport("AuthDecode"), {Argument::Text("")});
  EXPECT_FALSE(outcome.violations.empty());
}

TEST(RecordingHost, KnowsTheStringsThatAccountOpeningKeeps) {
  Arguments arguments(3, Argument::Int(0));
  arguments.resize(3 + 8, Argument::Text(""));
  arguments.resize(3 + 8 + 2, Argument::Byte(0));
  using OpenFunction =
      jstring (*)(JNIEnv*, jclass, jint, jint, jint, jstring, jstring, jstring, jstring, jstring,
                  jstring, jstring, jstring, jbyte, jbyte, jintArray);
  const OpenFunction releasesAll = [](JNIEnv* env, jclass, jint, jint, jint, jstring, jstring,
                                      jstring, jstring, jstring, jstring, jstring, jstring last,
                                      jbyte, jbyte, jintArray) {
    env->ReleaseStringUTFChars(last, env->GetStringUTFChars(last, nullptr));
    return env->NewStringUTF("");
  };
  CRecordingHost host;
  const Outcome outcome = host.CallAt(reinterpret_cast<void*>(releasesAll),
                                      *FindExport("OpenAccountEncode"), arguments);
  EXPECT_EQ(outcome.violations,
            std::vector<std::string>{"string 8 was released, but this export keeps it"});
}

// A forbidden slot has not the type that it is called by; a sanitizer would speak before the slot.
#define ANY_FUNCTION_TYPE __attribute__((no_sanitize("undefined")))

ANY_FUNCTION_TYPE jstring AskForLength(JNIEnv* env, jclass, jstring reply, jintArray) {
  env->functions->GetStringUTFLength(env, reply);
  return nullptr;
}

ANY_FUNCTION_TYPE jstring AskForException(JNIEnv* env, jclass, jstring, jintArray) {
  env->functions->ExceptionCheck(env);
  return nullptr;
}

TEST(RecordingHostDeathTest, EndsOnAForbiddenCallWithItsName) {
  EXPECT_DEATH(CallDecoder(&AskForLength), "forbidden VM call: GetStringUTFLength");
  EXPECT_DEATH(CallDecoder(&AskForException), "forbidden VM call: ExceptionCheck");
}

// Reads `distance` bytes off the end (or, negative, off the begin) of the reply "text".
template <int kDistance>
jstring Overread(JNIEnv* env, jclass, jstring reply, jintArray) {
  const char* text = env->GetStringUTFChars(reply, nullptr);
  const volatile char* byte = text + (kDistance < 0 ? kDistance : 4 + kDistance);
  const char result[] = {*byte, '\0'};
  env->ReleaseStringUTFChars(reply, text);
  return env->NewStringUTF(result);
}

TEST(RecordingHostDeathTest, OneByteTooFarCrashes) {
  const Argument text = Argument::Text("text");
  EXPECT_DEATH(CallDecoder(&Overread<1>, text, Placement::kBeforeUnreadable), "");
  EXPECT_DEATH(CallDecoder(&Overread<-1>, text, Placement::kAfterUnreadable), "");
  EXPECT_EQ(CallDecoder(&Overread<0>, text, Placement::kBeforeUnreadable).result, "");
}

}  // namespace
}  // namespace gateway_tests
