#include "tests/abi/load.h"

#include <algorithm>
#include <string_view>

namespace gateway_tests {
namespace {

// Where word sizes, signs and roundings of machines could part.
constexpr std::string_view kWords[] = {"|00=",
                                       "|01=",
                                       "|00=1|01=",
                                       "|67=",
                                       "|15=",
                                       "|",
                                       "=",
                                       "\n",
                                       " ",
                                       "&",
                                       "%",
                                       "0",
                                       "-1",
                                       "-0",
                                       "+7",
                                       "00000000",
                                       "2147483647",
                                       "2147483648",
                                       "-2147483648",
                                       "-2147483649",
                                       "4294967296",
                                       "9223372036854775807",
                                       "9223372036854775808",
                                       "-9223372036854775808",
                                       "99999999999999999999999",
                                       "0.005",
                                       "-0.5",
                                       "1234.5678",
                                       ".5",
                                       "5.",
                                       "1e9",
                                       "12.3456789012345",
                                       "\xFF\x80",
                                       "\x7F",
                                       "\xE5\xA7\x94\xE8\xA8\x97",
                                       "\t",
                                       "20240115",
                                       "134521",
                                       "0134521000",
                                       "TXFA4",
                                       "2330",
                                       "XX",
                                       "ABCDEFGHIJKLMNOPQRSTU"};

constexpr int64_t kNumbers[] = {0,    1,     2,     3,         4,          7,           8,      9,
                                10,   11,    14,    15,        16,         17,          20,     63,
                                64,   65,    99,    127,       128,        255,         -1,     -2,
                                -128, 32767, 65535, 999999999, 2147483647, -2147483648, -999999};

constexpr size_t kLongest = 20000;

template <typename Item, size_t kCount>
const Item& Pick(const Item (&items)[kCount], CDraw& draw) {
  return items[draw.Below(kCount)];
}

int64_t DrawNumber(CDraw& draw) {
  return draw.Below(4) == 0 ? static_cast<int32_t>(draw.Next()) : Pick(kNumbers, draw);
}

// Where the value of one of the fields of `text` begins; its length goes to `length`.
size_t DrawValue(const std::string& text, size_t& length, CDraw& draw) {
  size_t begin = text.find('=', draw.Below(text.size() + 1));
  begin = begin == std::string::npos ? text.size() : begin + 1;
  length = std::min(text.find_first_of("|\n", begin), text.size()) - begin;
  return begin;
}

void DisturbText(std::string& text, CDraw& draw) {
  const size_t at = draw.Below(text.size() + 1);
  const size_t length = draw.Below(std::min<size_t>(text.size() - at, 40) + 1);
  switch (draw.Below(8)) {
    case 0:
      text.resize(at);
      break;
    case 1:
      text.erase(at, length);
      break;
    case 2:
      if (at < text.size()) text[at] = static_cast<char>(1 + draw.Below(255));
      break;
    case 3:
      text.insert(draw.Below(text.size() + 1), text.substr(at, length));
      break;
    case 4:
      text.insert(at, Pick(kWords, draw));
      break;
    case 5: {  // Long enough for the largest buffers.
      const std::string part = text.substr(at, length);
      const size_t times = draw.Below(300);
      for (size_t i = 0; i < times && text.size() < kLongest; ++i) text.insert(at, part);
      break;
    }
    default: {
      size_t valueLength = 0;
      const size_t value = DrawValue(text, valueLength, draw);
      text.replace(value, valueLength, Pick(kWords, draw));
    }
  }
}

void DisturbOne(Argument& argument, CDraw& draw) {
  switch (argument.letter) {
    case 'i':
      argument.number = DrawNumber(draw);
      break;
    case 'b':
      argument.number = static_cast<int8_t>(draw.Next());
      break;
    case 'c':
      argument.number = draw.Below(4) == 0 ? static_cast<uint16_t>(draw.Next())
                                           : static_cast<int64_t>(draw.Below(128));
      break;
    default:
      if (!argument.text.has_value()) argument.text.emplace();
      for (size_t left = 1 + draw.Below(4); left > 0; --left) DisturbText(*argument.text, draw);
      if (argument.text->find('\0') != std::string::npos) argument.text->clear();
      if (draw.Below(100) == 0) argument.text.reset();
  }
}

}  // namespace

uint64_t CDraw::Next() {
  uint64_t mixed = m_nState += 0x9E3779B97F4A7C15U;
  mixed = (mixed ^ (mixed >> 30)) * 0xBF58476D1CE4E5B9U;
  mixed = (mixed ^ (mixed >> 27)) * 0x94D049BB133111EBU;
  return mixed ^ (mixed >> 31);
}

Arguments Disturb(Arguments arguments, CDraw& draw) {
  for (size_t left = 1 + draw.Below(3); left > 0; --left) {
    DisturbOne(arguments[draw.Below(arguments.size())], draw);
  }
  return arguments;
}

}  // namespace gateway_tests
