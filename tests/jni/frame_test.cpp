// The frame of the entry points: which VM calls and log lines a call makes, in their exact order.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

using TEvents = std::vector<std::string>;

constexpr int32_t kUntouched = 0x5A5A;
const std::string kHeader =
    "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|"
    "15=1|IDNO=A123456789|ACNO=1234567|PWD=secret|";
const std::string kBrokerDown = "[BROKER]主機連線失敗";

/// The arguments of a request, in Java order.
TArguments Request() {
  return {TArgument::Int(0),
          TArgument::Int(0),
          TArgument::Int(7),
          TArgument::Text("SN0001"),
          TArgument::Text("10.0.0.1"),
          TArgument::Text("9A00"),
          TArgument::Text("A123456789&1234567"),
          TArgument::Text("secret")};
}

struct TOperation {
  const char* m_szEncode;
  const char* m_szDecode;
  const char* m_szFunction;
};
void PrintTo(const TOperation& operation, std::ostream* out) {
  *out << operation.m_szEncode;
}

class Frame : public testing::TestWithParam<TOperation> {
 protected:
  void SetUp() override { ASSERT_TRUE(SetClock("2024-01-15 13:45:21")); }
  TOutcome Encode(const TArguments& arguments) {
    return m_Host.Call(*FindExport(GetParam().m_szEncode), arguments);
  }
  TOutcome Decode(const TArgument& reply) {
    return m_Host.Call(*FindExport(GetParam().m_szDecode), {reply});
  }
  std::string RequestText() const { return kHeader + GetParam().m_szFunction; }

  CRecordingHost m_Host;
};

std::string NameOf(const testing::TestParamInfo<TOperation>& info) {
  return info.param.m_szEncode;
}

INSTANTIATE_TEST_SUITE_P(Operations, Frame,
                         testing::Values(TOperation{"AuthEncode", "AuthDecode", "FUNC=0|01="},
                                         TOperation{"GetTotalAccountEncode",
                                                    "GetTotalAccountDecode", "FUNC=12|01="}),
                         NameOf);

TEST_P(Frame, RequestHoldsAllThenBuildsThenReleasesThenAnswers) {
  const TOutcome outcome = Encode(Request());
  const TEvents expected = {
      "GetStringUTFChars 1",
      "GetStringUTFChars 2",
      "GetStringUTFChars 3",
      "GetStringUTFChars 4",
      "GetStringUTFChars 5",
      "GetIntArrayElements",
      "log A123456789",
      "log 1234567",
      "log " + kHeader,
      "log " + RequestText(),
      "ReleaseStringUTFChars 1",
      "ReleaseStringUTFChars 2",
      "ReleaseStringUTFChars 3",
      "ReleaseStringUTFChars 4",
      "ReleaseStringUTFChars 5",
      "ReleaseIntArrayElements",
      "NewStringUTF " + RequestText(),
      "log ~CGatewayPub",
  };
  EXPECT_EQ(outcome.m_Events, expected);
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.m_Violations);
  EXPECT_EQ(outcome.m_Result, RequestText());
  EXPECT_EQ(outcome.m_Status, 1);
}

TEST_P(Frame, RefusedRequestTakesTheSameRoad) {
  TArguments arguments = Request();
  arguments[4] = TArgument::Text("");
  const std::string message = "[CLIENT] 無法取得IP，請確認網路連線是否正常！";
  const TEvents expected = {
      "GetStringUTFChars 1",     "GetStringUTFChars 2",
      "GetStringUTFChars 3",     "GetStringUTFChars 4",
      "GetStringUTFChars 5",     "GetIntArrayElements",
      "log A123456789",          "log 1234567",
      "log " + message,          "ReleaseStringUTFChars 1",
      "ReleaseStringUTFChars 2", "ReleaseStringUTFChars 3",
      "ReleaseStringUTFChars 4", "ReleaseStringUTFChars 5",
      "ReleaseIntArrayElements", "NewStringUTF " + message,
      "log ~CGatewayPub",
  };
  const TOutcome outcome = Encode(arguments);
  EXPECT_EQ(outcome.m_Events, expected);
  EXPECT_EQ(outcome.m_Status, -1);
}

TEST_P(Frame, ReplyHoldsAllThenReadsThenReleasesThenAnswers) {
  const TOutcome outcome = Decode(TArgument::Text("[BROKER]timeout"));
  const TEvents expected = {
      "GetStringUTFChars 1",
      "GetIntArrayElements",
      std::string("log ") + GetParam().m_szDecode + ": Len:15",
      "log [BROKER]timeout",
      "log " + kBrokerDown,
      "ReleaseStringUTFChars 1",
      "ReleaseIntArrayElements",
      "NewStringUTF " + kBrokerDown,
      "log ~CGatewayPub",
  };
  EXPECT_EQ(outcome.m_Events, expected);
  EXPECT_EQ(outcome.m_Status, -1);
}

TEST_P(Frame, NullReplyIsHandedOnWithoutAskingTheMachine) {
  const TOutcome outcome = Decode(TArgument::Null());
  const TEvents expected = {
      "GetIntArrayElements",
      std::string("log ") + GetParam().m_szDecode + ": Len:0",
      "log ",
      "log " + kBrokerDown,
      "ReleaseIntArrayElements",
      "NewStringUTF " + kBrokerDown,
      "log ~CGatewayPub",
  };
  EXPECT_EQ(outcome.m_Events, expected);
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.m_Violations);
}

TEST_P(Frame, NullStringsOfARequestAreNeitherHeldNorReleased) {
  TArguments arguments = Request();
  arguments[3] = TArgument::Null();
  arguments[5] = TArgument::Null();
  arguments[6] = TArgument::Null();
  const std::string header =
      "F=7|KIND=S|BHNO=|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=|";
  const std::string request = header + GetParam().m_szFunction;
  const TEvents expected = {
      "GetStringUTFChars 2",
      "GetStringUTFChars 5",
      "GetIntArrayElements",
      "log ",
      "log ",
      "log " + request,
      "ReleaseStringUTFChars 2",
      "ReleaseStringUTFChars 5",
      "ReleaseIntArrayElements",
      "NewStringUTF " + request,
      "log ~CGatewayPub",
  };
  EXPECT_EQ(Encode(arguments).m_Events, expected);
}

TEST_P(Frame, NullStatusArrayIsLeftAlone) {
  m_Host.PassNullStatus(true);
  const TOutcome request = Encode(Request());
  EXPECT_TRUE(request.IsSound()) << testing::PrintToString(request.m_Violations);
  EXPECT_EQ(request.m_Result, RequestText());
  EXPECT_EQ(request.m_Status, std::nullopt);
  const TEvents expected = {
      "GetStringUTFChars 1",
      std::string("log ") + GetParam().m_szDecode + ": Len:0",
      "log ",
      "log " + kBrokerDown,
      "ReleaseStringUTFChars 1",
      "NewStringUTF " + kBrokerDown,
      "log ~CGatewayPub",
  };
  EXPECT_EQ(Decode(TArgument::Text("")).m_Events, expected);
}

TEST_P(Frame, RefusedCharactersEndTheCallBeforeAnythingIsBuilt) {
  for (int failing = 1; failing <= 5; ++failing) {
    m_Host.FailCall(failing);
    TEvents expected;
    for (int i = 1; i <= failing; ++i) {
      expected.push_back("GetStringUTFChars " + std::to_string(i));
    }
    for (int i = 1; i < failing; ++i) {
      expected.push_back("ReleaseStringUTFChars " + std::to_string(i));
    }
    const TOutcome outcome = Encode(Request());
    EXPECT_EQ(outcome.m_Events, expected) << failing;
    EXPECT_EQ(outcome.m_Violations, TEvents()) << failing;
    EXPECT_EQ(outcome.m_Result, std::nullopt) << failing;
    EXPECT_EQ(outcome.m_Status, kUntouched) << failing;
  }
}

TEST_P(Frame, RefusedElementsEndTheCallBeforeAnythingIsBuilt) {
  m_Host.FailCall(6);
  const TOutcome request = Encode(Request());
  const TEvents expected = {
      "GetStringUTFChars 1",     "GetStringUTFChars 2",     "GetStringUTFChars 3",
      "GetStringUTFChars 4",     "GetStringUTFChars 5",     "GetIntArrayElements",
      "ReleaseStringUTFChars 1", "ReleaseStringUTFChars 2", "ReleaseStringUTFChars 3",
      "ReleaseStringUTFChars 4", "ReleaseStringUTFChars 5",
  };
  EXPECT_EQ(request.m_Events, expected);
  EXPECT_EQ(request.m_Result, std::nullopt);

  m_Host.FailCall(2);
  const TOutcome reply = Decode(TArgument::Text("|68=0000|"));
  EXPECT_EQ(reply.m_Events,
            (TEvents{"GetStringUTFChars 1", "GetIntArrayElements", "ReleaseStringUTFChars 1"}));
  EXPECT_EQ(reply.m_Result, std::nullopt);
  EXPECT_EQ(reply.m_Status, kUntouched);
}

TEST_P(Frame, RefusedResultStringGivesNullAndTheStatus) {
  m_Host.FailCall(3);
  const TOutcome outcome = Decode(TArgument::Text(""));
  EXPECT_EQ(outcome.m_Events.back(), "log ~CGatewayPub");
  EXPECT_EQ(outcome.m_Violations, TEvents());
  EXPECT_EQ(outcome.m_Result, std::nullopt);
  EXPECT_EQ(outcome.m_Status, -1);
}

TEST_P(Frame, NothingSurvivesACall) {
  const TOutcome first = Encode(Request());
  TArguments refused = Request();
  refused[4] = TArgument::Null();
  EXPECT_EQ(Encode(refused).m_Status, -1);
  EXPECT_EQ(Encode(Request()).m_Events, first.m_Events);
}

TEST(PlatformNames, AreShortCapitalsAndOnlyTwoRowsAreAlike) {
  ASSERT_TRUE(SetClock("2024-01-15 13:45:21"));
  constexpr int kRows = 15;
  std::vector<std::string> names;
  CRecordingHost host;
  for (int row = 0; row < kRows; ++row) {
    TArguments arguments = Request();
    arguments[1] = TArgument::Int(row);
    const std::string request = host.Call(*FindExport("AuthEncode"), arguments).m_Result.value();
    const size_t begin = request.find("|11=") + 4;
    names.push_back(request.substr(begin, request.find('|', begin) - begin));
  }
  for (size_t row = 0; row < kRows; ++row) {
    if (row <= 4 || row == 6 || row == 8) {
      EXPECT_EQ(names[row], "NO DEFINE") << row;
      continue;
    }
    EXPECT_GE(names[row].size(), 1U) << row;
    EXPECT_LE(names[row].size(), 8U) << row;
    const char* const allowed = "ABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789";
    EXPECT_EQ(names[row].find_first_not_of(allowed), std::string::npos) << names[row];
    for (size_t other = 0; other < row; ++other) {
      const bool alike = other == 10 && row == 14;
      EXPECT_EQ(names[row] == names[other], alike) << row << " and " << other;
    }
  }
}

}  // namespace
}  // namespace gateway_tests
