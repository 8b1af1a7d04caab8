// What goes out where the clock or the zone is odd: an order's date and times, and the key of a
// request.

#include <cstdlib>
#include <ctime>

#include "gateway/core/gateway_pub.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

class Clock : public CSessionTest {
 protected:
  void SetUp() override {
    CSessionTest::SetUp();
    m_gateway.setSerialNumber("SN0001");
    m_gateway.setLocalIP("10.0.0.1");
  }
  void TearDown() override { EnterMarketTimeZone(); }

  // Tags 21 to 23 of an order at this time.
  std::string Stamps(std::time_t when) {
    SetClock(when);
    const CRoomAtPageEnd out(CGatewayPub::kBufferSize, '\0');
    const CRoomAtPageEnd key(CGatewayPub::kBufferSize, '\0');
    m_gateway.m_nSeqNo = 7;
    EXPECT_EQ(m_gateway.initOrderHead('I', "9A00", "1234567", "pw", "", out, key), 1);
    const std::string order = static_cast<char*>(out);
    const size_t begin = order.find("|21="), end = order.find("|24=");
    if (begin == std::string::npos || end == std::string::npos) return order;
    return order.substr(begin, end - begin);
  }

  CGatewayPub m_gateway;
};

void EnterZone(const char* zone) {
  setenv("TZ", zone, 1);
  tzset();
}

constexpr std::time_t kMoment = 1705297521;  // 2024-01-15 05:45:21 in Greenwich

TEST_F(Clock, OfAnyYearIsSentAsItStands) {
  const struct {
    std::time_t when;
    const char* stamps;
  } rows[] = {
      {0, "|21=19700101|22=080000|23=08000007"},
      {-28801, "|21=19691231|22=235959|23=23595907"},
      {-14159025, "|21=19690721|22=105615|23=10561507"},
      {2147483647, "|21=20380119|22=111407|23=11140707"},
      {2147483648, "|21=20380119|22=111408|23=11140807"},
      {253402271999, "|21=99991231|22=235959|23=23595907"},
      // A year of five digits makes a date of nine.
      {253402272000, "|21=100000101|22=000000|23=00000007"},
      {-62135596800, "|21=00010101|22=080000|23=08000007"},
      {-62198755200, "|21=-0010101|22=080000|23=08000007"},
      // The last year that the C library tells wraps when 1900 is added; behind it there is no
      // date.
      {67768036191647999, "|21=-21474817491231|22=235959|23=23595907"},
      {INT64_MAX, "|21=19000100|22=000000|23=00000007"},
      {INT64_MIN, "|21=19000100|22=000000|23=00000007"},
  };
  for (const auto& row : rows) EXPECT_EQ(Stamps(row.when), row.stamps) << row.when;
}

TEST_F(Clock, OfAnyZoneIsSentAsItStands) {
  const struct {
    const char* zone;
    std::time_t when;
    const char* stamps;
  } rows[] = {
      {"UTC0", kMoment, "|21=20240115|22=054521|23=05452107"},
      {"<+14>-14", kMoment, "|21=20240115|22=194521|23=19452107"},
      {"<-12>12", kMoment, "|21=20240114|22=174521|23=17452107"},
      {"<+0545>-5:45", kMoment, "|21=20240115|22=113021|23=11302107"},
      {"<+00>0:00:01", kMoment, "|21=20240115|22=054520|23=05452007"},
      // An hour that summer time skips, and one that winter time tells twice.
      {"EST5EDT,M3.2.0,M11.1.0", 1710053999, "|21=20240310|22=015959|23=01595907"},
      {"EST5EDT,M3.2.0,M11.1.0", 1710054000, "|21=20240310|22=030000|23=03000007"},
      {"EST5EDT,M3.2.0,M11.1.0", 1730613600, "|21=20241103|22=010000|23=01000007"},
      {"EST5EDT,M3.2.0,M11.1.0", 1730610000, "|21=20241103|22=010000|23=01000007"},
      {"No/Such/Zone", kMoment, "|21=20240115|22=054521|23=05452107"},
      {"", kMoment, "|21=20240115|22=054521|23=05452107"},
  };
  for (const auto& row : rows) {
    EnterZone(row.zone);
    EXPECT_EQ(Stamps(row.when), row.stamps) << row.zone;
  }
}

// Calls after a change tell the new time, as soon as the C library has read the zone anew;
// Android's does at each call.
TEST_F(Clock, OfAZoneThatChangesIsThatOfTheLastReading) {
  EXPECT_EQ(Stamps(kMoment), "|21=20240115|22=134521|23=13452107");
  setenv("TZ", "UTC0", 1);
#ifdef __GLIBC__
  EXPECT_EQ(Stamps(kMoment), "|21=20240115|22=134521|23=13452107");
#endif
  tzset();
  EXPECT_EQ(Stamps(kMoment), "|21=20240115|22=054521|23=05452107");
}

}  // namespace
}  // namespace gateway_tests
