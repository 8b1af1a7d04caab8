// The session object's life and its setters.
#include <ctime>
#include <iterator>

#include "gateway/core/gateway_pub.h"
#include "gateway/core/log.h"

namespace {

constexpr std::string_view kNoEdition = "NO DEFINE";

// The client editions, by the host's platform number.
constexpr std::string_view kPlatformNames[] = {
    kNoEdition, kNoEdition, kNoEdition, kNoEdition, kNoEdition, "QVPHONE", kNoEdition, "QVTAB",
    kNoEdition, "QVLITE",   "QVPRO",    "QVFUTURE", "QVOPTION", "QVWATCH", "QVPRO"};

// Keeps at most `size` characters; a field that they fill has no terminator.
void SetField(char* field, size_t size, const char* text) {
  memset(field, 0, size);
  if (text != nullptr) memcpy(field, text, strnlen(text, size));
}

}  // namespace

CGatewayPub::CGatewayPub()
    : m_nDataSize(0), m_nDataLen(0), m_pData(nullptr), m_nMarket(0), m_nPlatform(0), m_nSeqNo(0) {
  m_szBuffer[0] = '\0';
  setSerialNumber(nullptr);
  setLocalIP(nullptr);
}

CGatewayPub::~CGatewayPub() {
  debuglog("~CGatewayPub");
  delete[] m_pData;
}

void CGatewayPub::setSerialNumber(const char* serial) {
  SetField(m_szSerialNo, sizeof m_szSerialNo, serial);
}

void CGatewayPub::setLocalIP(const char* ip) {
  SetField(m_szLocalIP, sizeof m_szLocalIP, ip);
}

void CGatewayPub::debuglog(const char* text) {
  ::debuglog(text);
}

std::string_view CGatewayPub::LocalIP() const {
  return {m_szLocalIP, strnlen(m_szLocalIP, sizeof m_szLocalIP)};
}

// A full serial number has no terminator, so the gateway knows it with the address run onto it.
std::string_view CGatewayPub::SerialNo(SerialScratch& scratch) const {
  const size_t size = strnlen(m_szSerialNo, sizeof m_szSerialNo);
  if (size < sizeof m_szSerialNo) return {m_szSerialNo, size};
  const std::string_view address = LocalIP();
  memcpy(scratch, m_szSerialNo, size);
  memcpy(scratch + size, address.data(), address.size());
  return {scratch, size + address.size()};
}

std::string_view CGatewayPub::PlatformName() const {
  const auto row = static_cast<uint32_t>(m_nPlatform);
  return row < std::size(kPlatformNames) ? kPlatformNames[row] : kNoEdition;
}

// Securities or futures; the host's number is compared unsigned, so a negative one means futures.
std::string_view CGatewayPub::RequestKind() const {
  return static_cast<uint32_t>(m_nMarket) <= 100 ? "S" : "F";
}

CGatewayPub::Stamp CGatewayPub::TakeStamp() {
  const time_t now = time(nullptr);
  struct tm local = {};
  localtime_r(&now, &local);
  const uint32_t sequence = static_cast<uint32_t>(m_nSeqNo) % 100;
  m_nSeqNo = static_cast<int32_t>(sequence);
  const auto clock =
      static_cast<uint32_t>(local.tm_hour * 10000 + local.tm_min * 100 + local.tm_sec);
  return {local.tm_year + 1900,
          local.tm_mon + 1,
          local.tm_mday,
          local.tm_hour,
          local.tm_min,
          local.tm_sec,
          static_cast<int>((clock * 100 + sequence) % 100000000)};
}
