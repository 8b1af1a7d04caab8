#ifndef TESTS_FUZZ_FUZZ_CALL_H_
#define TESTS_FUZZ_FUZZ_CALL_H_

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "tests/support/call_table.h"

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

/// One Java argument: a text, or null, for 'S', a number for 'i', 'b' and 'c'. A call owns no text:
/// it lies in the input, or where the mutator made it. Nothing is allocated for an execution.
struct TFuzzArgument {
  char m_chLetter;
  bool m_bNull;
  int64_t m_nNumber;
  std::string_view m_Text;
};

struct TFuzzCall {
  static constexpr size_t kMaxArguments = 31;

  size_t m_nRow = 0;
  uint8_t m_nMoment = 0;
  size_t m_nArguments = 0;
  TFuzzArgument m_Arguments[kMaxArguments];

  void Add(const TFuzzArgument& argument) { m_Arguments[m_nArguments++] = argument; }
  const TFuzzArgument* begin() const { return m_Arguments; }
  const TFuzzArgument* end() const { return m_Arguments + m_nArguments; }

  /// The time that m_nMoment stands for: hours and minutes of all kinds, 1970 to 2045.
  int64_t Clock() const;
};

TFuzzCall ReadCall(const TRows& rows, const uint8_t* data, size_t size);

/// Writes the bytes that ReadCall makes the same call of, as many as there is room for.
size_t WriteCall(const TFuzzCall& call, uint8_t* data, size_t maxSize);

/// Gives the call the arguments that its row takes, made of those it has: texts stay texts, in
/// their order, and so do numbers.
void FitArguments(const TRows& rows, TFuzzCall& call);

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_FUZZ_CALL_H_
