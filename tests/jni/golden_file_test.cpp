// Golden files: what is told of a case that fails, which files are refused, and what accepting
// rewrites.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include "tests/support/golden_answer.h"
#include "tests/support/golden_file.h"
#include "tests/support/golden_text.h"
#include "tests/support/golden_writer.h"

namespace gateway_tests {
namespace {

namespace fs = std::filesystem;

std::string ReadFile(const fs::path& path) {
  std::ifstream in(path);
  return {std::istreambuf_iterator<char>(in), {}};
}

// A folder of its own for golden files, gone afterwards.
class GoldenFile : public testing::Test {
 protected:
  GoldenFile() {
    std::string name = (fs::temp_directory_path() / "golden-XXXXXX").string();
    if (mkdtemp(name.data()) != nullptr) m_folder = name;
  }
  ~GoldenFile() override { fs::remove_all(m_folder); }

  GoldenCases Read(const std::string& text, Unanswered unanswered = Unanswered::kError) {
    std::ofstream(m_folder / "file.txt") << text;
    return ReadGoldenCases(m_folder, unanswered);
  }

  std::string Accept(const std::string& text) {
    const GoldenCases golden = Read(text, Unanswered::kTaken);
    EXPECT_EQ(golden.errors, std::vector<std::string>());
    return WithAnswers(text, golden.cases, Rewrite::kWrongCases);
  }

  fs::path m_folder;
};

const std::string kUsual = R"(# A file.

usual clock 2024-01-15 13:45:21
usual market int 0
usual platform int 0
usual seqNo int 7
usual serialNo str SN0001
usual localIP str 10.0.0.1
usual branch str 9A00
usual identity str 1234567&
usual password str secret
)";
const std::string kHeader =
    "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|15=0|"
    "ACNO=1234567|PWD=secret|";

struct DifferenceCase {
  const char* wanted;
  const char* got;
  const char* told;
};

TEST(Differences, AreToldInTheWordsOfTheText) {
  const DifferenceCase rows[] = {
      {"F=1|30=2000|UT=1", "F=1|30=2000|UT=1", ""},
      {"F=1|30=2000|UT=1", "F=1|30=2100|UT=1", R"(tag 30: wanted "2»000", got "2»100")"},
      {"F=1|30=2000|UT=1", "F=1|UT=1", R"(field 2: wanted "»30=2000", got "»UT=1")"},
      {"F=1|30=2000|UT=1", "F=1|30=2000", R"(field 3: wanted "»UT=1", got "»")"},
      {"F=1|30=2000", "F=1|30=2000|UT=1", R"(field 3: wanted "»", got "»UT=1")"},
      {"F=1||01=\n", "F=1||01=", R"(tag 01: wanted "»\n", got "»")"},
      {"F=1|33=!!9A00_7", "F=1|33=!!9A00_8", R"(tag 33: wanted "!!9A00_»7", got "!!9A00_»8")"},
      {"F=1|30=2", "why", R"(text: wanted "»F=1|30=2", got "»why")"},
      {"2!a@b!c@d!", "2!a@b!c@e!", R"(record 2, column 1: wanted "»d", got "»e")"},
      {"2!a@b!c@d!", "1!a@b!c@d!", R"(count: wanted "»2", got "»1")"},
      {"1!a@b!", "1!a!", R"(record 1, column 1: wanted "»b", got "»")"},
      {"1!a@b!", "1!a@b!c@d!", R"(record 2, column 0: wanted "»", got "»c")"},
      {"1!5!6!", "1!5!7!", R"(record 2, column 0: wanted "»6", got "»7")"},
      {"a@b!", "a@c!", R"(record 1, column 1: wanted "»b", got "»c")"},
      {"<0>!1!a@b!<1>!1!c@d!", "<0>!1!a@b!<1>!1!c@x!",
       R"(section <1>, record 1, column 1: wanted "»d", got "»x")"},
      {"<0>!1!a@b!<1>!0!", "<0>!1!a@b!<1>!2!", R"(section <1>, count: wanted "»0", got "»2")"},
      {"傳入的參數", "傳入的号數", R"(text: wanted "傳入的»參數", got "傳入的»号數")"},
      // Both characters begin with the same byte.
      {"a中", "a丰", R"(text: wanted "a»中", got "a»丰")"},
      {"ab", "abc", R"(text: wanted "ab»", got "ab»c")"},
  };
  for (const DifferenceCase& row : rows) {
    EXPECT_EQ(TellDifference(row.wanted, row.got), row.told) << row.wanted;
  }
}

TEST(Differences, OfLongTextsShowWhatIsNear) {
  const std::string x(100, 'x');
  const std::string near(60, 'x');
  EXPECT_EQ(TellDifference(x + "a" + x, x + "b" + x), "text: wanted \"…" + near + "»a" +
                                                          near.substr(1) + "…\", got \"…" + near +
                                                          "»b" + near.substr(1) + "…\"");
}

TEST_F(GoldenFile, OneBrokenCharacterIsOneDifference) {
  const std::string log = "log 1234567\nlog\nlog " + kHeader + "\nlog " + kHeader + "FUNC=0|01=\n" +
                          "log ~CGatewayPub\n";
  const std::string good = kUsual + "\n== login\nop AuthEncode\nresult " + kHeader + "FUNC=0|01=\n";
  struct Broken {
    const char* from;
    const char* to;
    const char* told;
  };
  const Broken rows[] = {
      {"log ", "log ", ""},
      {"result F=7|KIND=S|BHNO=9A00", "result F=7|KIND=S|BHNO=9A01",
       R"(result, tag BHNO: wanted "9A0»1", got "9A0»0")"},
      {"op AuthEncode\n", "op AuthEncode\nstatus -1\n", "status: wanted -1, got 1"},
      {"log 1234567", "log 1234568", R"(log line 1, text: wanted "123456»8", got "123456»7")"},
      {"log F=7|KIND=S", "log F=7|KIND=T", R"(log line 3, tag KIND: wanted "»T", got "»S")"},
      {"log ~CGatewayPub\n", "", R"(log line 5: wanted none, got "~CGatewayPub")"},
      {"log ~CGatewayPub\n", "log ~CGatewayPub\nlog x\n", R"(log line 6: wanted "x", got none)"},
  };
  for (const Broken& row : rows) {
    std::string text = good + log;
    text.replace(text.find(row.from), std::string(row.from).size(), row.to);
    const GoldenCases golden = Read(text);
    ASSERT_EQ(golden.errors, std::vector<std::string>());
    ASSERT_TRUE(SetClockOf(golden.cases.at(0)));
    CRecordingHost host;
    const Outcome outcome = host.Call(*FindExport("AuthEncode"), golden.cases[0].arguments);
    EXPECT_EQ(TellDifference(golden.cases[0], outcome, PlatformName(0)), row.told);
  }
}

struct FaultCase {
  const char* lines;
  const char* fault;
};

TEST_F(GoldenFile, SaysWhatIsWrongWithACase) {
  const FaultCase rows[] = {
      {"op AuthEncode\nresult x", ""},
      {"op AuthEncode", "file.txt:13: t: no result (scripts/golden --accept writes it)"},
      {"op AuthEnc\nresult x", "file.txt:13: t: no operation is named \"AuthEnc\""},
      {"result x", "file.txt:13: t: no operation is named \"\""},
      {"op AuthEncode\nquantity int 2\nresult x", "file.txt:13: t: no argument is named quantity"},
      {"op AuthEncode\nmarket str 0\nresult x", "file.txt:13: t: market has another type"},
      {"op AuthDecode\nresult x", "file.txt:13: t: no value for reply"},
      {"op AuthEncode\nmarket int 0\nmarket int 0\nresult x",
       "file.txt:16: not understood: market int 0"},
      {"op AuthEncode\nmarket int 2147483648\nresult x",
       "file.txt:15: not understood: market int 2147483648"},
      {"op AuthEncode\nbranch str \\q\nresult x", "file.txt:15: not understood: branch str \\q"},
      {"op AuthEncode\nresult x\nresult x", "file.txt:16: not understood: result x"},
      {"op AuthEncode\nresult x\n# why\nstatus 1", "file.txt:17: not understood: status 1"},
      {"op AuthEncode\nresult x ", "file.txt:15: the line ends in a blank (write \\s)"},
      {"op SubmitOrderEncode2\nfunction byte 'I'\ntradeType byte -1\nstatus 1\nresult x",
       "file.txt:13: t: the method has no status"},
      {"op SubmitOrderEncode2\nfunction byte '中'\ntradeType byte 0\nresult x",
       "file.txt:15: not understood: function byte '中'"},
  };
  for (const FaultCase& row : rows) {
    const GoldenCases golden = Read(kUsual + "\n== t\n" + row.lines + "\n");
    EXPECT_EQ(golden.errors.empty() ? "" : golden.errors[0], row.fault) << row.lines;
  }
}

TEST_F(GoldenFile, TakesWhatIsUsualFromTheLinesAbove) {
  const GoldenCases golden = Read(kUsual +
                                  "\n== one\nop AuthEncode\nbranch null\nresult x\n"
                                  "\nusual market int 5\n"
                                  "\n== two\nop AuthEncode\nclock 2025-01-01 00:00:00\nresult\n");
  ASSERT_EQ(golden.errors, std::vector<std::string>());
  const GoldenCase& one = golden.cases.at(0);
  const GoldenCase& two = golden.cases.at(1);
  EXPECT_EQ(one.arguments.at(0).number, 0);
  EXPECT_EQ(one.arguments.at(3).text, "SN0001");
  EXPECT_EQ(one.arguments.at(5).text, std::nullopt);
  EXPECT_EQ(one.clock, "2024-01-15 13:45:21");
  EXPECT_EQ(one.status, 1);
  EXPECT_EQ(two.arguments.at(0).number, 5);
  EXPECT_EQ(two.arguments.at(5).text, "9A00");
  EXPECT_EQ(two.clock, "2025-01-01 00:00:00");
  EXPECT_EQ(two.result, "");
}

TEST_F(GoldenFile, AcceptingWritesWhatDoesNotHoldAndNothingElse) {
  const std::string held =
      "\n== held\nop AuthEncode\nbranch str 9A00\nresult " + kHeader + "FUNC=0|01=\n";
  const std::string wrong = "\n# Why.\n== wrong\nop AuthEncode\npassword str\nresult x\nlog y\n";
  const std::string added = "\n== added\nop AuthDecode\nreply str [GATEWAY]error";
  const std::string header = kHeader.substr(0, kHeader.size() - 7);
  const std::string mended = "\n# Why.\n== wrong\nop AuthEncode\npassword str\nresult " + header +
                             "|FUNC=0|01=\nlog 1234567\nlog\nlog " + header + "|\nlog " + header +
                             "|FUNC=0|01=\nlog ~CGatewayPub\n";
  const std::string answered = added + "\nstatus -1\nresult [GATEWAY]主機連線失敗\n";
  const std::string accepted = Accept(kUsual + held + wrong + added + "\n");
  EXPECT_EQ(accepted, kUsual + held + mended + answered);
  EXPECT_EQ(Accept(accepted), accepted);
}

TEST_F(GoldenFile, AcceptingLeavesTheNameOfAnEditionOpen) {
  const std::string text = kUsual + "\n== edition\nop AuthEncode\nplatform int 5\n";
  const std::string accepted = Accept(text);
  EXPECT_NE(accepted.find("|11={11}|VER="), std::string::npos) << accepted;
  EXPECT_EQ(Accept(accepted), accepted);
}

// Golden.Case tells whether a case holds; here it is the form of its lines.
TEST(GoldenFiles, AreAsAcceptingWritesThem) {
  const GoldenCases golden = ReadGoldenCases(TEST_VECTORS);
  ASSERT_FALSE(golden.cases.empty());
  for (size_t at = 0; at < golden.cases.size();) {
    const std::string& file = golden.cases[at].file;
    std::vector<GoldenCase> cases;
    while (at < golden.cases.size() && golden.cases[at].file == file) {
      cases.push_back(golden.cases[at++]);
    }
    const std::string text = ReadFile(fs::path(TEST_VECTORS) / file);
    const std::string rewritten = WithAnswers(text, cases, Rewrite::kGoodCases);
    if (rewritten == text) continue;
    const size_t same = FirstDifference(text, rewritten);
    const auto line =
        std::count(text.begin(), text.begin() + static_cast<ptrdiff_t>(same), '\n') + 1;
    ADD_FAILURE() << file << ":" << line << ": wanted " << Marked(rewritten, same) << ", is "
                  << Marked(text, same);
  }
}

TEST(GoldenText, EscapesAreReadBack) {
  const std::string texts[] = {"",         " ",    "  ",       "a ",   "a\nb\r\t\\",
                               "\x01\x7f", "中文", "\xe4\xb8", "\xff", "é\xe9"};
  for (const std::string& text : texts) EXPECT_EQ(Unescape(Escape(text)), text);
  EXPECT_EQ(Escape("a \n\\中\xe4\x01 "), "a \\n\\\\中\\xe4\\x01\\s");
  for (const char* bad : {"\\", "\\q", "\\x", "\\x4", "\\x4g", "\\x00"}) {
    EXPECT_EQ(Unescape(bad), std::nullopt) << bad;
  }
}

}  // namespace
}  // namespace gateway_tests
