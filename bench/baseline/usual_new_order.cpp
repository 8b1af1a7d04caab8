#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <ctime>

#include "bench/baseline/usual.h"
#include "bench/sample_session.h"

namespace bench::usual {
namespace {

constexpr size_t kRequestSize = 4096;

// The header of an order, "|14=I", and the key that opens its signature.
bool WriteHead(const char* date, char* out, char* key) {
  char piece[256] = "";
  const time_t now = time(nullptr);
  tm parts = {};
  localtime_r(&now, &parts);
  const int id = ((parts.tm_hour * 10000 + parts.tm_min * 100 + parts.tm_sec) * 100 +
                  kSession.sequence % 100) %
                 100000000;

  if (strlen(kSession.localIP) == 0) {
    strcpy(out, "[CLIENT] 無法取得IP，請確認網路連線是否正常！");
    return false;
  }
  snprintf(piece, sizeof piece, "F=1|KIND=%s|BHNO=%s|CB=1|IP=%s",
           kSession.market <= 100 ? "S" : "F", kBranch, kSession.localIP);
  strcat(out, piece);
  snprintf(piece, sizeof piece, "|11=%s", "NO DEFINE");
  strcat(out, piece);
  snprintf(piece, sizeof piece, "|VER=%d", 24369);
  strcat(out, piece);
  snprintf(piece, sizeof piece, "|SN=%s", kSession.serialNo);
  strcat(out, piece);
  snprintf(piece, sizeof piece, "|65=%010d|14=%c", id, 'I');
  strcat(out, piece);

  char first[40];
  char second[40];
  const char* cursor = kIdentity;
  GetPart(&cursor, "&", first, sizeof first);
  GetPart(&cursor, "&", second, sizeof second);
  if (strlen(second) == 0) strcpy(second, first);
  sprintf(key, "%s_%s_%s_%c", kBranch, second, first, 'I');
  if (strlen(second) >= 2 && strlen(second) <= 7) {
    snprintf(piece, sizeof piece, "|15=0|IDNO=%s|ACNO=%s|PWD=%s", first, second, kPassword);
  } else {
    strcpy(out, "[CLIENT] 帳號或身份證字號輸入錯誤");
    return false;
  }
  strcat(out, piece);

  snprintf(piece, sizeof piece, "|21=%04d%02d%02d|22=%02d%02d%02d|23=%08d|24=%s|V4=%s",
           parts.tm_year + 1900, parts.tm_mon + 1, parts.tm_mday, parts.tm_hour, parts.tm_min,
           parts.tm_sec, id, "5", "");
  strcat(out, piece);
  if (strlen(date) > 0) {
    snprintf(piece, sizeof piece, "|44=%08d", atoi(date) + 19110000);
    strcat(out, piece);
  }
  Log(out);
  return true;
}

}  // namespace

char* NewStockOrder(const char* stockCode, const char* date, int quantity, int unit, int price,
                    char side, char flag13, int orderKind, int priceKind, int tradeType, int n6) {
  char* const out = static_cast<char*>(malloc(kRequestSize));
  memset(out, 0, kRequestSize);
  char key[200];
  memset(key, 0, sizeof key);
  char piece[512];
  if (!WriteHead(date, out, key)) return out;
  if (tradeType != 2) quantity *= unit;

  snprintf(piece, sizeof piece, "|27=%d|28=%d|29=%s|30=%d|UT=%d|13=%c|N6=%d", orderKind, tradeType,
           stockCode, quantity, unit, flag13, n6);
  strcat(out, piece);
  if (tradeType == 3) {
    snprintf(piece, sizeof piece, "|31=|M8=|32=%c|33=", side);
    strcat(out, piece);
    snprintf(piece, sizeof piece, "!!%s_%c_%s_%d_%d", key, side, stockCode, quantity, 3);
  } else if (priceKind != 0) {
    snprintf(piece, sizeof piece, "|31=0|M8=%d|32=%c|33=", priceKind, side);
    strcat(out, piece);
    snprintf(piece, sizeof piece, "!!%s_%c_%s_%d_%d", key, side, stockCode, quantity, priceKind);
  } else {
    snprintf(piece, sizeof piece, "|31=%d.%02d|M8=0|32=%c|33=", price / 100, price % 100, side);
    strcat(out, piece);
    snprintf(piece, sizeof piece, "!!%s_%c_%s_%d_%d.%02d", key, side, stockCode, quantity,
             price / 100, price % 100);
  }
  strcat(out, piece);
  return out;
}

}  // namespace bench::usual
