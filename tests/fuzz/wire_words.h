// What replies and arguments are made of: the words that the mutator writes, and the dictionary.
#ifndef TESTS_FUZZ_WIRE_WORDS_H_
#define TESTS_FUZZ_WIRE_WORDS_H_

#include <cstddef>
#include <cstdint>

namespace gateway_fuzz {

// Tags of replies, near misses among them.
inline constexpr const char* kTags[] = {
#include "tests/fuzz/wire_tags.inc"
    // What stands around records, what requests carry, and near misses.
    "00", "01", "M22", "10", "11", "13", "14", "15", "0", "6", "M", "7511", ""};

// The size of the buffer that a tag's value must fit; decoders differ.
struct TagBound {
  const char* tag;
  size_t bound;
};
inline constexpr TagBound kTagBounds[] = {
#include "tests/fuzz/wire_bounds.inc"
};

// Values of fields, and texts that a host passes.
inline constexpr const char* kValues[] = {"",
                                          " ",
                                          "  ",
                                          "0",
                                          "1",
                                          "2",
                                          "3",
                                          "4",
                                          "5",
                                          "6",
                                          "7",
                                          "8",
                                          "9",
                                          "00",
                                          "0000",
                                          "5001",
                                          "0001",
                                          "900000",
                                          "900001",
                                          "899999",
                                          "-1",
                                          "-",
                                          "+5",
                                          " 12",
                                          "12.5",
                                          ".5",
                                          "-0.05",
                                          "1234567.891",
                                          "00012",
                                          "2147483647",
                                          "2147483648",
                                          "-2147483648",
                                          "9223372036854775807",
                                          "99999999999999999999",
                                          "1130115",
                                          "990115",
                                          "20240115",
                                          "20240230",
                                          "134521",
                                          "B",
                                          "S",
                                          "A",
                                          "I",
                                          "D",
                                          "C",
                                          "P",
                                          "F",
                                          "O",
                                          "X",
                                          "Y",
                                          "N",
                                          "R",
                                          "2330",
                                          "TXFA4",
                                          "TXO18000A4",
                                          "202401",
                                          "202401W1",
                                          "TWD",
                                          "9A00",
                                          "12.",
                                          "A123456789&1234567",
                                          "1234567&",
                                          "X&A123456789",
                                          "&",
                                          "A123456789",
                                          "10.0.0.1",
                                          "SN0001",
                                          "secret",
                                          "[GATEWAY]",
                                          "[BROKER]",
                                          "[CERT]",
                                          "[GATEWAY]error",
                                          "[BROKER]timeout",
                                          "[BROKER]time",
                                          "a b",
                                          "\xe8\xad\x89\xe5\x88\xb8"};

// Lengths just below, at and above the sizes of the buffers that bound values and requests.
inline constexpr size_t kLengths[] = {
    1,   2,   3,   7,   8,   9,   10,  11,  15,  16,   17,   19,   20,   21,   39,  40,
    41,  63,  64,  65,  127, 128, 129, 199, 200, 201,  217,  218,  255,  256,  299, 300,
    399, 400, 401, 511, 512, 513, 767, 768, 769, 1023, 1024, 1025, 3800, 4095, 4096};

// Numbers that a host passes.
inline constexpr int64_t kNumbers[] = {
    0,   1,   2,   3,   4,    5,  6,  7,   8,    9,     10,         14,        15,
    16,  48,  49,  50,  66,   67, 68, 73,  83,   99,    100,        101,       127,
    128, 255, 256, 999, 1000, -1, -2, -50, -128, 32767, 2147483647, INT32_MIN, 12345678};

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_WIRE_WORDS_H_
