// The session object's life and its setters.
#include <ctime>
#include <iterator>

#include "gateway/core/gateway_pub.h"
#include "gateway/core/log.h"

namespace {

// A client edition; kEditions goes by the host's platform number.
struct Edition {
  char name[PaddedText::kReadable];
  size_t size;
};

template <size_t kSize>
constexpr Edition Named(const char (&name)[kSize]) {
  Edition edition = {{}, kSize - 1};
  for (size_t i = 0; i < kSize; ++i) edition.name[i] = name[i];
  return edition;
}

constexpr Edition kNoEdition = Named("NO DEFINE");

constexpr Edition kEditions[] = {
    kNoEdition,       kNoEdition,        kNoEdition,        kNoEdition,       kNoEdition,
    Named("QVPHONE"), kNoEdition,        Named("QVTAB"),    kNoEdition,       Named("QVLITE"),
    Named("QVPRO"),   Named("QVFUTURE"), Named("QVOPTION"), Named("QVWATCH"), Named("QVPRO")};

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

std::string_view CGatewayPub::LocalIP() const {
  return TextOf(m_szLocalIP);
}

// A full serial number has no terminator, so the gateway knows it with the address run onto it.
PaddedText CGatewayPub::SerialNo(std::string_view address, SerialScratch& scratch) const {
  const std::string_view own = TextOf(m_szSerialNo);
  if (own.size() < sizeof m_szSerialNo) return {own};
  memcpy(scratch, m_szSerialNo, sizeof m_szSerialNo);
  memcpy(scratch + sizeof m_szSerialNo, address.data(), address.size());
  return {{scratch, sizeof m_szSerialNo + address.size()}};
}

PaddedText CGatewayPub::PlatformName() const {
  const auto row = static_cast<uint32_t>(m_nPlatform);
  const Edition& edition = row < std::size(kEditions) ? kEditions[row] : kNoEdition;
  return {{edition.name, edition.size}};
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
