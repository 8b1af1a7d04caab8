// The Base64 text of certificate messages, and its decoder with all its habits.

#include <gtest/gtest.h>
#include <sys/resource.h>

#include <climits>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>

#include "gateway/account/base64_utils.h"

namespace {

// Bytes that reach every value, those above 127 too.
std::string Bytes(size_t count) {
  std::string bytes;
  for (size_t i = 0; i < count; ++i) bytes.push_back(static_cast<char>(i * 167 + 91));
  return bytes;
}

// Plain Base64, bit by bit: another road to the same text.
std::string PlainBase64(const std::string& bytes) {
  const std::string letters = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
  std::string text;
  for (size_t bit = 0; bit < bytes.size() * 8; bit += 6) {
    unsigned value = 0;
    for (size_t i = bit; i < bit + 6; ++i) {
      const auto byte = i / 8 < bytes.size() ? static_cast<unsigned char>(bytes[i / 8]) : 0U;
      value = value * 2 + (byte >> (7 - i % 8) & 1U);
    }
    text.push_back(letters[value]);
  }
  while (text.size() % 4 != 0) text.push_back('=');
  return text;
}

// The text of `bytes`, which lie in a block of their very size.
std::string Encoded(const std::string& bytes) {
  const auto block = std::make_unique<char[]>(bytes.size());
  bytes.copy(block.get(), bytes.size());
  CBase64Utils utils;
  char* const text = utils.Encode(block.get(), static_cast<int>(bytes.size()));
  std::string copy(text);
  free(text);
  EXPECT_EQ(copy.size(), CBase64Utils::EncodedSize(bytes.size()));
  EXPECT_EQ(utils.m_nError, 0);
  return copy;
}

TEST(Base64Encode, ExamplesOfGroupsAndPadding) {
  EXPECT_EQ(Encoded("abc"), "YWJj");
  EXPECT_EQ(Encoded("abcd"), "YWJjZA==");
  EXPECT_EQ(Encoded("abcde"), "YWJjZGU=");
  EXPECT_EQ(Encoded("abcdef"), "YWJjZGVm");
  EXPECT_EQ(Encoded("\xff\xfe\xfd"), "//79");
  EXPECT_EQ(Encoded("\xfb\xef\xbe\xff"), "++++/w==");
  EXPECT_EQ(Encoded(std::string(3, '\0')), "AAAA");
}

TEST(Base64Encode, FewerThanThreeBytesGiveFourPadsAndNoData) {
  for (const char* bytes : {"", "a", "ab"}) EXPECT_EQ(Encoded(bytes), "====") << bytes;
  CBase64Utils utils;
  char* const negative = utils.Encode("abc", -5);
  EXPECT_STREQ(negative, "====");
  free(negative);
}

TEST(Base64Encode, LinesOf1024CharactersEndAlsoBehindAFullLastLine) {
  EXPECT_EQ(Encoded(Bytes(767)), PlainBase64(Bytes(767)));
  EXPECT_EQ(Encoded(Bytes(768)), PlainBase64(Bytes(768)) + "\r\n");
  const std::string line = PlainBase64(Bytes(768)) + "\r\n";
  for (size_t count : {769U, 770U, 771U, 772U}) {
    EXPECT_EQ(Encoded(Bytes(count)), line + PlainBase64(Bytes(count).substr(768))) << count;
  }
  EXPECT_EQ(Encoded(Bytes(769)).substr(1024), "\r\nWw==");
}

TEST(Base64Encode, EveryLengthGivesPlainBase64OnceTheLineEndsAreOut) {
  for (size_t count = 3; count <= 4000; ++count) {
    const std::string text = Encoded(Bytes(count));
    std::string plain;
    for (size_t at = 0; at < text.size(); at += 1026) {
      const std::string line = text.substr(at, 1024);
      plain += line;
      const bool whole = line.size() == 1024 && at + 1024 < text.size();
      ASSERT_EQ(text.substr(at + line.size(), 2), whole ? "\r\n" : "") << count;
    }
    ASSERT_EQ(plain, PlainBase64(Bytes(count))) << count;
  }
}

struct Decoding {
  const char* title;
  const char* text;
  std::string bytes;
  int error = 0;
};
void PrintTo(const Decoding& decoding, std::ostream* out) {
  *out << decoding.title;
}

using namespace std::string_literals;

const Decoding kDecodings[] = {
    {"Nothing", "", ""},
    {"OneGroup", "YWJj", "abc"},
    {"AllBitsOfBytesAbove127", "//79", "\xff\xfe\xfd"},
    {"LastGroupOfTwoCountsTwo", "YWJjZA==", "abcd\0"s},
    {"LastGroupOfThreeCountsOne", "YWJjZGU=", "abcd"},
    {"LoneCharacterCountsThree", "Y", "`\0\0"s},
    {"WithoutPads", "YWJjZA", "abcd\0"s},
    {"PadAtOnce", "====", ""},
    {"NothingBehindAPadIsRead", "YWJj=YWJj", "abc"},
    {"LineBreakIsSkippedSilently", "YWJj\r\nZGVm", "abcdef"},
    {"BlankIsForeign", "YW Jj", "abc", 1},
    {"LetterRIsForeign", "YWrJj", "abc", 1},
    {"OtherLettersAreNot", "YWqJj", "aj\x89\x8c\0\0"s},
    {"ByteAbove127IsForeign", "YW\xffJj", "abc", 1},
    {"ForeignCharactersInARow", "Y*-\n_WJj", "abc", 1},
    {"LastForeignCharacterReads43", "YWJr", "abk", 1},
    {"LastLineFeedReadsThePlaceBehind", "YWJj\n", "abc\xac\0\0"s},
    {"LastLineBreakReadsItsLineFeed", "YWJj\r\n", "abc\xac\0\0"s},
    {"OnlyALineFeed", "\n", "\xac\0\0"s},
    {"LastForeignCharacterBehindALineFeedIsNoError", "YW\n*", "a"},
    {"OnlyAForeignCharacter", "r", "\xac\0\0"s, 1},
    {"PadBehindAForeignCharacterIsForeign", "YW\n==", "a", 1},
};

class Base64Decode : public testing::TestWithParam<Decoding> {};

TEST_P(Base64Decode, Case) {
  const std::string text = GetParam().text;
  const auto block = std::make_unique<char[]>(text.size());
  text.copy(block.get(), text.size());
  CBase64Utils utils;
  int length = static_cast<int>(text.size());
  char* const bytes = utils.Decode(block.get(), &length);
  ASSERT_NE(bytes, nullptr);
  EXPECT_EQ(std::string(bytes, static_cast<size_t>(length)), GetParam().bytes);
  EXPECT_EQ(utils.m_nError, GetParam().error);
  free(bytes);
}

std::string NameOf(const testing::TestParamInfo<Decoding>& info) {
  return info.param.title;
}

INSTANTIATE_TEST_SUITE_P(Texts, Base64Decode, testing::ValuesIn(kDecodings), NameOf);

TEST(Base64Decoder, LastGroupOfThreeIsWrittenWholeThoughItCountsOne) {
  CBase64Utils utils;
  int length = 8;
  char* const bytes = utils.Decode("YWJjZGU=", &length);
  EXPECT_STREQ(bytes, "abcde");
  EXPECT_EQ(length, 4);
  free(bytes);
}

TEST(Base64Decoder, ErrorFlagStays) {
  CBase64Utils utils;
  EXPECT_EQ(utils.m_nError, 0);
  for (const char* text : {"YW Jj", "YWJj"}) {
    int length = static_cast<int>(strlen(text));
    free(utils.Decode(text, &length));
    EXPECT_EQ(utils.m_nError, 1);
  }
}

TEST(Base64Decoder, LengthBelowOneAndNullTextGiveNothing) {
  for (int given : {0, -1}) {
    CBase64Utils utils;
    int length = given;
    free(utils.Decode("YWJj", &length));
    EXPECT_EQ(length, 0);
  }
  CBase64Utils utils;
  int length = 4;
  free(utils.Decode(nullptr, &length));
  EXPECT_EQ(length, 0);
}

TEST(Base64RoundTrip, WholeGroupsWithoutTheLetterRComeBack) {
  const std::string letters = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqstuvwxyz0123456789+/";
  std::string text;
  for (size_t groups = 1; groups <= 600; ++groups) {
    for (size_t i = 0; i < 4; ++i) text.push_back(letters[text.size() * 5 % letters.size()]);
    CBase64Utils utils;
    int length = static_cast<int>(text.size());
    char* const bytes = utils.Decode(text.c_str(), &length);
    ASSERT_EQ(utils.m_nError, 0);
    ASSERT_EQ(length, static_cast<int>(groups * 3));
    char* const encoded = utils.Encode(bytes, length);
    std::string back;
    for (const char* at = encoded; *at != '\0'; ++at) {
      if (*at != '\r' && *at != '\n') back.push_back(*at);
    }
    ASSERT_EQ(back, text);
    free(encoded);
    free(bytes);
  }
}

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define SANITIZED_HEAP
#elif defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
#define SANITIZED_HEAP
#endif
#endif

#ifndef SANITIZED_HEAP  // it ends the program instead
TEST(Base64, WithoutMemoryThereIsNoText) {
  rlimit before{};
  ASSERT_EQ(getrlimit(RLIMIT_AS, &before), 0);
  const rlimit gibibyte{1U << 30, before.rlim_max};
  ASSERT_EQ(setrlimit(RLIMIT_AS, &gibibyte), 0);
  CBase64Utils utils;
  int length = INT_MAX;
  const char* const encoded = utils.Encode("abc", INT_MAX);
  const char* const decoded = utils.Decode("YWJj", &length);
  setrlimit(RLIMIT_AS, &before);
  EXPECT_EQ(encoded, nullptr);
  EXPECT_EQ(decoded, nullptr);
  EXPECT_EQ(length, 0);
}
#endif

}  // namespace
