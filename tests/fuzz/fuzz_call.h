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

// What a target calls: rows by number.
struct Rows {
  const gateway_tests::Export* rows;
  size_t count;
};

// The rows of the target that is linked into this program.
Rows FuzzRows();

// One Java argument: a text, or null, for 'S', a number for 'i', 'b' and 'c'. A call owns no text:
// it lies in the input, or where the mutator made it. Nothing is allocated for an execution.
struct FuzzArgument {
  char letter;
  bool null;
  int64_t number;
  std::string_view text;
};

struct FuzzCall {
  static constexpr size_t kMaxArguments = 31;

  size_t row = 0;
  uint8_t moment = 0;
  size_t argumentCount = 0;
  FuzzArgument arguments[kMaxArguments];

  void Add(const FuzzArgument& argument) { arguments[argumentCount++] = argument; }
  const FuzzArgument* begin() const { return arguments; }
  const FuzzArgument* end() const { return arguments + argumentCount; }

  // The time that moment stands for: hours and minutes of all kinds, 1970 to 2045.
  int64_t Clock() const;
};

FuzzCall ReadCall(const Rows& rows, const uint8_t* data, size_t size);

// Writes the bytes that ReadCall makes the same call of, as many as there is room for.
size_t WriteCall(const FuzzCall& call, uint8_t* data, size_t maxSize);

// Gives the call the arguments that its row takes, made of those it has: texts stay texts, in
// their order, and so do numbers.
void FitArguments(const Rows& rows, FuzzCall& call);

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_FUZZ_CALL_H_
