// The session object: its fields, its setters, its log.

#include "tests/unit/session.h"

#include <cstring>
#include <type_traits>

#include "gateway/core/gateway_pub.h"
#include "gateway/core/log.h"

namespace gateway_tests {
namespace {

using SessionObject = CSessionTest;

// A host that knows the object by its layout finds each field where it expects it.
TEST_F(SessionObject, FieldsStandInTheirOrder) {
  CGatewayPub gateway;
  const auto place = [&gateway](const void* field) {
    return static_cast<const char*>(field) - reinterpret_cast<const char*>(&gateway);
  };
  const auto pointer = static_cast<std::ptrdiff_t>(sizeof(void*));
  const std::ptrdiff_t first = place(&gateway.m_nDataSize);
  EXPECT_EQ(first, pointer);
  EXPECT_EQ(place(&gateway.m_nDataLen), first + 4);
  EXPECT_EQ(place(gateway.m_szBuffer), first + 8);
  EXPECT_EQ(place(&gateway.m_pData), first + 8 + 4096);
  EXPECT_EQ(place(&gateway.m_nMarket), first + 8 + 4096 + pointer);
  EXPECT_EQ(place(&gateway.m_nPlatform), place(&gateway.m_nMarket) + 4);
  EXPECT_EQ(place(&gateway.m_nSeqNo), place(&gateway.m_nMarket) + 8);
  EXPECT_EQ(place(gateway.m_szSerialNo), place(&gateway.m_nMarket) + 12);
  EXPECT_EQ(place(gateway.m_szLocalIP), place(gateway.m_szSerialNo) + 20);
  EXPECT_EQ(sizeof gateway.m_szBuffer, 4096U);
  EXPECT_EQ(sizeof gateway.m_szSerialNo, 20U);
  EXPECT_EQ(sizeof gateway.m_szLocalIP, 64U);
  const std::ptrdiff_t end = place(gateway.m_szLocalIP) + 64;
  EXPECT_EQ(sizeof gateway, static_cast<size_t>((end + pointer - 1) / pointer * pointer))
      << "nothing stands behind the address";
}

TEST_F(SessionObject, HasAVirtualDestructorAndIsNotCopied) {
  EXPECT_TRUE(std::has_virtual_destructor_v<CGatewayPub>);
  EXPECT_FALSE(std::is_copy_constructible_v<CGatewayPub>);
  EXPECT_FALSE(std::is_copy_assignable_v<CGatewayPub>);
}

TEST_F(SessionObject, StartsZeroedAndLogsNothing) {
  alignas(CGatewayPub) char memory[sizeof(CGatewayPub)];
  memset(memory, 0x5a, sizeof memory);
  auto* gateway = new (memory) CGatewayPub;
  EXPECT_EQ(gateway->m_nDataSize, 0);
  EXPECT_EQ(gateway->m_nDataLen, 0);
  EXPECT_EQ(gateway->m_pData, nullptr);
  EXPECT_EQ(gateway->m_nMarket, 0);
  EXPECT_EQ(gateway->m_nPlatform, 0);
  EXPECT_EQ(gateway->m_nSeqNo, 0);
  EXPECT_EQ(std::string(gateway->m_szSerialNo, 20), std::string(20, '\0'));
  EXPECT_EQ(std::string(gateway->m_szLocalIP, 64), std::string(64, '\0'));
  EXPECT_EQ(m_log.Take(), Lines{});
  gateway->~CGatewayPub();
  EXPECT_EQ(m_log.Take(), Lines{"~CGatewayPub"});
}

TEST_F(SessionObject, BothLogFunctionsWriteTheSameLine) {
  CGatewayPub gateway;
  gateway.debuglog("member");
  debuglog("free");
  debuglog("");
  gateway.debuglog("");
  EXPECT_EQ(m_log.Take(), (Lines{"member", "free", "", ""}));
}

TEST_F(SessionObject, NullTextIsLoggedAsAnEmptyLine) {
  CGatewayPub gateway;
  gateway.debuglog(nullptr);
  debuglog(nullptr);
  EXPECT_EQ(m_log.Take(), (Lines{"", ""}));
}

struct FieldCase {
  size_t given;  // length of the text
  size_t kept;   // characters in the field
};

constexpr FieldCase kSerialCases[] = {{0, 0}, {1, 1}, {19, 19}, {20, 20}, {21, 20}, {4096, 20}};
constexpr FieldCase kAddressCases[] = {{0, 0}, {1, 1}, {63, 63}, {64, 64}, {65, 64}, {4096, 64}};

TEST_F(SessionObject, SerialNumberKeepsUpTo20CharactersAndNothingBesideItsField) {
  for (const FieldCase& row : kSerialCases) {
    CGatewayPub gateway;
    gateway.setLocalIP("10.0.0.1");
    gateway.setSerialNumber(CTextAtPageEnd(std::string(row.given, 'x')));
    EXPECT_EQ(std::string(gateway.m_szSerialNo, strnlen(gateway.m_szSerialNo, 20)),
              std::string(row.kept, 'x'))
        << row.given;
    EXPECT_STREQ(gateway.m_szLocalIP, "10.0.0.1") << row.given;
    EXPECT_EQ(gateway.m_nSeqNo, 0) << row.given;
  }
}

TEST_F(SessionObject, LocalAddressKeepsUpTo64CharactersAndNothingBesideItsField) {
  for (const FieldCase& row : kAddressCases) {
    struct {
      CGatewayPub gateway;
      char behind[8] = "untold!";
    } host;
    host.gateway.setSerialNumber("SN0001");
    host.gateway.setLocalIP(CTextAtPageEnd(std::string(row.given, '1')));
    EXPECT_EQ(std::string(host.gateway.m_szLocalIP, strnlen(host.gateway.m_szLocalIP, 64)),
              std::string(row.kept, '1'))
        << row.given;
    EXPECT_STREQ(host.gateway.m_szSerialNo, "SN0001") << row.given;
    EXPECT_STREQ(host.behind, "untold!") << row.given;
  }
}

TEST_F(SessionObject, NullClearsTheWholeField) {
  CGatewayPub gateway;
  gateway.setSerialNumber("12345678901234567890");
  gateway.setLocalIP("10.0.0.1");
  gateway.setSerialNumber(nullptr);
  EXPECT_EQ(std::string(gateway.m_szSerialNo, 20), std::string(20, '\0'));
  EXPECT_STREQ(gateway.m_szLocalIP, "10.0.0.1");
  gateway.setLocalIP(nullptr);
  EXPECT_EQ(std::string(gateway.m_szLocalIP, 64), std::string(64, '\0'));
}

TEST_F(SessionObject, ShorterTextReplacesALongerOne) {
  CGatewayPub gateway;
  gateway.setSerialNumber("12345678901234567890");
  gateway.setSerialNumber("AB");
  EXPECT_STREQ(gateway.m_szSerialNo, "AB");
  gateway.setLocalIP("2001:db8::1");
  gateway.setLocalIP("::1");
  EXPECT_STREQ(gateway.m_szLocalIP, "::1");
}

// A caller in C++ may fill the fields itself; they alone say what is sent.
TEST_F(SessionObject, HeadersSendWhatTheFieldsHold) {
  const struct {
    const char* serial;
    const char* address;
    std::string sent;  // as tag SN
  } rows[] = {{"AB", "::1", "AB"},
              {"1234567890123456789", "10.0.0.1", "1234567890123456789"},
              {"12345678901234567890", "10.0.0.1", "1234567890123456789010.0.0.1"}};
  CGatewayPub gateway;
  gateway.setSerialNumber("from the setter");
  gateway.setLocalIP("from the setter");
  for (const auto& row : rows) {
    const std::string serial = row.serial, address = row.address;
    memset(gateway.m_szSerialNo, 0, sizeof gateway.m_szSerialNo);
    memset(gateway.m_szLocalIP, 0, sizeof gateway.m_szLocalIP);
    serial.copy(gateway.m_szSerialNo, sizeof gateway.m_szSerialNo);
    address.copy(gateway.m_szLocalIP, sizeof gateway.m_szLocalIP);
    char query[CGatewayPub::kBufferSize] = "";
    EXPECT_EQ(gateway.initQueryHead("9A00", "", "pw", query), 1);
    EXPECT_NE(std::string(query).find("|SN=" + row.sent + "|"), std::string::npos) << query;
    EXPECT_NE(std::string(query).find(std::string("|IP=") + row.address + "|"), std::string::npos);
    char order[CGatewayPub::kBufferSize] = "";
    char key[CGatewayPub::kBufferSize] = "";
    EXPECT_EQ(gateway.initOrderHead1('I', "9A00", "1234567", "pw", "", order, key), 1);
    EXPECT_NE(std::string(order).find("|SN=" + row.sent + "|"), std::string::npos) << order;
    EXPECT_EQ(std::string(key).rfind(row.sent + "," + row.address + ",", 0), 0U) << key;
  }
  gateway.m_szLocalIP[0] = '\0';
  char query[CGatewayPub::kBufferSize] = "";
  EXPECT_EQ(gateway.initQueryHead("9A00", "", "pw", query), 0) << "no address";
}

// A full serial number goes on into the address; a full address ends with its field.
TEST_F(SessionObject, FullFieldsEndWhereTheyEnd) {
  struct {
    CGatewayPub gateway;
    char behind[8] = "untold!";
  } host;
  const std::string serial(20, 's'), address(64, 'a');
  memcpy(host.gateway.m_szSerialNo, serial.data(), serial.size());
  memcpy(host.gateway.m_szLocalIP, address.data(), address.size());
  char query[CGatewayPub::kBufferSize] = "";
  EXPECT_EQ(host.gateway.initQueryHead("9A00", "", "pw", query), 1);
  EXPECT_NE(std::string(query).find("|IP=" + address + "|"), std::string::npos) << query;
  EXPECT_NE(std::string(query).find("|SN=" + serial + address + "|"), std::string::npos) << query;
}

}  // namespace
}  // namespace gateway_tests
