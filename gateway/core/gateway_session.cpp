// The session object's life and its setters.
#include <ctime>
#include <iterator>

#include "gateway/core/decimal.h"
#include "gateway/core/gateway_pub.h"
#include "gateway/core/log.h"

namespace {

// Client editions; the row is the host's platform number.
constexpr char kNoEdition[] = "NO DEFINE";
constexpr char kEditions[][sizeof kNoEdition] = {"NO DEFINE", "NO DEFINE", "NO DEFINE", "NO DEFINE",
                                                 "NO DEFINE", "QVPHONE",   "NO DEFINE", "QVTAB",
                                                 "NO DEFINE", "QVLITE",    "QVPRO",     "QVFUTURE",
                                                 "QVOPTION",  "QVWATCH",   "QVPRO"};

// Keeps at most as many characters as the field has; one that they fill has no terminator.
template <size_t kSize>
void SetField(char (&field)[kSize], const char* text) {
  memset(field, 0, kSize);
  if (text != nullptr) memcpy(field, text, strnlen(text, kSize));
}

template <size_t kSize>
std::string_view TextOf(const char (&field)[kSize]) {
  return {field, strnlen(field, kSize)};
}

}  // namespace

CGatewayPub::CGatewayPub()
    : m_nDataSize(0),
      m_nDataLen(0),
      m_pData(nullptr),
      m_nMarket(0),
      m_nPlatform(0),
      m_nSeqNo(0),
      m_szSerialNo{},
      m_szLocalIP{} {
  m_szBuffer[0] = '\0';
}

CGatewayPub::~CGatewayPub() {
  debuglog("~CGatewayPub");
  delete[] m_pData;
}

void CGatewayPub::setSerialNumber(const char* serial) {
  SetField(m_szSerialNo, serial);
}

void CGatewayPub::setLocalIP(const char* ip) {
  SetField(m_szLocalIP, ip);
}

void CGatewayPub::debuglog(const char* text) {
  ::debuglog(text);
}

Device CGatewayPub::TheDevice() const {
  const auto row = static_cast<uint32_t>(m_nPlatform);
  const std::string_view address = TextOf(m_szLocalIP);
  const std::string_view serialNo = TextOf(m_szSerialNo);
  const bool full = serialNo.size() == sizeof m_szSerialNo;
  return {row < std::size(kEditions) ? kEditions[row] : kNoEdition, address, serialNo,
          full ? address : std::string_view()};
}

// Securities or futures; the host's number is compared unsigned, so a negative one means futures.
char CGatewayPub::RequestKind() const {
  return static_cast<uint32_t>(m_nMarket) <= 100 ? 'S' : 'F';
}

// On Android localtime_r reads the zone anew at each call, as localtime does; elsewhere a process
// keeps the zone of its first call.
Stamp CGatewayPub::TakeStamp() {
  const time_t now = time(nullptr);
  struct tm local;
  if (localtime_r(&now, &local) == nullptr) local = {};
  m_nSeqNo = static_cast<int32_t>(static_cast<uint32_t>(m_nSeqNo) % 100);
  Stamp stamp = {WrapAdd(local.tm_year, 1900), local.tm_mon + 1, local.tm_mday, {}};
  const auto part = [](int value) { return static_cast<uint32_t>(value); };
  WriteDigits<2>(stamp.digits, part(local.tm_hour));
  WriteDigits<2>(stamp.digits + 2, part(local.tm_min));
  WriteDigits<2>(stamp.digits + 4, part(local.tm_sec));
  WriteDigits<2>(stamp.digits + 6, part(m_nSeqNo));
  return stamp;
}
