#ifndef TESTS_SUPPORT_SAMPLE_REPLIES_H_
#define TESTS_SUPPORT_SAMPLE_REPLIES_H_

#include <cstddef>
#include <string>
#include <string_view>

namespace gateway_tests {

// The decoder whose replies list records, by the name of its export.
inline constexpr std::string_view kListDecoders[] = {
    "AuthDecode",          "GetTotalAccountDecode",   "QueryOrderDecode",
    "QueryReplyDecode",    "QueryInventoryDecode",    "QueryInventoryDecodeJZG",
    "PaymentDecode",       "PaymentDecodeJZG",        "FutQueryOrderDecode",
    "FutQueryReplyDecode", "FutQueryInventoryDecode",
};

// A reply with `records` records of everyday fields, each different from the last, then the end
// mark. The same at every call. Empty when `decoder` is none of kListDecoders.
std::string SampleList(std::string_view decoder, size_t records);

// A reply to one of the decoders that list nothing; empty when there is no such decoder.
std::string SampleAnswer(std::string_view decoder);

// A reply of one kind or the other, a list with `records` records.
std::string SampleReply(std::string_view decoder, size_t records);

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_SAMPLE_REPLIES_H_
