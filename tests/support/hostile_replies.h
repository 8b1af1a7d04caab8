#ifndef TESTS_SUPPORT_HOSTILE_REPLIES_H_
#define TESTS_SUPPORT_HOSTILE_REPLIES_H_

#include <cstddef>
#include <ostream>
#include <string>
#include <string_view>

namespace gateway_tests {

// Replies of any length that are made to take a reader long: a head, then the same again and
// again.
struct HostilePattern {
  const char* name;
  const char* head;
  const char* repeated;
};

inline void PrintTo(const HostilePattern& reply, std::ostream* out) {
  *out << reply.name;
}

inline constexpr HostilePattern kHostileReplies[] = {
    {"NoMarkers", "|68=0000", "x"},
    {"NoMarkersAtAll", "", "x"},
    {"OnlyBars", "|68=0000", "|"},
    {"OnlyBeginMarks", "|68=0000", "|00="},
    {"OnlyEndMarks", "|68=0000", "|01="},
    {"WrongOrder", "|68=0000", "|01=|00="},
    {"EndMarksBeforeOneBegin", "|68=0000|00=1|68=0000", "|01="},
    {"OneEndlessField", "|68=0000|M2=", "y"},
    {"EndlessCode", "|68=", "0"},
    {"EndlessRefusal", "|68=0001|M2=", "y"},
    {"EmptyRecords", "|68=0000", "|00=|01="},
    {"SmallRecords", "|68=0000", "|00=1|68=0000|01="},
    {"BlankValues", "|68=0000|00=1|68=0000", "|17= |18="},
    {"AlmostCodes", "", "|68"},
    {"AlmostMarkers", "|68=0000", "[GATEWAY]erro[BROKER]timeou"},
    {"EndlessDigits", "|68=0000|00=1|67=", "9"},
    {"NoData", "|68=5001", "|00=1|68=5001|M2=none|01="},
};

// The reply with as many repeats as fit `length` characters.
inline std::string MakeReply(const HostilePattern& hostile, size_t length) {
  std::string reply = hostile.head;
  const std::string_view repeated = hostile.repeated;
  reply.reserve(reply.size() + length);
  for (size_t size = repeated.size(); size <= length; size += repeated.size()) reply += repeated;
  return reply;
}

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_HOSTILE_REPLIES_H_
