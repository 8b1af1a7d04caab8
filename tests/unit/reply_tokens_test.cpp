// The tokenizers of replies in their buffer-copying form, and the judging of failed replies.

#include <climits>

#include "gateway/core/gateway_pub.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

class ReplyTokens : public CSessionTest {
 protected:
  CGatewayPub m_gateway;
};

struct TokenCase {
  const char* title;
  const char* reply;
  const char* tag;
  bool skip;
  int length;
  const char* value;
};

constexpr bool kTake = false, kSkip = true;

constexpr TokenCase kTokenCases[] = {
    {"field in the middle", "F=7|68=0000|M2=x|", "68", kTake, 4, "0000"},
    {"last field without a bar", "F=7|68=0000", "68", kTake, 4, "0000"},
    {"field at the very start", "68=0000|M2=x|", "68", kTake, 0, ""},
    {"field at the very start and again", "68=0000|68=1|", "68", kTake, 1, "1"},
    {"absent field", "F=7|68=0000|", "M2", kTake, 0, ""},
    {"empty reply", "", "68", kTake, 0, ""},
    {"tag without '='", "|68|68=1|", "68", kTake, 1, "1"},
    {"reply ends in the pattern", "|a=1|68", "68", kTake, 0, ""},
    {"reply ends behind the pattern", "|a=1|68=", "68", kTake, 0, ""},
    {"tag that only starts alike", "|681=9|68=1|", "68", kTake, 1, "1"},
    {"tag that only ends alike", "|168=9|68=1|", "68", kTake, 1, "1"},
    {"short tag against a long one", "|751=9|75=1|", "75", kTake, 1, "1"},
    {"long tag against a short one", "|75=1|751=9|", "751", kTake, 1, "9"},
    {"tag of one character", "|AB=1|A=2|", "A", kTake, 1, "2"},
    {"tag of ten characters", "|ABCDEFGHIJ=2|", "ABCDEFGHIJ", kTake, 1, "2"},
    {"case matters", "|m2=x|M2=y|", "M2", kTake, 1, "y"},
    {"first of several", "|68=1|68=2|", "68", kTake, 1, "1"},
    {"value with '='", "|M2=a=b|", "M2", kTake, 3, "a=b"},
    {"value that looks like its field", "|M2=M2=b|", "M2", kTake, 4, "M2=b"},
    {"doubled bar", "||68=1||", "68", kTake, 1, "1"},
    {"blank in the value", "|M2= a b |", "M2", kTake, 5, " a b "},
    {"Chinese value", "|M2=密碼|", "M2", kTake, 6, "密碼"},
    {"empty tag", "|=1|", "", kTake, 1, "1"},

    {"tag 68 of F=7|68=|68=0000| as it is", "F=7|68=|68=0000|", "68", kTake, 0, ""},
    {"tag 68 of F=7|68=|68=0000| skipping", "F=7|68=|68=0000|", "68", kSkip, 4, "0000"},
    {"single blank as it is", "|17= |17=98|", "17", kTake, 1, " "},
    {"single blank skipped", "|17= |17=98|", "17", kSkip, 2, "98"},
    {"two blanks are a value", "|17=  |17=98|", "17", kSkip, 2, "  "},
    {"other space is a value", "|17=\t|17=98|", "17", kSkip, 1, "\t"},
    {"several skipped", "|17=|17= |17=|17= |17=7|17=8|", "17", kSkip, 1, "7"},
    {"all skipped", "|17=|17= |", "17", kSkip, 0, ""},
    {"only empty ones", "|17=|", "17", kSkip, 0, ""},
    {"skipping with others between", "|17=|18=5|17=|18=6|17=9", "17", kSkip, 1, "9"},
    {"nothing to skip", "|17=1|17=2|", "17", kSkip, 1, "1"},
    {"unclosed empty value is taken", "|17=|17=", "17", kSkip, 0, ""},
    {"unclosed blank value is taken", "|17=|17= ", "17", kSkip, 1, " "},
    {"skipping at the start without a bar", "17=1|17=|17=2|", "17", kSkip, 1, "2"},
    {"absent, skipping", "|18=1|", "17", kSkip, 0, ""}};

TEST_F(ReplyTokens, GetTokenFindsTheValueOfAField) {
  for (const TokenCase& row : kTokenCases) {
    const CTextAtPageEnd reply(row.reply);
    const CRoomAtPageEnd out(32);
    EXPECT_EQ(m_gateway.GetToken(row.tag, reply, out, 32, row.skip), row.length) << row.title;
    std::string bytes = row.value;
    bytes.resize(32);
    EXPECT_EQ(out.Bytes(), bytes) << row.title << ": all of the buffer is cleared";
  }
}

TEST_F(ReplyTokens, GetTokenDropsAValueThatDoesNotFit) {
  const struct {
    int size;
    const char* value;
  } rows[] = {{3, ""}, {4, ""}, {5, "0000"}, {6, "0000"}, {1, ""}};
  const CTextAtPageEnd reply("|68=0000|");
  for (const auto& row : rows) {
    const CRoomAtPageEnd out(static_cast<size_t>(row.size));
    EXPECT_EQ(m_gateway.GetToken("68", reply, out, row.size, false), 4) << row.size;
    EXPECT_STREQ(out, row.value) << row.size;
  }
}

TEST_F(ReplyTokens, GetTokenDropsATooLongValueAlsoWhenItSkips) {
  const CRoomAtPageEnd out(4);
  EXPECT_EQ(m_gateway.GetToken("17", "|17=|17=1234|17=1|", out, 4, true), 4);
  EXPECT_STREQ(out, "");
}

TEST_F(ReplyTokens, GetTokenLeavesABufferOfNoSizeAlone) {
  char out[4] = "###";
  for (int size : {0, -1, INT_MIN}) {
    EXPECT_EQ(m_gateway.GetToken("68", "|68=0000|", out, size, false), 4);
    EXPECT_STREQ(out, "###");
  }
  EXPECT_EQ(m_gateway.GetToken("68", "|68=0000|", nullptr, 20, false), 4);
  EXPECT_EQ(m_gateway.GetToken("68", nullptr, out, 4, false), 0);
  EXPECT_STREQ(out, "");
}

TEST_F(ReplyTokens, GetTokenFindsNothingForANullTag) {
  for (bool skip : {false, true}) {
    char out[4] = "###";
    EXPECT_EQ(m_gateway.GetToken(nullptr, "|=1|", out, 4, skip), 0);
    EXPECT_STREQ(out, "");
    EXPECT_EQ(m_gateway.GetToken(nullptr, nullptr, out, 4, skip), 0);
  }
}

struct RecordCase {
  const char* title;
  const char* reply;
  int from;
  const char* record;
  int to;
};

constexpr RecordCase kRecordCases[] = {
    {"one record", "|00=|17=1|01=|", 0, "|00=|17=1", 10},
    {"text before it", "F=7|68=0000|00=a|17=1|01=", 0, "|00=a|17=1", 22},
    {"next one", "|00=a|01=|00=b|01=", 6, "|00=b", 15},
    {"position behind the opening", "|00=a|01=|00=b|01=", 1, "", 6},
    {"no marker", "|17=1|", 0, "", 6},
    {"opening alone", "|00=a|17=1", 0, "", 10},
    {"closing alone", "|17=1|01=", 0, "", 9},
    {"closing first", "|01=x|00=a|01=y", 0, "", 1},
    {"from a closing field on", "|01=x|00=a|01=y", 1, "|00=a", 11},
    {"closing first and none behind", "|01=x|00=a", 0, "", 1},
    {"two openings", "|00=a|00=b|01=", 0, "|00=a|00=b", 11},
    {"record without fields", "|00=|01=", 0, "|00=", 5},
    {"opening at the very start without a bar", "00=a|01=|00=b|01=", 0, "", 5},
    {"tags that only start alike", "|001=a|00=b|010=c|01=", 0, "|00=b|010=c", 18},
    {"markers in a value", "|M2=00=a|01=x|00=b|01=", 0, "", 9},
    {"empty reply", "", 0, "", 0},
    {"at the end", "|00=a|01=", 9, "", 9},
    {"nothing behind the last record", "|00=a|01=", 6, "", 9}};

TEST_F(ReplyTokens, GetSubStringCutsTheNextRecord) {
  for (const RecordCase& row : kRecordCases) {
    const CTextAtPageEnd reply(row.reply);
    const CRoomAtPageEnd out(40);
    int position = row.from;
    m_gateway.GetSubString(reply, position, out, 40);
    std::string bytes = row.record;
    bytes.resize(40);
    EXPECT_EQ(out.Bytes(), bytes) << row.title;
    EXPECT_EQ(position, row.to) << row.title;
  }
}

TEST_F(ReplyTokens, GetSubStringWalksAReplyToItsEnd) {
  const std::string reply = "F=7|00=a|01=|x=1|00=b|01=|01=|00=c|01=|00=d";
  std::vector<std::string> records;
  int position = 0;
  while (static_cast<size_t>(position) < reply.size()) {
    char record[16];
    m_gateway.GetSubString(reply.c_str(), position, record, sizeof record);
    records.emplace_back(record);
  }
  EXPECT_EQ(records, (Lines{"|00=a", "|00=b", "", "|00=c", ""}));
  EXPECT_EQ(static_cast<size_t>(position), reply.size());
}

TEST_F(ReplyTokens, GetSubStringDropsARecordThatDoesNotFitAndGoesOn) {
  const std::string reply = "|00=1234|01=|00=b|01=";  // a record of 8 characters
  const struct {
    int size;
    const char* record;
  } rows[] = {{7, ""}, {8, ""}, {9, "|00=1234"}, {10, "|00=1234"}};
  for (const auto& row : rows) {
    const CRoomAtPageEnd out(static_cast<size_t>(row.size));
    int position = 0;
    m_gateway.GetSubString(reply.c_str(), position, out, row.size);
    EXPECT_STREQ(out, row.record) << row.size;
    EXPECT_EQ(position, 9) << row.size;
    m_gateway.GetSubString(reply.c_str(), position, out, row.size);
    EXPECT_STREQ(out, "|00=b") << row.size;
  }
}

TEST_F(ReplyTokens, GetSubStringTakesOddPositionsAndBuffers) {
  char out[16] = "###";
  for (int from : {-1, 7, INT_MAX, INT_MIN}) {
    int position = from;
    m_gateway.GetSubString("|01=xy", position, out, sizeof out);
    EXPECT_EQ(position, 6) << from;
    EXPECT_STREQ(out, "");
  }
  int position = 0;
  m_gateway.GetSubString("|00=a|01=", position, nullptr, 16);
  EXPECT_EQ(position, 6);
  position = 0;
  m_gateway.GetSubString(nullptr, position, out, sizeof out);
  EXPECT_EQ(position, 0);
}

struct FieldCase {
  const char* title;
  const char* text;
  const char* separator;
  int size;
  const char* field;  // "#" where the buffer stays as it was
  int moved;
};

constexpr FieldCase kFieldCases[] = {{"up to the separator", "ab&cd", "&", 8, "ab", 3},
                                     {"last field", "cd", "&", 8, "cd", 2},
                                     {"empty field", "&cd", "&", 8, "#", 1},
                                     {"empty text", "", "&", 8, "#", 0},
                                     {"separator at the end", "ab&", "&", 8, "ab", 3},
                                     {"separator of two characters", "a&b&&c", "&&", 8, "a&b", 5},
                                     {"separator not there in full", "a&b", "&&", 8, "a&b", 3},
                                     {"fits exactly", "abc&d", "&", 4, "abc", 4},
                                     {"one too long, passed over", "abcd&d", "&", 4, "#", 5},
                                     {"last field fits exactly", "abc", "&", 4, "abc", 3},
                                     {"last field one too long", "abcd", "&", 4, "#", 4},
                                     {"buffer for the terminator alone", "a&b", "&", 1, "#", 2},
                                     {"buffer of no size", "a&b", "&", 0, "#", 2},
                                     {"buffer of negative size", "a&b", "&", -1, "#", 2}};

TEST_F(ReplyTokens, GetFieldStringTakesTheNextField) {
  for (const FieldCase& row : kFieldCases) {
    const CTextAtPageEnd text(row.text);
    char out[8] = "#";
    char* cursor = text;
    m_gateway.GetFieldString(&cursor, row.separator, out, row.size);
    EXPECT_STREQ(out, row.field) << row.title;
    EXPECT_EQ(cursor - text, row.moved) << row.title;
    EXPECT_STREQ(text, row.text) << row.title << ": the text stays as it was";
  }
}

TEST_F(ReplyTokens, GetFieldStringWithoutABufferMovesOnlyPastASeparator) {
  char text[] = "ab&cd";
  char* cursor = text;
  m_gateway.GetFieldString(&cursor, "&", nullptr, 8);
  EXPECT_EQ(cursor - text, 3);
  m_gateway.GetFieldString(&cursor, "&", nullptr, 8);
  EXPECT_EQ(cursor - text, 3);
  m_gateway.GetFieldString(&cursor, nullptr, nullptr, 8);
  m_gateway.GetFieldString(nullptr, "&", nullptr, 8);
  char* nothing = nullptr;
  m_gateway.GetFieldString(&nothing, "&", nullptr, 8);
  EXPECT_EQ(nothing, nullptr);
}

TEST_F(ReplyTokens, GetFieldStringWalksATextToItsEnd) {
  char text[] = "a&&c";
  char* cursor = text;
  Lines fields;
  for (int field = 0; field < 4; ++field) {
    char out[8] = "";
    m_gateway.GetFieldString(&cursor, "&", out, sizeof out);
    fields.emplace_back(out);
  }
  EXPECT_EQ(fields, (Lines{"a", "", "c", ""}));
}

const std::string kGatewayDown = "[GATEWAY]主機連線失敗";
const std::string kBrokerDown = "[BROKER]主機連線失敗";

struct TransportCase {
  const char* reply;
  const std::string* message;  // null where the reply is none of a failed transport
};

const TransportCase kTransportCases[] = {{"", &kBrokerDown},
                                         {nullptr, &kBrokerDown},
                                         {"[GATEWAY]error", &kGatewayDown},
                                         {"[GATEWAY]errors", &kGatewayDown},
                                         {"|M2=x[GATEWAY]error 5|", &kGatewayDown},
                                         {"[BROKER]timeout", &kBrokerDown},
                                         {"|M2=[BROKER]timeout|", &kBrokerDown},
                                         {"[BROKER]timeout[GATEWAY]error", &kGatewayDown},
                                         {"[GATEWAY]error[BROKER]timeout", &kGatewayDown},
                                         {"[[GATEWAY]error", &kGatewayDown},
                                         {"[GATEWAY][BROKER]timeout", &kBrokerDown},
                                         {"[GATEWAY]Error", nullptr},
                                         {"[GATEWAY] error", nullptr},
                                         {"[GATEWAY]erro", nullptr},
                                         {"[gateway]error", nullptr},
                                         {"GATEWAY]error", nullptr},
                                         {"[BROKER]timeou", nullptr},
                                         {"[BROKER]Timeout", nullptr},
                                         {"[BROKER]error", nullptr},
                                         {"[GATEWAY]timeout", nullptr},
                                         {"[CERT]error", nullptr},
                                         {"[", nullptr},
                                         {" ", nullptr},
                                         {"|68=0000|", nullptr}};

TEST_F(ReplyTokens, CheckErrorTellsAFailedTransport) {
  for (const TransportCase& row : kTransportCases) {
    const std::string label = row.reply == nullptr ? "(null)" : row.reply;
    const CTextAtPageEnd reply(label);
    int status = 77;
    const CRoomAtPageEnd message(64);
    const char* given = row.reply == nullptr ? nullptr : static_cast<char*>(reply);
    m_gateway.CheckError(given, &status, message, 64);
    std::string bytes = row.message == nullptr ? "" : *row.message;
    bytes.resize(64);
    EXPECT_EQ(message.Bytes(), bytes) << label;
    EXPECT_EQ(status, row.message == nullptr ? 77 : -1) << label;
  }
  EXPECT_EQ(m_log.Take(), Lines{});
}

TEST_F(ReplyTokens, CheckErrorTakesAnyMessageBuffer) {
  int status = 1;
  m_gateway.CheckError("", &status, nullptr, 64);
  EXPECT_EQ(status, -1);
  char message[64] = "###";
  status = 1;
  m_gateway.CheckError("[GATEWAY]error", &status, message, 0);
  EXPECT_EQ(status, -1);
  EXPECT_STREQ(message, "###");
}

struct PrefixCase {
  const char* message;
  const char* shown;
};

constexpr PrefixCase kPrefixCases[] = {{"密碼錯誤", "[GATEWAY]密碼錯誤"},
                                       {"", "[GATEWAY]"},
                                       {" ", "[GATEWAY] "},
                                       {"[GATEWAY]x", "[GATEWAY]x"},
                                       {"[BROKER]x", "[BROKER]x"},
                                       {"[CERT]x", "[CERT]x"},
                                       {"x[GATEWAY]", "x[GATEWAY]"},
                                       {"x [BROKER] y", "x [BROKER] y"},
                                       {"xy[CERT]", "xy[CERT]"},
                                       {"[CLIENT] x", "[GATEWAY][CLIENT] x"},
                                       {"[gateway]x", "[GATEWAY][gateway]x"},
                                       {"GATEWAY]x", "[GATEWAY]GATEWAY]x"},
                                       {"[GATEWAYx", "[GATEWAY][GATEWAYx"},
                                       {"%s%n", "[GATEWAY]%s%n"}};

TEST_F(ReplyTokens, MakeErrorMsgNamesASourceWhereNoneIs) {
  for (const PrefixCase& row : kPrefixCases) {
    const std::string text = row.message;
    const CRoomAtPageEnd message(text.size() + 10);  // 9 characters more and the terminator
    text.copy(message, text.size());
    message[text.size()] = '\0';
    m_gateway.MakeErrorMsg(message);
    EXPECT_STREQ(message, row.shown);
  }
}

TEST_F(ReplyTokens, MakeErrorMsgTakesNull) {
  m_gateway.MakeErrorMsg(nullptr);
}

TEST_F(ReplyTokens, MakeErrorMsgCutsNoMessage) {
  for (size_t length : {190U, 191U, 199U, 200U, 201U, 4000U}) {
    const std::string text(length, 'm');
    const CRoomAtPageEnd message(length + 10);
    text.copy(message, length);
    message[length] = '\0';
    m_gateway.MakeErrorMsg(message);
    EXPECT_EQ(std::string(message), "[GATEWAY]" + text);
  }
}

}  // namespace
}  // namespace gateway_tests
