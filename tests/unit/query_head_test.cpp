// The header of queries: its fields, the split of the identity, its failures and log lines.

#include <algorithm>
#include <climits>
#include <cstdlib>
#include <set>

#include "gateway/core/gateway_pub.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const std::string kUnsplit = "[CLIENT] 身分證字號及帳號有誤！";
const std::string kLengths = "[CLIENT] 帳號或身份證字號輸入錯誤";
const std::string kNoAddress = "[CLIENT] 無法取得IP，請確認網路連線是否正常！";
const std::string kTooLong = "[CLIENT]傳入的參數錯誤";
const std::string kHead =
    "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|";

// One header with the usual session, each part of which a test may change.
class QueryHead : public CSessionTest {
 protected:
  void SetUp() override {
    CSessionTest::SetUp();
    m_gateway.m_nSeqNo = 7;
    m_gateway.setSerialNumber("SN0001");
    m_gateway.setLocalIP("10.0.0.1");
  }

  int Write(const char* identity, const char* branch = "9A00", const char* password = "pw") {
    const CRoomAtPageEnd out(CGatewayPub::kBufferSize, '\0');
    m_log.Take();
    const int result = m_gateway.initQueryHead(branch, identity, password, out);
    m_text = out;
    m_lines = m_log.Take();
    return result;
  }

  int Write(const std::string& identity) { return Write(identity.c_str()); }

  // The value of a field of the last header, up to its '|'.
  std::string Field(const std::string& tag) const {
    const size_t at = ("|" + m_text).find("|" + tag + "=");
    if (at == std::string::npos) return "(none)";
    const size_t value = at + tag.size() + 1;
    return m_text.substr(value, m_text.find('|', value) - value);
  }

  CGatewayPub m_gateway;
  std::string m_text;
  Lines m_lines;
};

TEST_F(QueryHead, HasItsFieldsInOrder) {
  EXPECT_EQ(Write("1234567&"), 1);
  EXPECT_EQ(m_text, kHead + "15=0|ACNO=1234567|PWD=pw|");
  EXPECT_EQ(m_lines, (Lines{"1234567", "", m_text}));
}

TEST_F(QueryHead, GoesOnBehindWhatTheBufferHolds) {
  char out[CGatewayPub::kBufferSize] = "X|";
  EXPECT_EQ(m_gateway.initQueryHead("9A00", "1234567&", "pw", out), 1);
  EXPECT_EQ(out, "X|" + kHead + "15=0|ACNO=1234567|PWD=pw|");
  EXPECT_EQ(m_log.Take().back(), out);
  EXPECT_EQ(m_gateway.initQueryHead("9A00", "X&", "pw", out), 0);
  EXPECT_EQ(out, kLengths);
}

TEST_F(QueryHead, MarketUpTo100IsSecuritiesAndTheRestFutures) {
  for (int market : {0, 1, 99, 100}) {
    m_gateway.m_nMarket = market;
    EXPECT_EQ(Write("&"), 1);
    EXPECT_EQ(Field("KIND"), "S") << market;
  }
  for (int market : {101, 102, 200, INT_MAX, -1, -100, INT_MIN}) {
    m_gateway.m_nMarket = market;
    EXPECT_EQ(Write("&"), 1);
    EXPECT_EQ(Field("KIND"), "F") << market;
    EXPECT_EQ(m_text.rfind("F=7|KIND=F|BHNO=9A00|CB=1|IP=10.0.0.1|", 0), 0U) << market;
    EXPECT_EQ(m_gateway.m_nMarket, market);
  }
}

TEST_F(QueryHead, PlatformRowsNameTheirEdition) {
  std::set<std::string> editions;
  for (int row = 0; row < 15; ++row) {
    m_gateway.m_nPlatform = row;
    EXPECT_EQ(Write("&"), 1);
    const std::string name = Field("11");
    if (row <= 4 || row == 6 || row == 8) {
      EXPECT_EQ(name, "NO DEFINE") << row;
      continue;
    }
    EXPECT_TRUE(!name.empty() && name.size() <= 8) << row << name;
    EXPECT_TRUE(
        std::all_of(name.begin(), name.end(),
                    [](char c) { return (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9'); }))
        << row << name;
    EXPECT_EQ(editions.insert(name).second, row != 14) << row << name;
  }
  EXPECT_EQ(editions.size(), 7U);
  m_gateway.m_nPlatform = 10;
  Write("&");
  const std::string ten = Field("11");
  m_gateway.m_nPlatform = 14;
  Write("&");
  EXPECT_EQ(Field("11"), ten);
}

TEST_F(QueryHead, PlatformOutsideTheTableIsNotDefined) {
  for (int row : {-1, 15, 16, INT_MAX, INT_MIN}) {
    m_gateway.m_nPlatform = row;
    EXPECT_EQ(Write("&"), 1);
    EXPECT_EQ(Field("11"), "NO DEFINE") << row;
  }
}

struct SequenceCase {
  int given;
  int reduced;
  const char* requestId;
};

constexpr SequenceCase kSequenceCases[] = {
    {0, 0, "0013452100"},    {7, 7, "0013452107"},        {99, 99, "0013452199"},
    {100, 0, "0013452100"},  {101, 1, "0013452101"},      {123, 23, "0013452123"},
    {-1, 95, "0013452195"},  {-2, 94, "0013452194"},      {-96, 0, "0013452100"},
    {-97, 99, "0013452199"}, {INT_MAX, 47, "0013452147"}, {INT_MIN, 48, "0013452148"}};

TEST_F(QueryHead, SequenceNumberIsReducedAndStoredBack) {
  for (const SequenceCase& row : kSequenceCases) {
    m_gateway.m_nSeqNo = row.given;
    EXPECT_EQ(Write("&"), 1);
    EXPECT_EQ(m_gateway.m_nSeqNo, row.reduced) << row.given;
    EXPECT_EQ(Field("65"), row.requestId) << row.given;
  }
}

TEST_F(QueryHead, SequenceNumberIsReducedAlsoWhenTheHeaderFails) {
  m_gateway.m_nSeqNo = 123;
  EXPECT_EQ(Write("12345"), 0);
  EXPECT_EQ(m_gateway.m_nSeqNo, 23);
  m_gateway.m_nSeqNo = -1;
  m_gateway.setLocalIP("");
  EXPECT_EQ(Write("&"), 0);
  EXPECT_EQ(m_gateway.m_nSeqNo, 95);
}

TEST_F(QueryHead, RequestIdIsTheLocalTimeAndTheSequenceNumber) {
  const struct {
    const char* clock;
    int sequence;
    const char* id;
  } rows[] = {{"2024-01-15 00:00:00", 0, "0000000000"},
              {"2024-01-15 00:00:09", 1, "0000000901"},
              {"2024-01-15 09:05:03", 4, "0009050304"},
              {"2024-01-15 13:45:21", 7, "0013452107"},
              {"2024-12-31 23:59:59", 99, "0023595999"}};
  for (const auto& row : rows) {
    ASSERT_TRUE(SetClock(row.clock));
    m_gateway.m_nSeqNo = row.sequence;
    EXPECT_EQ(Write("&"), 1);
    EXPECT_EQ(Field("65"), row.id) << row.clock;
  }
  SetClock(1705297521);  // 05:45:21 in Greenwich
  EXPECT_EQ(Write("&"), 1);
  EXPECT_EQ(Field("65"), "0013452199");
}

// The identity block, by the lengths of the two parts.
std::string ExpectedBlock(size_t length1, size_t length2) {
  const std::string account = "15=0|ACNO=0000000|PWD=pw|";
  const std::string second(length2, 'b');
  if (length1 == 0) return "";
  if (length1 >= 2 && length1 <= 7) return account;
  if (length1 >= 8 && length1 <= 10) {
    const std::string first = "15=1|IDNO=" + std::string(length1, 'a') + "|";
    return first + (length2 >= 2 && length2 <= 7 ? "ACNO=0000000|PWD=pw|" : "PWD=pw|");
  }
  if (length2 == 8 || length2 == 10) return "15=1|IDNO=" + second + "|PWD=pw|";
  return "fails";
}

// Every row of the table with its near misses; a part of 40 characters or more counts as empty.
TEST_F(QueryHead, IdentityBlockIsChosenByTheLengthsOfItsParts) {
  const size_t lengths[] = {0, 1, 2, 3, 6, 7, 8, 9, 10, 11, 12, 38, 39, 40, 41, 200};
  for (size_t length1 : lengths) {
    for (size_t length2 : lengths) {
      const std::string label = std::to_string(length1) + " and " + std::to_string(length2);
      const std::string first(length1 < 40 ? length1 : 0, 'a');
      const std::string second(length2 < 40 ? length2 : 0, 'b');
      const std::string block = ExpectedBlock(first.size(), second.size());
      const int result = Write(std::string(length1, 'a') + "&" + std::string(length2, 'b'));
      Lines lines = {first, second};
      if (block == "fails") {
        EXPECT_EQ(result, 0) << label;
        EXPECT_EQ(m_text, kLengths) << label;
      } else {
        EXPECT_EQ(result, 1) << label;
        EXPECT_EQ(m_text, kHead + block) << label;
        if (!block.empty()) lines.push_back(m_text);
      }
      EXPECT_EQ(m_lines, lines) << label;
    }
  }
}

struct IdentityCase {
  const char* identity;
  const char* block;
};

constexpr IdentityCase kIdentityCases[] = {
    {"A123456789&1234567", "15=1|IDNO=A123456789|ACNO=1234567|PWD=pw|"},
    {"1234567&", "15=0|ACNO=1234567|PWD=pw|"},
    {"X&A123456789", "15=1|IDNO=A123456789|PWD=pw|"},
    {"1234567&A123456789", "15=0|ACNO=1234567|PWD=pw|"},
    {"A123456789&", "15=1|IDNO=A123456789|PWD=pw|"},
    {"A123456789&98", "15=1|IDNO=A123456789|ACNO=0000098|PWD=pw|"},
    {"A123456789&9", "15=1|IDNO=A123456789|PWD=pw|"},
    {"A12345678&1234567", "15=1|IDNO=A12345678|ACNO=1234567|PWD=pw|"},
    {"A1234567&12345678", "15=1|IDNO=A1234567|PWD=pw|"},
    {"X&A1234567", "15=1|IDNO=A1234567|PWD=pw|"},
    {"12345678901&A123456789", "15=1|IDNO=A123456789|PWD=pw|"},
    // Account numbers are read as C reads numbers, and are never validated.
    {"12&", "15=0|ACNO=0000012|PWD=pw|"},
    {"AB&", "15=0|ACNO=0000000|PWD=pw|"},
    {"99A1&", "15=0|ACNO=0000099|PWD=pw|"},
    {"-5&", "15=0|ACNO=-000005|PWD=pw|"},
    {"+123456&", "15=0|ACNO=0123456|PWD=pw|"},
    {"  42&", "15=0|ACNO=0000042|PWD=pw|"},
    {"-123456&", "15=0|ACNO=-123456|PWD=pw|"},
    // The first '&' splits; another one belongs to the second part.
    {"A123456789&12&34", "15=1|IDNO=A123456789|ACNO=0000012|PWD=pw|"},
    {"X&A12&456789", "15=1|IDNO=A12&456789|PWD=pw|"},
    {"A123456789&&", "15=1|IDNO=A123456789|PWD=pw|"}};

TEST_F(QueryHead, IdentityPartsAreSentInTheirPlaces) {
  for (const IdentityCase& row : kIdentityCases) {
    EXPECT_EQ(Write(row.identity), 1) << row.identity;
    EXPECT_EQ(m_text, kHead + row.block) << row.identity;
  }
}

TEST_F(QueryHead, IdentityWithoutAnAmpersandFails) {
  for (const char* identity : {"12345", "A123456789", " ", "1"}) {
    EXPECT_EQ(Write(identity), 0);
    EXPECT_EQ(m_text, kUnsplit) << identity;
    EXPECT_EQ(m_lines, Lines{}) << identity;
  }
}

TEST_F(QueryHead, SecondPartOf9CharactersIsNoIdNumber) {
  EXPECT_EQ(Write("X&A12345678"), 0);
  EXPECT_EQ(m_text, kLengths);
  EXPECT_EQ(m_lines, (Lines{"X", "A12345678"}));
}

TEST_F(QueryHead, LoneAmpersandGivesAHeaderThatIsNotLogged) {
  EXPECT_EQ(Write("&"), 1);
  EXPECT_EQ(m_text, kHead);
  EXPECT_EQ(m_lines, (Lines{"", ""}));
}

TEST_F(QueryHead, EmptyFirstPartEndsTheHeaderWhateverTheSecond) {
  EXPECT_EQ(Write("&A123456789"), 1);
  EXPECT_EQ(m_text, kHead);
  EXPECT_EQ(m_lines, (Lines{"", "A123456789"}));
}

TEST_F(QueryHead, EmptyOrNullIdentityIsNotSplit) {
  for (const char* identity : {"", static_cast<const char*>(nullptr)}) {
    EXPECT_EQ(Write(identity), 1);
    EXPECT_EQ(m_text, kHead);
    EXPECT_EQ(m_lines, (Lines{"", ""}));
  }
}

TEST_F(QueryHead, NullBranchAndPasswordAreReadAsEmpty) {
  EXPECT_EQ(Write("1234567&", nullptr, nullptr), 1);
  EXPECT_EQ(Field("BHNO"), "");
  EXPECT_EQ(Field("PWD"), "");
  EXPECT_EQ(Write("A123456789&12", "", ""), 1);
  EXPECT_EQ(Field("BHNO"), "");
  EXPECT_EQ(Field("PWD"), "");
}

TEST_F(QueryHead, WithoutAnAddressItFailsBehindTheIdentityLines) {
  m_gateway.setLocalIP("");
  EXPECT_EQ(Write("A123456789&1234567"), 0);
  EXPECT_EQ(m_text, kNoAddress);
  EXPECT_EQ(m_lines, (Lines{"A123456789", "1234567"}));
}

TEST_F(QueryHead, SplitIsJudgedBeforeTheAddressAndTheLengthsAfterIt) {
  m_gateway.setLocalIP(nullptr);
  EXPECT_EQ(Write("12345"), 0);
  EXPECT_EQ(m_text, kUnsplit);
  EXPECT_EQ(Write("X&X"), 0);
  EXPECT_EQ(m_text, kNoAddress);
}

TEST_F(QueryHead, FullSerialNumberRunsOnIntoTheAddress) {
  const std::string address64(64, '9');
  const struct {
    std::string serial, address, sent;
  } rows[] = {{"1234567890123456789", "10.0.0.1", "1234567890123456789"},
              {"12345678901234567890", "10.0.0.1", "1234567890123456789010.0.0.1"},
              {"12345678901234567890X", "10.0.0.1", "1234567890123456789010.0.0.1"},
              {"12345678901234567890", address64, "12345678901234567890" + address64},
              {"", "10.0.0.1", ""}};
  for (const auto& row : rows) {
    m_gateway.setSerialNumber(row.serial.c_str());
    m_gateway.setLocalIP(row.address.c_str());
    EXPECT_EQ(Write("&"), 1);
    EXPECT_EQ(Field("SN"), row.sent) << row.serial;
    EXPECT_EQ(Field("IP"), row.address) << row.serial;
  }
}

TEST_F(QueryHead, TextsOfTheHostAreSentAsTheyAre) {
  EXPECT_EQ(Write("1234567&", "a|b%s%n", "p w=%d&密碼"), 1);
  EXPECT_NE(m_text.find("|BHNO=a|b%s%n|CB=1|"), std::string::npos);
  EXPECT_NE(m_text.find("|PWD=p w=%d&密碼|"), std::string::npos);
}

TEST_F(QueryHead, HeaderThatFillsTheBufferIsWholeAndOneCharacterMoreFails) {
  Write("1234567&", "9A00", "");
  const size_t room = CGatewayPub::kBufferSize - 1 - m_text.size();
  const std::string longest(room, 'p');
  EXPECT_EQ(Write("1234567&", "9A00", longest.c_str()), 1);
  EXPECT_EQ(m_text, kHead + "15=0|ACNO=1234567|PWD=" + longest + "|");
  EXPECT_EQ(m_lines.size(), 3U);
  EXPECT_EQ(Write("1234567&", "9A00", (longest + "p").c_str()), 0);
  EXPECT_EQ(m_text, kTooLong);
  EXPECT_EQ(m_lines.size(), 2U);
  EXPECT_EQ(Write("&", std::string(65536, 'b').c_str(), ""), 0);
  EXPECT_EQ(m_text, kTooLong);
}

struct SplitCase {
  const char* field;
  int size1, size2;
  int result;
  const char* first;
  const char* second;  // "#" where the buffer stays as it was
};

constexpr SplitCase kSplitCases[] = {
    {nullptr, 40, 40, 0, "#", "#"},     {"", 40, 40, 0, "#", "#"},
    {"12345", 40, 40, 0, "#", "#"},     {"&", 40, 40, 1, "#", "#"},
    {"a&", 40, 40, 1, "a", "#"},        {"&b", 40, 40, 1, "#", "b"},
    {"a&b", 40, 40, 1, "a", "b"},       {"a&b&c", 40, 40, 1, "a", "b&c"},
    {"a&&", 40, 40, 1, "a", "&"},       {"123&456", 4, 4, 1, "123", "456"},
    {"1234&456", 4, 4, 1, "#", "456"},  {"123&4567", 4, 4, 1, "123", "#"},
    {"12345&45678", 4, 4, 1, "#", "#"}, {"a&b", 1, 1, 1, "#", "#"},
    {"a&b", 0, 0, 1, "#", "#"},         {"a&b", -1, INT_MIN, 1, "#", "#"},
    {"a&b", 2, 2, 1, "a", "b"}};

TEST_F(QueryHead, SeparateDataFromUiFieldCopiesWhatFits) {
  for (const SplitCase& row : kSplitCases) {
    const std::string label = row.field == nullptr ? "(null)" : row.field;
    const CRoomAtPageEnd first(static_cast<size_t>(std::max(row.size1, 2)));
    const CRoomAtPageEnd second(static_cast<size_t>(std::max(row.size2, 2)));
    first[1] = second[1] = '\0';
    const int result =
        m_gateway.SeparateDataFromUiField(row.field, first, row.size1, second, row.size2);
    EXPECT_EQ(result, row.result) << label;
    EXPECT_STREQ(first, row.first) << label;
    EXPECT_STREQ(second, row.second) << label;
  }
}

TEST_F(QueryHead, SeparateDataFromUiFieldTakesNullBuffers) {
  char part[8] = "#";
  EXPECT_EQ(m_gateway.SeparateDataFromUiField("a&b", nullptr, 8, part, 8), 1);
  EXPECT_STREQ(part, "b");
  EXPECT_EQ(m_gateway.SeparateDataFromUiField("a&b", part, 8, nullptr, 8), 1);
  EXPECT_STREQ(part, "a");
  EXPECT_EQ(m_gateway.SeparateDataFromUiField("a&b", nullptr, 0, nullptr, 0), 1);
}

}  // namespace
}  // namespace gateway_tests
