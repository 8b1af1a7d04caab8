// liblog reads its environment once, so that every case is a process of its own.
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <string>
#include <vector>

namespace {

struct Outcome {
  std::string written;  // to standard error
  bool accepted;        // liblog's answer
};

// Runs print_line with `arguments` under `tags` as ANDROID_LOG_TAGS (null: not set).
Outcome Print(const char* tags, std::vector<std::string> arguments) {
  int ends[2];
  EXPECT_EQ(0, pipe(ends));
  const pid_t child = fork();
  if (child == 0) {
    dup2(ends[1], STDERR_FILENO);
    close(ends[0]);
    close(ends[1]);
    tags == nullptr ? unsetenv("ANDROID_LOG_TAGS") : setenv("ANDROID_LOG_TAGS", tags, 1);
    std::vector<char*> argv = {const_cast<char*>(PRINT_LINE)};
    for (std::string& argument : arguments) argv.push_back(argument.data());
    argv.push_back(nullptr);
    execv(PRINT_LINE, argv.data());
    _exit(127);
  }
  close(ends[1]);
  Outcome outcome = {};
  char block[4096];
  for (ssize_t n; (n = read(ends[0], block, sizeof block)) > 0;) {
    outcome.written.append(block, static_cast<size_t>(n));
  }
  close(ends[0]);
  int status = -1;
  EXPECT_EQ(child, waitpid(child, &status, 0));
  EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) <= 1) << status;
  outcome.accepted = WEXITSTATUS(status) == 0;
  return outcome;
}

struct Row {
  const char* title;
  const char* tags;
  const char* priority;
  const char* tag;
  const char* text;
  const char* written;  // empty: filtered out
};

constexpr Row kRows[] = {
    {"no variable", nullptr, "3", "gatewayjni", "text", ""},
    {"an empty variable", "", "3", "gatewayjni", "text", ""},
    {"separators alone", " ,, ", "3", "gatewayjni", "text", ""},
    {"the tag", "gatewayjni:D", "3", "gatewayjni", "text", "D/gatewayjni: text\n"},
    {"every tag", "*:D", "3", "gatewayjni", "text", "D/gatewayjni: text\n"},
    {"another tag", "other:D", "3", "gatewayjni", "text", ""},
    {"a tag that starts alike", "gateway:D", "3", "gatewayjni", "text", ""},
    {"a tag that goes on", "gatewayjni2:D", "3", "gatewayjni", "text", ""},
    {"a higher filter", "gatewayjni:I", "3", "gatewayjni", "text", ""},
    {"a lower filter", "gatewayjni:V", "3", "gatewayjni", "text", "D/gatewayjni: text\n"},
    {"a tag without a priority", "gatewayjni", "2", "gatewayjni", "text", "V/gatewayjni: text\n"},
    {"a tag and a colon", "gatewayjni:", "2", "gatewayjni", "text", "V/gatewayjni: text\n"},
    {"no priority of this name", "gatewayjni:X", "7", "gatewayjni", "text", ""},
    {"silence for all", "*:S", "7", "gatewayjni", "text", ""},
    {"silence for the others", "*:S gatewayjni:D", "3", "gatewayjni", "text",
     "D/gatewayjni: text\n"},
    {"silence for the tag", "*:V,gatewayjni:S", "7", "gatewayjni", "text", ""},
    {"the tag before all", "gatewayjni:D *:S", "3", "gatewayjni", "text", "D/gatewayjni: text\n"},
    {"several, by blanks and commas", "a:E, b:W  gatewayjni:D", "3", "gatewayjni", "text",
     "D/gatewayjni: text\n"},
    {"the last of a tag", "gatewayjni:D gatewayjni:E", "3", "gatewayjni", "text", ""},
    {"info", "*:V", "4", "t", "text", "I/t: text\n"},
    {"warning", "*:V", "5", "t", "text", "W/t: text\n"},
    {"error", "*:V", "6", "t", "text", "E/t: text\n"},
    {"fatal", "*:F", "7", "t", "text", "F/t: text\n"},
    {"nothing is written as silent", "*:V", "8", "t", "text", ""},
    {"below every priority", "*:V", "1", "t", "text", ""},
    {"beyond every priority", "*:V", "99", "t", "text", ""},
    {"a negative priority", "*:V", "-1", "t", "text", ""},
    {"an empty text", "*:D", "3", "t", "", "D/t: \n"},
    {"a null text", "*:D", "3", "t", "(null)", "D/t: \n"},
    {"a null tag", "*:D", "3", "(null)", "text", "D/: text\n"},
    {"percent signs are text", "*:D", "3", "t", "%s%n", "D/t: %s%n\n"},
    {"not ASCII", "*:D", "3", "t", "委託單", "D/t: 委託單\n"},
};

TEST(HostLog, WritesWhatTheFiltersAskFor) {
  for (const Row& row : kRows) {
    SCOPED_TRACE(row.title);
    const Outcome outcome = Print(row.tags, {row.priority, row.tag, row.text});
    EXPECT_EQ(row.written, outcome.written);
    EXPECT_EQ(row.written[0] != '\0', outcome.accepted);
  }
}

TEST(HostLog, WritesLongTextsWhole) {
  const std::string text(100000, 'x');
  EXPECT_EQ("D/t: " + text + "\n", Print("*:D", {"3", "t", text}).written);
}

TEST(HostLog, KeepsFiltersWithinItsTable) {
  std::string tags;
  for (int i = 0; i < 31; ++i) tags += "tag" + std::to_string(i) + ":D ";
  EXPECT_TRUE(Print((tags + "last:D").c_str(), {"3", "last", "text"}).accepted);
  EXPECT_FALSE(Print((tags + "more:D last:D").c_str(), {"3", "last", "text"}).accepted);
}

TEST(HostLog, LinesOfThreadsDoNotMix) {
  const std::string text(3000, 'x');
  const std::string line = "D/t: " + text + "\n";
  const std::string written = Print("*:D", {"3", "t", text, "100", "8"}).written;
  ASSERT_EQ(800 * line.size(), written.size());
  for (size_t i = 0; i < 800; ++i) {
    ASSERT_EQ(0, written.compare(i * line.size(), line.size(), line)) << "line " << i;
  }
}

}  // namespace
