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

// Keeps at most as many characters as the field has; one that they fill has no terminator.
template <size_t kSize>
size_t SetField(char (&field)[kSize], const char* text) {
  memset(field, 0, kSize);
  const size_t size = text == nullptr ? 0 : strnlen(text, kSize);
  CopyShort(field, text, size);
  return size;
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
  m_nSerialNoLen = SetField(m_szSerialNo, serial);
}

void CGatewayPub::setLocalIP(const char* ip) {
  m_nLocalIPLen = SetField(m_szLocalIP, ip);
}

void CGatewayPub::debuglog(const char* text) {
  ::debuglog(text);
}

std::string_view CGatewayPub::LocalIP() const {
  return {m_szLocalIP, m_nLocalIPLen};
}

// A full serial number has no terminator, so the gateway knows it with the address run onto it.
std::string_view CGatewayPub::SerialNo(std::string_view address, SerialScratch& scratch) const {
  if (m_nSerialNoLen < sizeof m_szSerialNo) return {m_szSerialNo, m_nSerialNoLen};
  memcpy(scratch, m_szSerialNo, sizeof m_szSerialNo);
  memcpy(scratch + sizeof m_szSerialNo, address.data(), address.size());
  return {scratch, sizeof m_szSerialNo + address.size()};
}

std::string_view CGatewayPub::PlatformName() const {
  const auto row = static_cast<uint32_t>(m_nPlatform);
  return row < std::size(kPlatformNames) ? kPlatformNames[row] : kNoEdition;
}

// Securities or futures; the host's number is compared unsigned, so a negative one means futures.
char CGatewayPub::RequestKind() const {
  return static_cast<uint32_t>(m_nMarket) <= 100 ? 'S' : 'F';
}

void CGatewayPub::TakeStamp(Stamp& stamp) {
  const time_t now = time(nullptr);
  struct tm local;
  if (localtime_r(&now, &local) == nullptr) local = {};
  const uint32_t sequence = static_cast<uint32_t>(m_nSeqNo) % 100;
  m_nSeqNo = static_cast<int32_t>(sequence);
  const auto clock =
      static_cast<uint32_t>(local.tm_hour * 10000 + local.tm_min * 100 + local.tm_sec);
  stamp.year = WrapAdd(local.tm_year, 1900);
  stamp.month = local.tm_mon + 1;
  stamp.day = local.tm_mday;
  WriteEightDigits(stamp.requestId.chars, clock * 100 + sequence);
}
