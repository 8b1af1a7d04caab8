// Stock positions: what an account holds, bought in cash, on margin and sold short, and more.
//
//   request  header |FUNC=5|01=
//   record   |29=code|75=..|751=..|76=..|761=..|77=..|771=..|PS=..
//   result   <0>!count! ( code @ 75|751 ! )*         <1>!count! ( code @ 76|761 @@@@@ ! )*
//            <2>!count! ( code @ 77|771 @@@@ ! )*    <3>!count! ( code @ PS|0|0 ! )*
//
// The layout of the brokerage JZG has a third quantity (752, 762, 772) in each field, and no
// section 3. A stock stands in the sections in which its quantities do not add up to 0.
#include <new>

#include "gateway/core/decimal.h"
#include "gateway/core/log.h"
#include "gateway/core/messages.h"
#include "gateway/stock/gateway_stk.h"
#include "gateway/stock/stock_list.h"

namespace {

// Of the quantities no more is known than the section of the result that shows them.
enum Field {
  kStockCode = kOwnFields,
  kQuantity75,
  kQuantity751,
  kQuantity752,
  kQuantity76,
  kQuantity761,
  kQuantity762,
  kQuantity77,
  kQuantity771,
  kQuantity772,
  kQuantityPS
};

constexpr TagRow kRows[] = {
    {kSequence, "67", 20},     {kResultCode, "68", 20}, {kMessage, "M2", kRecord},
    {kStockCode, "29", 20},    {kQuantity75, "75", 50}, {kQuantity751, "751", 50},
    {kQuantity752, "752", 50}, {kQuantity76, "76", 50}, {kQuantity761, "761", 50},
    {kQuantity762, "762", 50}, {kQuantity77, "77", 50}, {kQuantity771, "771", 50},
    {kQuantity772, "772", 50}, {kQuantityPS, "PS", 50}};
constexpr CListTable kTags(kRows, kStockList);

constexpr size_t kMaxQuantities = 3;
constexpr size_t kMaxSections = 4;

// The quantities of one section's records, none if the section does not exist, and what ends such a
// record: the host reads each section with columns of its own.
struct SectionShape {
  size_t count;
  int quantities[kMaxQuantities];
  const char* ending;
};

using SectionShapes = SectionShape[kMaxSections];

// The sections of one reply while it is read. Its records come in any order, its sections one after
// the other, so they are collected side by side in one block of memory and copied once. Each has
// room for as much as the reply is long, which no section needs: what a record adds to a section is
// shorter than the record.
class CSections {
 public:
  // `room` has kMaxSections times `size` bytes.
  CSections(char* room, size_t size)
      : m_records{
            {room, size}, {room + size, size}, {room + 2 * size, size}, {room + 3 * size, size}} {}

  void Add(const SectionShapes& shapes, const CRecord& record) {
    for (size_t i = 0; i < kMaxSections; ++i) {
      if (AddTo(m_records[i], shapes[i], record)) ++m_counts[i];
    }
  }

  size_t Length(const SectionShapes& shapes) const {
    size_t length = 0;
    for (size_t i = 0; i < kMaxSections && shapes[i].count > 0; ++i) {
      length += strlen("<0>!!") + DecimalSize(m_counts[i], 0) + m_records[i].Length();
    }
    return length;
  }

  void WriteTo(CTextWriter& text, const SectionShapes& shapes) {
    for (size_t i = 0; i < kMaxSections && shapes[i].count > 0; ++i) {
      const std::string_view records(m_records[i].Text(), m_records[i].Length());
      text.Append(WIRE("<%d>!%d!%s"), static_cast<int>(i), m_counts[i], records);
    }
  }

 private:
  // Adds a stock whose quantities do not add up to 0.
  static bool AddTo(CTextWriter& records, const SectionShape& shape, const CRecord& record) {
    int32_t quantities[kMaxQuantities];
    int32_t sum = 0;
    for (size_t i = 0; i < shape.count; ++i) {
      quantities[i] = record.Number(shape.quantities[i]);
      sum = WrapAdd(sum, quantities[i]);
    }
    if (sum == 0) return false;
    records.Append(WIRE("%s@%d"), record.Text(kStockCode), quantities[0]);
    for (size_t i = 1; i < shape.count; ++i) records.Append(WIRE("|%d"), quantities[i]);
    records.AppendText(shape.ending);
    return true;
  }

  CTextWriter m_records[kMaxSections];
  int m_counts[kMaxSections] = {};
};

// Memory for one call; null when there is none left.
struct ScratchBlock {
  ScratchBlock(size_t count, size_t size)
      : data(size <= SIZE_MAX / count ? new (std::nothrow_t{}) char[count * size] : nullptr) {}
  ~ScratchBlock() { delete[] data; }
  ScratchBlock(const ScratchBlock&) = delete;
  ScratchBlock& operator=(const ScratchBlock&) = delete;

  char* const data;
};

// What tells the two brokerages' replies apart.
struct PositionLayout {
  SectionShapes sections;
  const char* noData;
};

// Both layouts log under one name.
char* ListPositions(CGatewayStk& gateway, const char* reply, const PositionLayout& layout,
                    int* status) {
  const std::string_view text = AsText(reply);
  LogReply("QueryInventoryDecode", text);
  if (gateway.TransportFailed(text, status)) return gateway.m_szBuffer;
  CReplyList positions(text, kTags);
  if (char* const answer = gateway.AnswerWithoutData(positions, layout.noData, status))
    return answer;

  const ScratchBlock scratch(kMaxSections, text.size());
  if (scratch.data == nullptr) {
    *status = -1;
    return nullptr;
  }
  CSections sections(scratch.data, text.size());
  while (positions.NextData()) sections.Add(layout.sections, positions.Record());

  const size_t length = sections.Length(layout.sections);
  char* const room = gateway.RenewResult(length, status);
  if (room == nullptr) return nullptr;
  CTextWriter result(room, length + 1);
  sections.WriteTo(result, layout.sections);
  return result.Text();
}

}  // namespace

char* CGatewayStk::QueryInventoryEncode(const char* branch, const char* identity,
                                        const char* password, int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.AppendText("|FUNC=5|01=");
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayStk::QueryInventoryDecode(const char* reply, int* status) {
  static constexpr PositionLayout kLayout = {{{2, {kQuantity75, kQuantity751}, "!"},
                                              {2, {kQuantity76, kQuantity761}, "@@@@@!"},
                                              {2, {kQuantity77, kQuantity771}, "@@@@!"},
                                              {1, {kQuantityPS}, "|0|0!"}},
                                             "<0>!0!<1>!0!<2>!0!<3>!0!"};
  return ListPositions(*this, reply, kLayout, status);
}

char* CGatewayStk::QueryInventoryDecodeJZG(const char* reply, int* status) {
  static constexpr PositionLayout kLayout = {
      {{3, {kQuantity75, kQuantity751, kQuantity752}, "!"},
       {3, {kQuantity76, kQuantity761, kQuantity762}, "@@@@@!"},
       {3, {kQuantity77, kQuantity771, kQuantity772}, "@@@@!"}},
      "<0>!0!<1>!0!<2>!0!"};
  return ListPositions(*this, reply, kLayout, status);
}
