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

using Events = std::vector<std::string>;

constexpr size_t kRequestCapacity = 4095;  // the buffer's 4096 bytes without the terminator

const std::string kBareHeader =
    "F=7|KIND=S|BHNO=|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|";
const std::string kUserHeader =
    "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|"
    "15=1|IDNO=A123456789|ACNO=1234567|PWD=secret|";

Arguments Session() {
  return {Argument::Int(0), Argument::Int(0), Argument::Int(7), Argument::Text("SN0001"),
          Argument::Text("10.0.0.1")};
}

Arguments Texts(const Events& texts) {
  Arguments arguments = Session();
  for (const std::string& text : texts) arguments.push_back(Argument::Text(text));
  return arguments;
}

Events UserTexts(const std::string& message) {
  return {"9A00", "A123456789&1234567", "secret", "19800102", message};
}

Outcome Call(const char* operation, const Arguments& arguments) {
  EXPECT_TRUE(SetClock("2024-01-15 13:45:21"));
  CRecordingHost host(Placement::kBeforeUnreadable);
  Outcome outcome = host.Call(*FindExport(operation), arguments);
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.violations);
  return outcome;
}

Events Repeated(const std::string& what, int count) {
  Events events;
  for (int i = 1; i <= count; ++i) events.push_back(what + " " + std::to_string(i));
  return events;
}

Events Joined(const std::vector<Events>& parts) {
  Events whole;
  for (const Events& part : parts) whole.insert(whole.end(), part.begin(), part.end());
  return whole;
}

TEST(FrameOfOpenAccount, LastThreeStringsAreNeverReleased) {
  Arguments arguments = Texts({"a", "A123456789&1234567", "b", "N", "A", "T"});
  arguments.push_back(Argument::Byte(1));
  arguments.push_back(Argument::Byte(-1));
  std::string header = kUserHeader;
  header.replace(header.find("9A00"), 4, "").replace(header.find("secret"), 6, "");
  const std::string request = header + "FUNC=9|NAME=N|ADDRESS=A|TEL=T|TIME=1|ITEM=255|01=";
  const Events expected = Joined(
      {Repeated("GetStringUTFChars", 8),
       {"GetIntArrayElements", "log A123456789", "log 1234567", "log " + header, "log " + request},
       Repeated("ReleaseStringUTFChars", 5),
       {"ReleaseIntArrayElements", "NewStringUTF " + request, "log ~CGatewayPub"}});
  EXPECT_EQ(Call("OpenAccountEncode", arguments).events, expected);
}

TEST(FrameOfApplyCert, IdentityIsLoggedBeforeTheRequestIsBuilt) {
  const std::string request = kUserHeader + "FUNC=13|MSG=YWJj|BIRTH=19800102|01=";
  const Events expected =
      Joined({Repeated("GetStringUTFChars", 7),
              {"GetIntArrayElements", "log A123456789&1234567", "log A123456789", "log 1234567",
               "log " + kUserHeader, "log " + request},
              Repeated("ReleaseStringUTFChars", 7),
              {"ReleaseIntArrayElements", "NewStringUTF " + request, "log ~CGatewayPub"}});
  EXPECT_EQ(Call("ApplyCertEncode", Texts(UserTexts("abc"))).events, expected);
}

TEST(FrameOfReNewCert, IsTheCommonOne) {
  const std::string request = kUserHeader + "FUNC=15|MSG=YWJj|BIRTH=19800102|01=";
  const Events expected =
      Joined({Repeated("GetStringUTFChars", 7),
              {"GetIntArrayElements", "log A123456789", "log 1234567", "log " + kUserHeader,
               "log " + request},
              Repeated("ReleaseStringUTFChars", 7),
              {"ReleaseIntArrayElements", "NewStringUTF " + request, "log ~CGatewayPub"}});
  EXPECT_EQ(Call("ReNewCertEncode", Texts(UserTexts("abc"))).events, expected);
}

TEST(FrameOfRevokeCert, NameIsLoggedFirstOfAllThenTheIdentityThenTheTestLine) {
  const std::string request = kUserHeader + "FUNC=18|MSG=YWJj|BIRTH=19800102|01=";
  const Events expected =
      Joined({{"log Java_com_brindlex_kernel_quorvane_gatewayjni_RevokeCertEncode"},
              Repeated("GetStringUTFChars", 7),
              {"GetIntArrayElements", "log A123456789&1234567", "log A123456789", "log 1234567",
               "log " + kUserHeader, "log test1", "log " + request},
              Repeated("ReleaseStringUTFChars", 7),
              {"ReleaseIntArrayElements", "NewStringUTF " + request, "log ~CGatewayPub"}});
  EXPECT_EQ(Call("RevokeCertEncode", Texts(UserTexts("abc"))).events, expected);
}

TEST(FrameOfGetCert2, StepsAreLoggedBetweenTheReleases) {
  const std::string request = kBareHeader + "FUNC=11|MSG=YWJj|01=";
  const Events expected = {
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
  EXPECT_EQ(Call("GetCertEncode2", Texts({"abc"})).events, expected);
}

// Plain Base64 of letters 'x', in lines: a third of a line's data at a time is "eHh4".
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

struct CertRequest {
  const char* operation;
  const char* function;
  bool user;
};
void PrintTo(const CertRequest& request, std::ostream* out) {
  *out << request.operation;
}

// Those with a birth date first, the one without a limit last.
constexpr CertRequest kCertRequests[] = {
    {"ApplyCertEncode", "13", true},      {"ReNewCertEncode", "15", true},
    {"RevokeCertEncode", "18", true},     {"GetCertEncode", "11", false},
    {"GetCertEncode2", "11", false},      {"GetCertStatusEncode", "14", false},
    {"InstallCertOKEncode", "16", false}, {"OpenCertEncode", "17", false},
    {"RegisterCertEncode", "10", false},
};

class CertMessage : public testing::TestWithParam<CertRequest> {
 protected:
  static Outcome Encode(size_t count) {
    const std::string message(count, 'x');
    return Call(GetParam().operation,
                Texts(GetParam().user ? UserTexts(message) : Events{message}));
  }
  static std::string Request(size_t count) {
    return (GetParam().user ? kUserHeader : kBareHeader) + "FUNC=" + GetParam().function +
           "|MSG=" + Base64OfX(count) + (GetParam().user ? "|BIRTH=19800102" : "") + "|01=";
  }
  static std::string ParameterError() {
    std::string name = GetParam().operation;
    if (name == "GetCertEncode2") name.pop_back();
    return name + "()傳入的參數錯誤";
  }
};

std::string NameOf(const testing::TestParamInfo<CertRequest>& info) {
  return info.param.operation;
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
        const Outcome outcome = Encode(count);
        EXPECT_EQ(outcome.result, Request(count)) << count;
        EXPECT_EQ(outcome.status, 1) << count;
      }
    }
  }
}

TEST_P(LimitedCertMessage, IsSentAsLongAsTheRequestFitsAndThenRefusedByName) {
  size_t longest = 2048;
  while (Request(longest + 1).size() <= kRequestCapacity) ++longest;
  EXPECT_EQ(Encode(longest).result, Request(longest));
  for (size_t count : {longest + 1, longest + 2, longest + 1000, size_t{1} << 20}) {
    const Outcome outcome = Encode(count);
    EXPECT_EQ(outcome.result, ParameterError()) << count;
    EXPECT_EQ(outcome.status, -1) << count;
  }
}

// One request of exactly the buffer's size, one a byte longer: the birth date makes up the rest.
TEST_P(CertMessageWithBirth, FillsTheBufferToItsLastByte) {
  Events texts = UserTexts("xxx");
  texts[3] += std::string(kRequestCapacity - Request(3).size(), '9');
  const Outcome fits = Call(GetParam().operation, Texts(texts));
  EXPECT_EQ(fits.result.value().size(), kRequestCapacity);
  EXPECT_EQ(fits.status, 1);
  texts[3] += "9";
  const Outcome over = Call(GetParam().operation, Texts(texts));
  EXPECT_EQ(over.result, ParameterError());
  EXPECT_EQ(over.status, -1);
}

TEST_P(EndlessCertMessage, OfAMebibyteIsSentWhole) {
  for (size_t count : {size_t{4096}, (size_t{1} << 20) - 1, size_t{1} << 20}) {
    const Outcome outcome = Encode(count);
    EXPECT_TRUE(outcome.result == Request(count)) << count;
    EXPECT_EQ(outcome.status, 1);
  }
}

TEST(CertReply, TextOfAMebibyteComesBackWhole) {
  const std::string text(size_t{1} << 20, 't');
  for (const char* operation : {"RegisterCertDecode", "GetCertDecode", "OpenCertDecode"}) {
    const Outcome accepted = Call(operation, {Argument::Text("|00=|68=0000|M2=" + text + "|01=")});
    EXPECT_TRUE(accepted.result == text) << operation;
    EXPECT_EQ(accepted.status, 1);
    const Outcome refused = Call(operation, {Argument::Text("|00=|68=E|M2=" + text + "|01=")});
    EXPECT_TRUE(refused.result == "[CERT]E " + text) << operation;
    EXPECT_EQ(refused.status, -1);
  }
}

// The escape may make a request too long that was not.
TEST(EscapedRequest, BlanksCountThreefoldAgainstTheBuffer) {
  const auto change = [](const std::string& password) {
    return Call("ChangePasswordEncode", Texts({"9A00", "A123456789&1234567", "secret", password}));
  };
  const size_t bare = change("").result.value().size();
  const size_t blanks = (kRequestCapacity - bare) / 3;
  const Outcome fits = change(std::string(blanks, ' '));
  EXPECT_EQ(fits.result.value().size(), bare + 3 * blanks);
  EXPECT_EQ(fits.status, 1);
  const Outcome over = change(std::string(blanks + 1, ' '));
  EXPECT_EQ(over.result, "[CLIENT]傳入的參數錯誤");
  EXPECT_EQ(over.status, -1);
}

}  // namespace
}  // namespace gateway_tests
