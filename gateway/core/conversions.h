// Dates and prices on slices of a reply or of a host text: what the CGatewayPub methods of the same
// matter do on buffers.
#ifndef QUORVANE_GATEWAY_CORE_CONVERSIONS_H_
#define QUORVANE_GATEWAY_CORE_CONVERSIONS_H_

#include <cstdint>
#include <string_view>

// A date moved to the other calendar (see CGatewayPub::TransDate). Holds the converted text; a text
// that is no date of 6, 7 or 8 characters is handed on as it is, so the source outlives the object.
class CTransDate {
 public:
  explicit CTransDate(std::string_view date);
  CTransDate(const CTransDate&) = delete;
  CTransDate& operator=(const CTransDate&) = delete;

  std::string_view Text() const { return m_text; }

 private:
  char m_szDate[20];
  std::string_view m_text;
};

// See CGatewayPub::RocDateToStandardDate.
int32_t RocToWesternDate(int32_t rocDate);
int32_t RocToWesternDate(std::string_view rocDate);

// See CGatewayPub::GetPriceString and GetPriceString2.
int32_t ScalePrice(std::string_view text, int decimals);
int64_t ScaleAmount(std::string_view text, int decimals);

// A record's time field shows its first six characters.
inline std::string_view FirstSix(std::string_view text) {
  return {text.data(), text.size() < 6 ? text.size() : 6};
}

#endif  // QUORVANE_GATEWAY_CORE_CONVERSIONS_H_
