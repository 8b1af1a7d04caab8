// The four entry points that depart from the common frame, event by event, and the sizes of
// certificate messages and account texts.

#include <gtest/gtest.h>

#include <iterator>
#include <string>
#include <vector>

#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

using TEvents = std::vector<std::string>;

constexpr size_t kRequestCapacity = 4095;  // the buffer's 4096 bytes without the terminator

const std::string kBareHeader =
    "F=7|KIND=S|BHNO=|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|";
const std::string kUserHeader =
    "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|"
    "15=1|IDNO=A123456789|ACNO=1234567|PWD=secret|";

TArguments Session() {
  return {TArgument::Int(0), TArgument::Int(0), TArgument::Int(7), TArgument::Text("SN0001"),
          TArgument::Text("10.0.0.1")};
}

TArguments Texts(const TEvents& texts) {
  TArguments arguments = Session();
  for (const std::string& text : texts) arguments.push_back(TArgument::Text(text));
  return arguments;
}

TEvents UserTexts(const std::string& message) {
  return {"9A00", "A123456789&1234567", "secret", "19800102", message};
}

TOutcome Call(const char* operation, const TArguments& arguments) {
  EXPECT_TRUE(SetClock("2024-01-15 13:45:21"));
  CRecordingHost host(EPlacement::kBeforeUnreadable);
  TOutcome outcome = host.Call(*FindExport(operation), arguments);
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.m_Violations);
  return outcome;
}

TEvents Repeated(const std::string& what, int count) {
  TEvents events;
  for (int i = 1; i <= count; ++i) events.push_back(what + " " + std::to_string(i));
  return events;
}

TEvents Joined(const std::vector<TEvents>& parts) {
  TEvents whole;
  for (const TEvents& part : parts) whole.insert(whole.end(), part.begin(), part.end());
  return whole;
}

TEST(FrameOfOpenAccount, LastThreeStringsAreNeverReleased) {
  TArguments arguments = Texts({"a", "A123456789&1234567", "b", "N", "A", "T"});
  arguments.push_back(TArgument::Byte(1));
  arguments.push_back(TArgument::Byte(-1));
  std::string header = kUserHeader;
  header.replace(header.find("9A00"), 4, "").replace(header.find("secret"), 6, "");
  const std::string request = header + "FUNC=9|NAME=N|ADDRESS=A|TEL=T|TIME=1|ITEM=255|01=";
  const TEvents expected = Joined(
      {Repeated("GetStringUTFChars", 8),
       {"GetIntArrayElements", "log A123456789", "log 1234567", "log " + header, "log " + request},
       Repeated("ReleaseStringUTFChars", 5),
       {"ReleaseIntArrayElements", "NewStringUTF " + request, "log ~CGatewayPub"}});
  EXPECT_EQ(Call("OpenAccountEncode", arguments).m_Events, expected);
}

TEST(FrameOfApplyCert, IdentityIsLoggedBeforeTheRequestIsBuilt) {
  const std::string request = kUserHeader + "FUNC=13|MSG=YWJj|BIRTH=19800102|01=";
  const TEvents expected =
      Joined({Repeated("GetStringUTFChars", 7),
              {"GetIntArrayElements", "log A123456789&1234567", "log A123456789", "log 1234567",
               "log " + kUserHeader, "log " + request},
              Repeated("ReleaseStringUTFChars", 7),
              {"ReleaseIntArrayElements", "NewStringUTF " + request, "log ~CGatewayPub"}});
  EXPECT_EQ(Call("ApplyCertEncode", Texts(UserTexts("abc"))).m_Events, expected);
}

TEST(FrameOfReNewCert, IsTheCommonOne) {
  const std::string request = kUserHeader + "FUNC=15|MSG=YWJj|BIRTH=19800102|01=";
  const TEvents expected =
      Joined({Repeated("GetStringUTFChars", 7),
              {"GetIntArrayElements", "log A123456789", "log 1234567", "log " + kUserHeader,
               "log " + request},
              Repeated("ReleaseStringUTFChars", 7),
              {"ReleaseIntArrayElements", "NewStringUTF " + request, "log ~CGatewayPub"}});
  EXPECT_EQ(Call("ReNewCertEncode", Texts(UserTexts("abc"))).m_Events, expected);
}

TEST(FrameOfRevokeCert, NameIsLoggedFirstOfAllThenTheIdentityThenTheTestLine) {
  const std::string request = kUserHeader + "FUNC=18|MSG=YWJj|BIRTH=19800102|01=";
  const TEvents expected =
      Joined({{"log Java_com_brindlex_kernel_quorvane_gatewayjni_RevokeCertEncode"},
              Repeated("GetStringUTFChars", 7),
              {"GetIntArrayElements", "log A123456789&1234567", "log A123456789", "log 1234567",
               "log " + kUserHeader, "log test1", "log " + request},
              Repeated("ReleaseStringUTFChars", 7),
              {"ReleaseIntArrayElements", "NewStringUTF " + request, "log ~CGatewayPub"}});
  EXPECT_EQ(Call("RevokeCertEncode", Texts(UserTexts("abc"))).m_Events, expected);
}

TEST(FrameOfGetCert2, StepsAreLoggedBetweenTheReleases) {
  const std::string request = kBareHeader + "FUNC=11|MSG=YWJj|01=";
  const TEvents expected = {
      "GetStringUTFChars 1",
      "GetStringUTFChars 2",
      "GetStringUTFChars 3",
      "GetIntArrayElements",
      "log regMsg Len:3",
      "log GetCertEncode2_1",
      "log ",
      "log ",
      "log GetCertEncode2_3",
      "log GetCertEncode2_4",
      "log GetCertEncode2_5",
      "log GetCertEncode2__6",
      "log GetCertEncode2__7",
      "log gatewayjni_GetCertEncode2_0",
      "log " + request,
      "log gatewayjni_GetCertEncode2_1",
      "ReleaseStringUTFChars 1",
      "log gatewayjni_GetCertEncode2_2",
      "ReleaseStringUTFChars 2",
      "log gatewayjni_GetCertEncode2_3",
      "ReleaseStringUTFChars 3",
      "log gatewayjni_GetCertEncode2_4",
      "ReleaseIntArrayElements",
      "log gatewayjni_GetCertEncode2_5",
      "NewStringUTF " + request,
      "log ~CGatewayPub",
  };
  EXPECT_EQ(Call("GetCertEncode2", Texts({"abc"})).m_Events, expected);
}

/// Plain Base64 of letters 'x', in lines: a third of a line's data at a time is "eHh4".
std::string Base64OfX(size_t count) {
  std::string text;
  for (size_t group = 1; group <= count / 3; ++group) {
    text += "eHh4";
    if (group % 256 == 0) text += "\r\n";
  }
  if (count % 3 == 1) text += "eA==";
  if (count % 3 == 2) text += "eHg=";
  return text;
}

struct TCertRequest {
  const char* m_szOperation;
  const char* m_szFunction;
  bool m_bUser;
};
void PrintTo(const TCertRequest& request, std::ostream* out) {
  *out << request.m_szOperation;
}

// Those with a birth date first, the one without a limit last.
constexpr TCertRequest kCertRequests[] = {
    {"ApplyCertEncode", "13", true},      {"ReNewCertEncode", "15", true},
    {"RevokeCertEncode", "18", true},     {"GetCertEncode", "11", false},
    {"GetCertEncode2", "11", false},      {"GetCertStatusEncode", "14", false},
    {"InstallCertOKEncode", "16", false}, {"OpenCertEncode", "17", false},
    {"RegisterCertEncode", "10", false},
};

class CertMessage : public testing::TestWithParam<TCertRequest> {
 protected:
  static TOutcome Encode(size_t count) {
    const std::string message(count, 'x');
    return Call(GetParam().m_szOperation,
                Texts(GetParam().m_bUser ? UserTexts(message) : TEvents{message}));
  }
  static std::string Request(size_t count) {
    return (GetParam().m_bUser ? kUserHeader : kBareHeader) + "FUNC=" + GetParam().m_szFunction +
           "|MSG=" + Base64OfX(count) + (GetParam().m_bUser ? "|BIRTH=19800102" : "") + "|01=";
  }
  static std::string ParameterError() {
    std::string name = GetParam().m_szOperation;
    if (name == "GetCertEncode2") name.pop_back();
    return name + "()傳入的參數錯誤";
  }
};

std::string NameOf(const testing::TestParamInfo<TCertRequest>& info) {
  return info.param.m_szOperation;
}

INSTANTIATE_TEST_SUITE_P(Operations, CertMessage, testing::ValuesIn(kCertRequests), NameOf);

using LimitedCertMessage = CertMessage;
INSTANTIATE_TEST_SUITE_P(Operations, LimitedCertMessage,
                         testing::ValuesIn(kCertRequests, std::end(kCertRequests) - 1), NameOf);

using CertMessageWithBirth = CertMessage;
INSTANTIATE_TEST_SUITE_P(Operations, CertMessageWithBirth,
                         testing::ValuesIn(kCertRequests, kCertRequests + 3), NameOf);

using EndlessCertMessage = CertMessage;
INSTANTIATE_TEST_SUITE_P(Operations, EndlessCertMessage,
                         testing::Values(*(std::end(kCertRequests) - 1)), NameOf);

TEST_P(CertMessage, IsWholeAboutEverySizeThatABufferOfItsOwnMightHave) {
  for (size_t size : {200U, 400U, 520U, 768U, 1024U, 1280U, 1536U, 2048U}) {
    // About the size itself, and about the message whose Base64 has that size.
    for (size_t middle : {size, size * 3 / 4}) {
      for (size_t count = middle - 3; count <= middle + 3; ++count) {
        const TOutcome outcome = Encode(count);
        EXPECT_EQ(outcome.m_Result, Request(count)) << count;
        EXPECT_EQ(outcome.m_Status, 1) << count;
      }
    }
  }
}

TEST_P(LimitedCertMessage, IsSentAsLongAsTheRequestFitsAndThenRefusedByName) {
  size_t longest = 2048;
  while (Request(longest + 1).size() <= kRequestCapacity) ++longest;
  EXPECT_EQ(Encode(longest).m_Result, Request(longest));
  for (size_t count : {longest + 1, longest + 2, longest + 1000, size_t{1} << 20}) {
    const TOutcome outcome = Encode(count);
    EXPECT_EQ(outcome.m_Result, ParameterError()) << count;
    EXPECT_EQ(outcome.m_Status, -1) << count;
  }
}

// One request of exactly the buffer's size, one a byte longer: the birth date makes up the rest.
TEST_P(CertMessageWithBirth, FillsTheBufferToItsLastByte) {
  TEvents texts = UserTexts("xxx");
  texts[3] += std::string(kRequestCapacity - Request(3).size(), '9');
  const TOutcome fits = Call(GetParam().m_szOperation, Texts(texts));
  EXPECT_EQ(fits.m_Result.value().size(), kRequestCapacity);
  EXPECT_EQ(fits.m_Status, 1);
  texts[3] += "9";
  const TOutcome over = Call(GetParam().m_szOperation, Texts(texts));
  EXPECT_EQ(over.m_Result, ParameterError());
  EXPECT_EQ(over.m_Status, -1);
}

TEST_P(EndlessCertMessage, OfAMebibyteIsSentWhole) {
  for (size_t count : {size_t{4096}, (size_t{1} << 20) - 1, size_t{1} << 20}) {
    const TOutcome outcome = Encode(count);
    EXPECT_TRUE(outcome.m_Result == Request(count)) << count;
    EXPECT_EQ(outcome.m_Status, 1);
  }
}

TEST(CertReply, TextOfAMebibyteComesBackWhole) {
  const std::string text(size_t{1} << 20, 't');
  for (const char* operation : {"RegisterCertDecode", "GetCertDecode", "OpenCertDecode"}) {
    const TOutcome accepted =
        Call(operation, {TArgument::Text("|00=|68=0000|M2=" + text + "|01=")});
    EXPECT_TRUE(accepted.m_Result == text) << operation;
    EXPECT_EQ(accepted.m_Status, 1);
    const TOutcome refused = Call(operation, {TArgument::Text("|00=|68=E|M2=" + text + "|01=")});
    EXPECT_TRUE(refused.m_Result == "[CERT]E " + text) << operation;
    EXPECT_EQ(refused.m_Status, -1);
  }
}

// The escape may make a request too long that was not.
TEST(EscapedRequest, BlanksCountThreefoldAgainstTheBuffer) {
  const auto change = [](const std::string& password) {
    return Call("ChangePasswordEncode", Texts({"9A00", "A123456789&1234567", "secret", password}));
  };
  const size_t bare = change("").m_Result.value().size();
  const size_t blanks = (kRequestCapacity - bare) / 3;
  const TOutcome fits = change(std::string(blanks, ' '));
  EXPECT_EQ(fits.m_Result.value().size(), bare + 3 * blanks);
  EXPECT_EQ(fits.m_Status, 1);
  const TOutcome over = change(std::string(blanks + 1, ' '));
  EXPECT_EQ(over.m_Result, "[CLIENT]傳入的參數錯誤");
  EXPECT_EQ(over.m_Status, -1);
}

}  // namespace
}  // namespace gateway_tests
