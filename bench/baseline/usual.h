// The usual C way: each field is looked up with a pattern made by snprintf and found by strstr,
// each buffer is cleared before use, each piece is printed to a scratch buffer and joined by
// strcat. It answers what the library answers, byte for byte, and is what many an app ships.
#ifndef QUORVANE_BENCH_BASELINE_USUAL_H_
#define QUORVANE_BENCH_BASELINE_USUAL_H_

#include <cstddef>

namespace bench::usual {

// --- Texts ---

// Copies the value of the first field `tag` into `out` if it fits; returns its length.
int GetToken(const char* tag, const char* text, char* out, int size, bool skipBlank = false);

// As GetToken for a number; a missing field leaves `value` as it was.
void GetNumber(const char* tag, const char* text, int* value);

// Copies the next record, from "|00=" to before "|01=", and moves `pos` behind it.
void GetRecord(const char* text, size_t* pos, char* out, size_t size);

// Copies the text before `separator`, or all of it, and moves `cursor` behind.
void GetPart(const char** cursor, const char* separator, char* out, size_t size);

void ReplaceAll(char* text, char from, char to);

// 1130115 to 20240115 and back, in place.
void TransDate(char* date);

// "12.5" with 2 decimals to 1250.
int GetPrice(const char* text, int decimals);

// True, with the message in `out`, when the reply is a transport failure.
bool TransportFailed(const char* reply, char* out);

void Log(const char* text);

// A text on the heap that grows when a record does not fit.
struct List {
  char* text;
  size_t length;
  size_t capacity;
};

void Append(List* list, const char* record);

// "count!records" in a block of its own; releases the list.
char* FinishList(List* list, int count);

// --- Operations: results are blocks of malloc, which the caller releases. ---

char* NewStockOrder(const char* stockCode, const char* date, int quantity, int unit, int price,
                    char side, char flag13, int orderKind, int priceKind, int tradeType, int n6);
char* DecodeLogin(const char* reply);
char* DecodeStockBook(const char* reply);
char* DecodeFuturesBook(const char* reply);

}  // namespace bench::usual

#endif  // QUORVANE_BENCH_BASELINE_USUAL_H_
