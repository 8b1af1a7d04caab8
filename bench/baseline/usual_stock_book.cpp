#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <initializer_list>

#include "bench/baseline/usual.h"

namespace bench::usual {
namespace {

// The codes that the screen knows an order's kind by; 0 for none.
int OrderTypeCode(int kind, int type, bool buying) {
  if (kind == 5) return 38;
  if (kind == 6) return 30;
  if (kind == 7) return 31;
  if (kind == 8 && type == 3) return buying ? 40 : 41;
  if (kind == 8) return buying ? 33 : 34;
  int code = 0;
  if (type == 0 || type == 1) {
    if (kind == 0) code = 1;
    if (kind == 1 || kind == 3) code = 3;
    if (kind == 2 || kind == 4) code = 5;
  } else if (type == 2) {
    if (kind == 0) code = 7;
  } else if (type == 3) {
    if (kind == 0) code = 9;
    if (kind == 1 || kind == 3) code = 11;
    if (kind == 2 || kind == 4) code = 13;
  }
  return code == 0 || buying ? code : code + 1;
}

const char* StatusText(const char* record, const char* remark, int ordered, int filled,
                       int reduced) {
  char n6[50];
  if (strcmp(remark, "全部取消") == 0) return "已取消";
  if (strcmp(remark, "委託已傳送，等待接收回報！") == 0) return "正在處理";
  if (reduced == ordered) return "已取消";
  if (filled != 0 && ordered == filled) return "已成交";
  if (filled != 0 && ordered == reduced + filled) return "部份成交，其餘已取消";
  if (filled != 0) return "部份成交";
  if (reduced != 0) return "已改量";
  GetToken("N6", record, n6, sizeof n6);
  return strcmp(n6, "0") == 0 ? "預約單" : "委託成功";
}

void AppendPrice(const char* record, char* line) {
  char value[50];
  char piece[64];
  int kind = 0;
  GetToken("31", record, value, sizeof value);
  const int price = strlen(value) > 0 ? GetPrice(value, 2) : 0;
  snprintf(piece, sizeof piece, "@%d", price);
  if (price == 0) strcpy(piece, "@市價");
  GetNumber("M8", record, &kind);
  if (kind == 5) strcpy(piece, "@平盤價");
  if (kind == 9) strcpy(piece, "@漲停價");
  if (kind == 1) strcpy(piece, "@跌停價");
  strcat(line, piece);
}

void AppendTimes(const char* record, const char* failure, char* line) {
  char value[50];
  GetToken("22", record, value, sizeof value);
  value[6] = '\0';
  strcat(line, "@");
  strcat(line, value);
  for (const char* tag : {"21", "44"}) {
    GetToken(tag, record, value, sizeof value);
    TransDate(value);
    strcat(line, "@");
    strcat(line, value);
  }
  GetToken("N6", record, value, sizeof value);
  strcat(line, "@");
  strcat(line, value);
  GetToken("JV", record, value, sizeof value);
  strcat(line, "@");
  if (strcmp(value, "Y") == 0) {
    strcat(line, "1");
  } else if (strcmp(value, "N") == 0 || strlen(failure) > 0) {
    strcat(line, "2");
  }
  strcat(line, "!");
}

void AppendText(const char* tag, const char* record, char* line) {
  char value[50];
  GetToken(tag, record, value, sizeof value);
  strcat(line, value);
}

bool WriteOrder(const char* record, char* line) {
  char value[50];
  char failure[200] = "";
  char remark[200] = "";
  char piece[300];
  int kind = 0;
  int type = 0;
  int ordered = 0;
  int reduced = 0;
  int cancelled = 0;
  int filled = 0;
  GetNumber("27", record, &kind);
  GetNumber("28", record, &type);
  GetToken("32", record, value, sizeof value);
  const int code = OrderTypeCode(kind, type, strcmp(value, "B") == 0);
  if (code == 0) return false;
  GetNumber("70", record, &ordered);
  GetNumber("41", record, &reduced);
  GetNumber("37", record, &cancelled);
  GetNumber("47", record, &filled);
  reduced += cancelled;
  const char* status = "";
  GetToken("39", record, value, sizeof value);
  if (strcmp(value, "E") == 0) {
    GetToken("K1", record, failure, sizeof failure);
    ReplaceAll(failure, '!', ' ');
  } else {
    GetToken("K1", record, remark, sizeof remark);
    status = StatusText(record, remark, ordered, filled, reduced);
  }

  AppendText("46", record, line);
  strcat(line, "@");
  AppendText("36", record, line);
  snprintf(piece, sizeof piece, "@%d@", code);
  strcat(line, piece);
  AppendText("29", record, line);
  snprintf(piece, sizeof piece, "@%d@", ordered);
  strcat(line, piece);
  strcat(line, status);
  if (strlen(status) == 0 && strlen(failure) > 0) {
    snprintf(piece, sizeof piece, "委託失敗&%s", failure);
    strcat(line, piece);
  }
  snprintf(piece, sizeof piece, "@%d@%d", filled, reduced);
  strcat(line, piece);
  AppendPrice(record, line);
  AppendTimes(record, failure, line);
  return true;
}

}  // namespace

char* DecodeStockBook(const char* reply) {
  char text[600];
  snprintf(text, sizeof text, "QueryOrderDecode: Len:%d", static_cast<int>(strlen(reply)));
  Log(text);
  Log(reply);
  if (TransportFailed(reply, text)) return strdup(text);
  char record[400];
  char code[20];
  size_t pos = 0;
  GetRecord(reply, &pos, record, sizeof record);
  GetToken("68", record, code, sizeof code);
  if (strcmp(code, "5001") == 0) return strdup("0!");
  if (strcmp(code, "0000") != 0) {
    char message[400];
    GetToken("M2", record, message, sizeof message);
    snprintf(text, sizeof text, "[GATEWAY]%s(%s)", message, code);
    return strdup(text);
  }

  const size_t length = strlen(reply);
  List list = {};
  int count = 0;
  for (;;) {
    int sequence = 0;
    GetNumber("67", record, &sequence);
    if (sequence > 899999 || pos >= length) return FinishList(&list, count);
    GetToken("68", record, code, sizeof code);
    if (strcmp(code, "0000") == 0) {
      char line[800];
      memset(line, 0, sizeof line);
      if (!WriteOrder(record, line)) {
        free(list.text);
        return strdup("[CLIENT] 委託種類錯誤");
      }
      Append(&list, line);
      ++count;
    }
    GetRecord(reply, &pos, record, sizeof record);
  }
}

}  // namespace bench::usual
