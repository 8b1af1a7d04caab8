#include "gateway/core/conversions.h"

#include "gateway/core/gateway_pub.h"

namespace {

constexpr int kRocYearZero = 1911;
constexpr int kRocDateOffset = 19110000;

// The longest part of a negative price that is read; the rest is cut.
constexpr size_t kNegativePriceChars = 20;

std::string_view From(std::string_view text, size_t start) {
  text.remove_prefix(start);
  return text;
}

std::string_view UpTo(std::string_view text, size_t end) {
  return {text.data(), end < text.size() ? end : text.size()};
}

// 32- and 64-bit arithmetic of one and the same reading.
struct Narrow {
  using Number = int32_t;
  static Number Read(std::string_view text) { return ReadInt32(text); }
  static Number Power(int exponent) { return PowerOfTen32(exponent); }
};

struct Wide {
  using Number = int64_t;
  static Number Read(std::string_view text) { return ReadInt64(text); }
  static Number Power(int exponent) { return PowerOfTen64(exponent); }
};

// A decimal text times 10^decimals: missing fraction digits count as zeros, further ones are cut.
template <class Arithmetic>
typename Arithmetic::Number Scale(std::string_view text, int decimals) {
  const size_t point = text.find('.');
  const auto whole = WrapMultiply(Arithmetic::Read(UpTo(text, point)), Arithmetic::Power(decimals));
  if (point == std::string_view::npos) return whole;
  const std::string_view digits = From(text, point + 1);
  auto fraction = Arithmetic::Read(digits);
  const auto missing = static_cast<int64_t>(decimals) - static_cast<int64_t>(digits.size());
  if (missing >= 0) {
    fraction = WrapMultiply(fraction, Arithmetic::Power(static_cast<int>(missing)));
  } else {
    fraction /= Arithmetic::Power(missing < -INT8_MAX ? INT8_MAX : static_cast<int>(-missing));
  }
  return WrapAdd(whole, fraction);
}

}  // namespace

CTransDate::CTransDate(std::string_view date) : m_text(date) {
  if (date.size() < 6 || date.size() > 8) return;
  const int year = ReadInt32(UpTo(date, date.size() - 4));
  if (year == 0 && ReadInt32(date) == 0) return;
  char* const monthAndDay = date.size() == 8 ? WriteNumber<0>(m_szDate, year - kRocYearZero)
                                             : WriteNumber<4>(m_szDate, year + kRocYearZero);
  memcpy(monthAndDay, From(date, date.size() - 4).data(), 4);
  m_text = {m_szDate, static_cast<size_t>(monthAndDay + 4 - m_szDate)};
}

int32_t RocToWesternDate(int32_t rocDate) {
  return rocDate == 0 ? 0 : WrapAdd(rocDate, kRocDateOffset);
}

int32_t RocToWesternDate(std::string_view rocDate) {
  return RocToWesternDate(ReadInt32(rocDate));
}

int32_t ScalePrice(std::string_view text, int decimals) {
  if (text.empty() || text.front() != '-') return Scale<Narrow>(text, decimals);
  const std::string_view magnitude = UpTo(From(text, 1), kNegativePriceChars);
  return WrapSubtract(0, Scale<Narrow>(magnitude, decimals));
}

int64_t ScaleAmount(std::string_view text, int decimals) {
  return Scale<Wide>(text, decimals);
}

void CGatewayPub::TransDate(char* date) {
  const CTransDate converted(AsText(date));
  const std::string_view text = converted.Text();
  if (text.empty() || text.data() == date) return;
  memcpy(date, text.data(), text.size());
  date[text.size()] = '\0';
}

int CGatewayPub::RocDateToStandardDate(int rocDate) {
  return RocToWesternDate(rocDate);
}

int CGatewayPub::RocDateToStandardDate(const char* rocDate) {
  return RocToWesternDate(AsText(rocDate));
}

void CGatewayPub::SetPriceString(int value, int decimals, char* out, int outSize) {
  if (out == nullptr || outSize < 1) return;
  memset(out, 0, static_cast<size_t>(outSize));
  const int64_t unit = decimals > 0 ? PowerOfTen32(decimals) : 1;
  const size_t width = decimals > 0 ? static_cast<size_t>(decimals) : 0;
  CTextWriter text(out, static_cast<size_t>(outSize));
  text.Append(WIRE("%ld."), value / unit);
  text.AppendPadded(value % unit, width);
  if (text.Overflowed()) text.Replace("");
  text.Text();
}

int32_t CGatewayPub::GetPriceString(const char* text, int decimals) {
  return ScalePrice(AsText(text), decimals);
}

int64_t CGatewayPub::GetPriceString2(const char* text, int decimals) {
  return ScaleAmount(AsText(text), decimals);
}

void CGatewayPub::fctRep(const char* src, char* dst) {
  if (AsText(src).empty() || dst == nullptr) return;
  for (dst += strlen(dst); *src != '\0'; ++src) {
    if (*src == ' ') {
      memcpy(dst, "%20", 3);
      dst += 3;
    } else {
      *dst++ = *src;
    }
  }
  *dst = '\0';
}

void CGatewayPub::StringReplaceAll(char* text, int from, int to) {
  const char searched = static_cast<char>(from);
  const char replacement = static_cast<char>(to);
  if (text == nullptr || searched == '\0' || searched == replacement) return;
  for (; *text != '\0'; ++text) {
    if (*text == searched) *text = replacement;
    if (*text == '\0') return;
  }
}
