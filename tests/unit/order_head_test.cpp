// The three headers of order requests and the keys that they leave.

#include <climits>
#include <functional>

#include "gateway/core/gateway_pub.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const std::string kLengths = "[CLIENT] 帳號或身份證字號輸入錯誤";
const std::string kNoAddress = "[CLIENT] 無法取得IP，請確認網路連線是否正常！";
const std::string kTooLong = "[CLIENT]傳入的參數錯誤";

// The three variants up to tag 14, for a securities session, and what follows the identity.
const std::string kHeads[] = {
    "F=1|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|SN=SN0001|65=0013452107|14=I",
    "F=1|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|SN=SN0001|65=0013452107|14=I",
    "F=1|KIND=S|CB=1|BHNO=9A00|VER=24369|SN=SN0001|11=NO DEFINE|65=0013452107|14=I"};
const std::string kStamps = "|21=20240115|22=134521|23=13452107|24=5|V4=";
const std::string kTails[] = {kStamps, kStamps, ""};

struct OrderArguments {
  char function = 'I';
  const char* branch = "9A00";
  const char* identity = "1234567";
  const char* password = "pw";
  const char* rocDate = "";
};

class OrderHead : public CSessionTest {
 protected:
  void SetUp() override {
    CSessionTest::SetUp();
    m_gateway.m_nSeqNo = 7;
    m_gateway.setSerialNumber("SN0001");
    m_gateway.setLocalIP("10.0.0.1");
  }

  int Write(int variant, const OrderArguments& a) {
    const CRoomAtPageEnd out(CGatewayPub::kBufferSize, '\0');
    const CRoomAtPageEnd key(CGatewayPub::kBufferSize, '#');
    m_log.Take();
    int result = 0;
    if (variant == 2) {
      key[0] = '\0';
      result = m_gateway.initOrderHead2(a.function, a.branch, a.identity, a.password, out);
    } else {
      const auto method = variant == 0 ? &CGatewayPub::initOrderHead : &CGatewayPub::initOrderHead1;
      result = std::invoke(method, m_gateway, a.function, a.branch, a.identity, a.password,
                           a.rocDate, out, key);
    }
    m_text = out;
    m_key.assign(key, strnlen(key, CGatewayPub::kBufferSize));
    m_lines = m_log.Take();
    return result;
  }

  int Write(int variant, const std::string& identity) {
    OrderArguments arguments;
    arguments.identity = identity.c_str();
    return Write(variant, arguments);
  }

  CGatewayPub m_gateway;
  std::string m_text, m_key;
  Lines m_lines;
};

TEST_F(OrderHead, VariantsHaveTheirFieldsInOrder) {
  for (int variant : {0, 1, 2}) {
    EXPECT_EQ(Write(variant, "A123456789&1234567"), 1);
    EXPECT_EQ(m_text,
              kHeads[variant] + "|15=0|IDNO=A123456789|ACNO=1234567|PWD=pw" + kTails[variant]);
    EXPECT_EQ(m_lines, Lines{m_text}) << variant;
  }
}

TEST_F(OrderHead, KeysAreWrittenOverWhatTheBufferHeld) {
  EXPECT_EQ(Write(0, "A123456789&1234567"), 1);
  EXPECT_EQ(m_key, "9A00_1234567_A123456789_I");
  EXPECT_EQ(Write(1, "A123456789&1234567"), 1);
  EXPECT_EQ(m_key, "SN0001,10.0.0.1,20240115,9A00-1234567,A123456789,I");
}

// The identity block, by the lengths of the two parts; the second decides.
std::string ExpectedBlock(int variant, const std::string& first, std::string second) {
  if (second.empty()) second = first;
  const size_t length1 = first.size(), length2 = second.size();
  if (length2 >= 2 && length2 <= 7) return "|15=0|IDNO=" + first + "|ACNO=" + second + "|PWD=pw";
  if (length2 < 8 || length2 > 10) return "fails";
  const std::string block = (variant == 0 ? "15=1|IDNO=" : "|15=1|IDNO=") + second;
  return block + (length1 >= 2 && length1 <= 7 ? "|ACNO=" + first + "|PWD=pw|" : "|PWD=pw|");
}

// Every row of the table with its near misses; a part of 40 characters or more counts as empty.
TEST_F(OrderHead, IdentityBlockIsChosenByTheLengthsOfItsParts) {
  const size_t lengths[] = {0, 1, 2, 3, 6, 7, 8, 9, 10, 11, 12, 38, 39, 40, 41, 200};
  for (int variant : {0, 1, 2}) {
    for (size_t length1 : lengths) {
      for (size_t length2 : lengths) {
        const std::string label = std::to_string(variant) + ": " + std::to_string(length1) +
                                  " and " + std::to_string(length2);
        const std::string first(length1 < 40 ? length1 : 0, 'a');
        const std::string second(length2 < 40 ? length2 : 0, 'b');
        const std::string block = ExpectedBlock(variant, first, second);
        const int result =
            Write(variant, std::string(length1, 'a') + "&" + std::string(length2, 'b'));
        if (block == "fails") {
          EXPECT_EQ(result, 0) << label;
          EXPECT_EQ(m_text, kLengths) << label;
          EXPECT_EQ(m_lines, Lines{}) << label;
        } else {
          EXPECT_EQ(result, 1) << label;
          EXPECT_EQ(m_text, kHeads[variant] + block + kTails[variant]) << label;
          EXPECT_EQ(m_lines, Lines{m_text}) << label;
        }
      }
    }
  }
}

struct IdentityCase {
  const char* identity;
  const char* block;   // of variants 1 and 2; variant 0 has no bar before "15=1"
  const char* second;  // as the keys show it
  const char* first;
};

constexpr IdentityCase kIdentityCases[] = {
    {"A123456789&1234567", "|15=0|IDNO=A123456789|ACNO=1234567|PWD=pw", "1234567", "A123456789"},
    {"1234567&A123456789", "|15=1|IDNO=A123456789|ACNO=1234567|PWD=pw|", "A123456789", "1234567"},
    {"A123456789", "|15=1|IDNO=A123456789|PWD=pw|", "A123456789", "A123456789"},
    {"A12345678", "|15=1|IDNO=A12345678|PWD=pw|", "A12345678", "A12345678"},
    {"A1234567&", "|15=1|IDNO=A1234567|PWD=pw|", "A1234567", "A1234567"},
    {"1234567", "|15=0|IDNO=1234567|ACNO=1234567|PWD=pw", "1234567", "1234567"},
    {"&1234567", "|15=0|IDNO=|ACNO=1234567|PWD=pw", "1234567", ""},
    {"&A123456789", "|15=1|IDNO=A123456789|PWD=pw|", "A123456789", ""},
    {"X&A123456789", "|15=1|IDNO=A123456789|PWD=pw|", "A123456789", "X"},
    {"A123456789&A123456780", "|15=1|IDNO=A123456780|PWD=pw|", "A123456780", "A123456789"},
    // Sent as text, not as a number of 7 digits.
    {"AB&98", "|15=0|IDNO=AB|ACNO=98|PWD=pw", "98", "AB"},
    // A third part is not looked at; an empty second one is.
    {"A123456789&1234567&rest", "|15=0|IDNO=A123456789|ACNO=1234567|PWD=pw", "1234567",
     "A123456789"},
    {"A123456789&&1234567", "|15=1|IDNO=A123456789|PWD=pw|", "A123456789", "A123456789"}};

TEST_F(OrderHead, IdentityPartsAreSentInTheirPlacesAndInTheKeys) {
  for (const IdentityCase& row : kIdentityCases) {
    const std::string first = row.first, second = row.second, block = row.block;
    const bool idNumber = block.rfind("|15=1", 0) == 0;
    EXPECT_EQ(Write(0, row.identity), 1) << row.identity;
    EXPECT_EQ(m_text, kHeads[0] + (idNumber ? block.substr(1) : block) + kStamps) << row.identity;
    EXPECT_EQ(m_key, "9A00_" + second + "_" + first + "_I") << row.identity;
    EXPECT_EQ(Write(1, row.identity), 1) << row.identity;
    EXPECT_EQ(m_text, kHeads[1] + block + kStamps) << row.identity;
    EXPECT_EQ(m_key, "SN0001,10.0.0.1,20240115,9A00-" + second + "," + first + ",I");
    EXPECT_EQ(Write(2, row.identity), 1) << row.identity;
    EXPECT_EQ(m_text, kHeads[2] + block) << row.identity;
  }
}

TEST_F(OrderHead, IdNumberRunsIntoTag14InThePlainVariantAndDoublesTheBarBefore21) {
  EXPECT_EQ(Write(0, "1234567&A123456789"), 1);
  EXPECT_NE(m_text.find("|14=I15=1|IDNO=A123456789|ACNO=1234567|PWD=pw||21=20240115|"),
            std::string::npos);
  EXPECT_EQ(Write(1, "1234567&A123456789"), 1);
  EXPECT_NE(m_text.find("|14=I|15=1|IDNO=A123456789|ACNO=1234567|PWD=pw||21=20240115|"),
            std::string::npos);
}

TEST_F(OrderHead, UnusableIdentityFails) {
  for (const char* identity : {"", "&", "X", "X&X", "12345678901", "1234567&12345678901"}) {
    for (int variant : {0, 1, 2}) {
      EXPECT_EQ(Write(variant, identity), 0) << identity;
      EXPECT_EQ(m_text, kLengths) << identity;
      EXPECT_EQ(m_lines, Lines{}) << identity;
    }
  }
  OrderArguments null;
  null.identity = nullptr;
  for (int variant : {0, 1, 2}) EXPECT_EQ(Write(variant, null), 0);
}

TEST_F(OrderHead, KeyIsThereAlsoWhenTheIdentityFails) {
  EXPECT_EQ(Write(0, "X&Y"), 0);
  EXPECT_EQ(m_key, "9A00_Y_X_I");
  EXPECT_EQ(Write(1, "X&Y"), 0);
  EXPECT_EQ(m_key, "SN0001,10.0.0.1,20240115,9A00-Y,X,I");
}

TEST_F(OrderHead, WithoutAnAddressTheVariantsThatSendItFail) {
  m_gateway.setLocalIP("");
  for (int variant : {0, 1}) {
    m_gateway.m_nSeqNo = 123;
    EXPECT_EQ(Write(variant, "X&X"), 0);
    EXPECT_EQ(m_text, kNoAddress);
    EXPECT_EQ(m_key, std::string(CGatewayPub::kBufferSize, '#')) << "as it was";
    EXPECT_EQ(m_lines, Lines{});
    EXPECT_EQ(m_gateway.m_nSeqNo, 23);
  }
  m_gateway.m_nSeqNo = 7;
  EXPECT_EQ(Write(2, "1234567"), 1);
  EXPECT_EQ(m_text, kHeads[2] + "|15=0|IDNO=1234567|ACNO=1234567|PWD=pw");
}

TEST_F(OrderHead, MarketAbove100IsFuturesInEveryVariant) {
  const struct {
    int market;
    const char* kind;
  } rows[] = {{0, "S"}, {100, "S"}, {101, "F"}, {-1, "F"}, {INT_MAX, "F"}, {INT_MIN, "F"}};
  for (const auto& row : rows) {
    m_gateway.m_nMarket = row.market;
    for (int variant : {0, 1, 2}) {
      EXPECT_EQ(Write(variant, "1234567"), 1);
      EXPECT_EQ(m_text.rfind(std::string("F=1|KIND=") + row.kind + "|", 0), 0U) << row.market;
    }
  }
}

struct DateCase {
  const char* rocDate;
  const char* field;
};

constexpr DateCase kDateCases[] = {{"", ""},
                                   {nullptr, ""},
                                   {"1130115", "|44=20240115"},
                                   {"990101", "|44=20100101"},
                                   {"0", "|44=00000000"},
                                   {"x", "|44=00000000"},
                                   {" ", "|44=00000000"},
                                   {"-19110001", "|44=-0000001"}};

TEST_F(OrderHead, DateIsSentByThePlainVariantAlone) {
  for (const DateCase& row : kDateCases) {
    OrderArguments arguments;
    arguments.rocDate = row.rocDate;
    const std::string block = "|15=0|IDNO=1234567|ACNO=1234567|PWD=pw";
    EXPECT_EQ(Write(0, arguments), 1);
    EXPECT_EQ(m_text, kHeads[0] + block + kStamps + row.field);
    EXPECT_EQ(Write(1, arguments), 1);
    EXPECT_EQ(m_text, kHeads[1] + block + kStamps);
  }
}

TEST_F(OrderHead, StampsAreTheLocalDateAndTime) {
  ASSERT_TRUE(SetClock("2031-09-02 04:05:06"));
  m_gateway.m_nSeqNo = 201;
  for (int variant : {0, 1}) {
    EXPECT_EQ(Write(variant, "1234567"), 1);
    EXPECT_NE(m_text.find("|65=0004050601|14=I|"), std::string::npos);
    EXPECT_NE(m_text.find("|21=20310902|22=040506|23=04050601|24=5|V4="), std::string::npos);
    EXPECT_EQ(m_gateway.m_nSeqNo, 1);
  }
  EXPECT_EQ(m_key, "SN0001,10.0.0.1,20310902,9A00-1234567,1234567,I");
}

TEST_F(OrderHead, ClockBeyondTheCalendarIsNoDate) {
  SetClock(INT64_MAX);
  EXPECT_EQ(Write(0, "1234567"), 1);
  EXPECT_NE(m_text.find("|21=19000100|22=000000|23=00000007|24=5|V4="), std::string::npos);
}

TEST_F(OrderHead, SequenceNumberIsReducedAndStoredBack) {
  for (int variant : {0, 1, 2}) {
    m_gateway.m_nSeqNo = -1;
    EXPECT_EQ(Write(variant, "1234567"), 1);
    EXPECT_NE(m_text.find("|65=0013452195|"), std::string::npos);
    EXPECT_EQ(m_gateway.m_nSeqNo, 95);
  }
}

TEST_F(OrderHead, EveryFunctionCharacterIsSentAndANulAsNothing) {
  for (int code = CHAR_MIN; code <= CHAR_MAX; ++code) {
    OrderArguments arguments;
    arguments.function = static_cast<char>(code);
    const std::string sent = code == 0 ? "" : std::string(1, static_cast<char>(code));
    for (int variant : {0, 1, 2}) {
      EXPECT_EQ(Write(variant, arguments), 1);
      EXPECT_NE(m_text.find("|14=" + sent + "|15=0|IDNO=1234567|"), std::string::npos) << code;
    }
    Write(0, arguments);
    EXPECT_EQ(m_key, "9A00_1234567_1234567_" + sent) << code;
    Write(1, arguments);
    EXPECT_EQ(m_key, "SN0001,10.0.0.1,20240115,9A00-1234567,1234567," + sent) << code;
  }
}

TEST_F(OrderHead, FullSerialNumberRunsOnIntoTheAddress) {
  m_gateway.setSerialNumber("12345678901234567890");
  for (int variant : {0, 1, 2}) {
    EXPECT_EQ(Write(variant, "1234567"), 1);
    EXPECT_NE(m_text.find("|SN=1234567890123456789010.0.0.1|"), std::string::npos);
  }
  Write(1, "1234567");
  EXPECT_EQ(m_key, "1234567890123456789010.0.0.1,10.0.0.1,20240115,9A00-1234567,1234567,I");
}

TEST_F(OrderHead, NullTextsAreReadAsEmpty) {
  OrderArguments arguments;
  arguments.branch = nullptr;
  arguments.password = nullptr;
  for (int variant : {0, 1, 2}) {
    EXPECT_EQ(Write(variant, arguments), 1);
    EXPECT_NE(m_text.find("|BHNO=|"), std::string::npos);
    EXPECT_NE(m_text.find("|PWD="), std::string::npos);
  }
}

TEST_F(OrderHead, HeaderGoesOnBehindWhatTheBufferHolds) {
  char out[CGatewayPub::kBufferSize] = "X|";
  EXPECT_EQ(m_gateway.initOrderHead2('I', "9A00", "1234567", "pw", out), 1);
  EXPECT_EQ(out, "X|" + kHeads[2] + "|15=0|IDNO=1234567|ACNO=1234567|PWD=pw");
}

TEST_F(OrderHead, HeaderThatFillsTheBufferIsWholeAndOneCharacterMoreFails) {
  for (int variant : {0, 1, 2}) {
    OrderArguments arguments;
    arguments.password = "";
    Write(variant, arguments);
    const std::string longest(CGatewayPub::kBufferSize - 1 - m_text.size(), 'p');
    arguments.password = longest.c_str();
    EXPECT_EQ(Write(variant, arguments), 1);
    EXPECT_EQ(m_text.size(), CGatewayPub::kBufferSize - 1);
    EXPECT_EQ(m_lines, Lines{m_text});
    const std::string over = longest + "p";
    arguments.password = over.c_str();
    EXPECT_EQ(Write(variant, arguments), 0);
    EXPECT_EQ(m_text, kTooLong);
    EXPECT_EQ(m_lines, Lines{});
  }
}

}  // namespace
}  // namespace gateway_tests
