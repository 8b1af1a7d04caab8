#ifndef TESTS_UNIT_SESSION_H_
#define TESTS_UNIT_SESSION_H_

#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "tests/support/guarded_block.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {

// The lines that this thread logs, in order, while the object lives. A null text is "(null)", and
// a line that is not debug output of "gatewayjni" says so.
class CLogLines : public CLogListener {
 public:
  CLogLines() { ListenToLog(this); }
  ~CLogLines() override { ListenToLog(nullptr); }

  void OnLog(int priority, const char* tag, const char* text) override {
    std::string line = text == nullptr ? "(null)" : text;
    if (priority != 3) line += " (priority " + std::to_string(priority) + ")";
    if (std::string_view(tag) != "gatewayjni") line += std::string(" (tag ") + tag + ")";
    m_lines.push_back(line);
  }

  // The lines since the last call.
  std::vector<std::string> Take() { return std::exchange(m_lines, {}); }

 private:
  std::vector<std::string> m_lines;
};

// A terminated copy of `text` whose terminator is the last readable byte: one byte too far
// crashes.
class CTextAtPageEnd {
 public:
  explicit CTextAtPageEnd(const std::string& text)
      : m_block(Placement::kBeforeUnreadable, text.c_str(), text.size() + 1) {}

  operator char*() const { return m_block.Data(); }

 private:
  CGuardedBlock m_block;
};

// A buffer of exactly `size` bytes, filled with `fill`, before an unreadable page.
class CRoomAtPageEnd {
 public:
  explicit CRoomAtPageEnd(size_t size, char fill = '#')
      : m_block(Placement::kBeforeUnreadable, std::string(size, fill).data(), size) {}

  operator char*() const { return m_block.Data(); }

  // All bytes, terminators included.
  std::string Bytes() const { return {m_block.Data(), m_block.Size()}; }

 private:
  CGuardedBlock m_block;
};

// Stops the clock at 2024-01-15 13:45:21 in the market's time zone and listens to the log.
class CSessionTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_TRUE(SetClock("2024-01-15 13:45:21")); }

  CLogLines m_log;
};

using Lines = std::vector<std::string>;

}  // namespace gateway_tests

#endif  // TESTS_UNIT_SESSION_H_
