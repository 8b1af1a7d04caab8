// Login and the list of the user's accounts.

#include <functional>

#include "gateway/core/gateway_pub.h"
#include "tests/unit/allocations.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const std::string kTooLong = "[CLIENT]傳入的參數錯誤";
const std::string kHead =
    "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|";

struct Operation {
  const char* name;
  char* (CGatewayPub::*encode)(const char*, const char*, const char*, int*);
  char* (CGatewayPub::*decode)(const char*, int*);
  const char* function;
  bool login;
};

const Operation kOperations[] = {
    {"AuthDecode", &CGatewayPub::AuthEncode, &CGatewayPub::AuthDecode, "FUNC=0|01=", true},
    {"GetTotalAccountDecode", &CGatewayPub::GetTotalAccountEncode,
     &CGatewayPub::GetTotalAccountDecode, "FUNC=12|01=", false}};

class Login : public CSessionTest {
 protected:
  std::string Encode(const Operation& operation, const std::string& identity,
                     const std::string& password = "pw", const char* address = "10.0.0.1") {
    CGatewayPub gateway;
    gateway.m_nSeqNo = 7;
    gateway.setSerialNumber("SN0001");
    gateway.setLocalIP(address);
    m_status = 77;
    m_log.Take();
    const std::string result = std::invoke(operation.encode, gateway, "9A00", identity.c_str(),
                                           password.c_str(), &m_status);
    m_lines = m_log.Take();
    return result;
  }

  // The result, "(null)" for none; the reply ends at an unreadable page and is left as it was.
  std::string Decode(const Operation& operation, const std::string& reply) {
    CGatewayPub gateway;
    const CTextAtPageEnd text(reply);
    m_status = 77;
    m_log.Take();
    const char* const result = std::invoke(operation.decode, gateway, text, &m_status);
    m_lines = m_log.Take();
    EXPECT_EQ(static_cast<char*>(text), reply);
    return result == nullptr ? "(null)" : result;
  }

  // The result of both decoders, which must agree.
  std::string Decode(const std::string& reply) {
    const std::string login = Decode(kOperations[0], reply);
    EXPECT_EQ(Decode(kOperations[1], reply), login) << reply;
    return login;
  }

  int m_status = 0;
  Lines m_lines;
};

std::string Record(const std::string& fields) {
  return "|00=" + fields + "|01=";
}

// The line of one account with these fields behind its code "0000".
std::string AccountLine(const std::string& fields) {
  return "|68=0000" + Record("|67=1|68=0000" + fields);
}

TEST_F(Login, RequestIsTheHeaderAndTheFunction) {
  for (const Operation& operation : kOperations) {
    EXPECT_EQ(Encode(operation, "1234567&"),
              kHead + "15=0|ACNO=1234567|PWD=pw|" + operation.function);
    EXPECT_EQ(m_status, 1);
    EXPECT_EQ(Encode(operation, "A123456789&1234567"),
              kHead + "15=1|IDNO=A123456789|ACNO=1234567|PWD=pw|" + operation.function);
    EXPECT_EQ(Encode(operation, "&"), kHead + operation.function);
    EXPECT_EQ(m_status, 1);
    EXPECT_EQ(m_lines, (Lines{"", ""}));
  }
}

TEST_F(Login, FailedHeaderIsTheRequestsMessage) {
  for (const Operation& operation : kOperations) {
    EXPECT_EQ(Encode(operation, "12345"), "[CLIENT] 身分證字號及帳號有誤！");
    EXPECT_EQ(m_status, -1);
    EXPECT_EQ(Encode(operation, "X&X"), "[CLIENT] 帳號或身份證字號輸入錯誤");
    EXPECT_EQ(m_status, -1);
    EXPECT_EQ(Encode(operation, "1234567&", "pw", ""),
              "[CLIENT] 無法取得IP，請確認網路連線是否正常！");
    EXPECT_EQ(m_status, -1);
  }
}

TEST_F(Login, RequestThatFillsTheBufferIsWholeAndOneCharacterMoreFails) {
  for (const Operation& operation : kOperations) {
    const size_t room = CGatewayPub::kBufferSize - 1 - Encode(operation, "1234567&", "").size();
    const std::string longest(room, 'p');
    EXPECT_EQ(Encode(operation, "1234567&", longest),
              kHead + "15=0|ACNO=1234567|PWD=" + longest + "|" + operation.function);
    EXPECT_EQ(m_status, 1);
    EXPECT_EQ(Encode(operation, "1234567&", longest + "p"), kTooLong);
    EXPECT_EQ(m_status, -1);
  }
}

TEST_F(Login, FailedTransportIsToldBeforeAnythingIsRead) {
  for (const Operation& operation : kOperations) {
    const std::string length = std::string(operation.name) + ": Len:";
    EXPECT_EQ(Decode(operation, ""), "[BROKER]主機連線失敗");
    EXPECT_EQ(m_status, -1);
    EXPECT_EQ(m_lines, (Lines{length + "0", ""}));
    EXPECT_EQ(Decode(operation, "|68=0000|M2=[GATEWAY]error|"), "[GATEWAY]主機連線失敗");
    EXPECT_EQ(m_status, -1);
    EXPECT_EQ(m_lines, (Lines{length + "27", "|68=0000|M2=[GATEWAY]error|"}));
    EXPECT_EQ(Decode(operation, "[BROKER]timeout"), "[BROKER]主機連線失敗");
    EXPECT_EQ(m_status, -1);
  }
}

TEST_F(Login, NullReplyIsAnEmptyOne) {
  for (const Operation& operation : kOperations) {
    CGatewayPub gateway;
    m_log.Take();
    EXPECT_STREQ(std::invoke(operation.decode, gateway, nullptr, &m_status),
                 "[BROKER]主機連線失敗");
    EXPECT_EQ(m_status, -1);
    EXPECT_EQ(m_log.Take(), (Lines{std::string(operation.name) + ": Len:0", ""}));
  }
}

struct RefusalCase {
  const char* title;
  std::string reply;
  std::string message;
};

const RefusalCase kRefusalCases[] = {
    {"message as the gateway sent it", "|68=0012|M2=密碼錯誤|", "密碼錯誤"},
    {"no message", "|68=0012|", ""},
    {"empty message", "|68=0012|M2=|M2=x|", ""},
    {"blank message", "|68=0012|M2= |", " "},
    {"no code", "F=7|M2=x|", "x"},
    {"empty code", "|68=|68=0000|M2=x|", "x"},
    {"no data is a refusal here", "|68=5001|M2=none|", "none"},
    {"code that only starts alike", "|68=00000|M2=x|", "x"},
    {"code of 20 characters is dropped", "|68=00000000000000000000|M2=x|", "x"},
    {"message of a record", "|68=1" + Record("|M2=inner"), "inner"},
    {"code of a record comes first", Record("|68=1") + "|68=0000|M2=x|", "x"},
    {"message of 4095 bytes", "|68=1|M2=" + std::string(4095, 'm'), std::string(4095, 'm')},
    {"message of 4096 bytes is dropped", "|68=1|M2=" + std::string(4096, 'm'), ""}};

TEST_F(Login, RefusalIsPassedOn) {
  for (const RefusalCase& row : kRefusalCases) {
    EXPECT_EQ(Decode(row.reply), row.message) << row.title;
    EXPECT_EQ(m_status, -1) << row.title;
  }
}

TEST_F(Login, LoginAloneLogsTheCode) {
  EXPECT_EQ(Decode(kOperations[0], "|68=0012|M2=x|"), "x");
  EXPECT_EQ(m_lines, (Lines{"AuthDecode: Len:14", "|68=0012|M2=x|", "[strResult]0012"}));
  EXPECT_EQ(Decode(kOperations[1], "|68=0012|M2=x|"), "x");
  EXPECT_EQ(m_lines, (Lines{"GetTotalAccountDecode: Len:14", "|68=0012|M2=x|"}));
  Decode(kOperations[0], "|68=00000000000000000000|");
  EXPECT_EQ(m_lines.back(), "[strResult]");
  Decode(kOperations[0], "|68=0000|");
  EXPECT_EQ(m_lines.back(), "[strResult]0000");
}

struct AccountCase {
  const char* fields;
  const char* line;
};

constexpr AccountCase kAccountCases[] = {
    {"|07=S|M5=m|16=z|17=98|18=76|69=王小明", "<S>@m@0009876@z@王小明!"},
    {"", "<>@@@@!"},
    {"|17=|18=1234567|", "<>@@1234567@@!"},
    {"|17=A1|18=|69=n", "<>@@0000000@@n!"},
    {"|17=98|18=76", "<>@@0009876@@!"},
    {"|17=123|18=456", "<>@@0123456@@!"},
    {"|17=123|18=4567", "<>@@1234567@@!"},
    {"|17=1234|18=5678", "<>@@12345678@@!"},
    {"|17=ABC|18=DEFG", "<>@@ABCDEFG@@!"},
    {"|17=12A|18=34", "<>@@0000012@@!"},
    {"|17=-1|18=2", "<>@@-000012@@!"},
    {"|17=0|18=0", "<>@@0000000@@!"},
    // 17 and 18 pass over empty and blank values, the others take what stands first.
    {"|17=|17= |17=98|18= |18=76|", "<>@@0009876@@!"},
    {"|07=|07=S|M5= |M5=m|16=|16=z|69=|69=n", "<>@ @@@!"},
    {"|17= ", "<>@@0000000@@!"},  // not closed: taken as found, one character
    {"|18=", "<>@@@@!"},
    {"|17= |18=5", "<>@@0000005@@!"},
    // At the bounds: 9 characters of 07, 17 and 18, 19 of M5, 16 and 69.
    {"|07=123456789|17=123456789|18=987654321", "<123456789>@@123456789987654321@@!"},
    {"|07=1234567890|17=1234567890|18=1234567890", "<>@@@@!"},
    {"|17=1234567890|17=5|18=7", "<>@@0000007@@!"},
    {"|M5=1234567890123456789|16=1234567890123456789|69=1234567890123456789",
     "<>@1234567890123456789@@1234567890123456789@1234567890123456789!"},
    {"|M5=12345678901234567890|16=12345678901234567890|69=12345678901234567890", "<>@@@@!"},
    {"|07=S|07=T|69=a|69=b", "<S>@@@@a!"},
    {"|107=S|M55=m", "<>@@@@!"}};

TEST_F(Login, AccountIsOneLine) {
  for (const AccountCase& row : kAccountCases) {
    EXPECT_EQ(Decode(AccountLine(row.fields)), std::string("1!") + row.line) << row.fields;
    EXPECT_EQ(m_status, 1);
  }
}

struct WalkCase {
  const char* title;
  std::string records;
  const char* result;
};

const std::string kOne = Record("|67=1|68=0000|07=a"), kTwo = Record("|67=2|68=0000|07=b");

const WalkCase kWalkCases[] = {
    {"two accounts", kOne + kTwo, "2!<a>@@@@!<b>@@@@!"},
    {"no record", "", "0!"},
    {"900001 ends the list", kOne + Record("|67=900001|68=0000|07=x") + kTwo, "1!<a>@@@@!"},
    {"900001 ends it whatever its code", kOne + Record("|67=900001|68=1") + kTwo, "1!<a>@@@@!"},
    {"900000 does not", kOne + Record("|67=900000|68=0000|07=x"), "2!<a>@@@@!<x>@@@@!"},
    {"a first record at the end mark", Record("|67=900001|68=0000|07=x") + kTwo, "0!"},
    {"no sequence", Record("|68=0000|07=x"), "1!<x>@@@@!"},
    {"negative sequence", Record("|67=-5|68=0000|07=x"), "1!<x>@@@@!"},
    {"sequence with text", Record("|67=900001x|68=0000|07=x"), "0!"},
    {"sequence of 20 characters is dropped", Record("|67=00000000000000900001|68=0000|07=x"),
     "1!<x>@@@@!"},
    {"another code is skipped", kOne + Record("|67=3|68=0001|07=x") + kTwo, "2!<a>@@@@!<b>@@@@!"},
    {"no code is skipped", kOne + Record("|67=3|07=x") + kTwo, "2!<a>@@@@!<b>@@@@!"},
    {"longer code is skipped", Record("|67=3|68=00000|07=x") + kTwo, "1!<b>@@@@!"},
    {"all skipped", Record("|68=1|07=x"), "0!"},
    {"no closing field", kOne + "|00=|68=0000|07=x", "1!<a>@@@@!"},
    {"stray closing field ends the list", kOne + "|01=" + kTwo, "1!<a>@@@@!"},
    {"record without fields is skipped", kOne + Record("") + kTwo, "2!<a>@@@@!<b>@@@@!"},
    {"record of 199 characters", kOne + Record("|68=0000|07=c|x=" + std::string(179, 'x')) + kTwo,
     "3!<a>@@@@!<c>@@@@!<b>@@@@!"},
    {"record of 200 characters ends the list",
     kOne + Record("|68=0000|07=c|x=" + std::string(180, 'x')) + kTwo, "1!<a>@@@@!"}};

TEST_F(Login, RecordsAreWalkedToTheEndOfTheList) {
  for (const WalkCase& row : kWalkCases) {
    EXPECT_EQ(Decode("|68=0000" + row.records), row.result) << row.title;
    EXPECT_EQ(m_status, 1) << row.title;
  }
}

TEST_F(Login, CodeOfTheReplyMayBeThatOfARecord) {
  EXPECT_EQ(Decode(kOne), "1!<a>@@@@!");
  EXPECT_EQ(Decode(Record("|67=1|68=1") + kOne), "");
  EXPECT_EQ(m_status, -1);
}

TEST_F(Login, NoticeCountsAsOneMoreRecordOfALogin) {
  const std::string reply = "|68=0000|M3=維護公告|" + kOne.substr(1) + kTwo;
  EXPECT_EQ(Decode(kOperations[0], reply), "3!<a>@@@@!<b>@@@@!<M>@維護公告!");
  EXPECT_EQ(m_status, 1);
  EXPECT_EQ(m_lines, (Lines{"AuthDecode: Len:" + std::to_string(reply.size()), reply,
                            "[strResult]0000", "[strResult2]維護公告", "[status]1"}));
  EXPECT_EQ(Decode(kOperations[1], reply), "2!<a>@@@@!<b>@@@@!");
  EXPECT_EQ(m_lines, (Lines{"GetTotalAccountDecode: Len:" + std::to_string(reply.size()), reply}));
}

TEST_F(Login, NoticeIsShownOnlyBehindAnAccount) {
  const std::string reply = "|68=0000|M3=notice|" + Record("|67=1|68=1").substr(1);
  EXPECT_EQ(Decode(kOperations[0], reply), "0!");
  EXPECT_EQ(m_status, 1);
  EXPECT_EQ(m_lines.back(), "[strResult]0000");
  EXPECT_EQ(Decode(kOperations[0], "|68=0000|M3=notice|"), "0!");
}

TEST_F(Login, EmptyNoticeIsLoggedButNoRecord) {
  for (const char* notice : {"", "|M3=", "|M3=|M3=second"}) {
    EXPECT_EQ(Decode(kOperations[0], "|68=0000" + std::string(notice) + kOne), "1!<a>@@@@!");
    EXPECT_EQ(m_lines[3], "[strResult2]");
    EXPECT_EQ(m_lines[4], "[status]1");
  }
  EXPECT_EQ(Decode(kOperations[0], "|68=0000|M3= " + kOne), "2!<a>@@@@!<M>@ !");
}

TEST_F(Login, NoticeOf299BytesFitsAndOf300IsDropped) {
  for (size_t length : {1U, 292U, 293U, 299U, 300U, 301U, 5000U}) {
    const std::string notice(length < 300 ? length : 0, 'n');
    const std::string expected = notice.empty() ? "1!<a>@@@@!" : "2!<a>@@@@!<M>@" + notice + "!";
    EXPECT_EQ(Decode(kOperations[0], "|68=0000" + kOne + "|M3=" + std::string(length, 'n')),
              expected)
        << length;
    EXPECT_EQ(m_lines[3], "[strResult2]" + notice);
  }
}

TEST_F(Login, LongListsTakeAtMostTwoAllocations) {
  for (size_t accounts : {1U, 1000U, 20000U}) {
    std::string reply = "|68=0000|M3=notice|", expected = std::to_string(accounts + 1) + "!";
    for (size_t i = 0; i < accounts; ++i) {
      reply += Record("|68=0000|17=1");
      expected += "<>@@0000001@@!";
    }
    CGatewayPub gateway;
    const CAllocations allocations;
    const char* const result = gateway.AuthDecode(reply.c_str(), &m_status);
    EXPECT_LE(allocations.Count(), 2U);
    EXPECT_EQ(result, expected + "<M>@notice!");
  }
}

TEST_F(Login, DecoderWithoutMemoryGivesNothing) {
  for (const Operation& operation : kOperations) {
    const CAllocations refused(1);
    EXPECT_EQ(Decode(operation, "|68=0000" + kOne), "(null)");
    EXPECT_EQ(m_status, -1);
    EXPECT_EQ(Decode(operation, "|68=0000|"), "0!") << "needs none";
    EXPECT_EQ(m_status, 1);
  }
}

TEST_F(Login, ReplyMayBeDecodedTwiceByOneObject) {
  CGatewayPub gateway;
  const std::string reply = "|68=0000" + kOne;
  EXPECT_STREQ(gateway.AuthDecode(reply.c_str(), &m_status), "1!<a>@@@@!");
  EXPECT_STREQ(gateway.AuthDecode(reply.c_str(), &m_status), "1!<a>@@@@!");
  EXPECT_STREQ(gateway.AuthDecode("", &m_status), "[BROKER]主機連線失敗");
}

}  // namespace
}  // namespace gateway_tests
