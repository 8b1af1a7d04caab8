#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <initializer_list>

#include "bench/baseline/usual.h"

namespace bench::usual {
namespace {

// What the gateway sends once and means until it sends it anew.
struct Standing {
  int o4, v5, quantity, cancelled, reduced, filled;
  char timeInForce[2];
  const char* product;
};

bool IsBlank(const char* text) {
  return strlen(text) == 0 || strcmp(text, " ") == 0;
}

const char* StateText(const char* record, const Standing& standing) {
  char value[1024];
  const int cancelled = standing.cancelled + standing.reduced;
  const bool immediate =
      strcmp(standing.timeInForce, "F") == 0 || strcmp(standing.timeInForce, "I") == 0;
  GetToken("39", record, value, sizeof value);
  if (strcmp(value, "E") == 0) return "@委託失敗";
  if (standing.quantity == cancelled) return immediate ? "@撮合未成交" : "@已取消";
  if (standing.filled == 0 && cancelled == 0) {
    GetToken("N6", record, value, sizeof value);
    return strcmp(value, "0") == 0 ? "@預約單" : "@委託成功";
  }
  if (standing.filled == 0) return "@已改量";
  if (standing.quantity == standing.filled) return "@已成交";
  if (standing.quantity == cancelled + standing.filled) {
    return strcmp(standing.timeInForce, "I") == 0 ? "@撮合部份成交" : "@部份成交，其餘已取消";
  }
  return "@部份成交";
}

void AppendLegs(const char* record, bool option, Standing* standing, char* line) {
  char w3[8];
  char side1[1024];
  char side2[1024];
  char piece[32] = "";
  GetToken("W3", record, w3, sizeof w3);
  GetToken("32", record, side1, sizeof side1);
  GetToken("EL", record, side2, sizeof side2);
  int code = 0;
  if (IsBlank(w3)) {
    code = 51;
  } else if (strcmp(w3, "0") == 0) {
    code = 53;
  } else if (strcmp(w3, "1") == 0) {
    code = 55;
  } else if (strcmp(w3, "2") == 0 && !option) {
    code = 57;
  } else {
    strcat(line, "@");
    return;
  }
  const int first = strcmp(side1, "B") == 0 ? code : code + 1;
  if (IsBlank(side2)) {
    standing->product = option ? "O" : "F";
    snprintf(piece, sizeof piece, "@%d", first);
  } else {
    standing->product = option ? "X" : "Y";
    const int second = strcmp(side2, "B") == 0 ? code : code + 1;
    const bool known1 = strcmp(side1, "B") == 0 || strcmp(side1, "S") == 0;
    const bool known2 = strcmp(side2, "B") == 0 || strcmp(side2, "S") == 0;
    if (known1 && known2) snprintf(piece, sizeof piece, "@%d|%d", first, second);
  }
  strcat(line, piece);
}

void AppendPair(const char* tag1, const char* tag2, const char* record, char* line) {
  char value[1024];
  GetToken(tag1, record, value, sizeof value);
  strcat(line, value);
  GetToken(tag2, record, value, sizeof value);
  if (!IsBlank(value)) {
    strcat(line, "|");
    strcat(line, value);
  }
  strcat(line, "&");
}

void AppendContract(const char* record, const Standing& standing, char* line) {
  char commodity[1024];
  char value[1024];
  char piece[64];
  GetToken("33", record, commodity, sizeof commodity);
  strcat(line, "@TIMEX&");
  strcat(line, standing.product);
  strcat(line, "&");
  strcat(line, commodity);
  if (strcmp(standing.product, "X") == 0) {
    GetToken("V9", record, value, sizeof value);
    strcat(line, "|");
    strcat(line, value);
  }
  strcat(line, "&");
  AppendPair("29", "W0", record, line);
  AppendPair("V8", "W1", record, line);
  GetToken("34", record, value, sizeof value);
  const int strike1 = GetPrice(value, 4);
  GetToken("W2", record, value, sizeof value);
  if (IsBlank(value)) {
    snprintf(piece, sizeof piece, "%d", strike1);
  } else {
    const bool tenths = strcmp(commodity, "MSO") == 0 || strcmp(commodity, "GTO") == 0 ||
                        strcmp(commodity, "TEO") == 0;
    const int unit = tenths ? 10 : 1;
    snprintf(piece, sizeof piece, "%d|%d", strike1 / unit, GetPrice(value, 4) / unit);
  }
  strcat(line, piece);
}

void AppendPrice(const char* record, char* line) {
  char value[1024];
  char piece[64];
  if (GetToken("27", record, value, sizeof value) == 0) return;
  const int type = atoi(value);
  GetToken("31", record, value, sizeof value);
  snprintf(piece, sizeof piece, "@%d", GetPrice(value, 4));
  if (type == 1) strcpy(piece, "@市價");
  if (type == 3) strcpy(piece, "@範圍市價");
  strcat(line, piece);
}

void AppendTimes(const char* record, const char* message, const Standing& standing, char* line) {
  char value[1024];
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
  } else if (strcmp(value, "N") == 0 || strlen(message) > 0) {
    strcat(line, "2");
  }
  strcat(line, "@");
  strcat(line, standing.timeInForce);
  GetToken("MT", record, value, sizeof value);
  strcat(line, "@");
  strcat(line, strlen(value) > 0 ? value : " ");
  strcat(line, "!");
}

bool WriteOrder(const char* record, Standing* standing, char* line) {
  char value[1024];
  char callPut[8];
  char message[512] = "";
  char piece[64];
  GetToken("V8", record, callPut, sizeof callPut);
  const bool option = strcmp(callPut, "C") == 0 || strcmp(callPut, "P") == 0;
  if (!option && !IsBlank(callPut)) return false;
  GetToken("39", record, value, sizeof value);
  if (strcmp(value, "E") == 0) GetToken("K1", record, message, sizeof message);

  GetToken("46", record, value, sizeof value);
  Log(value);
  strcat(line, value);
  GetToken("36", record, value, sizeof value);
  strcat(line, "@");
  strcat(line, value);
  AppendLegs(record, option, standing, line);
  AppendContract(record, *standing, line);
  snprintf(piece, sizeof piece, "@%d", standing->quantity);
  strcat(line, piece);
  strcat(line, StateText(record, *standing));
  if (strlen(message) > 0) {
    strcat(line, "&");
    strcat(line, message);
  }
  snprintf(piece, sizeof piece, "@%d@%d", standing->filled,
           standing->cancelled + standing->reduced);
  strcat(line, piece);
  AppendPrice(record, line);
  AppendTimes(record, message, *standing, line);
  return true;
}

void UpdateTimeInForce(const char* record, Standing* standing) {
  GetNumber("O4", record, &standing->o4);
  GetNumber("V5", record, &standing->v5);
  if (standing->o4 == 0 && standing->v5 == 0) strcpy(standing->timeInForce, "R");
  if (standing->o4 == 0 && standing->v5 == 1) strcpy(standing->timeInForce, "I");
  if (standing->o4 == 1 && standing->v5 == 0) strcpy(standing->timeInForce, "F");
}

void UpdateQuantities(const char* record, Standing* standing) {
  GetNumber("70", record, &standing->quantity);
  GetNumber("41", record, &standing->cancelled);
  GetNumber("37", record, &standing->reduced);
  GetNumber("47", record, &standing->filled);
}

}  // namespace

char* DecodeFuturesBook(const char* reply) {
  const size_t length = strlen(reply);
  if (length == 0) return strdup("[CLIENT]主機連線失敗");
  char record[1024];
  char code[128];
  size_t pos = 0;
  GetRecord(reply, &pos, record, sizeof record);
  GetToken("68", record, code, sizeof code);
  if (strcmp(code, "5001") == 0) return strdup("0!");
  if (strcmp(code, "0000") != 0) {
    char message[512];
    char text[700] = "";
    GetToken("M2", record, message, sizeof message);
    if (strlen(code) > 0) snprintf(text, sizeof text, "[GATEWAY]%s(%s)", message, code);
    return strdup(text);
  }

  List list = {};
  Standing standing = {};
  standing.product = "";
  int count = 0;
  for (;;) {
    int sequence = 0;
    GetNumber("67", record, &sequence);
    if (sequence >= 900000 || pos >= length) return FinishList(&list, count);
    UpdateTimeInForce(record, &standing);
    GetToken("68", record, code, 8);
    if (strcmp(code, "0000") == 0) {
      UpdateQuantities(record, &standing);
      char line[2048];
      memset(line, 0, sizeof line);
      if (!WriteOrder(record, &standing, line)) {
        free(list.text);
        return strdup("[CLIENT]委託種類錯誤");
      }
      Append(&list, line);
      ++count;
    }
    GetRecord(reply, &pos, record, sizeof record);
  }
}

}  // namespace bench::usual
