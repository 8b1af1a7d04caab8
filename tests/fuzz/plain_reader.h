#ifndef TESTS_FUZZ_PLAIN_READER_H_
#define TESTS_FUZZ_PLAIN_READER_H_

#include <cstddef>
#include <string>
#include <vector>

// The rules of a reply once more, as plainly as they can be told: a search for every question, a
// copy for every answer. What the library reads in one pass is held against it.

namespace gateway_fuzz {

/// What a buffer holds: the value, and the length that was found, fit or not.
struct TPlainToken {
  std::string m_Text;
  size_t m_nLength = 0;
};

/// `value` as a buffer of `bound` bytes holds it.
std::string PlainBounded(const std::string& value, size_t bound);

/// The value of the first field `tag` of `reply`, which stands behind a '|'; with `skipBlank` the
/// first that is not an empty or blank one closed by a '|'.
TPlainToken PlainToken(const std::string& tag, const std::string& reply, size_t bound,
                       bool skipBlank);

/// One record from `pos` on, and where the next one is to be looked for.
struct TPlainRecord {
  std::string m_Text;
  size_t m_nNext = 0;
};
TPlainRecord PlainRecord(const std::string& reply, size_t pos, size_t bound);

/// All complete records, one after the other; a closing mark that no opening one stands before
/// gives an empty record, and so does a record of `bound` characters or more.
std::vector<std::string> PlainRecords(const std::string& reply, size_t bound);

enum class EPlainTransport { kOk, kGatewayDown, kBrokerDown };
EPlainTransport PlainTransport(const std::string& reply);

/// Text up to a separator, and what is left behind it.
struct TPlainField {
  std::string m_Text;
  std::string m_Rest;
};
TPlainField PlainField(const std::string& text, const std::string& separator);

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_PLAIN_READER_H_
