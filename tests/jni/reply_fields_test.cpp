// Each field that the dictionary names for a decoder, through the exports: whether a blank value is
// passed over, and the bound of its value.

#include <gtest/gtest.h>

#include <algorithm>
#include <initializer_list>
#include <iterator>
#include <set>
#include <string>
#include <string_view>

#include "tests/fuzz/reply_tables.h"
#include "tests/support/recording_host.h"
#include "tests/support/sample_replies.h"

namespace gateway_tests {
namespace {

using gateway_fuzz::Field;
using gateway_fuzz::Table;

// What makes another answer of the sample reply.
struct Turn {
  std::string_view from, to;
};

constexpr Turn kTurns[] = {
    {"", ""}, {"|68=0000", "|68=E001"}, {"|39= ", "|39=E"}, {"|19=S", "|19="}};

std::string TurnedReply(std::string_view decoder, const Turn& turn) {
  std::string reply = "|" + SampleReply(decoder, 2);
  const size_t at = reply.find(turn.from);
  if (at != std::string::npos) reply.replace(at, turn.from.size(), turn.to);
  return reply;
}

// The text of a refused futures order is read both ways (gateway/futures/order_reply.cpp).
bool PassesOverBlanks(const Table& table, const Field& field, const Turn& turn) {
  const bool bothWays = std::string_view(table.decoder) == "FutSubmitOrderDecode" &&
                        std::string_view(field.tag) == "K1";
  return bothWays ? turn.to == "|39=E" : field.skipBlank;
}

// A reply to a decoder, of which one field is changed: the first one, or an added one.
class CChangedReply {
 public:
  CChangedReply(const Table& table, const Field& field, bool ofRecord, const Turn& turn)
      : m_row(*FindExport(table.decoder)),
        m_reply(TurnedReply(table.decoder, turn)),
        m_mark("|" + std::string(field.tag) + "=") {
    const size_t record = ofRecord ? m_reply.find("|00=") : 0;
    m_nAt = m_reply.find(m_mark, record);
    if (m_nAt == std::string::npos) {
      m_nAt = ofRecord ? m_reply.find('|', record + 1) : 0;
    } else {
      m_nSize = m_reply.find('|', m_nAt + 1) - m_nAt;
      const std::string value = m_reply.substr(m_nAt + m_mark.size(), m_nSize - m_mark.size());
      if (!value.empty()) m_value = value;
    }
  }

  // The value of the sample, or "1" where it has none.
  const std::string& Value() const { return m_value; }

  // The result and the status with such values of the field, one behind the other.
  std::string Decode(std::initializer_list<std::string> values) const {
    std::string fields;
    for (const std::string& value : values) fields += m_mark + value;
    std::string reply = m_reply;
    reply.replace(m_nAt, m_nSize, fields);
    Arguments arguments = {Argument::Text(reply)};
    if (m_row.shape.front() == 'i') arguments.insert(arguments.begin(), Argument::Int(0));
    const Outcome outcome = CRecordingHost().Call(m_row, arguments);
    EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.violations);
    return *outcome.result + " " + std::to_string(outcome.status.value_or(0));
  }

 private:
  const Export& m_row;
  std::string m_reply;
  std::string m_mark;
  std::string m_value = "1";
  size_t m_nAt = 0;
  size_t m_nSize = 0;
};

// Calls `check(table, field, turn, reply)` for each field of each decoder, in each reply.
template <class Check>
void ForEachField(const Check& check) {
  for (const Table& table : gateway_fuzz::kTables) {
    for (const bool ofRecord : {false, true}) {
      const Field* field = ofRecord ? table.record : table.head;
      for (; field->tag != nullptr; ++field) {
        SCOPED_TRACE(std::string(table.decoder) + ", " + field->tag);
        for (const Turn& turn : kTurns) {
          check(table, *field, turn, CChangedReply(table, *field, ofRecord, turn));
        }
      }
    }
  }
}

TEST(ReplyFields, BlankValueIsTakenOrPassedOver) {
  ForEachField(
      [](const Table& table, const Field& field, const Turn& turn, const CChangedReply& reply) {
        const std::string one = PassesOverBlanks(table, field, turn) ? reply.Value() : " ";
        EXPECT_EQ(reply.Decode({" ", reply.Value()}), reply.Decode({one}));
      });
}

// Fields of which single characters are known: a longer value is as none.
constexpr std::string_view kShortValues[] = {"32", "39", "JV"};

bool IsShort(std::string_view tag) {
  return std::count(std::begin(kShortValues), std::end(kShortValues), tag) != 0;
}

// A long value that may mean something: a number, a text, an end mark, an acceptance letter, a
// kind.
struct Filling {
  std::string_view begin;
  char fill;
  std::string_view end;

  std::string OfSize(size_t size) const {
    const size_t filled = size - begin.size() - end.size();
    return std::string(begin) + std::string(filled, fill) + std::string(end);
  }
};

constexpr Filling kFillings[] = {{"", '1', ""},       {"", '9', ""},  {"", 'x', ""},
                                 {"", '0', "900001"}, {"S", 'x', ""}, {"", '0', "1"}};

TEST(ReplyFields, ValueFitsUpToItsBound) {
  std::set<std::string> hidden;
  ForEachField([&hidden](const Table& table, const Field& field, const Turn& turn,
                         const CChangedReply& reply) {
    const bool fitsRecord = table.recordSize == 0 || field.bound + 120 < table.recordSize;
    if (field.bound == gateway_fuzz::kUnbounded || !fitsRecord) return;
    const std::string name = std::string(table.decoder) + " " + field.tag;
    if (turn.from.empty() && !IsShort(field.tag)) hidden.insert(name);
    for (const Filling& filling : kFillings) {
      const std::string tooLong = reply.Decode({filling.OfSize(field.bound)});
      EXPECT_EQ(reply.Decode({filling.OfSize(field.bound + 1)}), tooLong);
      if (reply.Decode({filling.OfSize(field.bound - 1)}) != tooLong) hidden.erase(name);
    }
  });
  // The lists of accounts know one code.
  EXPECT_EQ(hidden, (std::set<std::string>{"AuthDecode 68", "GetTotalAccountDecode 68"}));
}

}  // namespace
}  // namespace gateway_tests
