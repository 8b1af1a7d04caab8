#ifndef TESTS_FUZZ_PLAIN_READER_H_
#define TESTS_FUZZ_PLAIN_READER_H_

#include <cstddef>
#include <string_view>

// The rules of a reply once more, as plainly as they can be told: a search from the start for every
// question, byte by byte. What the library reads in one pass is held against it.

namespace gateway_fuzz {

// What a buffer holds: the value, and the length that was found, fit or not.
struct PlainToken {
  std::string_view text;
  size_t length = 0;
};

// Where `what`, which is not empty, stands in `text` from `from` on; npos when nowhere.
size_t PlainFind(std::string_view text, std::string_view what, size_t from);

// `value` as a buffer of `bound` bytes holds it.
std::string_view PlainBounded(std::string_view value, size_t bound);

// The value of the first field `tag` of `reply`, which stands behind a '|'; with `skipBlank` the
// first that is not an empty or blank one closed by a '|'.
PlainToken ReadPlainToken(std::string_view tag, std::string_view reply, size_t bound,
                          bool skipBlank);

// One record from `pos` on, and where the next one is to be looked for.
struct PlainRecord {
  std::string_view text;
  size_t next = 0;
};
PlainRecord ReadPlainRecord(std::string_view reply, size_t pos, size_t bound);

// The next complete record from `pos` on, which moves behind it; a closing mark that no opening
// one stands before gives an empty record, and so does a record of `bound` characters or more.
// False when there is none.
bool PlainNextRecord(std::string_view reply, size_t bound, size_t& pos, std::string_view& record);

enum class PlainTransport { kOk, kGatewayDown, kBrokerDown };
PlainTransport JudgePlainTransport(std::string_view reply);

// Text up to a separator, and what is left behind it.
struct PlainField {
  std::string_view text;
  std::string_view rest;
};
PlainField ReadPlainField(std::string_view text, std::string_view separator);

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_PLAIN_READER_H_
