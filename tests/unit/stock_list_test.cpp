// The order book and the fills of the stock market.

#include <cstring>
#include <functional>
#include <map>
#include <tuple>

#include "gateway/stock/gateway_stk.h"
#include "gateway/stock/order_type_codes.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const std::string kKindError = "[CLIENT] 委託種類錯誤";
const std::string kDateError = "[CLIENT] 日期輸入錯誤";
const std::string kSent = "委託已傳送，等待接收回報！";

using Fields = std::map<std::string, std::string>;

std::string Record(const Fields& fields) {
  std::string record = "|00=";
  for (const auto& [tag, value] : fields) record += "|" + tag + "=" + value;
  return record + "|01=";
}

Fields With(Fields fields, const std::string& tag, const std::string& value) {
  fields[tag] = value;
  return fields;
}

const std::string kEnd = Record({{"67", "900000"}, {"68", "0000"}});

struct Answer {
  std::string text;
  int status;
};

bool operator==(const Answer& a, const Answer& b) {
  return a.text == b.text && a.status == b.status;
}

void PrintTo(const Answer& answer, std::ostream* out) {
  *out << answer.text << " / " << answer.status;
}

class StockLists : public CSessionTest {
 protected:
  using Method = decltype(&CGatewayStk::QueryOrderDecode);

  static Answer Read(Method method, const std::string& reply, int market = 0) {
    CGatewayStk gateway;
    gateway.m_nMarket = market;
    int status = 77;
    const char* const text = std::invoke(method, gateway, CTextAtPageEnd(reply), &status);
    return {text, status};
  }
  static Answer ReadBook(const std::string& reply, int market = 0) {
    return Read(&CGatewayStk::QueryOrderDecode, reply, market);
  }
  static Answer ReadFills(const std::string& reply) {
    return Read(&CGatewayStk::QueryReplyDecode, reply);
  }

  // One field of the only record, by position.
  static std::string BookField(const Fields& fields, size_t position, int market = 0) {
    const Answer answer = ReadBook(Record(fields) + kEnd, market);
    EXPECT_EQ(answer.status, 1) << answer.text;
    EXPECT_EQ(answer.text.substr(0, 2), "1!");
    std::string rest = answer.text.substr(2);
    for (; position > 0; --position) rest.erase(0, rest.find('@') + 1);
    return rest.substr(0, rest.find_first_of("@!"));
  }
};

const Fields kOrder = {{"67", "1"}, {"68", "0000"},   {"46", "G0002"},    {"36", "W0001"},
                       {"27", "0"}, {"28", "0"},      {"32", "B"},        {"29", "2330"},
                       {"70", "5"}, {"41", "1"},      {"37", "1"},        {"47", "3"},
                       {"39", " "}, {"K1", ""},       {"N6", "1"},        {"31", "10.05"},
                       {"M8", "0"}, {"22", "134521"}, {"21", "20240115"}, {"44", "1130116"},
                       {"JV", "Y"}};

TEST_F(StockLists, OrderHasItsFourteenFields) {
  EXPECT_EQ(ReadBook(Record(kOrder) + kEnd),
            (Answer{"1!G0002@W0001@1@2330@5@部份成交，其餘已取消@3@2@1005@134521@1130115@20240116@1"
                    "@1!",
                    1}));
}

TEST_F(StockLists, OrderOfMissingFieldsCarriesNothingOver) {
  EXPECT_EQ(ReadBook(Record(kOrder) + Record({{"68", "0000"}}) + kEnd),
            (Answer{"2!G0002@W0001@1@2330@5@部份成交，其餘已取消@3@2@1005@134521@1130115@20240116@1"
                    "@1!@@2@@0@已取消@0@0@市價@@@@@!",
                    1}));
}

const Fields kFill = {{"67", "1"},    {"68", "0000"},  {"36", "W0001"},    {"27", "0"},
                      {"28", "0"},    {"32", "S"},     {"29", "2330"},     {"47", "3000"},
                      {"48", "10.5"}, {"49", "31500"}, {"50", "20240115"}, {"51", "134521123"}};

TEST_F(StockLists, FillHasItsEightFields) {
  EXPECT_EQ(ReadFills(Record(kFill) + kEnd),
            (Answer{"1!W0001@2@2330@3000@1050@31500@1130115@134521!", 1}));
}

TEST_F(StockLists, FillOfMissingFieldsCarriesNothingOver) {
  EXPECT_EQ(ReadFills(Record(kFill) + Record({{"68", "0000"}, {"47", "1"}}) + kEnd),
            (Answer{"2!W0001@2@2330@3000@1050@31500@1130115@134521!@2@@1@0@0@@!", 1}));
}

TEST_F(StockLists, RecordWithoutAFilledQuantityIsNoFill) {
  for (const char* quantity : {"", "0", "x", "00"}) {
    const std::string none = Record(With(With(kFill, "47", quantity), "27", "99"));
    EXPECT_EQ(ReadFills(none + Record(kFill) + kEnd),
              (Answer{"1!W0001@2@2330@3000@1050@31500@1130115@134521!", 1}));
    EXPECT_EQ(ReadFills(none + kEnd), (Answer{"0!", 1})) << quantity;
  }
}

struct ListCase {
  const char* label;
  std::string reply;
  Answer answer;
};

TEST_F(StockLists, BothAnswerWithoutDataAlike) {
  const ListCase rows[] = {
      {"no data", Record({{"67", "900000"}, {"68", "5001"}}), {"0!", 1}},
      {"end mark alone", kEnd, {"0!", 1}},
      {"refused", Record({{"68", "E012"}, {"M2", "查無帳號"}}), {"[GATEWAY]查無帳號(E012)", -1}},
      {"refused by a named source",
       Record({{"68", "E1"}, {"M2", "[BROKER]no"}}),
       {"[BROKER]no(E1)", -1}},
      {"refused without a code", Record({{"M2", "no"}}), {"[GATEWAY]no", -1}},
      {"refused without a message", Record({{"68", "E1"}}), {"[GATEWAY](E1)", -1}},
      {"no record", "|68=0000|67=900000", {"[GATEWAY]", -1}},
      {"a long message",
       Record({{"68", "E1"}, {"M2", std::string(370, 'm')}}),
       {"[GATEWAY]" + std::string(370, 'm') + "(E1)", -1}},
      {"gateway error", "[GATEWAY]error", {"[GATEWAY]主機連線失敗", -1}},
      {"broker time-out", Record(kOrder) + "[BROKER]timeout", {"[BROKER]主機連線失敗", -1}},
      {"empty reply", "", {"[BROKER]主機連線失敗", -1}},
  };
  for (const ListCase& row : rows) {
    EXPECT_EQ(ReadBook(row.reply), row.answer) << row.label;
    EXPECT_EQ(ReadFills(row.reply), row.answer) << row.label;
  }
}

TEST_F(StockLists, CountsItsRecordsAndSkipsThoseWithoutData) {
  const std::string skipped = Record(With(kFill, "68", "E001"));
  const std::string fill = "W0001@2@2330@3000@1050@31500@1130115@134521!";
  const std::string good = Record(kFill);
  EXPECT_EQ(ReadFills(good + good + good + kEnd), (Answer{"3!" + fill + fill + fill, 1}));
  EXPECT_EQ(ReadFills(good + skipped + good + kEnd), (Answer{"2!" + fill + fill, 1}));
  EXPECT_EQ(ReadFills(good + good), (Answer{"2!" + fill + fill, 1})) << "cut short";
  EXPECT_EQ(ReadFills(good + kEnd + good), (Answer{"1!" + fill, 1})) << "behind the end mark";
}

// A fill whose record has `size` characters before the bar that ends it.
std::string FillOfSize(size_t size) {
  const std::string bare = Record(With(kFill, "99", ""));
  return Record(With(kFill, "99", std::string(size + strlen("|01=") - bare.size(), 'x')));
}

TEST_F(StockLists, RecordTooLongForItsBufferIsSkipped) {
  const std::string fill = "W0001@2@2330@3000@1050@31500@1130115@134521!";
  const std::string fits = FillOfSize(399), tooLong = FillOfSize(400);
  ASSERT_EQ(fits.find("|01="), 399U);
  EXPECT_EQ(ReadFills(fits + tooLong + fits + kEnd), (Answer{"2!" + fill + fill, 1}));
  EXPECT_EQ(ReadFills(tooLong + fits), (Answer{"[GATEWAY]", -1})) << "first";
}

TEST_F(StockLists, CodeAndSequenceHaveBuffersOf20Bytes) {
  const std::string code(19, 'E');
  EXPECT_EQ(ReadFills(Record({{"68", code}})), (Answer{"[GATEWAY](" + code + ")", -1}));
  EXPECT_EQ(ReadFills(Record({{"68", code + "E"}})), (Answer{"[GATEWAY]", -1}));
  const std::string sequence = std::string(13, '0') + "900000";
  EXPECT_EQ(ReadFills(Record(With(kFill, "67", sequence))), (Answer{"0!", 1}));
  EXPECT_EQ(ReadFills(Record(With(kFill, "67", "0" + sequence))).text.substr(0, 2), "1!");
}

TEST_F(StockLists, OneOrderWithoutACodeFailsTheWholeList) {
  EXPECT_EQ(ReadBook(Record(kOrder) + Record(With(kOrder, "27", "9")) + kEnd),
            (Answer{kKindError, -1}));
  EXPECT_EQ(ReadFills(Record(kFill) + Record(With(kFill, "27", "9")) + kEnd),
            (Answer{kKindError, -1}));
}

TEST_F(StockLists, BookLogsTheReplyAndFillsDoNot) {
  m_log.Take();
  ReadBook(kEnd);
  EXPECT_EQ(m_log.Take(), (Lines{"QueryOrderDecode: Len:" + std::to_string(kEnd.size()), kEnd,
                                 "~CGatewayStk", "~CGatewayPub"}));
  ReadFills(kEnd);
  EXPECT_EQ(m_log.Take(), (Lines{"~CGatewayStk", "~CGatewayPub"}));
}

// Order-type codes: buy and other side, 0 where the cell is open. Trade types -1 to 4 and beyond.
struct CodeRow {
  int kind, tradeType, buy, other;
};

constexpr CodeRow kCodes[] = {
    {0, 0, 1, 2},   {0, 1, 1, 2},    {0, 2, 7, 8},    {0, 3, 9, 10},   {1, 0, 3, 4},
    {1, 1, 3, 4},   {1, 3, 11, 12},  {2, 0, 5, 6},    {2, 1, 5, 6},    {2, 3, 13, 14},
    {3, 0, 3, 4},   {3, 1, 3, 4},    {3, 3, 11, 12},  {4, 0, 5, 6},    {4, 1, 5, 6},
    {4, 3, 13, 14}, {5, -1, 38, 38}, {5, 0, 38, 38},  {5, 1, 38, 38},  {5, 2, 38, 38},
    {5, 3, 38, 38}, {5, 4, 38, 38},  {5, 99, 38, 38}, {8, -1, 33, 34}, {8, 0, 33, 34},
    {8, 1, 33, 34}, {8, 2, 33, 34},  {8, 3, 40, 41},  {8, 4, 33, 34},  {8, 99, 33, 34},
};

std::tuple<int, int> CodesOf(int kind, int tradeType) {
  for (const CodeRow& row : kCodes) {
    if (row.kind == kind && row.tradeType == tradeType) return {row.buy, row.other};
  }
  return {0, 0};
}

TEST_F(StockLists, EveryOrderTypeHasItsCode) {
  for (int kind :
       {-2147483647, -1, 0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 18, 26, 31, 32, 33, 40, 256}) {
    for (int tradeType : {-1, 0, 1, 2, 3, 4, 99}) {
      for (const char* side : {"B", "S", "", "b", "BB", " B"}) {
        const bool buys = std::string(side) == "B";
        const auto [buy, other] = CodesOf(kind, tradeType);
        const int live = buys ? buy : other;
        const bool inBookAlone = kind == 6 || kind == 7;
        const int book = inBookAlone ? kind + 24 : live;
        const auto fields = [&](const Fields& base) {
          return With(With(With(base, "27", std::to_string(kind)), "28", std::to_string(tradeType)),
                      "32", side);
        };
        const Answer orders = ReadBook(Record(fields(kOrder)) + kEnd);
        const Answer fills = ReadFills(Record(fields(kFill)) + kEnd);
        const std::string label = std::to_string(kind) + "/" + std::to_string(tradeType) + side;
        if (book == 0) {
          EXPECT_EQ(orders, (Answer{kKindError, -1})) << label;
        } else {
          const std::string start = "1!G0002@W0001@" + std::to_string(book) + "@2330@";
          EXPECT_EQ(orders.text.substr(0, start.size()), start) << label;
        }
        if (live == 0) {
          EXPECT_EQ(fills, (Answer{kKindError, -1})) << label;
        } else {
          const std::string start = "1!W0001@" + std::to_string(live) + "@2330@";
          EXPECT_EQ(fills.text.substr(0, start.size()), start) << label;
        }
      }
    }
  }
}

struct StateCase {
  const char* label;
  const char *ordered, *filled, *tag41, *tag37;
  std::string text;
  const char* n6;
  int market;
  const char* state;
};

TEST_F(StockLists, StateOfAnOrder) {
  const StateCase rows[] = {
      {"text says all cancelled", "5", "5", "0", "0", "全部取消", "1", 0, "已取消"},
      {"text with more than that", "5", "5", "0", "0", "全部取消!", "1", 0, "已成交"},
      {"sent", "5", "5", "0", "0", kSent, "1", 0, "正在處理"},
      {"sent, market 3", "5", "5", "0", "0", kSent, "1", 3, "委託收到"},
      {"sent, market 103", "5", "5", "0", "0", kSent, "1", 103, "委託收到"},
      {"sent, market 8", "5", "5", "0", "0", kSent, "1", 8, "正在處理"},
      {"sent, market 4", "5", "5", "0", "0", kSent, "1", 4, "正在處理"},
      {"all reduced", "5", "0", "5", "0", "", "1", 0, "已取消"},
      {"all reduced in two tags", "5", "0", "2", "3", "", "1", 0, "已取消"},
      {"reduced by the order, filled too", "5", "5", "5", "0", "", "1", 0, "已取消"},
      {"nothing ordered", "0", "0", "0", "0", "", "1", 0, "已取消"},
      {"filled", "5", "5", "0", "0", "", "1", 0, "已成交"},
      {"filled, reduced oddly", "5", "5", "1", "0", "", "1", 0, "已成交"},
      {"partly filled, rest cancelled", "5", "3", "1", "1", "", "1", 0, "部份成交，其餘已取消"},
      {"partly filled", "5", "3", "0", "0", "", "1", 0, "部份成交"},
      {"partly filled and reduced", "5", "3", "1", "0", "", "1", 0, "部份成交"},
      {"negative fill", "5", "-1", "0", "0", "", "1", 0, "部份成交"},
      {"untouched, N6 0", "5", "0", "0", "0", "", "0", 0, "預約單"},
      {"untouched, N6 1", "5", "0", "0", "0", "", "1", 0, "委託成功"},
      {"untouched, N6 empty", "5", "0", "0", "0", "", "", 0, "委託成功"},
      {"untouched, N6 00", "5", "0", "0", "0", "", "00", 0, "委託成功"},
      {"reductions cancel out", "5", "0", "1", "-1", "", "0", 0, "預約單"},
      {"reduced", "5", "0", "1", "0", "", "0", 0, "已改量"},
      {"missing quantities", "", "", "", "", "", "", 0, "已取消"},
      {"sums wrap", "-2147483648", "1", "2147483647", "0", "", "1", 0, "部份成交，其餘已取消"},
      {"WAIT that did not fail", "5", "5", "0", "0", "WAIT ", "1", 8, "已成交"},
  };
  for (const StateCase& row : rows) {
    Fields fields = kOrder;
    fields["70"] = row.ordered;
    fields["47"] = row.filled;
    fields["41"] = row.tag41;
    fields["37"] = row.tag37;
    fields["K1"] = row.text;
    fields["N6"] = row.n6;
    EXPECT_EQ(BookField(fields, 5, row.market), row.state) << row.label;
    fields["39"] = "EE";
    EXPECT_EQ(BookField(fields, 5, row.market), row.state) << row.label << ", state EE";
  }
}

struct FailureCase {
  const char* label;
  std::string text;
  int market;
  std::string state, flag;
};

TEST_F(StockLists, FailedOrder) {
  const FailureCase rows[] = {
      {"with a text", "餘額不足", 0, "委託失敗&餘額不足", "2"},
      {"without a text", "", 0, "", ""},
      {"text of the cancelled", "全部取消", 0, "委託失敗&全部取消", "2"},
      {"text of the sent", kSent, 3, "委託失敗&" + kSent, "2"},
      {"text with record ends", "!a!b!", 0, "委託失敗& a b ", "2"},
      {"longest text", std::string(199, 'k'), 0, "委託失敗&" + std::string(199, 'k'), "2"},
      {"text too long", std::string(200, 'k'), 0, "", ""},
      {"waiting on market 8", "WAIT ", 8, "處理中", "2"},
      {"waiting on market 8, from a record end", "WAIT!", 8, "處理中", "2"},
      {"waiting elsewhere", "WAIT ", 108, "委託失敗&WAIT ", "2"},
      {"WAIT without its blank", "WAIT", 8, "委託失敗&WAIT", "2"},
      {"no text on market 8", "", 8, "", ""},
  };
  Fields small = {{"68", "0000"}, {"39", "E"}};
  for (const FailureCase& row : rows) {
    const Fields fields = With(small, "K1", row.text);
    EXPECT_EQ(BookField(fields, 5, row.market), row.state) << row.label;
    EXPECT_EQ(BookField(fields, 13, row.market), row.flag) << row.label;
    EXPECT_EQ(BookField(With(fields, "JV", "Y"), 13, row.market), "1") << row.label;
    EXPECT_EQ(BookField(With(fields, "JV", "N"), 13, row.market), "2") << row.label;
  }
}

TEST_F(StockLists, ChangeFlagOfAnOrderThatDidNotFail) {
  for (const auto& [flag, shown] :
       Fields{{"Y", "1"}, {"N", "2"}, {"", ""}, {"y", ""}, {"YY", ""}}) {
    for (const char* remark : {"", "委託成功", "全部取消", "!"}) {
      EXPECT_EQ(BookField(With(With(kOrder, "JV", flag), "K1", remark), 13), shown)
          << flag << remark;
    }
  }
}

struct PriceCase {
  const char *price, *kind, *shown;
};

TEST_F(StockLists, PriceOfAnOrder) {
  constexpr PriceCase kRows[] = {
      {"10.05", "0", "1005"},
      {"10.05", "", "1005"},
      {"10.05", "2", "1005"},
      {"10.05", "1", "跌停價"},
      {"10.05", "5", "平盤價"},
      {"10.05", "9", "漲停價"},
      {"", "9", "漲停價"},
      {"0", "9", "漲停價"},
      {"", "0", "市價"},
      {"0", "0", "市價"},
      {"0.00", "", "市價"},
      {"0.001", "0", "市價"},
      {"x", "0", "市價"},
      {"7", "0", "700"},
      {"-1.5", "0", "-150"},
      {"0.999", "0", "99"},
      {"21474836.47", "0", "2147483647"},
  };
  for (const PriceCase& row : kRows) {
    EXPECT_EQ(BookField(With(With(kOrder, "31", row.price), "M8", row.kind), 8), row.shown)
        << row.price << " " << row.kind;
  }
}

TEST_F(StockLists, ValueTooLongForItsBufferReadsAsEmpty) {
  const std::string fits(49, 'v'), tooLong(50, 'v');
  Fields fields = {{"68", "0000"}};
  for (const auto& [tag, position] : std::map<std::string, size_t>{
           {"46", 0}, {"36", 1}, {"29", 3}, {"21", 10}, {"44", 11}, {"N6", 12}}) {
    EXPECT_EQ(BookField(With(fields, tag, fits), position), fits) << tag;
    EXPECT_EQ(BookField(With(fields, tag, tooLong), position), "") << tag;
  }
  EXPECT_EQ(BookField(With(fields, "22", fits), 9), "vvvvvv");
  EXPECT_EQ(BookField(With(fields, "22", tooLong), 9), "");
  EXPECT_EQ(BookField(With(fields, "70", std::string(49, '0') + "5"), 4), "0");
}

constexpr char kHead[] =
    "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|15=0|"
    "ACNO=1234567|PWD=pw|";
constexpr char kEscapedHead[] =
    "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO%20DEFINE|VER=24369|65=0013452107|SN=SN0001|15=0|"
    "ACNO=1234567|PWD=pw|";

class StockListRequests : public CSessionTest {
 protected:
  void SetUp() override {
    CSessionTest::SetUp();
    m_gateway.m_nSeqNo = 7;
    m_gateway.setSerialNumber("SN0001");
    m_gateway.setLocalIP("10.0.0.1");
  }

  Answer AskBook(const char* date, int tradeType, const char* identity = "1234567&") {
    int status = 77;
    const char* const text =
        m_gateway.QueryOrderEncode("9A00", identity, "pw", date, tradeType, &status);
    return {text, status};
  }
  Answer AskFills(const char* start, const char* end, const char* identity = "1234567&") {
    int status = 77;
    const char* const text =
        m_gateway.QueryReplyEncode("9A00", identity, "pw", start, end, &status);
    return {text, status};
  }

  CGatewayStk m_gateway;
};

TEST_F(StockListRequests, BookOfADay) {
  const std::string head = kEscapedHead;
  EXPECT_EQ(AskBook("20240115", 0),
            (Answer{head + "|FUNC=2|SDATE=20240115|EDATE=20240115|28=0|01=\n", 1}));
  EXPECT_EQ(AskBook("1130115", -1),
            (Answer{head + "|FUNC=2|SDATE=1130115|EDATE=1130115|28=-1|01=\n", 1}));
  EXPECT_EQ(AskBook(" 2024 ", 3),
            (Answer{head + "|FUNC=2|SDATE=%202024%20|EDATE=%202024%20|28=3|01=\n", 1}));
}

TEST_F(StockListRequests, FillsOfAPeriodInTheOtherCalendar) {
  const std::string head = std::string(kEscapedHead) + "|FUNC=3|57=2|SDATE=";
  EXPECT_EQ(AskFills("1130101", "1130115"), (Answer{head + "20240101|EDATE=20240115|01=\n", 1}));
  EXPECT_EQ(AskFills("20240101", "990101"), (Answer{head + "1130101|EDATE=20100101|01=\n", 1}));
  EXPECT_EQ(AskFills("0000000", "x y"), (Answer{head + "0000000|EDATE=x%20y|01=\n", 1}));
}

TEST_F(StockListRequests, EmptyDateIsRefused) {
  EXPECT_EQ(AskBook("", 0), (Answer{kDateError, -1}));
  EXPECT_EQ(AskBook(nullptr, 0), (Answer{kDateError, -1}));
  EXPECT_EQ(AskFills("", "1130115"), (Answer{kDateError, -1}));
  EXPECT_EQ(AskFills("1130115", ""), (Answer{kDateError, -1}));
  EXPECT_EQ(AskFills(nullptr, nullptr), (Answer{kDateError, -1}));
}

TEST_F(StockListRequests, HeaderFailureComesFirst) {
  const Answer unsplit = {"[CLIENT] 身分證字號及帳號有誤！", -1};
  EXPECT_EQ(AskBook("", 0, "1234567"), unsplit);
  EXPECT_EQ(AskFills("", "", "1234567"), unsplit);
}

TEST_F(StockListRequests, HeaderIsLoggedBeforeItIsEscaped) {
  m_log.Take();
  AskBook("20240115", 0);
  EXPECT_EQ(m_log.Take(), (Lines{"1234567", "", kHead}));
  AskFills("1130101", "1130115");
  EXPECT_EQ(m_log.Take(), (Lines{"1234567", "", kHead}));
}

TEST_F(StockListRequests, RequestThatDoesNotFitWithItsEscapesIsRefused) {
  const size_t rest = AskFills("x", "1130115").text.size() - 1;
  const std::string fits((CGatewayPub::kBufferSize - 1 - rest) / 3, ' ');
  const Answer answer = AskFills(fits.c_str(), "1130115");
  EXPECT_EQ(answer.status, 1);
  EXPECT_EQ(answer.text.size(), rest + 3 * fits.size());
  EXPECT_EQ(AskFills((fits + " ").c_str(), "1130115"), (Answer{"[CLIENT]傳入的參數錯誤", -1}));
}

}  // namespace
}  // namespace gateway_tests
