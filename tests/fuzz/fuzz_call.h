#ifndef TESTS_FUZZ_FUZZ_CALL_H_
#define TESTS_FUZZ_FUZZ_CALL_H_

#include <cstddef>
#include <cstdint>
#include <string>

#include "tests/support/call_table.h"
#include "tests/support/recording_host.h"

// An input of a fuzz target is a call, as bytes:
//
//   row      1 byte, modulo the number of rows that the target has
//   moment   1 byte, chooses where the clock stands
//   one argument for each letter of the row's shape, the status array left out:
//     i      4 bytes, lowest first
//     c      2 bytes, lowest first
//     b      1 byte
//     S      the characters up to a zero byte; the one character ff alone is the null string
//
// Where the bytes end early, numbers are 0 and texts end. So every sequence of bytes is a call, and
// a text is found by the fuzzer's own mutations too.

namespace gateway_fuzz {

/// What a target calls: rows by number.
struct TRows {
  const gateway_tests::TExport* m_pRows;
  size_t m_nCount;
};

/// The rows of the target that is linked into this program.
TRows FuzzRows();

struct TFuzzCall {
  size_t m_nRow = 0;
  uint8_t m_nMoment = 0;
  gateway_tests::TArguments m_Arguments;

  /// The time that m_nMoment stands for: hours and minutes of all kinds, 1970 to 2045.
  int64_t Clock() const;
};

TFuzzCall ReadCall(const TRows& rows, const uint8_t* data, size_t size);

/// ReadCall of these bytes gives the same call.
std::string WriteCall(const TFuzzCall& call);

/// Gives the call the arguments that its row takes, made of those it has: texts stay texts, in
/// their order, and so do numbers.
void FitArguments(const TRows& rows, TFuzzCall& call);

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_FUZZ_CALL_H_
