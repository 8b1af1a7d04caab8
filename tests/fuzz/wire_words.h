// What replies and arguments are made of: the words that the mutator writes, and the dictionary.
#ifndef TESTS_FUZZ_WIRE_WORDS_H_
#define TESTS_FUZZ_WIRE_WORDS_H_

#include <cstddef>
#include <cstdint>

namespace gateway_fuzz {

// Tags of replies, near misses among them.
inline constexpr const char* kTags[] = {
    "00", "01", "67",  "68",  "M2",  "M3",  "M5",  "M8",  "M22",  "07", "10", "11", "13",
    "14", "15", "16",  "17",  "18",  "19",  "21",  "22",  "27",   "28", "29", "31", "32",
    "33", "34", "36",  "37",  "39",  "41",  "44",  "46",  "47",   "48", "49", "50", "51",
    "69", "70", "75",  "76",  "77",  "78",  "79",  "81",  "82",   "84", "85", "86", "87",
    "88", "89", "96",  "97",  "A0",  "A1",  "A2",  "B8",  "B9",   "EL", "F0", "F1", "F2",
    "F3", "JV", "K1",  "KT",  "LO",  "MT",  "N6",  "O4",  "PN",   "PS", "QX", "QY", "R8",
    "RA", "RF", "U5",  "U9",  "V5",  "V8",  "V9",  "W0",  "W1",   "W2", "W3", "W5", "0",
    "6",  "M",  "751", "752", "761", "762", "771", "772", "7511", ""};

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
