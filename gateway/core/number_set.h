// Small sets of numbers: which kinds a rule allows, which rows of a table a value selects.
#ifndef QUORVANE_GATEWAY_CORE_NUMBER_SET_H_
#define QUORVANE_GATEWAY_CORE_NUMBER_SET_H_

#include <cstdint>

// A set of numbers from 0 to 31.
struct NumberSet {
  uint32_t bits;

  constexpr bool Has(int number) const {
    return number >= 0 && number < 32 && (bits >> number & 1) != 0;
  }
};

template <class... Numbers>
constexpr NumberSet SetOf(Numbers... numbers) {
  return {(0U | ... | (1U << numbers))};
}

#endif  // QUORVANE_GATEWAY_CORE_NUMBER_SET_H_
