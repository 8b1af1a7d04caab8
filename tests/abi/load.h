#ifndef TESTS_ABI_LOAD_H_
#define TESTS_ABI_LOAD_H_

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "tests/support/recording_host.h"

namespace gateway_tests {

// Numbers that look drawn and are the same on every machine and in every C++ library (splitmix64).
class CDraw {
 public:
  explicit CDraw(uint64_t seed) : m_nState(seed) {}

  uint64_t Next();
  // A number below `bound`, which is not 0.
  size_t Below(size_t bound) { return static_cast<size_t>(Next() % bound); }

 private:
  uint64_t m_nState;
};

// `arguments`, which are those of a sensible call, with a few of them changed: numbers at their
// bounds, texts cut, repeated, spliced and with the words and numbers of the wire in odd places.
Arguments Disturb(Arguments arguments, CDraw& draw);

}  // namespace gateway_tests

#endif  // TESTS_ABI_LOAD_H_
