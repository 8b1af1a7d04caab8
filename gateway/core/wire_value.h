// The values that stand in the pieces of a wire text, each with the cheapest way to write it.
#ifndef QUORVANE_GATEWAY_CORE_WIRE_VALUE_H_
#define QUORVANE_GATEWAY_CORE_WIRE_VALUE_H_

#include <cstring>
#include <string_view>
#include <type_traits>

#include "gateway/core/branch_hints.h"
#include "gateway/core/decimal.h"

inline std::string_view AsText(const char* text) {
  return text == nullptr ? std::string_view() : std::string_view(text);
}
inline std::string_view AsText(std::string_view text) {
  return text;
}

// Copies more than 16 bytes, or fewer than 4.
void CopyUncommon(char* to, const char* from, size_t size);

// Copies `size` bytes. Most values of a line have 4 to 16: two moves meet or overlap, which costs
// less than a call.
ALWAYS_INLINE inline void CopyShort(char* to, const char* from, size_t size) {
  if (Rarely(size - 4 > 12)) return CopyUncommon(to, from, size);
  if (size >= 8) {
    uint64_t head, tail;
    memcpy(&head, from, 8);
    memcpy(&tail, from + size - 8, 8);
    memcpy(to, &head, 8);
    memcpy(to + size - 8, &tail, 8);
  } else {
    uint32_t head, tail;
    memcpy(&head, from, 4);
    memcpy(&tail, from + size - 4, 4);
    memcpy(to, &head, 4);
    memcpy(to + size - 4, &tail, 4);
  }
}

// A value plainly, for a text that has next to no room left.
struct WireArgument {
  std::string_view text;
  int64_t number;
};

// The values of a piece as they are written: how many bytes the writing touches at most, from the
// value's place on; the writing itself, which returns the place behind the value; the value
// plainly.
struct TextValue {
  std::string_view text;

  size_t Bound() const { return text.size(); }
  ALWAYS_INLINE char* WriteTo(char* at) const {
    CopyShort(at, text.data(), text.size());
    return at + text.size();
  }
  WireArgument Plain() const { return {text, 0}; }
};

// A text that lies in at least kReadable bytes, so that nothing asks how many of them count.
struct PaddedText {
  static constexpr size_t kReadable = 16;

  std::string_view text;

  size_t Bound() const { return text.size() + kReadable; }
  ALWAYS_INLINE char* WriteTo(char* at) const {
    memcpy(at, text.data(), kReadable);
    if (Rarely(text.size() > kReadable)) memcpy(at, text.data(), text.size());
    return at + text.size();
  }
  WireArgument Plain() const { return {text, 0}; }
};

// A text whose size the compiler knows, where it lies.
template <size_t kSize>
struct FixedValue {
  const char* chars;

  static size_t Bound() { return kSize; }
  ALWAYS_INLINE char* WriteTo(char* at) const {
    memcpy(at, chars, kSize);
    return at + kSize;
  }
  WireArgument Plain() const { return {{chars, kSize}, 0}; }
};

// The same with its characters; outlives the pieces that it is put into.
template <size_t kSize>
struct FixedText {
  char chars[kSize];
};

struct CharValue {
  char c;

  static size_t Bound() { return 1; }
  ALWAYS_INLINE char* WriteTo(char* at) const {
    *at = c;
    return at + 1;
  }
  WireArgument Plain() const { return {{}, c}; }
};

// `Signed` is int32_t or int64_t; `kWidth` as in "%0<width>d", 0 for the plain number.
template <class Signed, size_t kWidth>
struct NumberValue {
  // Numbers below it fill their width with zeros on the left, and fit 32 bits.
  static constexpr uint64_t kEnd = kWidth < 10 ? PowerOfTen(kWidth) : UINT32_MAX;

  Signed number;

  static size_t Bound() {
    return kWidth > kMaxDecimalSize<Signed> ? kWidth : kMaxDecimalSize<Signed>;
  }
  ALWAYS_INLINE char* WriteTo(char* at) const {
    if constexpr (kWidth == 0) {
      if (Mostly(static_cast<uint64_t>(number) < kShortNumberEnd)) {
        return ShortDigits(static_cast<uint32_t>(number)).WriteTo(at);
      }
      return WriteNumber(at, number);
    } else {
      if (Mostly(number >= 0 && static_cast<uint64_t>(number) < kEnd)) {
        return WriteDigits<kWidth>(at, static_cast<uint32_t>(number));
      }
      return WriteDecimal(at, number, kWidth);
    }
  }
  WireArgument Plain() const { return {{}, number}; }
};

// A byte of the host's, which has one digit where it makes sense.
struct ByteValue {
  uint8_t number;

  static size_t Bound() { return 3; }
  ALWAYS_INLINE char* WriteTo(char* at) const {
    if (Rarely(number > 9)) return WriteDecimal(at, number, 0);
    return WriteDigits<1>(at, number);
  }
  WireArgument Plain() const { return {{}, number}; }
};

// An int that several pieces print: its digits are made once.
struct RepeatedNumber {
  explicit RepeatedNumber(int value)
      : number(value), digits(IsShort() ? static_cast<uint32_t>(value) : 0) {}

  bool IsShort() const { return static_cast<uint32_t>(number) < kShortNumberEnd; }

  static size_t Bound() { return kMaxDecimalSize<int32_t>; }
  ALWAYS_INLINE char* WriteTo(char* at) const {
    return Mostly(IsShort()) ? digits.WriteTo(at) : WriteNumber(at, number);
  }
  WireArgument Plain() const { return {{}, number}; }

  int number;
  ShortDigits digits;
};

// As NumberValue, with a width that is known only at run time.
struct PaddedValue {
  int64_t number;
  size_t width;

  size_t Bound() const { return DecimalSize(number, width); }
  char* WriteTo(char* at) const { return WriteDecimal(at, number, width); }
};

inline TextValue MakeTextValue(std::string_view text) {
  return {text};
}
inline TextValue MakeTextValue(const char* text) {
  return {AsText(text)};
}
inline PaddedText MakeTextValue(PaddedText text) {
  return text;
}
template <size_t kSize>
FixedValue<kSize> MakeTextValue(FixedValue<kSize> text) {
  return text;
}
template <size_t kSize>
FixedValue<kSize> MakeTextValue(const FixedText<kSize>& text) {
  return {text.chars};
}

// The value that a mark of this kind and width prints.
template <char kKind, size_t kWidth, class Value>
auto MakeWireValue(const Value& value) {
  if constexpr (kKind == 's') {
    return MakeTextValue(value);
  } else if constexpr (kKind == 'c') {
    static_assert(std::is_same_v<Value, char>, "%c takes a char");
    return CharValue{value};
  } else if constexpr (kKind == 'l') {
    static_assert(std::is_integral_v<Value>, "%ld takes an integer");
    return NumberValue<int64_t, kWidth>{static_cast<int64_t>(value)};
  } else if constexpr (std::is_same_v<Value, uint8_t>) {
    static_assert(kKind == 'd' && kWidth == 0, "a byte is printed plainly");
    return ByteValue{value};
  } else if constexpr (std::is_same_v<Value, RepeatedNumber>) {
    static_assert(kKind == 'd' && kWidth == 0, "a repeated number is printed plainly");
    return value;
  } else {
    static_assert(kKind == 'd' && std::is_same_v<Value, int>, "%d takes an int");
    return NumberValue<int32_t, kWidth>{value};
  }
}

#endif  // QUORVANE_GATEWAY_CORE_WIRE_VALUE_H_
