// The frame of the entry points: which VM calls and log lines a call makes, in their exact order.

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <string>
#include <vector>

#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

using Events = std::vector<std::string>;

constexpr int32_t kUntouched = 0x5A5A;
const std::string kHeader =
    "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|"
    "15=1|IDNO=A123456789|ACNO=1234567|PWD=secret|";
const std::string kBrokerDown = "[BROKER]主機連線失敗";

// The arguments of a request, in Java order.
Arguments Request() {
  return {Argument::Int(0),
          Argument::Int(0),
          Argument::Int(7),
          Argument::Text("SN0001"),
          Argument::Text("10.0.0.1"),
          Argument::Text("9A00"),
          Argument::Text("A123456789&1234567"),
          Argument::Text("secret")};
}

struct Operation {
  const char* encode;
  const char* decode;
  const char* function;
};
void PrintTo(const Operation& operation, std::ostream* out) {
  *out << operation.encode;
}

class Frame : public testing::TestWithParam<Operation> {
 protected:
  void SetUp() override { ASSERT_TRUE(SetClock("2024-01-15 13:45:21")); }
  Outcome Encode(const Arguments& arguments) {
    return m_host.Call(*FindExport(GetParam().encode), arguments);
  }
  Outcome Decode(const Argument& reply) {
    return m_host.Call(*FindExport(GetParam().decode), {reply});
  }
  std::string RequestText() const { return kHeader + GetParam().function; }

  CRecordingHost m_host;
};

std::string NameOf(const testing::TestParamInfo<Operation>& info) {
  return info.param.encode;
}

INSTANTIATE_TEST_SUITE_P(Operations, Frame,
                         testing::Values(Operation{"AuthEncode", "AuthDecode", "FUNC=0|01="},
                                         Operation{"GetTotalAccountEncode", "GetTotalAccountDecode",
                                                   "FUNC=12|01="}),
                         NameOf);

TEST_P(Frame, RequestHoldsAllThenBuildsThenReleasesThenAnswers) {
  const Outcome outcome = Encode(Request());
  const Events expected = {
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
  EXPECT_EQ(outcome.events, expected);
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.violations);
  EXPECT_EQ(outcome.result, RequestText());
  EXPECT_EQ(outcome.status, 1);
}

TEST_P(Frame, RefusedRequestTakesTheSameRoad) {
  Arguments arguments = Request();
  arguments[4] = Argument::Text("");
  const std::string message = "[CLIENT] 無法取得IP，請確認網路連線是否正常！";
  const Events expected = {
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
  const Outcome outcome = Encode(arguments);
  EXPECT_EQ(outcome.events, expected);
  EXPECT_EQ(outcome.status, -1);
}

TEST_P(Frame, ReplyHoldsAllThenReadsThenReleasesThenAnswers) {
  const Outcome outcome = Decode(Argument::Text("[BROKER]timeout"));
  const Events expected = {
      "GetStringUTFChars 1",
      "GetIntArrayElements",
      std::string("log ") + GetParam().decode + ": Len:15",
      "log [BROKER]timeout",
      "log " + kBrokerDown,
      "ReleaseStringUTFChars 1",
      "ReleaseIntArrayElements",
      "NewStringUTF " + kBrokerDown,
      "log ~CGatewayPub",
  };
  EXPECT_EQ(outcome.events, expected);
  EXPECT_EQ(outcome.status, -1);
}

// Lengths that end at the sizes of numbers, and longer ones.
TEST(Log, TellsTheLengthOfRepliesOfAnySize) {
  size_t decoders = 0;
  for (const Export& row : AllExports()) {
    if (!row.IsDecoder()) continue;
    size_t told = 0;
    const size_t lengths[] = {127, 128, 255, 256, 9999, 32768, 65535, 65536, 99999, 1 << 20};
    for (const size_t length : lengths) {
      Arguments arguments = {Argument::Text(std::string(length, '|'))};
      if (row.shape.front() == 'i') arguments.insert(arguments.begin(), Argument::Int(0));
      CRecordingHost host;
      const Events lines = host.Call(row, arguments).logLines;
      const auto line = std::find_if(lines.begin(), lines.end(), [](const std::string& text) {
        return text.find("Len:") != std::string::npos;
      });
      if (line == lines.end()) continue;
      ++told;
      EXPECT_EQ(line->substr(line->find("Len:")), "Len:" + std::to_string(length)) << row.name;
    }
    EXPECT_TRUE(told == 0 || told == std::size(lengths)) << row.name;
    if (told != 0) ++decoders;
  }
  EXPECT_EQ(decoders, 17U);
}

TEST_P(Frame, NullReplyIsHandedOnWithoutAskingTheMachine) {
  const Outcome outcome = Decode(Argument::Null());
  const Events expected = {
      "GetIntArrayElements",
      std::string("log ") + GetParam().decode + ": Len:0",
      "log ",
      "log " + kBrokerDown,
      "ReleaseIntArrayElements",
      "NewStringUTF " + kBrokerDown,
      "log ~CGatewayPub",
  };
  EXPECT_EQ(outcome.events, expected);
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.violations);
}

TEST_P(Frame, NullStringsOfARequestAreNeitherHeldNorReleased) {
  Arguments arguments = Request();
  arguments[3] = Argument::Null();
  arguments[5] = Argument::Null();
  arguments[6] = Argument::Null();
  const std::string header =
      "F=7|KIND=S|BHNO=|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=|";
  const std::string request = header + GetParam().function;
  const Events expected = {
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
  EXPECT_EQ(Encode(arguments).events, expected);
}

TEST_P(Frame, NullStatusArrayIsLeftAlone) {
  m_host.PassNullStatus(true);
  const Outcome request = Encode(Request());
  EXPECT_TRUE(request.IsSound()) << testing::PrintToString(request.violations);
  EXPECT_EQ(request.result, RequestText());
  EXPECT_EQ(request.status, std::nullopt);
  const Events expected = {
      "GetStringUTFChars 1",
      std::string("log ") + GetParam().decode + ": Len:0",
      "log ",
      "log " + kBrokerDown,
      "ReleaseStringUTFChars 1",
      "NewStringUTF " + kBrokerDown,
      "log ~CGatewayPub",
  };
  EXPECT_EQ(Decode(Argument::Text("")).events, expected);
}

TEST_P(Frame, RefusedCharactersEndTheCallBeforeAnythingIsBuilt) {
  for (int failing = 1; failing <= 5; ++failing) {
    m_host.FailCall(failing);
    Events expected;
    for (int i = 1; i <= failing; ++i) {
      expected.push_back("GetStringUTFChars " + std::to_string(i));
    }
    for (int i = 1; i < failing; ++i) {
      expected.push_back("ReleaseStringUTFChars " + std::to_string(i));
    }
    const Outcome outcome = Encode(Request());
    EXPECT_EQ(outcome.events, expected) << failing;
    EXPECT_EQ(outcome.violations, Events()) << failing;
    EXPECT_EQ(outcome.result, std::nullopt) << failing;
    EXPECT_EQ(outcome.status, kUntouched) << failing;
  }
}

TEST_P(Frame, RefusedElementsEndTheCallBeforeAnythingIsBuilt) {
  m_host.FailCall(6);
  const Outcome request = Encode(Request());
  const Events expected = {
      "GetStringUTFChars 1",     "GetStringUTFChars 2",     "GetStringUTFChars 3",
      "GetStringUTFChars 4",     "GetStringUTFChars 5",     "GetIntArrayElements",
      "ReleaseStringUTFChars 1", "ReleaseStringUTFChars 2", "ReleaseStringUTFChars 3",
      "ReleaseStringUTFChars 4", "ReleaseStringUTFChars 5",
  };
  EXPECT_EQ(request.events, expected);
  EXPECT_EQ(request.result, std::nullopt);

  m_host.FailCall(2);
  const Outcome reply = Decode(Argument::Text("|68=0000|"));
  EXPECT_EQ(reply.events,
            (Events{"GetStringUTFChars 1", "GetIntArrayElements", "ReleaseStringUTFChars 1"}));
  EXPECT_EQ(reply.result, std::nullopt);
  EXPECT_EQ(reply.status, kUntouched);
}

TEST_P(Frame, RefusedResultStringGivesNullAndTheStatus) {
  m_host.FailCall(3);
  const Outcome outcome = Decode(Argument::Text(""));
  EXPECT_EQ(outcome.events.back(), "log ~CGatewayPub");
  EXPECT_EQ(outcome.violations, Events());
  EXPECT_EQ(outcome.result, std::nullopt);
  EXPECT_EQ(outcome.status, -1);
}

TEST_P(Frame, NothingSurvivesACall) {
  const Outcome first = Encode(Request());
  Arguments refused = Request();
  refused[4] = Argument::Null();
  EXPECT_EQ(Encode(refused).status, -1);
  EXPECT_EQ(Encode(Request()).events, first.events);
}

TEST(PlatformNames, AreShortCapitalsAndOnlyTwoRowsAreAlike) {
  ASSERT_TRUE(SetClock("2024-01-15 13:45:21"));
  constexpr int kRows = 15;
  std::vector<std::string> names;
  CRecordingHost host;
  for (int row = 0; row < kRows; ++row) {
    Arguments arguments = Request();
    arguments[1] = Argument::Int(row);
    const std::string request = host.Call(*FindExport("AuthEncode"), arguments).result.value();
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
