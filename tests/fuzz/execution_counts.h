#ifndef TESTS_FUZZ_EXECUTION_COUNTS_H_
#define TESTS_FUZZ_EXECUTION_COUNTS_H_

#include <cstddef>
#include <cstdint>

#include "tests/fuzz/fuzz_call.h"

// How often each row was executed, by this process and by all others that share the file named by
// the environment variable QUORVANE_FUZZ_COUNTS: fuzzing workers come and go.

namespace gateway_fuzz {

// Opens the counts; without the variable they are this process's own.
void OpenCounts();

void CountExecution(size_t row);

// Prints one line for each row and one for all; false when some row was never executed.
bool PrintCounts(const Rows& rows);

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_EXECUTION_COUNTS_H_
