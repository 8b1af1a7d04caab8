#ifndef TESTS_SUPPORT_GOLDEN_WRITER_H_
#define TESTS_SUPPORT_GOLDEN_WRITER_H_

#include <string>
#include <vector>

#include "tests/support/golden_file.h"

namespace gateway_tests {

// Which cases of a file are written anew: those that do not hold, or those that do, whose form
// alone can change then.
enum class Rewrite { kWrongCases, kGoodCases };

// The text of a golden file with what the library answers to its cases. `cases` are those of the
// file, in order. Lines other than status, result and log stay as they are, and so do all lines of
// the other cases.
std::string WithAnswers(const std::string& text, const std::vector<GoldenCase>& cases,
                        Rewrite which);

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_GOLDEN_WRITER_H_
