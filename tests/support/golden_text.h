#ifndef TESTS_SUPPORT_GOLDEN_TEXT_H_
#define TESTS_SUPPORT_GOLDEN_TEXT_H_

#include <optional>
#include <string>
#include <string_view>

namespace gateway_tests {

// The text that a golden file writes as `escaped`; none when an escape is unknown.
std::optional<std::string> Unescape(std::string_view escaped);

// `text` as a golden file writes it: on one line that does not end in a blank, in UTF-8.
std::string Escape(std::string_view text);

// Where the first byte differs, moved back to where its character begins; npos when none does.
size_t FirstDifference(std::string_view wanted, std::string_view got);

// `text` as a golden file writes it, in quotes, with » before the byte `at`; what is far from there
// is left out.
std::string Marked(std::string_view text, size_t at);

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_GOLDEN_TEXT_H_
