#include <cstdio>
#include <cstdlib>
#include <cstring>

#include "bench/baseline/usual.h"

namespace bench::usual {
namespace {

bool WriteAccount(const char* record, char* line, size_t size) {
  char code[20];
  char kind[10];
  char name[20];
  char branch[20];
  char account[20] = "";
  char front[10];
  char back[10];
  char label[20];
  GetToken("68", record, code, sizeof code);
  if (strcmp(code, "0000") != 0) return false;
  GetToken("07", record, kind, sizeof kind);
  GetToken("M5", record, name, sizeof name);
  GetToken("16", record, branch, sizeof branch);
  GetToken("17", record, front, sizeof front, true);
  GetToken("18", record, back, sizeof back, true);
  GetToken("69", record, label, sizeof label);
  strcat(account, front);
  strcat(account, back);
  if (strlen(account) > 0 && strlen(account) < 7) {
    const int number = atoi(account);
    snprintf(account, sizeof account, "%07d", number);
  }
  snprintf(line, size, "<%s>@%s@%s@%s@%s!", kind, name, account, branch, label);
  return true;
}

// "count!accounts", and behind them the notice, which counts as one more.
char* Finish(List* list, int count, const char* notice) {
  if (strlen(notice) == 0) return FinishList(list, count);
  char line[320];
  snprintf(line, sizeof line, "<M>@%s!", notice);
  Append(list, line);
  return FinishList(list, count + 1);
}

}  // namespace

char* DecodeLogin(const char* reply) {
  char text[512];
  memset(text, 0, sizeof text);
  snprintf(text, sizeof text, "AuthDecode: Len:%d", static_cast<int>(strlen(reply)));
  Log(text);
  Log(reply);
  if (TransportFailed(reply, text)) return strdup(text);
  char code[20];
  GetToken("68", reply, code, sizeof code);
  snprintf(text, sizeof text, "[strResult]%s", code);
  Log(text);
  if (strcmp(code, "0000") != 0) {
    GetToken("M2", reply, text, sizeof text);
    return strdup(text);
  }

  List list = {};
  int count = 0;
  size_t pos = 0;
  char record[200];
  GetRecord(reply, &pos, record, sizeof record);
  while (strlen(record) > 0) {
    int sequence = 0;
    GetNumber("67", record, &sequence);
    if (sequence > 900000) break;
    char line[200];
    memset(line, 0, sizeof line);
    if (WriteAccount(record, line, sizeof line)) {
      Append(&list, line);
      ++count;
    }
    GetRecord(reply, &pos, record, sizeof record);
  }
  if (count == 0) return strdup("0!");

  char notice[300];
  GetToken("M3", reply, notice, sizeof notice);
  snprintf(text, sizeof text, "[strResult2]%s", notice);
  Log(text);
  Log("[status]1");
  return Finish(&list, count, notice);
}

}  // namespace bench::usual
