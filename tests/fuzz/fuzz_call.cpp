#include "tests/fuzz/fuzz_call.h"

#include <algorithm>
#include <cstring>

namespace gateway_fuzz {
namespace {

constexpr std::string_view kNullText = "\xff";

// The letters of the arguments that a call passes.
std::string_view Letters(const gateway_tests::Export& row) {
  std::string_view shape = row.shape;
  if (row.HasStatus()) shape.remove_suffix(1);
  return shape;
}

size_t BytesOf(char letter) {
  return letter == 'i' ? 4 : letter == 'c' ? 2 : 1;
}

// The bytes that are left; behind the last one stand zeros.
class CReader {
 public:
  CReader(const uint8_t* data, size_t size) : m_pAt(data), m_pEnd(data + size) {}

  uint8_t Byte() { return m_pAt == m_pEnd ? uint8_t{0} : *m_pAt++; }

  int64_t Number(char letter) {
    uint32_t value = 0;
    for (size_t i = 0; i < BytesOf(letter); ++i) value |= uint32_t{Byte()} << (8 * i);
    if (letter == 'i') return static_cast<int32_t>(value);
    return letter == 'b' ? int64_t{static_cast<int8_t>(value)} : int64_t{value};
  }

  std::string_view Text() {
    if (m_pAt == m_pEnd) return {};
    const size_t left = static_cast<size_t>(m_pEnd - m_pAt);
    const auto* const zero = static_cast<const uint8_t*>(std::memchr(m_pAt, 0, left));
    const std::string_view text(reinterpret_cast<const char*>(m_pAt),
                                zero == nullptr ? left : static_cast<size_t>(zero - m_pAt));
    m_pAt = zero == nullptr ? m_pEnd : zero + 1;
    return text;
  }

 private:
  const uint8_t* m_pAt;
  const uint8_t* m_pEnd;
};

// The bytes that there is room for.
class CWriter {
 public:
  CWriter(uint8_t* data, size_t size) : m_pBegin(data), m_pAt(data), m_pEnd(data + size) {}

  void Byte(uint64_t value) {
    if (m_pAt != m_pEnd) *m_pAt++ = static_cast<uint8_t>(value & 0xff);
  }

  void Text(std::string_view text) {
    const size_t size = std::min(text.size(), static_cast<size_t>(m_pEnd - m_pAt));
    if (size > 0) std::memcpy(m_pAt, text.data(), size);
    m_pAt += size;
  }

  size_t Size() const { return static_cast<size_t>(m_pAt - m_pBegin); }

 private:
  uint8_t* m_pBegin;
  uint8_t* m_pAt;
  uint8_t* m_pEnd;
};

}  // namespace

int64_t FuzzCall::Clock() const {
  return int64_t{moment} * 9277711 + 1700000000 % 86399;
}

FuzzCall ReadCall(const Rows& rows, const uint8_t* data, size_t size) {
  CReader reader(data, size);
  FuzzCall call;
  call.row = reader.Byte() % rows.count;
  call.moment = reader.Byte();
  for (char letter : Letters(rows.rows[call.row])) {
    if (letter == 'S') {
      const std::string_view text = reader.Text();
      const bool null = text == kNullText;
      call.Add({letter, null, 0, null ? std::string_view() : text});
    } else {
      call.Add({letter, false, reader.Number(letter), {}});
    }
  }
  return call;
}

size_t WriteCall(const FuzzCall& call, uint8_t* data, size_t maxSize) {
  CWriter writer(data, maxSize);
  writer.Byte(call.row);
  writer.Byte(call.moment);
  for (const FuzzArgument& argument : call) {
    if (argument.letter == 'S') {
      writer.Text(argument.null ? kNullText : argument.text);
      writer.Byte(0);
      continue;
    }
    const auto value = static_cast<uint64_t>(argument.number);
    for (size_t i = 0; i < BytesOf(argument.letter); ++i) writer.Byte(value >> (8 * i));
  }
  return writer.Size();
}

void FitArguments(const Rows& rows, FuzzCall& call) {
  const FuzzCall old = call;
  call.argumentCount = 0;
  size_t text = 0;
  size_t number = 0;
  for (char letter : Letters(rows.rows[call.row])) {
    size_t& at = letter == 'S' ? text : number;
    while (at < old.argumentCount && (old.arguments[at].letter == 'S') != (letter == 'S')) ++at;
    FuzzArgument argument = {letter, false, 0, {}};
    if (at < old.argumentCount) argument = old.arguments[at++];
    argument.letter = letter;
    call.Add(argument);
  }
}

}  // namespace gateway_fuzz
