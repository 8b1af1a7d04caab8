// What the virtual machine is handed is well-formed, also where a character was cut or taken apart.

#include <gtest/gtest.h>

#include <string>

#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

std::string ResultOf(const char* operation, const Arguments& arguments) {
  CRecordingHost host(Placement::kBeforeUnreadable);
  const Outcome outcome = host.Call(*FindExport(operation), arguments);
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.violations);
  return outcome.result.value();
}

std::string FillOf(const std::string& fields) {
  return ResultOf("FutQueryReplyDecode",
                  {Argument::Text("|68=0000|00=1|67=1|68=0000" + fields + "|01=")});
}

TEST(WellFormedResult, TimeCutWithinACharacter) {
  EXPECT_EQ(FillOf("|51=12345中"), "1!&@@TAIMEX&F&&&&0@0&0@0&0@@@&12345?@ @&!");
  EXPECT_EQ(FillOf("|51=123中9"), "1!&@@TAIMEX&F&&&&0@0&0@0&0@@@&123中@ @&!");
}

TEST(WellFormedResult, FirstByteOfTagMT) {
  EXPECT_EQ(FillOf("|MT=中"), "1!&@@TAIMEX&F&&&&0@0&0@0&0@@@&@?@&!");
}

TEST(WellFormedResult, DateTakenApartWithinACharacter) {
  const std::string order = "|39= |19=S|46=A1|MT=1|44=";
  EXPECT_EQ(ResultOf("FutSubmitOrderDecode", {Argument::Text(order + "12中45|")}),
            "A1@1923??45@@1@1@!");
  EXPECT_EQ(ResultOf("FutSubmitOrderDecode", {Argument::Text(order + "中1234|")}),
            "A1@中1234@@1@1@!");
}

TEST(WellFormedResult, TextThatIsWellFormedStaysAsItIs) {
  const std::string memo = "中\xC0\x80\xF0\x9F\x98\x80\xED\xA0\xBD\xED\xB8\x80";
  EXPECT_EQ(FillOf("|50=" + memo), "1!&@@TAIMEX&F&&&&0@0&0@0&0@@@&@ @&" + memo + "!");
}

Arguments Login(const std::string& serialNo, const std::string& localIP) {
  return {Argument::Int(0),         Argument::Int(0),        Argument::Int(7),
          Argument::Text(serialNo), Argument::Text(localIP), Argument::Text("9A00"),
          Argument::Text(""),       Argument::Text("pw")};
}

TEST(WellFormedResult, SerialNumberAndAddressCutWithinACharacter) {
  ASSERT_TRUE(SetClock("2024-01-15 13:45:21"));
  const std::string serial(18, 's'), address(63, 'a');
  const std::string head = "F=7|KIND=S|BHNO=9A00|CB=1|IP=";
  const std::string middle = "|11=NO DEFINE|VER=24369|65=0013452107|SN=";
  EXPECT_EQ(ResultOf("AuthEncode", Login(serial + "中", "::1")),
            head + "::1" + middle + serial + "??::1|FUNC=0|01=");
  EXPECT_EQ(ResultOf("AuthEncode", Login("SN", address + "中")),
            head + address + "?" + middle + "SN|FUNC=0|01=");
}

// A full serial number runs on into the address, and a character with it.
TEST(WellFormedResult, SerialNumberWhoseCharacterEndsInTheAddress) {
  ASSERT_TRUE(SetClock("2024-01-15 13:45:21"));
  const std::string serial(18, 's');
  const std::string result = ResultOf("AuthEncode", Login(serial + "\xE4\xB8", "\xAD.1"));
  EXPECT_NE(result.find("|IP=?.1|"), std::string::npos) << result;
  EXPECT_NE(result.find("|SN=" + serial + "中.1|"), std::string::npos) << result;
}

TEST(WellFormedResult, CharacterArgumentsAboveAscii) {
  ASSERT_TRUE(SetClock("2024-01-15 13:45:21"));
  Arguments order = Login("SN0001", "::1");
  order[0] = Argument::Int(1);
  order[6] = Argument::Text("1234567&");
  for (const char* text : {"", "", "TXF", "", "202401", "", "", "", "", ""}) {
    order.push_back(Argument::Text(text));
  }
  for (int number : {0, 1, 2}) order.push_back(Argument::Byte(number));
  for (int letter : {0x49, 0xE9, 0x52, 0x78, 0x4EAD, 0x53}) order.push_back(Argument::Char(letter));
  for (int number : {3, 99, 175000000}) order.push_back(Argument::Int(number));
  for (const char* operation : {"FutSubmitOrderEncode", "FutSubmitOrderEncode1"}) {
    const std::string result = ResultOf(operation, order);
    EXPECT_NE(result.find("|32=?|33=TXF|"), std::string::npos) << result;
    EXPECT_NE(result.find("|W3=?|N6=0"), std::string::npos) << result;
  }
}

// The log shows what the machine is handed.
TEST(WellFormedResult, IsLoggedAsItIsHandedOver) {
  CRecordingHost host;
  const Outcome outcome = host.Call(*FindExport("FutQueryReplyDecode"),
                                    {Argument::Text("|68=0000|00=1|67=1|68=0000|MT=中|01=")});
  ASSERT_GE(outcome.logLines.size(), 2U);
  EXPECT_EQ(outcome.logLines[outcome.logLines.size() - 2], outcome.result);
}

}  // namespace
}  // namespace gateway_tests
