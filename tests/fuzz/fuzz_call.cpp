#include "tests/fuzz/fuzz_call.h"

#include <string_view>
#include <utility>

namespace gateway_fuzz {
namespace {

using gateway_tests::TArgument;
using gateway_tests::TArguments;

constexpr std::string_view kNullText = "\xff";

/// The letters of the arguments that a call passes.
std::string_view Letters(const gateway_tests::TExport& row) {
  std::string_view shape = row.m_szShape;
  if (row.HasStatus()) shape.remove_suffix(1);
  return shape;
}

size_t BytesOf(char letter) {
  return letter == 'i' ? 4 : letter == 'c' ? 2 : 1;
}

/// The bytes that are left; behind the last one stand zeros.
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

  TArgument Text() {
    const uint8_t* end = m_pAt;
    while (end != m_pEnd && *end != 0) ++end;
    const std::string_view text(reinterpret_cast<const char*>(m_pAt),
                                static_cast<size_t>(end - m_pAt));
    m_pAt = end == m_pEnd ? end : end + 1;
    return text == kNullText ? TArgument::Null() : TArgument::Text(text);
  }

 private:
  const uint8_t* m_pAt;
  const uint8_t* m_pEnd;
};

}  // namespace

int64_t TFuzzCall::Clock() const {
  return int64_t{m_nMoment} * 9277711 + 1700000000 % 86399;
}

TFuzzCall ReadCall(const TRows& rows, const uint8_t* data, size_t size) {
  CReader reader(data, size);
  TFuzzCall call;
  call.m_nRow = reader.Byte() % rows.m_nCount;
  call.m_nMoment = reader.Byte();
  const std::string_view letters = Letters(rows.m_pRows[call.m_nRow]);
  call.m_Arguments.reserve(letters.size());
  for (char letter : letters) {
    if (letter == 'S') {
      call.m_Arguments.push_back(reader.Text());
    } else {
      call.m_Arguments.push_back({letter, reader.Number(letter), {}});
    }
  }
  return call;
}

std::string WriteCall(const TFuzzCall& call) {
  std::string bytes = {static_cast<char>(call.m_nRow), static_cast<char>(call.m_nMoment)};
  for (const TArgument& argument : call.m_Arguments) {
    if (argument.m_chLetter == 'S') {
      bytes.append(argument.m_Text.has_value() ? std::string_view(*argument.m_Text) : kNullText);
      bytes.push_back('\0');
      continue;
    }
    const auto value = static_cast<uint64_t>(argument.m_nNumber);
    for (size_t i = 0; i < BytesOf(argument.m_chLetter); ++i) {
      bytes.push_back(static_cast<char>(value >> (8 * i) & 0xff));
    }
  }
  return bytes;
}

void FitArguments(const TRows& rows, TFuzzCall& call) {
  TArguments old = std::move(call.m_Arguments);
  call.m_Arguments.clear();
  size_t text = 0;
  size_t number = 0;
  for (char letter : Letters(rows.m_pRows[call.m_nRow])) {
    size_t& at = letter == 'S' ? text : number;
    while (at < old.size() && (old[at].m_chLetter == 'S') != (letter == 'S')) ++at;
    TArgument argument = letter == 'S' ? TArgument::Text("") : TArgument{letter, 0, {}};
    if (at < old.size()) argument = std::move(old[at++]);
    argument.m_chLetter = letter;
    call.m_Arguments.push_back(std::move(argument));
  }
}

}  // namespace gateway_fuzz
