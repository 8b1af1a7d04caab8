#ifndef TESTS_SUPPORT_GOLDEN_ANSWER_H_
#define TESTS_SUPPORT_GOLDEN_ANSWER_H_

#include <string>
#include <string_view>

#include "tests/support/golden_file.h"
#include "tests/support/recording_host.h"

namespace gateway_tests {

// Where two texts differ first, in the words of what they are: the tag of a request, the record and
// column of a result (columns count from 0), else the place in the text; with what was wanted there
// and what came. Empty when they are the same.
std::string TellDifference(std::string_view wanted, std::string_view got);

// The first thing in which a call did not do what the golden case wants; empty when it did all.
// `platform` is the name of the platform row that the case passes.
std::string TellDifference(const GoldenCase& golden, const Outcome& outcome,
                           const std::string& platform);

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_GOLDEN_ANSWER_H_
