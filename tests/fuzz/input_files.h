#ifndef TESTS_FUZZ_INPUT_FILES_H_
#define TESTS_FUZZ_INPUT_FILES_H_

#include <cstdint>
#include <vector>

namespace gateway_fuzz {

using Bytes = std::vector<uint8_t>;

// Appends the file, or each file of the folder, to `inputs`; false, and a word on stderr, where one
// cannot be read.
bool ReadInputs(const char* path, std::vector<Bytes>& inputs);

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_INPUT_FILES_H_
