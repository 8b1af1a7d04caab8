// The numbers under which the user interface knows the sides of a leg: buying has an odd one,
// selling the even one behind it, and tag W3 chooses the pair.
#ifndef QUORVANE_GATEWAY_FUTURES_LEG_CODE_H_
#define QUORVANE_GATEWAY_FUTURES_LEG_CODE_H_

#include <string_view>

struct LegPair {
  std::string_view w3;
  int buying;
  bool forOptions;
};

inline constexpr LegPair kLegPairs[] = {
    {"", 51, true}, {"0", 53, true}, {"1", 55, true}, {"2", 57, false}};

inline constexpr const LegPair& kUsualLegPair = kLegPairs[0];

// The pair of exactly this W3, or null.
inline const LegPair* FindLegPair(std::string_view w3) {
  for (const LegPair& pair : kLegPairs) {
    if (pair.w3 == w3) return &pair;
  }
  return nullptr;
}

// What a side adds to the buying number; -1 for a text that is no side.
inline constexpr int kNoSide = -1;
inline int SideOffset(std::string_view side) {
  if (side == "B") return 0;
  return side == "S" ? 1 : kNoSide;
}

// Whether a value is empty or a single blank.
inline bool IsBlank(std::string_view value) {
  return value.empty() || value == " ";
}

#endif  // QUORVANE_GATEWAY_FUTURES_LEG_CODE_H_
