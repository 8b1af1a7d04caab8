#include "gateway/core/conversions.h"

#include <iterator>

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

// As Scale, for the usual price: four to eight characters, no more decimals than are wanted. Its
// digits are read as one number, as if there were no point. False, with nothing read, for any other
// text.
bool ScaleShort(std::string_view text, int decimals, int32_t& scaled) {
  static constexpr int32_t kPowers[] = {1,      10,      100,      1000,     10000,
                                        100000, 1000000, 10000000, 100000000};
  if (text.size() - 4 > 4 || static_cast<uint32_t>(decimals) >= std::size(kPowers)) return false;
  uint64_t word = LoadWord(text);
  size_t count = text.size();
  auto missing = static_cast<size_t>(decimals);
  if (const uint64_t points = BytesEqual(word, '.'); points != 0) {
    const auto before = static_cast<unsigned>(__builtin_ctzll(points)) & 56;  // bits, not bytes
    word = (word & ((uint64_t{1} << before) - 1)) | (word >> before >> 8) << before;
    --count;
    missing -= count - before / 8;
  }
  word = AlignRight(word, count);
  if (missing >= std::size(kPowers) || !AreEightDigits(word)) return false;
  scaled = WrapMultiply(static_cast<int32_t>(ValueOfEightDigits(word)), kPowers[missing]);
  return true;
}

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
  const size_t size = date.size();
  if (size < 6 || size > 8) return;
  uint32_t year;
  memcpy(&year, date.data(), 4);
  year = AlignRight(year, size - 4);
  const uint32_t value = ValueOfFourDigits(year);
  if (Rarely(!AreFourDigits(year) || value == 0 || (size == 8 && value < kRocYearZero))) {
    ConvertUnusual();
    return;
  }
  char* const monthAndDay = size == 8 ? ShortDigits(value - kRocYearZero).WriteTo(m_szDate)
                                      : WriteDigits<4>(m_szDate, value + kRocYearZero);
  memcpy(monthAndDay, date.data() + size - 4, 4);
  m_text = {m_szDate, static_cast<size_t>(monthAndDay + 4 - m_szDate)};
}

// A year that is no number, or one before the calendar.
void CTransDate::ConvertUnusual() {
  const std::string_view date = m_text;
  if (ReadInt32(date) == 0) return;
  const std::string_view monthAndDay = From(date, date.size() - 4);
  const int year = ReadInt32(UpTo(date, date.size() - 4));
  CTextWriter text(m_szDate, sizeof m_szDate);
  if (date.size() == 8) {
    text.Append(WIRE("%d%s"), year - kRocYearZero, monthAndDay);
  } else {
    text.Append(WIRE("%04d%s"), year + kRocYearZero, monthAndDay);
  }
  m_text = {text.Text(), text.Length()};
}

int32_t RocToWesternDate(int32_t rocDate) {
  return rocDate == 0 ? 0 : WrapAdd(rocDate, kRocDateOffset);
}

int32_t RocToWesternDate(std::string_view rocDate) {
  return RocToWesternDate(ReadInt32(rocDate));
}

int32_t ScalePrice(std::string_view text, int decimals) {
  int32_t scaled;
  if (Mostly(ScaleShort(text, decimals, scaled))) return scaled;
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
