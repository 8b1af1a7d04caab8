// The user whose requests are measured, for the library and for what it is held against.
#ifndef QUORVANE_BENCH_SAMPLE_SESSION_H_
#define QUORVANE_BENCH_SAMPLE_SESSION_H_

namespace bench {

struct Session {
  int market, platform, sequence;
  const char* serialNo;
  const char* localIP;
};

inline constexpr Session kSession = {0, 0, 7, "A1B2C3D4E5F60718", "192.168.100.123"};

inline constexpr char kBranch[] = "9A00";
inline constexpr char kIdentity[] = "A123456789&1234567";
inline constexpr char kPassword[] = "s3cretpw";
inline constexpr char kStockCode[] = "2330";
inline constexpr char kOrderDate[] = "1130115";
inline constexpr char kReference[] = "20240115-100123&A0012345";

}  // namespace bench

#endif  // QUORVANE_BENCH_SAMPLE_SESSION_H_
