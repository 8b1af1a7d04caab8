// A result that grows: the records of a list.
#ifndef QUORVANE_GATEWAY_CORE_RESULT_TEXT_H_
#define QUORVANE_GATEWAY_CORE_RESULT_TEXT_H_

#include <cstdint>

#include "gateway/core/wire_text.h"

// A heap text as the gateway objects keep it: owned by the object, released with array delete.
struct HeapText {
  char*& data;
  int32_t& size;    // capacity
  int32_t& length;  // characters
};

// Joins `text` to the text that is there (see CGatewayPub::AppendData).
void AppendHeapText(const HeapText& owner, const char* text, int length, bool reset);

// Replaces the text by one of `length` characters, all of which its owner fills, and returns it;
// null, with the old text as it was, when memory runs out.
char* RenewHeapText(const HeapText& owner, size_t length);

// Writes the records of one list into an object's heap text. A list that memory cannot hold fails
// once, for good.
class CResultText : public CWireText {
 public:
  static constexpr size_t kOpeningRoom = 20;  // kept before the records for what opens the list

  // `owner`'s text is replaced. `expected` is a fair guess of the list's size: a first allocation
  // holds that much, and a second eight times as much, more than any reply of that size can give,
  // or all that an int can tell.
  CResultText(const HeapText& owner, size_t expected);
  CResultText(const CResultText&) = delete;
  CResultText& operator=(const CResultText&) = delete;

  bool Failed() const { return m_bFailed; }

  // The records so far.
  size_t Length() const { return static_cast<size_t>(m_pAt - m_pRecords); }

  // The terminated list behind "%s%d!" of `opening` (at most 8 characters) and `count`, or null
  // when it failed. It begins where the owner's heap text does.
  char* Finish(std::string_view opening, int count);

 private:
  bool MakeRoom(size_t count) override;

  HeapText m_owner;
  uint64_t m_nExpected;
  char* m_pRecords;
  char m_cNoRoom = '\0';  // what the text points to before its first allocation; never written
  bool m_bFailed = false;
};

#endif  // QUORVANE_GATEWAY_CORE_RESULT_TEXT_H_
