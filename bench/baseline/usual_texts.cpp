#include <android/log.h>

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include "bench/baseline/usual.h"

namespace bench::usual {

int GetToken(const char* tag, const char* text, char* out, int size, bool skipBlank) {
  char pattern[16];
  snprintf(pattern, sizeof pattern, "|%s=", tag);
  memset(out, 0, static_cast<size_t>(size));
  const char* found = strstr(text, pattern);
  while (found != nullptr) {
    const char* const value = found + strlen(pattern);
    const char* const bar = strchr(value, '|');
    const size_t length = bar != nullptr ? static_cast<size_t>(bar - value) : strlen(value);
    const bool blank = length == 0 || (length == 1 && *value == ' ');
    if (skipBlank && blank && bar != nullptr) {
      found = strstr(bar, pattern);
      continue;
    }
    if (length < static_cast<size_t>(size)) strncpy(out, value, length);
    return static_cast<int>(length);
  }
  return 0;
}

void GetNumber(const char* tag, const char* text, int* value) {
  char number[64];
  if (GetToken(tag, text, number, sizeof number) > 0) *value = atoi(number);
}

void GetRecord(const char* text, size_t* pos, char* out, size_t size) {
  memset(out, 0, size);
  const char* const begin = strstr(text + *pos, "|00=");
  const char* const end = strstr(text + *pos, "|01=");
  if (begin == nullptr || end == nullptr) {
    *pos += strlen(text + *pos);
    return;
  }
  if (end > begin && static_cast<size_t>(end - begin) < size) {
    strncpy(out, begin, static_cast<size_t>(end - begin));
  }
  *pos = static_cast<size_t>(end - text) + 1;
}

void GetPart(const char** cursor, const char* separator, char* out, size_t size) {
  const char* const found = strstr(*cursor, separator);
  const size_t length = found != nullptr ? static_cast<size_t>(found - *cursor) : strlen(*cursor);
  memset(out, 0, size);
  if (length < size) strncpy(out, *cursor, length);
  *cursor += found != nullptr ? length + strlen(separator) : length;
}

void ReplaceAll(char* text, char from, char to) {
  for (char* at = strchr(text, from); at != nullptr; at = strchr(text, from)) *at = to;
}

void TransDate(char* date) {
  char year[8] = "";
  char moved[32] = "";
  if (atoi(date) == 0) return;
  const size_t length = strlen(date);
  if (length == 7) {
    strncpy(year, date, 3);
    snprintf(moved, sizeof moved, "%04d%s", atoi(year) + 1911, date + 3);
  } else if (length == 8) {
    strncpy(year, date, 4);
    snprintf(moved, sizeof moved, "%d%s", atoi(year) - 1911, date + 4);
  } else if (length == 6) {
    strncpy(year, date, 2);
    snprintf(moved, sizeof moved, "%04d%s", atoi(year) + 1911, date + 2);
  } else {
    return;
  }
  strcpy(date, moved);
}

int GetPrice(const char* text, int decimals) {
  char whole[64] = "";
  const bool negative = *text == '-';
  strncpy(whole, negative ? text + 1 : text, sizeof whole - 1);
  char* const point = strchr(whole, '.');
  int value = 0;
  if (point != nullptr) {
    *point = '\0';
    value = atoi(point + 1);
    const int digits = static_cast<int>(strlen(point + 1));
    if (digits < decimals) value *= static_cast<int>(pow(10, decimals - digits));
    if (digits > decimals) value /= static_cast<int>(pow(10, digits - decimals));
  }
  value += atoi(whole) * static_cast<int>(pow(10, decimals));
  return negative ? -value : value;
}

bool TransportFailed(const char* reply, char* out) {
  if (strstr(reply, "[GATEWAY]error") != nullptr) {
    strcpy(out, "[GATEWAY]主機連線失敗");
    return true;
  }
  if (strstr(reply, "[BROKER]timeout") != nullptr || strlen(reply) == 0) {
    strcpy(out, "[BROKER]主機連線失敗");
    return true;
  }
  return false;
}

void Log(const char* text) {
  __android_log_write(ANDROID_LOG_DEBUG, "gatewayjni", text);
}

void Append(List* list, const char* record) {
  const size_t length = strlen(record);
  if (list->length + length >= list->capacity) {
    const size_t capacity = list->length + length + 4096;
    char* const grown = static_cast<char*>(calloc(capacity, 1));
    if (list->text != nullptr) memcpy(grown, list->text, list->length);
    free(list->text);
    list->text = grown;
    list->capacity = capacity;
  }
  strcat(list->text + list->length, record);  // at the known end, not from the start
  list->length += length;
}

char* FinishList(List* list, int count) {
  char* const result = static_cast<char*>(calloc(list->length + 20, 1));
  sprintf(result, "%d!%s", count, list->text != nullptr ? list->text : "");
  free(list->text);
  return result;
}

}  // namespace bench::usual
