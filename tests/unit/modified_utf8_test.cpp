// What of a result may go to the virtual machine, byte by byte.

#include "jni/modified_utf8.h"

#include <gtest/gtest.h>

#include <string>

#include "tests/support/modified_utf8.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

std::string Mended(const std::string& text) {
  const CTextAtPageEnd copy(text);
  MendModifiedUtf8(copy);
  return std::string(copy);
}

struct TextCase {
  const char* title;
  const char* text;
  const char* mended;
};

constexpr TextCase kTextCases[] = {
    {"nothing", "", ""},
    {"every control character", "\x01\x1F\t\n ~\x7F", "\x01\x1F\t\n ~\x7F"},
    {"two bytes, lowest", "\xC0\x80", "\xC0\x80"},
    {"two bytes, highest", "\xDF\xBF", "\xDF\xBF"},
    {"three bytes, lowest", "\xE0\x80\x80", "\xE0\x80\x80"},
    {"three bytes, highest", "\xEF\xBF\xBF", "\xEF\xBF\xBF"},
    {"a rare character as two halves", "\xED\xA0\x80\xED\xB0\x80", "\xED\xA0\x80\xED\xB0\x80"},
    {"four bytes, lowest", "\xF0\x80\x80\x80", "\xF0\x80\x80\x80"},
    {"four bytes, highest", "\xF7\xBF\xBF\xBF", "\xF7\xBF\xBF\xBF"},
    {"continuation alone, lowest", "a\x80z", "a?z"},
    {"continuation alone, highest", "a\xBFz", "a?z"},
    {"lead of five", "a\xF8\x80\x80\x80\x80z", "a?????z"},
    {"highest byte", "a\xFF\xBFz", "a??z"},
    {"two bytes and one more", "\xC3\xA9\xA9", "\xC3\xA9?"},
    {"three bytes and one more", "中\x80", "中?"},
    {"four bytes and one more", "\xF0\x9F\x98\x80\x80", "\xF0\x9F\x98\x80?"},
    {"two without the second", "\xC3z", "?z"},
    {"three without the third", "\xE4\xB8z", "??z"},
    {"three without the second", "\xE4z", "?z"},
    {"four without the fourth", "\xF0\x9F\x98z", "???z"},
    {"four without the third", "\xF0\x9Fz", "??z"},
    {"four without the second", "\xF0z", "?z"},
    {"lead before a sequence", "\xE4中", "?中"},
    {"cut before a sequence", "\xE4\xB8中", "??中"},
    {"two, cut by the end", "ab\xC3", "ab?"},
    {"three, cut by the end", "ab\xE4\xB8", "ab??"},
    {"four, cut by the end", "ab\xF0\x9F\x98", "ab???"},
    {"tail of three",
     "\xB8\xAD"
     "45",
     "??45"},
};

TEST(ModifiedUtf8, BytesOfNoSequenceBecomeQuestionMarks) {
  for (const TextCase& row : kTextCases) {
    EXPECT_EQ(Mended(row.text), row.mended) << row.title;
    EXPECT_EQ(IsModifiedUtf8(row.text), row.text == std::string(row.mended)) << row.title;
    // At every place of a longer text, which is looked at several bytes at a time.
    for (size_t before = 0; before < 40; ++before) {
      const std::string head(before, 'a'), tail(40 - before, 'z');
      EXPECT_EQ(Mended(head + row.text + tail), head + row.mended + tail) << row.title;
      EXPECT_EQ(Mended(head + row.text), head + row.mended) << row.title;
    }
  }
}

// Whether the byte at `at` lies in a whole sequence that begins there or up to three bytes before.
bool IsOfASequence(const std::string& text, size_t at) {
  for (size_t start = at < 3 ? 0 : at - 3; start <= at; ++start) {
    for (size_t size = at - start + 1; size <= 4 && start + size <= text.size(); ++size) {
      const auto lead = static_cast<unsigned char>(text[start]);
      const size_t wanted = lead < 0x80   ? 1U
                            : lead < 0xC0 ? 0U
                            : lead < 0xE0 ? 2U
                            : lead < 0xF0 ? 3U
                            : lead < 0xF8 ? 4U
                                          : 0U;
      if (wanted == size && IsModifiedUtf8(text.substr(start, size))) return true;
    }
  }
  return false;
}

// Every text of five bytes drawn from the boundaries of all ranges.
TEST(ModifiedUtf8, EveryArrangementOfBoundariesIsMendedByteByByte) {
  const std::string bytes = "A\x7F\x80\xBF\xC0\xDF\xE0\xEF\xF0\xF7\xF8\xFF";
  constexpr size_t kSize = 5;
  size_t number = 0;
  size_t end = 1;
  for (size_t i = 0; i < kSize; ++i) end *= bytes.size();
  for (; number < end; ++number) {
    std::string text;
    for (size_t rest = number, i = 0; i < kSize; ++i, rest /= bytes.size()) {
      text += bytes[rest % bytes.size()];
    }
    std::string expected = text;
    for (size_t i = 0; i < kSize; ++i) {
      if (!IsOfASequence(text, i)) expected[i] = '?';
    }
    MendModifiedUtf8(text.data());
    ASSERT_EQ(text, expected) << number;
    ASSERT_TRUE(IsModifiedUtf8(text)) << number;
  }
}

}  // namespace
}  // namespace gateway_tests
