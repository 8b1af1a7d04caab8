#ifndef TESTS_FUZZ_COVERAGE_MAP_H_
#define TESTS_FUZZ_COVERAGE_MAP_H_

#include <cstddef>
#include <cstdint>

// The counters that the compiler puts at each turn of the code under test. Without them, in a build
// of another kind, nothing is ever new.

namespace gateway_fuzz {

// Whether the code was passed, since the last call, at a place or as often as never before; the
// counters are zero afterwards.
bool TakeCoverage();

// How many places there are.
size_t CountedPlaces();

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_COVERAGE_MAP_H_
