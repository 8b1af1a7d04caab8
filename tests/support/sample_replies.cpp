#include "tests/support/sample_replies.h"

#include <cstdint>
#include <cstdio>

namespace gateway_tests {
namespace {

// Numbers that look like chance and are the same every time.
class CDice {
 public:
  // 0 to sides - 1.
  int Roll(int sides) {
    m_nState = m_nState * 6364136223846793005U + 1442695040888963407U;
    return static_cast<int>((m_nState >> 33) % static_cast<uint64_t>(sides));
  }
  template <size_t kCount>
  const char* Pick(const char* const (&texts)[kCount]) {
    return texts[Roll(static_cast<int>(kCount))];
  }

 private:
  uint64_t m_nState = 20240115;
};

class CRecordText {
 public:
  CRecordText(std::string& reply, CDice& dice) : m_reply(reply), m_dice(dice) {}

  CRecordText& Add(const char* tag, std::string_view value) {
    m_reply.append("|").append(tag).append("=").append(value);
    return *this;
  }
  CRecordText& Add(const char* tag, int value) { return Add(tag, std::to_string(value)); }
  // With leading zeros.
  CRecordText& Add(const char* tag, int value, int width) {
    char text[16];
    snprintf(text, sizeof text, "%0*d", width, value);
    return Add(tag, text);
  }
  // A price with hundredths.
  CRecordText& AddPrice(const char* tag, int hundredths) {
    char text[24];
    snprintf(text, sizeof text, "%d.%02d", hundredths / 100, hundredths % 100);
    return Add(tag, text);
  }
  CRecordText& AddTime(const char* tag, const char* rest) {
    char text[16];
    snprintf(text, sizeof text, "%02d%02d%02d%s", 9 + m_dice.Roll(4), m_dice.Roll(60),
             m_dice.Roll(60), rest);
    return Add(tag, text);
  }

  CDice& Dice() { return m_dice; }

 private:
  std::string& m_reply;
  CDice& m_dice;
};

constexpr const char* kStocks[] = {"2330", "2317", "0050", "00878", "2454", "030123", "1101"};
constexpr const char* kSides[] = {"B", "S"};

void AddAccount(CRecordText& record, int number) {
  record.Add("07", "S1").Add("M5", "王小明").Add("16", "9A00");
  record.Add("17", number % 9 == 0 ? " " : "98").Add("18", 10000 + record.Dice().Roll(89999));
  record.Add("69", "證券戶");
}

void AddStockKind(CRecordText& record) {
  CDice& dice = record.Dice();
  record.Add("27", dice.Roll(5)).Add("28", dice.Roll(2)).Add("32", dice.Pick(kSides));
  record.Add("29", dice.Pick(kStocks));
}

void AddStockOrder(CRecordText& record, int number) {
  CDice& dice = record.Dice();
  const int quantity = 1000 * (1 + dice.Roll(40));
  const int state = dice.Roll(8);
  const bool failed = state == 0;
  const int reduced = state < 3 ? 1000 * dice.Roll(2) : 0;
  const int filled = state == 3 ? quantity : state > 5 ? quantity / 2 : 0;
  record.Add("46", number, 12).Add("36", "20240115-9A00-" + std::to_string(10000000 + number));
  AddStockKind(record);
  record.Add("70", quantity).Add("41", failed ? 0 : reduced).Add("47", filled);
  record.Add("39", failed ? "E" : " ");
  record.Add("K1", failed       ? "委託價格超過漲跌停範圍!請重新輸入"
                   : state == 1 ? "全部取消"
                   : state == 2 ? "委託已傳送，等待接收回報！"
                                : "委託成功，已送達交易所");
  record.Add("N6", dice.Roll(6) == 0 ? "0" : "1").AddPrice("31", 1000 + dice.Roll(90000));
  record.Add("M8", dice.Roll(9) == 0 ? 9 : 0).AddTime("22", "123456").Add("21", 1130115);
  record.Add("44", 1130115).Add("JV", dice.Roll(3) == 0 ? "Y" : "N");
}

void AddStockFill(CRecordText& record, int number) {
  record.Add("36", number, 12);
  AddStockKind(record);
  CDice& dice = record.Dice();
  record.Add("47", dice.Roll(20) == 0 ? 0 : 1000 * (1 + dice.Roll(9)));
  record.AddPrice("48", 1000 + dice.Roll(90000)).Add("49", dice.Roll(100000));
  record.Add("50", 1130115).AddTime("51", "456");
}

void AddHolding(CRecordText& record, bool brokerage) {
  CDice& dice = record.Dice();
  record.Add("29", dice.Pick(kStocks));
  for (const char* tag : {"75", "751", "76", "761", "77", "771"}) {
    record.Add(tag, dice.Roll(3) == 0 ? 0 : 1000 * dice.Roll(50));
  }
  if (brokerage) {
    for (const char* tag : {"752", "762", "772"}) record.Add(tag, 1000 * dice.Roll(5));
  } else {
    record.Add("PS", dice.Roll(4) == 0 ? 1000 : 0);
  }
}

void AddPayment(CRecordText& record, bool brokerage) {
  CDice& dice = record.Dice();
  AddStockKind(record);
  if (brokerage) record.Add("KT", dice.Roll(3) == 0 ? 12 : 21);
  record.Add("50", 1130115).Add("47", 1000 * (1 + dice.Roll(9)));
  record.AddPrice("48", 1000 + dice.Roll(90000));
  for (const char* tag : {"49", "79", "78", "84", "81", "82", "85", "87"}) {
    record.Add(tag, dice.Roll(1000000));
  }
  if (dice.Roll(2) == 0) record.Add("86", dice.Roll(1000)).Add("89", dice.Roll(1000));
  record.Add("88", dice.Roll(100)).Add("96", dice.Roll(2) == 0 ? "-" : "+");
  record.Add("97", dice.Roll(2000000));
}

// The fields of a contract: one leg, or two (`pair`), which have fields of their own.
void AddContract(CRecordText& record, bool option, bool pair) {
  CDice& dice = record.Dice();
  const char* const commodity = option ? "TXO" : "TXF";
  record.Add("33", commodity).Add("29", "202402").Add("V8", option ? "C" : " ");
  record.Add("34", option ? 17000 + 100 * dice.Roll(20) : 0).Add("32", dice.Pick(kSides));
  if (!pair) return;
  record.Add("V9", commodity).Add("W0", "202403").Add("EL", dice.Pick(kSides));
  if (option) record.Add("W1", "P").Add("W2", "17500");
}

void AddFuturesOrder(CRecordText& record, int number) {
  CDice& dice = record.Dice();
  const int quantity = 1 + dice.Roll(9);
  const int state = dice.Roll(8);
  record.Add("O4", 0).Add("V5", dice.Roll(4) == 0 ? 1 : 0);
  record.Add("46", number, 12).Add("36", "20240115-F004-" + std::to_string(10000000 + number));
  AddContract(record, dice.Roll(3) == 0, dice.Roll(5) == 0);
  record.Add("W3", dice.Pick({"", "0", "1"})).Add("70", quantity);
  record.Add("41", state == 1 ? quantity : 0);
  record.Add("47", state == 2 ? quantity : 0).Add("39", state == 0 ? "E" : " ");
  record.Add("K1", state == 0 ? "保證金不足!請入金" : "委託成功").Add("N6", state == 3 ? "0" : "1");
  record.Add("27", dice.Roll(4) == 0 ? 1 : 2).Add("31", 17000 + dice.Roll(900));
  record.AddTime("22", "789012").Add("21", 1130115).Add("44", 1130115);
  record.Add("JV", dice.Pick({"Y", "N", ""})).Add("MT", dice.Pick({"0", "1", ""}));
}

void AddFuturesFill(CRecordText& record, int number) {
  CDice& dice = record.Dice();
  record.Add("36", number, 10).Add("46", number, 8).Add("31", 17000 + dice.Roll(900));
  record.Add("70", 5).Add("37", dice.Roll(3)).Add("47", 1 + dice.Roll(4));
  AddContract(record, dice.Roll(3) == 0, dice.Roll(5) == 0);
  record.Add("48", 17000 + dice.Roll(900)).Add("W5", "").Add("W3", dice.Pick({"0", "1"}));
  record.Add("21", 1130115).AddTime("22", "").Add("50", 1130115).AddTime("51", "321");
  record.Add("MT", "0").Add("44", 1130115);
}

void AddPosition(CRecordText& record, int) {
  CDice& dice = record.Dice();
  const bool pair = dice.Roll(5) == 0;
  AddContract(record, dice.Roll(3) == 0, pair);
  record.Add("48", 17000 + dice.Roll(900)).Add("W5", pair ? "17123.5" : "");
  record.Add("R8", 1 + dice.Roll(20)).Add("50", 100 * dice.Roll(900)).Add("28", 1);
}

struct List {
  std::string_view decoder;
  void (*add)(CRecordText& record, int number);
};

constexpr List kLists[] = {
    {"AuthDecode", AddAccount},
    {"GetTotalAccountDecode", AddAccount},
    {"QueryOrderDecode", AddStockOrder},
    {"QueryReplyDecode", AddStockFill},
    {"QueryInventoryDecode", [](CRecordText& record, int) { AddHolding(record, false); }},
    {"QueryInventoryDecodeJZG", [](CRecordText& record, int) { AddHolding(record, true); }},
    {"PaymentDecode", [](CRecordText& record, int) { AddPayment(record, false); }},
    {"PaymentDecodeJZG", [](CRecordText& record, int) { AddPayment(record, true); }},
    {"FutQueryOrderDecode", AddFuturesOrder},
    {"FutQueryReplyDecode", AddFuturesFill},
    {"FutQueryInventoryDecode", AddPosition},
};

struct Answer {
  std::string_view decoder;
  std::string_view reply;
};

constexpr std::string_view kDone = "F=7|KIND=S|00=1|68=0000|M2=|01=";
constexpr std::string_view kAccepted =
    "F=1|KIND=S|65=0013452107|39= |19=S|46=A0012|36=000123456|44=1130115|K1=委託成功|MT=0|";
constexpr std::string_view kCertificate =
    "F=7|KIND=S|00=1|68=0000|M2=MIIDdzCCAl+gAwIBAgIEbVhJ1DANBgkqhkiG9w0BAQsFADBsMRAwDgYDVQQGEwdV"
    "bmtub3duMRAwDgYDVQQIEwdVbmtub3duMRAwDgYDVQQHEwdVbmtub3duMRAwDgYDVQQKEwdVbmtub3duMRAwDgYDVQQL"
    "EwdVbmtub3duMRAwDgYDVQQDEwdVbmtub3duMB4XDTI0MDExNTA1NDUyMVoXDTI1MDExNDA1NDUyMVowbDEQMA4GA1UE|"
    "01=";

constexpr Answer kAnswers[] = {
    {"OpenAccountDecode", kDone},
    {"ChangePasswordDecode", kDone},
    {"QueryBankRemainDecode", "F=7|KIND=S|00=1|68=0000|PN=1234567|01="},
    {"RegisterCertDecode", kCertificate},
    {"GetCertDecode", kCertificate},
    {"ApplyCertDecode", kCertificate},
    {"RevokeCertDecode", kCertificate},
    {"ReNewCertDecode", kCertificate},
    {"GetCertStatusDecode", kCertificate},
    {"InstallCertOKDecode", kCertificate},
    {"OpenCertDecode", kCertificate},
    {"SubmitOrderDecode", kAccepted},
    {"CancelChangeOrderDecode", kAccepted},
    {"QueryCreditInfoDecode",
     "F=7|KIND=S|00=1|68=0000|29=2330|A0=60|76=12000|77=3000|B8=Y|B9=N|A1=90|A2=500|01="},
    {"FutSubmitOrderDecode", kAccepted},
    {"QueryFinanceDecode",
     "F=7|KIND=F|00=1|68=0000|LO=1234567.89|PN=250000|RA=98.5|QY=1200000|QX=900000|U5=150000|"
     "U9=85000|RF=1.25|F0=10|F1=20|F2=30|F3=40|01="},
};

}  // namespace

std::string SampleList(std::string_view decoder, size_t records) {
  for (const List& list : kLists) {
    if (list.decoder != decoder) continue;
    CDice dice;
    std::string reply = "F=7|KIND=S|65=0013452107";
    CRecordText record(reply, dice);
    for (size_t number = 1; number <= records; ++number) {
      record.Add("00", "1").Add("67", static_cast<int>(number), 6).Add("68", "0000");
      list.add(record, static_cast<int>(number));
      record.Add("01", "");
    }
    record.Add("00", "1").Add("67", "900001").Add("68", "0000").Add("01", "");
    if (decoder == "AuthDecode") record.Add("M3", "系統將於週六進行維護，造成不便敬請見諒");
    return reply;
  }
  return {};
}

std::string SampleAnswer(std::string_view decoder) {
  for (const Answer& answer : kAnswers) {
    if (answer.decoder == decoder) return std::string(answer.reply);
  }
  return {};
}

std::string SampleReply(std::string_view decoder, size_t records) {
  const std::string list = SampleList(decoder, records);
  return list.empty() ? SampleAnswer(decoder) : list;
}

}  // namespace gateway_tests
