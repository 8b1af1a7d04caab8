// The bounded text writer: pieces, its sticky overflow, blanks escaped in place.

#include "gateway/core/text_writer.h"

#include <algorithm>
#include <climits>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <utility>

#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

constexpr size_t kSize = 16;

// A writer over a buffer of exactly `size` bytes.
struct Line {
  explicit Line(size_t size = kSize) : room(size), writer(room, size) {}

  CRoomAtPageEnd room;
  CTextWriter writer;
};

TEST(TextWriter, StartsEmptyAndTerminatesOnlyWhenAsked) {
  Line line;
  EXPECT_EQ(line.writer.Length(), 0U);
  EXPECT_FALSE(line.writer.Overflowed());
  line.writer.AppendText("ab");
  EXPECT_EQ(line.room.Bytes(), "ab" + std::string(14, '#'));
  EXPECT_EQ(line.writer.Text(), static_cast<char*>(line.room));
  EXPECT_EQ(line.room.Bytes(), std::string("ab\0", 3) + std::string(13, '#'));
  EXPECT_EQ(line.writer.Length(), 2U);
}

// Texts of each length around the buffer's size, in one piece and in pieces of one character.
TEST(TextWriter, OverflowIsStickyAndNothingIsCut) {
  for (size_t length = 0; length <= kSize + 2; ++length) {
    const std::string text(length, 'x');
    Line whole, single;
    whole.writer.AppendText(text);
    for (char c : text) single.writer.AppendChar(c);
    const bool fits = length < kSize;
    EXPECT_EQ(whole.writer.Overflowed(), !fits) << length;
    EXPECT_EQ(single.writer.Overflowed(), !fits) << length;
    EXPECT_STREQ(whole.writer.Text(), fits ? text.c_str() : "") << length;
    EXPECT_STREQ(single.writer.Text(), fits ? text.c_str() : std::string(15, 'x').c_str());
    EXPECT_EQ(whole.writer.Length(), fits ? length : 0) << length;
  }
}

TEST(TextWriter, NothingIsWrittenBehindAnOverflow) {
  Line line;
  line.writer.AppendText("abc");
  line.writer.AppendText(std::string(13, 'x'));
  EXPECT_TRUE(line.writer.Overflowed());
  line.writer.AppendText("d");
  line.writer.AppendChar('e');
  line.writer.AppendPadded(7, 2);
  line.writer.Append(WIRE("%s|%c|%d|"), "f", 'g', 8);
  line.writer.AppendText("");
  line.writer.EscapeBlanks();
  EXPECT_STREQ(line.writer.Text(), "abc");
  EXPECT_TRUE(line.writer.Overflowed());
}

TEST(TextWriter, ReplaceStartsOverAlsoBehindAnOverflow) {
  Line line;
  line.writer.AppendText(std::string(99, 'x'));
  line.writer.Replace("message");
  EXPECT_FALSE(line.writer.Overflowed());
  EXPECT_STREQ(line.writer.Text(), "message");
  line.writer.Replace(std::string(15, 'y'));
  EXPECT_FALSE(line.writer.Overflowed());
  line.writer.Replace("");
  EXPECT_STREQ(line.writer.Text(), "");
  line.writer.Replace(std::string(16, 'y'));
  EXPECT_TRUE(line.writer.Overflowed());
  EXPECT_STREQ(line.writer.Text(), "");
}

TEST(TextWriter, BufferOfOneByteHoldsTheEmptyText) {
  Line line(1);
  EXPECT_STREQ(line.writer.Text(), "");
  EXPECT_FALSE(line.writer.Overflowed());
  line.writer.AppendChar('a');
  EXPECT_TRUE(line.writer.Overflowed());
  EXPECT_STREQ(line.writer.Text(), "");
}

TEST(TextWriter, ContinueGoesOnBehindTheText) {
  const CRoomAtPageEnd room(8, '\0');
  room[0] = 'a';
  CTextWriter writer = CTextWriter::Continue(room, 8);
  EXPECT_EQ(writer.Length(), 1U);
  writer.AppendText("bcdefg");
  EXPECT_STREQ(writer.Text(), "abcdefg");
  EXPECT_FALSE(writer.Overflowed());
  writer.AppendChar('h');
  EXPECT_TRUE(writer.Overflowed());
  writer.Replace("x");
  EXPECT_STREQ(writer.Text(), "x");
  EXPECT_EQ(writer.Text(), static_cast<char*>(room));
}

TEST(TextWriter, ContinueStaysInsideABufferWithoutATerminator) {
  const CRoomAtPageEnd room(8, 'a');
  CTextWriter writer = CTextWriter::Continue(room, 8);
  EXPECT_EQ(writer.Length(), 7U);
  EXPECT_STREQ(writer.Text(), "aaaaaaa");
}

TEST(TextWriter, PiecesArePrintedByTheirFormats) {
  Line line(128);
  const char* const null = nullptr;
  line.writer.Append(WIRE("F=7|KIND=%s|BHNO=%s"), "S", std::string_view("9A00"));
  line.writer.Append(WIRE("|%s|"), null);
  line.writer.Append(WIRE("%c%c"), 'a', '\xE5');
  line.writer.Append(WIRE("|%d|%07d|%02d|%ld"), -5, 42, -7, int64_t{INT64_MIN});
  line.writer.Append(WIRE("plain"));
  EXPECT_STREQ(line.writer.Text(),
               "F=7|KIND=S|BHNO=9A00||a\xE5|-5|0000042|-7|-9223372036854775808plain");
}

// Joined as C text: the rest of that piece is lost, the next one follows directly.
TEST(TextWriter, NulCharacterEndsItsOwnPieceAlone) {
  Line line(64);
  line.writer.Append(WIRE("|32=%c|33=%d|"), '\0', 5);
  line.writer.Append(WIRE("next%c%c"), 'x', '\0');
  line.writer.Append(WIRE("%c%s"), '\0', "lost");
  line.writer.Append(WIRE("|end"));
  EXPECT_STREQ(line.writer.Text(), "|32=nextx|end");
  EXPECT_FALSE(line.writer.Overflowed());
}

TEST(TextWriter, EveryOtherCharacterIsWritten) {
  Line line(600);
  std::string expected;
  for (int code = CHAR_MIN; code <= CHAR_MAX; ++code) {
    if (code == 0) continue;
    line.writer.Append(WIRE("%c|"), static_cast<char>(code));
    expected += static_cast<char>(code) + std::string("|");
  }
  EXPECT_EQ(std::string(line.writer.Text()), expected);
}

// A piece is joined whole or not at all, to the last byte of the buffer; the bound by which its
// room is asked for first may be larger than the piece.
TEST(TextWriter, PieceThatFitsExactlyIsWhole) {
  const std::string expected = "|7|-5|0042|ab|c|";
  for (size_t size = 1; size <= expected.size() + 40; ++size) {
    Line line(size);
    line.writer.Append(WIRE("|%d|%ld|%04d|%s|%c|"), 7, int64_t{-5}, 42, "ab", 'c');
    const bool fits = expected.size() < size;
    EXPECT_EQ(line.writer.Overflowed(), !fits) << size;
    EXPECT_STREQ(line.writer.Text(), fits ? expected.c_str() : "") << size;
  }
}

// Texts and characters have no room to spare, as numbers have.
TEST(TextWriter, CharactersAndTextsFitExactly) {
  const std::string expected = "xab|yz|cd";
  for (size_t size = 1; size <= expected.size() + 3; ++size) {
    Line line(size);
    line.writer.Append(WIRE("%c%s|%c%c|%s"), 'x', "ab", 'y', 'z', "cd");
    const bool fits = expected.size() < size;
    EXPECT_EQ(line.writer.Overflowed(), !fits) << size;
    EXPECT_STREQ(line.writer.Text(), fits ? expected.c_str() : "") << size;
  }
}

// The same with every kind of value at once.
TEST(TextWriter, ValuesOfEveryKindFitExactly) {
  for (const int number : {0, 7, 12, 345, 6789, 10000, 12345678, 123456789, INT_MAX, -1, INT_MIN}) {
    char expected[200];
    snprintf(expected, sizeof expected, "%d|%d|%s|x%s", number, number & 0xff, "abc", "1234567");
    for (size_t size = 1; size <= strlen(expected) + 90; ++size) {
      Line line(size);
      line.writer.Append(WIRE("%d|%d|%s|%c%s"), number, static_cast<uint8_t>(number & 0xff), "abc",
                         'x', "1234567");
      const bool fits = strlen(expected) < size;
      EXPECT_EQ(line.writer.Overflowed(), !fits) << size;
      EXPECT_STREQ(line.writer.Text(), fits ? expected : "") << size;
    }
  }
}

TEST(TextWriter, LongNumbersOfEveryWidthFitExactly) {
  for (const int64_t number : {int64_t{5}, int64_t{-5}, int64_t{INT64_MAX}, int64_t{INT64_MIN}}) {
    char expected[80];
    snprintf(expected, sizeof expected, "%lld|%010d|%02d", static_cast<long long>(number),
             static_cast<int>(number % 1000), static_cast<int>(number % 1000));
    for (size_t size = 1; size <= strlen(expected) + 60; ++size) {
      Line line(size);
      line.writer.Append(WIRE("%ld|%010d|%02d"), number, static_cast<int>(number % 1000),
                         static_cast<int>(number % 1000));
      const bool fits = strlen(expected) < size;
      EXPECT_EQ(line.writer.Overflowed(), !fits) << size;
      EXPECT_STREQ(line.writer.Text(), fits ? expected : "") << size;
    }
  }
}

TEST(TextWriter, BytesArePrintedAsNumbers) {
  for (int number = 0; number < 256; ++number) {
    Line line(16);
    line.writer.Append(WIRE("%d|"), static_cast<uint8_t>(number));
    EXPECT_EQ(std::string(line.writer.Text()), std::to_string(number) + "|");
  }
}

TEST(TextWriter, PieceThatANulEndsNeedsNoRoomForItsRest) {
  const std::string lost(100, 'x');
  for (size_t size : {3U, 4U}) {
    Line line(size);
    line.writer.Append(WIRE("|7=%c|8=%s|"), '\0', lost);
    EXPECT_EQ(line.writer.Overflowed(), size == 3) << size;
    EXPECT_STREQ(line.writer.Text(), size == 3 ? "" : "|7=");
  }
}

TEST(TextWriter, TextsOfEveryLengthAreCopied) {
  std::string letters;
  for (size_t i = 0; i < 100; ++i) letters += static_cast<char>('!' + i % 90);
  for (size_t length = 0; length <= 100; ++length) {
    const std::string text = letters.substr(0, length);
    const CGuardedBlock source(Placement::kBeforeUnreadable, text.data(), length);
    Line line(length + 3);
    line.writer.Append(WIRE("<%s>"), std::string_view(source.Data(), length));
    EXPECT_EQ(line.writer.Text(), "<" + text + ">");
  }
}

// Each number as the C library prints it, through a format of every width that the wire could use.
template <size_t kWidth>
struct WidthFormat {
  static constexpr char kChars[] = {'%', '0', '0' + kWidth / 10, '0' + kWidth % 10, 'd', '\0'};
  static constexpr std::string_view Text() { return {kChars, 5}; }
};

template <size_t... kWidths>
void ExpectPrintedAsC(int value, std::index_sequence<kWidths...>) {
  const auto one = [value](auto format, const char* cFormat) {
    Line line(64);
    line.writer.Append(format, value);
    char expected[64];
    snprintf(expected, sizeof expected, "%0*d", atoi(cFormat + 1), value);
    ASSERT_STREQ(line.writer.Text(), expected) << cFormat;
  };
  (one(WidthFormat<kWidths + 1>(), WidthFormat<kWidths + 1>::kChars), ...);
}

TEST(TextWriter, NumbersArePrintedAsTheCLibraryPrintsThem) {
  std::vector<int> values = {0, INT_MAX, INT_MAX - 1, INT_MIN, INT_MIN + 1};
  for (int power = 1; power < 1000000000; power *= 10) {
    for (int value : {power - 1, power, power + 1, power / 7 * 50, power * 2}) {
      values.push_back(value);
      values.push_back(-value);
    }
  }
  for (int value : values) {
    ExpectPrintedAsC(value, std::make_index_sequence<14>());
    Line line(64);
    line.writer.Append(WIRE("%d|%ld"), value, value);
    const std::string number = std::to_string(value);
    ASSERT_EQ(line.writer.Text(), number + "|" + number);
  }
}

TEST(TextWriter, LongNumbersArePrintedInFull) {
  for (int64_t value : {INT64_MAX, INT64_MIN, int64_t{UINT32_MAX}, int64_t{UINT32_MAX} + 1,
                        int64_t{-4294967296}, int64_t{99999}, int64_t{100000}, int64_t{-1}}) {
    Line line(32);
    line.writer.Append(WIRE("%ld"), value);
    EXPECT_EQ(line.writer.Text(), std::to_string(value));
  }
}

struct BlankCase {
  const char* text;
  const char* escaped;
};

constexpr BlankCase kBlankCases[] = {{"", ""},         {"abc", "abc"},
                                     {" ", "%20"},     {"   ", "%20%20%20"},
                                     {"a b", "a%20b"}, {" a  b ", "%20a%20%20b%20"},
                                     {"a\tb", "a\tb"}};

TEST(TextWriter, EscapesBlanksIntoABufferThatFitsExactly) {
  for (const BlankCase& row : kBlankCases) {
    const size_t exact = std::string(row.escaped).size() + 1;
    for (size_t more : {0U, 1U, 2U, 20U}) {
      Line line(exact + more);
      line.writer.AppendText(row.text);
      line.writer.EscapeBlanks();
      EXPECT_FALSE(line.writer.Overflowed()) << row.text;
      EXPECT_STREQ(line.writer.Text(), row.escaped);
      EXPECT_EQ(line.writer.Length(), exact - 1);
    }
  }
}

TEST(TextWriter, EscapedTextOneByteTooLongOverflows) {
  for (const BlankCase& row : kBlankCases) {
    const std::string escaped = row.escaped;
    if (escaped == row.text) continue;
    Line line(escaped.size());
    line.writer.AppendText(row.text);
    line.writer.EscapeBlanks();
    EXPECT_TRUE(line.writer.Overflowed()) << row.text;
    EXPECT_STREQ(line.writer.Text(), row.text);
    line.writer.Replace("");
    EXPECT_FALSE(line.writer.Overflowed());
  }
}

TEST(TextWriter, GoesOnBehindEscapedBlanks) {
  Line line;
  line.writer.AppendText("a b");
  line.writer.EscapeBlanks();
  line.writer.AppendText("|c d");
  line.writer.EscapeBlanks();
  EXPECT_STREQ(line.writer.Text(), "a%20b|c%20d");
}

}  // namespace
}  // namespace gateway_tests
