// The futures order book: what stands from record to record, states, leg codes, the fields.

#include "gateway/futures/gateway_fut.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const std::string kEnd = "|00=1|67=900000|68=0000|01=";

std::string Record(const std::string& fields) {
  return "|00=1|67=1|68=0000" + fields + "|01=";
}

class FuturesOrderBook : public CSessionTest {
 protected:
  std::string Decode(const std::string& reply) {
    m_nStatus = 0;
    return m_gateway.QueryOrderDecode(CTextAtPageEnd(reply), &m_nStatus);
  }

  // The only record's fields between '@'; the number of fields is checked.
  std::vector<std::string> Fields(const std::string& record, size_t count = 16) {
    std::string list = Decode(Record(record) + kEnd);
    EXPECT_EQ(list.substr(0, 2), "1!") << list;
    EXPECT_EQ(list.back(), '!');
    list = list.substr(2, list.size() - 3);
    std::vector<std::string> fields;
    for (size_t from = 0; from != std::string::npos;) {
      const size_t at = list.find('@', from);
      fields.push_back(list.substr(from, at - from));
      from = at == std::string::npos ? at : at + 1;
    }
    EXPECT_EQ(fields.size(), count) << list;
    fields.resize(count);
    return fields;
  }

  // The records' fields at `place`, one for each record.
  std::string Column(const std::string& reply, size_t place) {
    const std::string list = Decode(reply);
    std::string column;
    for (size_t from = list.find('!') + 1; from < list.size();) {
      const std::string record = list.substr(from, list.find('!', from) - from);
      from += record.size() + 1;
      size_t at = 0;
      for (size_t i = 0; i < place; ++i) at = record.find('@', at) + 1;
      column += record.substr(at, record.find('@', at) - at) + ";";
    }
    return column;
  }

  CGatewayFut m_gateway;
  int m_nStatus = 0;
};

// Places of the fields between '@'.
enum {
  kNumber,
  kReference,
  kLegs,
  kContract,
  kQuantity,
  kState,
  kFilled,
  kCancelled,
  kPrice,
  kTime,
  kDate,
  kOrderDate,
  kN6,
  kJV,
  kLetter,
  kMT
};

TEST_F(FuturesOrderBook, RecordHasAllItsFields) {
  EXPECT_EQ(Decode(Record("|46=A01|36=B02|V8= |32=B|33=TXF|29=202401|70=5|41=1|37=1|47=2|27=2"
                          "|31=17500.5|22=091500123|21=1130115|44=20240115|N6=1|JV=Y|MT=1|39= "
                          "|O4=0|V5=1") +
                   kEnd),
            "1!A01@B02@51@TIMEX&F&TXF&202401& &0@5@部份成交@2@2@175005000@091500@20240115@"
            "1130115@1@1@I@1!");
  EXPECT_EQ(m_nStatus, 1);
  EXPECT_EQ(Decode(Record("|46=A01|36=B02|V8=C|W1=P|32=B|EL=S|33=TXO|V9=TEO|29=202401|W0=202402"
                          "|34=17500|W2=600.5|70=5|47=5|27=1|N6=1|JV=N") +
                   kEnd),
            "1!A01@B02@51|52@TIMEX&X&TXO|TEO&202401|202402&C|P&175000000|6005000@5@已成交@5@0@市價@"
            "@@@1@2@R@ !");
}

TEST_F(FuturesOrderBook, RecordWithoutAnyFieldOfItsOwn) {
  EXPECT_EQ(Decode(Record("") + kEnd), "1!@@52@TIMEX&F&&&&0@0@已取消@0@0@@@@@@R@ !");
}

TEST_F(FuturesOrderBook, OrderNumbersAreLoggedEmptyOnesToo) {
  Decode(Record("|46=A01") + "|00=1|68=0009|46=skipped|01=" + Record("") + Record("|46=A03") +
         kEnd);
  EXPECT_EQ(m_log.Take(), (Lines{"A01", "", "A03"}));
}

TEST_F(FuturesOrderBook, EndMarkInTheFirstRecordIsAnEmptyList) {
  EXPECT_EQ(Decode(kEnd), "0!");
  EXPECT_EQ(Decode("|00=1|67=900001|68=0000|01=" + Record("|46=A")), "0!");
  EXPECT_EQ(m_nStatus, 1);
}

TEST_F(FuturesOrderBook, EndMarkIsASixteenByteNumber) {
  const std::string order = Record("|46=A");
  const auto count = [&](const std::string& sequence) {
    const std::string list =
        Decode(order + "|00=1|67=" + sequence + "|68=0000|01=" + order + order);
    return list.substr(0, list.find('!'));
  };
  EXPECT_EQ(count("899999"), "4");
  EXPECT_EQ(count("900000"), "1");
  EXPECT_EQ(count("000000000900000"), "1");
  EXPECT_EQ(count("0000000000900000"), "4");  // 16 characters: dropped
  EXPECT_EQ(count("x"), "4");
  EXPECT_EQ(count(""), "4");
}

TEST_F(FuturesOrderBook, FirstRecordSpeaksForTheReply) {
  const struct {
    const char* name;
    std::string reply, result;
    int status;
  } rows[] = {
      {"empty reply", "", "[CLIENT]主機連線失敗", -1},
      {"no data", "|00=1|68=5001|M2=none|01=", "0!", 1},
      {"refusal gets its source", "|00=1|68=0009|M2=no|01=", "[GATEWAY]no(0009)", -1},
      {"refusal with a source", "|00=1|68=0009|M2=[CERT]no|01=", "[CERT]no(0009)", -1},
      {"refusal without words", "|00=1|68=0009|01=", "[GATEWAY](0009)", -1},
      {"refusal without a code", "|00=1|M2=no|01=", "", -1},
      {"code of 127", "|00=1|68=" + std::string(127, '9') + "|01=",
       "[GATEWAY](" + std::string(127, '9') + ")", -1},
      {"code of 128 is dropped", "|00=1|68=" + std::string(128, '9') + "|M2=no|01=", "", -1},
      {"words of 511", "|00=1|68=1|M2=" + std::string(511, 'm') + "|01=",
       "[GATEWAY]" + std::string(511, 'm') + "(1)", -1},
      {"words of 512 are dropped",
       "|00=1|68=1|M2=" + std::string(512, 'm') + "|01=", "[GATEWAY](1)", -1},
      {"code before the first record does not count",
       "|68=0000|00=1|68=0009|01=", "[GATEWAY](0009)", -1},
      {"no record", "|68=0000|M2=no", "", -1},
      {"record cut short", "|00=1|68=0000|46=A", "", -1},
      {"gateway's transport marker is not asked for", "[GATEWAY]error", "", -1},
      {"broker's transport marker is not asked for", "[BROKER]timeout", "", -1},
      {"first record too long", Record("|46=" + std::string(1024, 'n')) + kEnd, "", -1},
  };
  for (const auto& row : rows) {
    EXPECT_EQ(Decode(row.reply), row.result) << row.name;
    EXPECT_EQ(m_nStatus, row.status) << row.name;
  }
  EXPECT_STREQ(m_gateway.QueryOrderDecode(nullptr, &m_nStatus), "[CLIENT]主機連線失敗");
}

TEST_F(FuturesOrderBook, LaterRecordsOfAnotherCodeAreSkippedAndNotCounted) {
  const std::string list = Decode(Record("|46=A") + "|00=1|68=0009|46=B|01=" +
                                  "|00=1|68=5001|46=C|01=" + "|00=1|46=D|01=" + Record("|46=E"));
  EXPECT_EQ(list.substr(0, 3), "2!A");
  EXPECT_NE(list.find("!E@"), std::string::npos);
  EXPECT_EQ(m_nStatus, 1);
}

TEST_F(FuturesOrderBook, RecordOf1023CharactersIsReadAndALongerOneIsSkipped) {
  const size_t frame = std::string("|00=1|67=1|68=0000|46=").size();
  const std::string number(1023 - frame, 'n');
  EXPECT_NE(Decode(Record("|46=A") + Record("|46=" + number)).find("!" + number + "@"),
            std::string::npos);
  const std::string list =
      Decode(Record("|46=A") + Record("|46=" + number + "n") + Record("|46=C"));
  EXPECT_EQ(list.substr(0, 2), "2!");
  EXPECT_NE(list.find("!C@"), std::string::npos);
}

TEST_F(FuturesOrderBook, UnknownCallPutFailsTheWholeListAfterItsNumberWasLogged) {
  for (const char* callPut : {"X", "c", "CC", "  "}) {
    EXPECT_EQ(Decode(Record("|46=A") + Record(std::string("|46=B|V8=") + callPut) +
                     Record("|46=C") + kEnd),
              "[CLIENT]委託種類錯誤");
    EXPECT_EQ(m_nStatus, -1);
    EXPECT_EQ(m_log.Take(), (Lines{"A", "B"}));
  }
  // Seven characters are read, eight are dropped and leave a futures order.
  EXPECT_EQ(Decode(Record("|V8=CCCCCCC")), "[CLIENT]委託種類錯誤");
  EXPECT_EQ(Fields("|V8=CCCCCCCC|32=B|27=1")[kContract], "TIMEX&F&&&&0");
}

struct LegRow {
  const char* w3;
  int buying;  // 0: a bare '@'
  bool options;
};

TEST_F(FuturesOrderBook, LegCodesOfEveryCell) {
  const LegRow rows[] = {
      {"", 51, false},  {" ", 51, false}, {"0", 53, false},        {"1", 55, false},
      {"2", 57, false}, {"3", 0, false},  {"00", 0, false},        {"  ", 0, false},
      {"", 51, true},   {" ", 51, true},  {"0", 53, true},         {"1", 55, true},
      {"2", 0, true},   {"9", 0, true},   {"12345678", 51, false}, {"1234567", 0, false},
  };
  for (const LegRow& row : rows) {
    const auto legs = [&](const std::string& side1, const std::string& side2) {
      std::string fields = "|W3=" + std::string(row.w3) + "|32=" + side1 + "|EL=" + side2;
      fields += row.options ? "|V8=P|27=1" : "|V8=|27=1";
      // A code that is left out altogether leaves the record one field short.
      return Fields(fields, 15)[2].substr(0, 5) == "TIMEX" ? "(none)" : "(wrong)";
    };
    const auto code = [&](const std::string& side1, const std::string& side2) {
      std::string fields = "|W3=" + std::string(row.w3) + "|32=" + side1 + "|EL=" + side2;
      fields += row.options ? "|V8=P|27=1" : "|V8=|27=1";
      return Fields(fields)[kLegs];
    };
    const std::string n = std::to_string(row.buying);
    const std::string m = std::to_string(row.buying + 1);
    if (row.buying == 0) {
      for (const char* side1 : {"B", "S", "x"}) {
        for (const char* side2 : {"", " ", "B", "S", "x"}) EXPECT_EQ(code(side1, side2), "");
      }
      continue;
    }
    for (const char* blank : {"", " "}) {
      EXPECT_EQ(code("B", blank), n);
      for (const char* other : {"S", "", " ", "x", "BB", "b"}) EXPECT_EQ(code(other, blank), m);
    }
    EXPECT_EQ(code("B", "S"), n + "|" + m);
    EXPECT_EQ(code("S", "B"), m + "|" + n);
    EXPECT_EQ(code("B", "B"), n + "|" + n);
    EXPECT_EQ(code("S", "S"), m + "|" + m);
    for (const char* other : {"", " ", "x", "BB", "b"}) {
      EXPECT_EQ(legs(other, "B"), "(none)") << row.w3;
      EXPECT_EQ(legs(other, "S"), "(none)");
    }
    EXPECT_EQ(legs("B", "x"), "(none)");
    EXPECT_EQ(legs("S", "  "), "(none)");
  }
}

TEST_F(FuturesOrderBook, ProductLetterOfEveryCellAndThroughAnUnusualW3) {
  const std::string price = "|27=1";
  EXPECT_EQ(Fields("|32=B" + price)[kContract], "TIMEX&F&&&&0");
  EXPECT_EQ(Fields("|32=B|V8=C" + price)[kContract], "TIMEX&O&&&C&0");
  EXPECT_EQ(Fields("|32=B|EL=S|33=a|V9=b" + price)[kContract], "TIMEX&Y&a&&&0");
  EXPECT_EQ(Fields("|32=B|EL=S|33=a|V9=b|V8=P" + price)[kContract], "TIMEX&X&a|b&&P&0");
  EXPECT_EQ(Fields("|W3=9|32=B" + price)[kContract], "TIMEX&&&&&0");
  EXPECT_EQ(Column(Record("|32=B|V8=C|EL=S|33=a|V9=b") + Record("|W3=9|33=c|V9=d") +
                       Record("|32=x|EL=x|33=e|27=1") + kEnd,
                   kContract),
            "TIMEX&X&a|b&&C&0;TIMEX&X&c|d&&&0;0;");
}

TEST_F(FuturesOrderBook, TwoLegFuturesShowTheFirstCommodityAlone) {
  EXPECT_EQ(Fields("|32=B|EL=S|33=TXF|V9=MXF|29=202401|W0=202402|27=1")[kContract],
            "TIMEX&Y&TXF&202401|202402&&0");
}

TEST_F(FuturesOrderBook, StrikesAndTheCommoditiesInTenths) {
  const auto strikes = [this](const std::string& fields) {
    const std::string contract = Fields("|27=1|32=B|V8=C" + fields)[kContract];
    return contract.substr(contract.rfind('&') + 1);
  };
  EXPECT_EQ(strikes("|34=17500"), "175000000");
  EXPECT_EQ(strikes("|34=0.99999"), "9999");
  EXPECT_EQ(strikes("|34=17500|W2= "), "175000000");
  EXPECT_EQ(strikes("|34=17500|W2=17600"), "175000000|176000000");
  EXPECT_EQ(strikes("|34=17500|W2=0"), "175000000|0");
  for (const char* tenths : {"MSO", "GTO", "TEO"}) {
    const std::string commodity = std::string("|33=") + tenths;
    EXPECT_EQ(strikes(commodity + "|34=17500|W2=17600"), "17500000|17600000");
    EXPECT_EQ(strikes(commodity + "|34=17500"), "175000000");
    EXPECT_EQ(strikes(commodity + "|34=-0.0019|W2=0.0019"), "-1|1");
    EXPECT_EQ(strikes(commodity + "1|34=17500|W2=17600"), "175000000|176000000");
  }
  EXPECT_EQ(strikes("|33=TXO|34=1|W2=2"), "10000|20000");
  EXPECT_EQ(strikes("|33=mso|34=1|W2=2"), "10000|20000");
}

TEST_F(FuturesOrderBook, SecondMonthAndCallPutShowUnlessBlank) {
  const auto contract = [this](const std::string& fields) {
    return Fields("|27=1|32=B" + fields)[kContract];
  };
  EXPECT_EQ(contract("|29=1|W0= |V8=C|W1= "), "TIMEX&O&&1&C&0");
  EXPECT_EQ(contract("|29=1|W0=2|V8=C|W1=P"), "TIMEX&O&&1|2&C|P&0");
  EXPECT_EQ(contract("|29=|W0=  |V8=|W1=  "), "TIMEX&F&&|  &|  &0");
}

TEST_F(FuturesOrderBook, PriceByItsTypeAndMissingWithoutOne) {
  const auto price = [this](const std::string& fields) { return Fields(fields)[kPrice]; };
  EXPECT_EQ(price("|27=1|31=5"), "市價");
  EXPECT_EQ(price("|27=01|31=5"), "市價");
  EXPECT_EQ(price("|27=3|31=5"), "範圍市價");
  EXPECT_EQ(price("|27=2|31=5.5"), "55000");
  EXPECT_EQ(price("|27= |31=-5.5"), "-55000");
  EXPECT_EQ(price("|27=x"), "0");
  EXPECT_EQ(price("|27=11|31=1"), "10000");
  EXPECT_EQ(Fields("|31=5|22=091500", 15)[kPrice], "091500");
  EXPECT_EQ(Fields("|27=|31=5|22=0915", 15)[kPrice], "0915");
}

TEST_F(FuturesOrderBook, TimesDatesAndFlags) {
  const auto field = [this](size_t place, const std::string& fields) {
    return Fields("|27=1" + fields)[place];
  };
  EXPECT_EQ(field(kTime, "|22=0915001"), "091500");
  EXPECT_EQ(field(kTime, "|22=0915"), "0915");
  EXPECT_EQ(field(kDate, "|21=1130115"), "20240115");
  EXPECT_EQ(field(kDate, "|21=0000000"), "0000000");
  EXPECT_EQ(field(kOrderDate, "|44=20240115"), "1130115");
  EXPECT_EQ(field(kN6, "|N6=12"), "12");
  EXPECT_EQ(field(kJV, "|JV=N"), "2");
  EXPECT_EQ(field(kJV, "|JV=Y"), "1");
  EXPECT_EQ(field(kJV, "|JV=NN"), "");
  EXPECT_EQ(field(kJV, ""), "");
  EXPECT_EQ(field(kJV, "|39=E|K1=no"), "2");
  EXPECT_EQ(field(kJV, "|39=E|K1=no|JV=Y"), "1");
  EXPECT_EQ(field(kJV, "|39=E"), "");
  EXPECT_EQ(field(kJV, "|K1=no"), "");
  EXPECT_EQ(field(kMT, ""), " ");
  EXPECT_EQ(field(kMT, "|MT=12"), "12");
}

TEST_F(FuturesOrderBook, TimeInForceStandsAlsoThroughSkippedRecords) {
  const auto letters = [this](const std::vector<std::string>& pairs) {
    std::string reply;
    for (const std::string& pair : pairs) reply += Record("|27=1" + pair);
    return Column(reply + kEnd, kLetter);
  };
  EXPECT_EQ(letters({""}), "R;");
  EXPECT_EQ(letters({"|O4=0|V5=0"}), "R;");
  EXPECT_EQ(letters({"|O4=0|V5=1"}), "I;");
  EXPECT_EQ(letters({"|O4=1|V5=0"}), "F;");
  EXPECT_EQ(letters({"|O4=1|V5=1"}), ";");
  EXPECT_EQ(letters({"|V5=1", "", "|V5=", "|V5=0", "|O4=1"}), "I;I;I;R;F;");
  EXPECT_EQ(letters({"|O4=1", "|V5=1", "|O4=0", "|V5=2"}), "F;F;I;I;");
  EXPECT_EQ(letters({"|V5=01", "|V5=x"}), "I;R;");
  EXPECT_EQ(Column(Record("|27=1") + "|00=1|68=0009|V5=1|01=" + Record("|27=1") + kEnd, kLetter),
            "R;I;");
}

TEST_F(FuturesOrderBook, QuantitiesStandUntilOthersComeButNotFromSkippedRecords) {
  const std::string reply = Record("|70=9|41=1|37=2|47=3") + Record("") + Record("|41=5|70=") +
                            "|00=1|68=0009|70=1|41=1|37=1|47=1|01=" + Record("|47=x") + kEnd;
  EXPECT_EQ(Column(reply, kQuantity), "9;9;9;9;");
  EXPECT_EQ(Column(reply, kCancelled), "3;3;7;7;");
  EXPECT_EQ(Column(reply, kFilled), "3;3;3;0;");
}

TEST_F(FuturesOrderBook, QuantitiesWrap) {
  EXPECT_EQ(Column(Record("|41=2147483647|37=1") + kEnd, kCancelled), "-2147483648;");
}

TEST_F(FuturesOrderBook, MessageOfAFailedOrder) {
  const auto state = [this](const std::string& fields) { return Fields("|27=1" + fields)[kState]; };
  EXPECT_EQ(state("|39=E|K1=no"), "委託失敗&no");
  EXPECT_EQ(state("|39=E"), "委託失敗");
  EXPECT_EQ(state("|39=E|K1=a!b"), "委託失敗&a!b");
  EXPECT_EQ(state("|39=E|K1=" + std::string(511, 'k')), "委託失敗&" + std::string(511, 'k'));
  EXPECT_EQ(state("|39=E|K1=" + std::string(512, 'k')), "委託失敗");
  EXPECT_EQ(state("|39=EE|K1=no"), "已取消");
  EXPECT_EQ(state("|39= |K1=no"), "已取消");
  EXPECT_EQ(state("|39=E|K1=委託已傳送，等待接收回報！"), "委託失敗&委託已傳送，等待接收回報！");
}

TEST_F(FuturesOrderBook, StatesComeFromTheRecord) {
  const auto state = [this](const std::string& fields) { return Fields("|27=1" + fields)[kState]; };
  EXPECT_EQ(state("|70=5|47=2|41=1|37=2|V5=1"), "撮合部份成交");
  EXPECT_EQ(state("|70=5|47=2|41=1|37=2|O4=1"), "部份成交，其餘已取消");
  EXPECT_EQ(state("|70=5|41=5|O4=1"), "撮合未成交");
  EXPECT_EQ(state("|70=5|37=5"), "已取消");
  EXPECT_EQ(state("|70=5|N6=0"), "預約單");
  EXPECT_EQ(state("|70=5|N6=1"), "委託成功");
  EXPECT_EQ(state("|70=5|37=1"), "已改量");
  EXPECT_EQ(state("|70=5|47=5"), "已成交");
  EXPECT_EQ(state("|70=5|47=4"), "部份成交");
}

}  // namespace
}  // namespace gateway_tests
