// Small sets of numbers: which kinds a rule allows, which rows of a table a value selects.
#ifndef QUORVANE_GATEWAY_CORE_NUMBER_SET_H_
#define QUORVANE_GATEWAY_CORE_NUMBER_SET_H_

#include <cstdint>

// A set of numbers from 0 to 30, or of all numbers there are.
struct NumberSet {
  uint32_t bits;

  static constexpr uint32_t kAll = 0xffffffff;

  constexpr bool Has(int number) const {
    return bits == kAll || (number >= 0 && number <= 30 && (bits >> number & 1) != 0);
  }
};

inline constexpr NumberSet kEveryNumber = {NumberSet::kAll};

template <class... Numbers>
constexpr NumberSet SetOf(Numbers... numbers) {
  return {(0U | ... | (1U << numbers))};
}

#endif  // QUORVANE_GATEWAY_CORE_NUMBER_SET_H_
