// Futures replies: result codes, the fills, the positions, the margin account.

#include <algorithm>

#include "gateway/futures/gateway_fut.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const std::string kNoReply = "[CLIENT]主機連線失敗";
const std::string kEnd = "|00=1|67=900000|68=0000|01=";

std::string Record(const std::string& fields) {
  return "|00=1|67=1|68=0000" + fields + "|01=";
}

class FuturesList : public CSessionTest {
 protected:
  using Decode = char* (CGatewayFut::*)(const char*, int*);

  std::string Read(Decode decode, const std::string& reply) {
    m_nStatus = 0;
    return (m_gateway.*decode)(CTextAtPageEnd(reply), &m_nStatus);
  }
  std::string Fills(const std::string& reply) {
    return Read(&CGatewayFut::QueryReplyDecode, reply);
  }
  std::string Positions(const std::string& reply) {
    return Read(&CGatewayFut::QueryInventoryDecode, reply);
  }
  std::string Margin(const std::string& reply) {
    return Read(&CGatewayFut::QueryFinanceDecode, reply);
  }
  std::string Fill(const std::string& fields) { return Fills(Record(fields)); }

  CGatewayFut m_gateway;
  int m_nStatus = 0;
};

TEST_F(FuturesList, ResultCode) {
  const std::string words(511, 'm');
  const struct {
    const char* name;
    std::string reply, result;
  } rows[] = {
      {"empty", "", "[CLIENT]連線失敗"},
      {"done", "|68=0000|M2=x", "0000"},
      {"no data", "|68=5001|M2=x", "5001"},
      {"refused", "|68=0009|M2=no", "no(0009)"},
      {"refused, with a source", "|68=0009|M2=[CERT]no", "[CERT]no(0009)"},
      {"no words", "|68=0009", "(0009)"},
      {"no code", "|M2=no", "no()"},
      {"nothing", "x", "()"},
      {"code of seven", "|68=1234567", "(1234567)"},
      {"code of eight is dropped", "|68=12345678|M2=no", "no()"},
      {"words of 511", "|68=1|M2=" + words, words + "(1)"},
      {"words of 512 are dropped", "|68=1|M2=m" + words, "(1)"},
      {"first code counts, though empty", "|68=|68=0000", "()"},
  };
  for (const auto& row : rows) {
    const CTextAtPageEnd reply(row.reply);
    const CRoomAtPageEnd fits(row.result.size() + 1);
    EXPECT_EQ(m_gateway.GetResultCode(reply, fits, static_cast<int>(row.result.size()) + 1), fits);
    EXPECT_EQ(std::string(fits), row.result) << row.name;
    const CRoomAtPageEnd small(row.result.size());
    m_gateway.GetResultCode(reply, small, static_cast<int>(row.result.size()));
    EXPECT_EQ(small.Bytes(), std::string(row.result.size(), '\0')) << row.name;
  }
  const CRoomAtPageEnd untouched(4);
  m_gateway.GetResultCode("|68=0000", untouched, 0);
  EXPECT_EQ(untouched.Bytes(), "####");
  EXPECT_EQ(m_gateway.GetResultCode("|68=0000", nullptr, 10), nullptr);
}

TEST_F(FuturesList, PositionTextsGrowEachOnItsOwn) {
  m_gateway.AppendFutData("abc", 3, false);
  EXPECT_EQ(m_gateway.m_nFutDataSize, 3 + 4096);
  EXPECT_EQ(m_gateway.m_nFutDataLen, 3);
  EXPECT_EQ(m_gateway.m_pOptData, nullptr);
  EXPECT_EQ(m_gateway.m_pData, nullptr);
  m_gateway.AppendOptData("x", 1, true);
  EXPECT_EQ(m_gateway.m_nOptDataSize, 1 + 4096);
  EXPECT_STREQ(m_gateway.m_pOptData, "x");
  EXPECT_STREQ(m_gateway.m_pFutData, "abc");
  const std::string most(4095, 'y');
  m_gateway.AppendFutData(most.c_str(), 4095, false);
  EXPECT_EQ(m_gateway.m_nFutDataSize, 3 + 4096) << "one byte is left";
  m_gateway.AppendFutData("z", 1, false);
  EXPECT_EQ(m_gateway.m_nFutDataSize, 4098 + 1 + 4096);
  EXPECT_EQ(std::string(m_gateway.m_pFutData), "abc" + most + "z");
  m_gateway.AppendFutData(nullptr, 3, true);
  m_gateway.AppendFutData("q", 0, true);
  EXPECT_EQ(m_gateway.m_nFutDataLen, 4099);
  m_gateway.AppendFutData("new", 3, true);
  EXPECT_STREQ(m_gateway.m_pFutData, "new");
  EXPECT_EQ(m_gateway.m_nFutDataLen, 3);
}

TEST_F(FuturesList, FillsOfOneAndTwoLegs) {
  EXPECT_EQ(Fill("|36=A1|46=B2|31=17500.5|70=5|37=2|47=3|21=1130115|22=20240115|50=memo"
                 "|51=091500123|33=TXF|29=202401|32=B|48=17.25|MT=1|44=1130116"),
            "1!A1&B2@51@TAIMEX&F&TXF&202401&&0@3&3@175005000&172500@@@20240115&091500@1@1130116&"
            "memo!");
  EXPECT_EQ(Fill("|36=A1|46=B2|33=TXO|V9=TEO|29=202401|W0=202402|V8=C|W1=P|34=17500|W2=17600"
                 "|32=B|EL=S|W3=0"),
            "1!A1&B2@53|54@TAIMEX&X&TXO&202401|202402&C|P&175000000|176000000@0&0@0&0@@@&@ @&!");
  EXPECT_EQ(Fill(""), "1!&@@TAIMEX&F&&&&0@0&0@0&0@@@&@ @&!");
  EXPECT_EQ(m_nStatus, 1);
}

std::string Part(const std::string& list, size_t place) {
  size_t at = 0;
  for (size_t i = 0; i < place; ++i) at = list.find('@', at) + 1;
  return list.substr(at, list.find('@', at) - at);
}

TEST_F(FuturesList, FillLegCodesOfEveryCell) {
  const struct {
    const char* w3;
    int buying;
  } rows[] = {{"", 51},  {" ", 51}, {"0", 53},  {"1", 55},
              {"2", 57}, {"3", 51}, {"00", 51}, {"x", 51}};
  for (const auto& row : rows) {
    const auto code = [&](const std::string& fields) {
      return Part(Fill("|W3=" + std::string(row.w3) + fields), 1);
    };
    const std::string n = std::to_string(row.buying);
    const std::string m = std::to_string(row.buying + 1);
    EXPECT_EQ(code("|32=B"), n);
    EXPECT_EQ(code("|32=S"), m);
    EXPECT_EQ(code("|32=S|EL=B"), m) << "no second leg";
    for (const char* other : {"", " ", "b", "BS"}) {
      EXPECT_EQ(code(std::string("|32=") + other), "");
      EXPECT_EQ(code(std::string("|V9=T|EL=S|32=") + other), "|" + m);
      EXPECT_EQ(code(std::string("|V9=T|32=B|EL=") + other), n);
    }
    EXPECT_EQ(code("|V9=T|32=B|EL=S"), n + "|" + m);
    EXPECT_EQ(code("|V9=T|32=S|EL=B"), m + "|" + n);
    EXPECT_EQ(code("|V9=T|32=B|EL=B"), n + "|" + n);
    EXPECT_EQ(code("|V9=T|32=S|EL=S"), m + "|" + m);
  }
}

TEST_F(FuturesList, FillDetails) {
  EXPECT_EQ(Part(Fill("|70=0|37=5|47=1"), 3), "0&1") << "nothing ordered, nothing remains";
  EXPECT_EQ(Part(Fill("|37=5"), 3), "0&0");
  EXPECT_EQ(Part(Fill("|70=-2147483648|37=1"), 3), "2147483647&0");
  EXPECT_EQ(Part(Fill("|70=3|37=5"), 3), "-2&0");
  EXPECT_EQ(Part(Fill("|V8= |34=1"), 2), "TAIMEX&F&&& &10000");
  EXPECT_EQ(Part(Fill("|V8=C|34=1"), 2), "TAIMEX&O&&&C&10000");
  EXPECT_EQ(Part(Fill("|V8=x"), 2), "TAIMEX&O&&&x&0");
  EXPECT_EQ(Part(Fill("|MT=12"), 8), "1");
  EXPECT_EQ(Part(Fill("|MT=1234567"), 8), "1");
  EXPECT_EQ(Part(Fill("|MT=12345678"), 8), " ");
  const std::string fits(15, 'f');
  const std::string tooLong(16, 'f');
  EXPECT_EQ(Fill("|36=" + fits + "|46=" + fits + "|22=" + fits + "|50=" + fits + "|44=" + fits),
            "1!" + fits + "&" + fits + "@@TAIMEX&F&&&&0@0&0@0&0@@@" + fits + "&@ @" + fits + "&" +
                fits + "!");
  EXPECT_EQ(Fill("|36=" + tooLong + "|46=" + tooLong + "|22=" + tooLong + "|50=" + tooLong +
                 "|44=" + tooLong),
            "1!&@@TAIMEX&F&&&&0@0&0@0&0@@@&@ @&!");
}

// Nothing stands from one fill to the next.
TEST_F(FuturesList, FillsDoNotCarryOver) {
  EXPECT_EQ(Fills(Record("|36=A|32=B|W3=2|70=5|47=1|V9=T|EL=S") + Record("|36=B")),
            "2!A&@57|58@TAIMEX&X&&|&|&0|0@5&1@0&0@@@&@ @&!B&@@TAIMEX&F&&&&0@0&0@0&0@@@&@ @&!");
}

struct ListRow {
  const char* name;
  std::string reply;
  std::string fills, positions;
  int status;
};

TEST_F(FuturesList, RepliesThatListNothing) {
  const std::string noPositions = "<5>!0!<6>!0!";
  const ListRow rows[] = {
      {"empty reply", "", kNoReply, kNoReply, -1},
      {"no data", "|68=5001|M2=x", "0!", noPositions, 1},
      {"no data in its first record", "|00=1|68=5001|01=", "0!", noPositions, 1},
      {"refused", "|68=0009|M2=no", "no(0009)", "no(0009)", -1},
      {"refused without a source put before", "|68=0009|M2=[CERT]no", "[CERT]no(0009)",
       "[CERT]no(0009)", -1},
      {"nothing at all", "x", "()", "()", -1},
      {"gateway's transport marker is not asked for", "[GATEWAY]error", "()", "()", -1},
      {"broker's transport marker is not asked for", "[BROKER]timeout|68=0000", "0!", noPositions,
       1},
      {"code alone", "|68=0000", "0!", noPositions, 1},
      {"end mark first", kEnd + Record("|36=A"), "0!", noPositions, 1},
      {"end mark far above", "|68=0000|00=1|67=2147483647|01=" + Record("|36=A"), "0!", noPositions,
       1},
      {"empty record first", "|68=0000|01=" + Record("|36=A"), "0!", noPositions, 1},
      {"long record first", "|68=0000" + Record("|x=" + std::string(1024, 'x')) + Record(""), "0!",
       noPositions, 1},
      {"records of other codes", "|68=0000|00=1|68=0009|01=|00=1|68=5001|01=|00=1|01=", "0!",
       noPositions, 1},
      {"record cut short", "|68=0000|00=1|68=0000|36=A", "0!", noPositions, 1},
  };
  for (const ListRow& row : rows) {
    EXPECT_EQ(Fills(row.reply), row.fills) << row.name;
    EXPECT_EQ(m_nStatus, row.status) << row.name;
    EXPECT_EQ(Positions(row.reply), row.positions) << row.name;
    EXPECT_EQ(m_nStatus, row.status) << row.name;
  }
  EXPECT_EQ(std::string(m_gateway.QueryReplyDecode(nullptr, &m_nStatus)), kNoReply);
  EXPECT_EQ(std::string(m_gateway.QueryInventoryDecode(nullptr, &m_nStatus)), kNoReply);
  EXPECT_EQ(std::string(m_gateway.QueryFinanceDecode(nullptr, &m_nStatus)), kNoReply);
  EXPECT_EQ(m_log.Take(), Lines{});
}

TEST_F(FuturesList, ListsEndAtAnEmptyRecordOrTheEndMarkAndPassOverOtherCodes) {
  const std::string kept = Record("|36=A|46=A|32=A");
  const std::string other = "|00=1|68=0009|36=x|32=x|01=";
  const std::string fill = "A&A@@TAIMEX&F&&&&0@0&0@0&0@@@&@ @&!";
  const std::string position = "A@TIMEX&F&&00@0@0@@!";
  for (const std::string& end :
       {kEnd, std::string("|01="), Record("|x=" + std::string(1024, 'x')), std::string()}) {
    const std::string reply = kept + other + kept + end + (end.empty() ? "" : kept);
    EXPECT_EQ(Fills(reply), "2!" + fill + fill) << end;
    EXPECT_EQ(Positions(reply), "<5>!2!" + position + position + "<6>!0!") << end;
  }
}

TEST_F(FuturesList, PositionsInTheirSections) {
  const std::string legs = "|V9=TEO|29=202401|W0=202402|W1=P|34=1|W2=2|32=B|EL=S|48=3|R8=4|50=m";
  const std::string reply = Record("|33=TXF|28=1" + legs + "|W5=5") +
                            Record("|33=TXF|28=2|29=202401|32=S|48=3|R8=4|50=m|V8= |W5=9") +
                            Record("|33=TXO|28=1|29=202401|V8=P|34=1.5|32=S|48=3|R8=4|50=m") +
                            Record("|33=TXO|V8=C" + legs + "|W5=5") +
                            Record("|33=TXO|V8=C" + legs + "|28=4") + kEnd;
  EXPECT_EQ(Positions(reply),
            "<5>!2!"
            "B|S@TIMEX&Y&TXF&20240100|20240200@4@30000|50000@m@TWD!"
            "S@TIMEX&F&TXF&20240100@4@30000@m@USD!"
            "<6>!3!"
            "S@TIMEX&O&TXO&20240100&P&15000@4@30000@m!"
            "B|S@TIMEX&X&TXO|TEO&20240100|20240200&C|P&10000|20000@4@30000|50000@m!"
            "B|S@TIMEX&X&TXO|TEO&20240100|20240200&C|P&10000|20000@4@30000|@m!");
  EXPECT_EQ(m_nStatus, 1);
}

TEST_F(FuturesList, PositionsOfOneSectionLeaveTheOtherEmpty) {
  EXPECT_EQ(Positions(Record("|32=B")), "<5>!1!B@TIMEX&F&&00@0@0@@!<6>!0!");
  EXPECT_EQ(Positions(Record("|32=B|V8=C")), "<5>!0!<6>!1!B@TIMEX&O&&00&C&0@0@0@!");
}

TEST_F(FuturesList, OnlyTheLettersPAndCMakeAnOption) {
  for (const char* futures : {"", " ", "X", "c", "CC", "PC"}) {
    EXPECT_EQ(Positions(Record(std::string("|V8=") + futures)).substr(0, 6), "<5>!1!") << futures;
  }
  for (const char* option : {"P", "C"}) {
    EXPECT_EQ(Positions(Record(std::string("|V8=") + option)).substr(0, 6), "<5>!0!") << option;
  }
}

TEST_F(FuturesList, Currencies) {
  const struct {
    const char* code;
    const char* name;
  } rows[] = {{"1", "TWD"}, {"2", "USD"}, {"3", ""}, {"4", "RMB"}, {"5", ""},
              {"0", ""},    {"", ""},     {" ", ""}, {"12", "TWD"}};
  for (const auto& row : rows) {
    EXPECT_EQ(Positions(Record(std::string("|28=") + row.code)),
              std::string("<5>!1!@TIMEX&F&&00@0@0@@") + row.name + "!<6>!0!")
        << row.code;
  }
}

TEST_F(FuturesList, ThousandsOfRecordsAreAllListed) {
  constexpr int kRecords = 20000;
  std::string reply;
  for (int i = 0; i < kRecords; ++i) {
    reply += Record("|46=" + std::to_string(i) + (i % 2 == 0 ? "|V8=C" : "|V8="));
  }
  EXPECT_EQ(Fills(reply).substr(0, 6), "20000!");
  const std::string positions = Positions(reply);
  EXPECT_EQ(positions.substr(0, 10), "<5>!10000!");
  EXPECT_NE(positions.find("!<6>!10000!"), std::string::npos);
  EXPECT_EQ(std::count(positions.begin(), positions.end(), '!'), kRecords + 4);
  m_nStatus = 0;
  EXPECT_EQ(std::string(m_gateway.QueryOrderDecode(reply.c_str(), &m_nStatus)).substr(0, 6),
            "20000!");
}

TEST_F(FuturesList, MarginOfEveryPlace) {
  EXPECT_EQ(Margin("|00=1|LO=1.25|PN=2|RA=3|QY=4|QX=5|U5=6|U9=7|RF=8|F0=9|F1=10|F2=11|F3=12|01="),
            "1!TWD@@125@@20000@30000@12500@40000@@50000@@60000@@@@@70000@60000@@@@@80000@@@@@90000@"
            "100000@110000@120000@!");
  EXPECT_EQ(m_nStatus, 1);
}

const std::string kNoMargin = "1!TWD@@0@@0@0@0@0@@0@@0@@@@@0@0@@@@@0@@@@@0@0@0@0@!";

TEST_F(FuturesList, MarginOfAnyReplyThatIsNotEmpty) {
  EXPECT_EQ(Margin(""), kNoReply);
  EXPECT_EQ(m_nStatus, -1);
  for (const char* reply : {"x", "|00=1|01=", "|68=0009|M2=no", "[GATEWAY]error", "[BROKER]timeout",
                            "|LO=1|00=1|LO=1", "|01=|00=1|LO=1|01="}) {
    EXPECT_EQ(Margin(reply), kNoMargin) << reply;
    EXPECT_EQ(m_nStatus, 1);
  }
  EXPECT_EQ(std::count(kNoMargin.begin(), kNoMargin.end(), '@'), 31);
}

TEST_F(FuturesList, MarginReadsTheFirstRecordAlone) {
  EXPECT_EQ(Margin("|00=1|U9=1|68=0009|01=|00=1|U9=2|RF=3|01="),
            "1!TWD@@0@@0@0@0@0@@0@@0@@@@@10000@0@@@@@0@@@@@0@0@0@0@!");
}

TEST_F(FuturesList, MarginAmountsOf64BitsAndBelowZero) {
  EXPECT_EQ(Part(Margin("|00=1|RA=922337203685477.5807|01="), 5), "9223372036854775807");
  EXPECT_EQ(Part(Margin("|00=1|RA=3000000000|01="), 5), "30000000000000");
  EXPECT_EQ(Part(Margin("|00=1|LO=-12.50|01="), 2), "-1150");
  EXPECT_EQ(Part(Margin("|00=1|LO=-12|01="), 2), "-1200");
}

TEST_F(FuturesList, MarginAmountsBesidesPN) {
  EXPECT_EQ(Part(Margin("|00=1|RA=3&4|01="), 5), "30000");
  EXPECT_EQ(Part(Margin("|00=1|RA=" + std::string(600, '0') + "5|01="), 5), "50000");
}

TEST_F(FuturesList, MarginPN) {
  const auto pn = [this](const std::string& value) {
    return Part(Margin("|00=1|PN=" + value + "|01="), 4);
  };
  EXPECT_EQ(pn("12&34"), "12&34");
  EXPECT_EQ(pn("&"), "&");
  EXPECT_EQ(pn("12.5"), "125000");
  EXPECT_EQ(pn(""), "0");
  EXPECT_EQ(pn("&" + std::string(510, 'p')), "&" + std::string(510, 'p'));
  EXPECT_EQ(pn("&" + std::string(511, 'p')), "0");
}

}  // namespace
}  // namespace gateway_tests
