// The mutator of both fuzz targets: it works on what a call is made of - the row, numbers, texts,
// and in texts on fields and records - and leaves bytes to the fuzzer's own mutations.

#include <algorithm>
#include <array>
#include <cstring>
#include <initializer_list>
#include <iterator>
#include <string_view>
#include <utility>

#include "tests/fuzz/fuzz_call.h"
#include "tests/fuzz/lent_memory.h"
#include "tests/fuzz/wire_words.h"

extern "C" size_t LLVMFuzzerMutate(uint8_t* data, size_t size, size_t maxSize);

namespace gateway_fuzz {
namespace {

/// Copies a text, which may be an empty one of no place.
void Copy(std::string_view text, char* to) {
  if (!text.empty()) std::memcpy(to, text.data(), text.size());
}

/// Room for all that one mutation makes; what does not fit is not made.
class CScratch {
 public:
  void Clear() { m_nUsed = 0; }
  size_t Left() const { return sizeof m_Bytes - m_nUsed; }

  /// The next bytes; how many of them are used is told later.
  char* Open() { return m_Bytes + m_nUsed; }
  std::string_view Close(size_t size) {
    const std::string_view text(m_Bytes + m_nUsed, size);
    m_nUsed += size;
    return text;
  }

  std::string_view Concatenate(std::initializer_list<std::string_view> parts) {
    char* const begin = Open();
    size_t size = 0;
    for (const std::string_view part : parts) {
      if (size + part.size() > Left()) return {};
      Copy(part, begin + size);
      size += part.size();
    }
    return Close(size);
  }

 private:
  size_t m_nUsed = 0;
  char m_Bytes[size_t{1} << 20];
};

/// The fields of a text, between its bars.
class CFields {
 public:
  void Clear() { m_nSize = 0; }
  size_t Size() const { return m_nSize; }
  std::string_view& operator[](size_t at) { return m_Fields[at]; }
  const std::string_view* At(size_t at) const { return m_Fields + at; }

  void Split(std::string_view text) {
    Clear();
    while (m_nSize < kMax) {
      const void* const bar = text.empty() ? nullptr : std::memchr(text.data(), '|', text.size());
      if (bar == nullptr) break;
      const auto size = static_cast<size_t>(static_cast<const char*>(bar) - text.data());
      m_Fields[m_nSize++] = text.substr(0, size);
      text.remove_prefix(size + 1);
    }
    if (m_nSize < kMax) m_Fields[m_nSize++] = text;
  }

  std::string_view Join(CScratch& scratch, size_t maxSize) const {
    char* const begin = scratch.Open();
    const size_t room = std::min(maxSize, scratch.Left());
    size_t size = 0;
    for (size_t i = 0; i < m_nSize; ++i) {
      const std::string_view field = m_Fields[i];
      if (size + field.size() + 1 > room) break;
      if (i > 0) begin[size++] = '|';
      Copy(field, begin + size);
      size += field.size();
    }
    return scratch.Close(size);
  }

  void Insert(size_t at, std::string_view field) { Insert(at, &field, 1); }

  /// `fields` may be fields of this text.
  void Insert(size_t at, const std::string_view* fields, size_t count) {
    if (m_nSize + count > kMax) return;
    std::copy_n(fields, count, m_More);
    std::copy_backward(m_Fields + at, m_Fields + m_nSize, m_Fields + m_nSize + count);
    std::copy_n(m_More, count, m_Fields + at);
    m_nSize += count;
  }

  void Erase(size_t at, size_t count) {
    std::copy(m_Fields + at + count, m_Fields + m_nSize, m_Fields + at);
    m_nSize -= count;
  }

  void Cut(size_t size) { m_nSize = size; }

  /// The first field from `at` on that begins with `mark`, else Size().
  size_t Find(size_t at, std::string_view mark) const {
    while (at < m_nSize && m_Fields[at].substr(0, mark.size()) != mark) ++at;
    return at;
  }

 private:
  static constexpr size_t kMax = 8192;
  size_t m_nSize = 0;
  std::string_view m_Fields[kMax];
  std::string_view m_More[kMax];
};

/// A text of one character, as long as one wants.
struct TFill {
  char m_Bytes[4096];
};
template <char... kFill>
std::string_view FillOf(size_t which, size_t size) {
  static const auto s_Fills = [] {
    std::array<TFill, sizeof...(kFill)> fills;
    size_t i = 0;
    for (const char fill : {kFill...}) std::memset(fills[i++].m_Bytes, fill, sizeof(TFill));
    return fills;
  }();
  return {s_Fills[which % sizeof...(kFill)].m_Bytes, std::min(size, sizeof(TFill))};
}

class CMutator {
 public:
  /// To be called before each mutation: what the last one made is gone then.
  void Start(const TRows& rows, unsigned seed, size_t maxSize) {
    m_Rows = rows;
    m_nState = seed * uint64_t{2654435761U} + 88172645463325252U;
    m_nMax = maxSize;
    m_Scratch.Clear();
    Below(1);
  }

  void Mutate(TFuzzCall& call) {
    const size_t kind = Below(16);
    if (kind == 0) {
      call.m_nRow = Below(m_Rows.m_nCount);
      FitArguments(m_Rows, call);
    } else if (kind == 1) {
      call.m_nMoment = static_cast<uint8_t>(Below(256));
    } else {
      TFuzzArgument& argument = call.m_Arguments[Below(call.m_nArguments)];
      if (argument.m_chLetter == 'S') {
        MutateText(argument);
      } else {
        MutateNumber(argument);
      }
    }
  }

  /// Gives the call a text, or some fields of a text, of another call.
  void Cross(TFuzzCall& call, const TFuzzCall& other) {
    const size_t from = SomeText(other);
    const size_t to = SomeText(call);
    if (from == other.m_nArguments || to == call.m_nArguments) return;
    const TFuzzArgument& source = other.m_Arguments[from];
    TFuzzArgument& target = call.m_Arguments[to];
    if (Below(4) == 0 || target.m_bNull || source.m_bNull) {
      target = source;
      return;
    }
    m_Fields.Split(target.m_Text);
    m_Others.Split(source.m_Text);
    const size_t begin = Below(m_Others.Size());
    const size_t count = 1 + Below(m_Others.Size() - begin);
    m_Fields.Insert(Below(m_Fields.Size() + 1), m_Others.At(begin), count);
    target.m_Text = m_Fields.Join(m_Scratch, m_nMax);
  }

 private:
  size_t Below(size_t bound) {
    m_nState ^= m_nState << 13;
    m_nState ^= m_nState >> 7;
    m_nState ^= m_nState << 17;
    return static_cast<size_t>(m_nState % bound);
  }
  template <class TList>
  auto Choose(const TList& list) {
    return list[Below(std::size(list))];
  }

  /// The place of one of the texts; m_nArguments when there is none.
  size_t SomeText(const TFuzzCall& call) {
    size_t texts[TFuzzCall::kMaxArguments];
    size_t count = 0;
    for (size_t i = 0; i < call.m_nArguments; ++i) {
      if (call.m_Arguments[i].m_chLetter == 'S') texts[count++] = i;
    }
    return count == 0 ? call.m_nArguments : texts[Below(count)];
  }

  std::string_view Value() {
    if (Below(8) != 0) return Choose(kValues);
    const size_t size = Choose(kLengths);
    return FillOf<'0', '9', 'x', ' ', '.', '&'>(Below(6), size);
  }
  std::string_view Field() { return m_Scratch.Concatenate({Choose(kTags), "=", Value()}); }

  void InsertRecord(size_t at) {
    constexpr const char* kNumbers67[] = {"67=0", "67=1", "67=2", "67=3", "67=4",
                                          "67=5", "67=6", "67=7", "67=8"};
    std::string_view record[32] = {"00=1", Choose(kNumbers67),
                                   Below(4) != 0 ? std::string_view("68=0000") : Field()};
    size_t count = 3;
    for (size_t more = Below(24); more > 0; --more) record[count++] = Field();
    record[count++] = "01=";
    m_Fields.Insert(at, record, count);
  }

  void MutateNumber(TFuzzArgument& argument) {
    const int64_t value =
        Below(2) != 0 ? Choose(kNumbers) : argument.m_nNumber + int64_t(Below(9)) - 4;
    const auto bits = static_cast<uint32_t>(value);
    argument.m_nNumber = argument.m_chLetter == 'c'   ? int64_t{static_cast<uint16_t>(bits)}
                         : argument.m_chLetter == 'b' ? int64_t{static_cast<int8_t>(bits)}
                                                      : int64_t{static_cast<int32_t>(bits)};
  }

  void MutateText(TFuzzArgument& argument) {
    const size_t kind = argument.m_bNull ? 0 : Below(16);
    argument.m_bNull = false;
    if (kind == 0) {
      argument.m_Text = Value();
    } else if (kind == 1) {
      argument.m_bNull = Below(4) == 0;
      argument.m_Text = {};
    } else if (kind < 6) {
      argument.m_Text = MutateBytes(argument.m_Text);
    } else {
      argument.m_Text = MutateFields(argument.m_Text);
    }
  }

  std::string_view MutateBytes(std::string_view text) {
    const size_t room = std::max(m_nMax, text.size());
    if (room > m_Scratch.Left()) return text;
    char* const bytes = m_Scratch.Open();
    Copy(text, bytes);
    const size_t size = LLVMFuzzerMutate(reinterpret_cast<uint8_t*>(bytes), text.size(), room);
    char* const end = std::remove(bytes, bytes + size, '\0');
    return m_Scratch.Close(static_cast<size_t>(end - bytes));
  }

  std::string_view MutateFields(std::string_view text) {
    m_Fields.Split(text);
    const size_t at = Below(m_Fields.Size());
    const size_t other = Below(m_Fields.Size());
    std::string_view& field = m_Fields[at];
    switch (Below(12)) {
      case 0:
      case 1:
        m_Fields.Insert(other + 1, Field());
        break;
      case 2:
        m_Fields.Erase(at, 1);
        break;
      case 3:
        m_Fields.Insert(other, field);
        break;
      case 4:
        std::swap(field, m_Fields[other]);
        break;
      case 5:
      case 6:
        field = m_Scratch.Concatenate({field.substr(0, field.find('=') + 1), Value()});
        break;
      case 7:
        field = m_Scratch.Concatenate(
            {Choose(kTags), field.substr(std::min(field.find('='), field.size()))});
        break;
      case 8:
        InsertRecord(other + 1);
        break;
      case 9:
        m_Fields.Insert(at, Below(2) == 0 ? "00=" : "01=");
        break;
      case 10:
        m_Fields.Cut(at + 1);
        break;
      default:
        CopyRecord(at, other);
    }
    return m_Fields.Join(m_Scratch, m_nMax);
  }

  /// Repeats, or takes out, the record that begins next behind `at`.
  void CopyRecord(size_t at, size_t other) {
    const size_t begin = m_Fields.Find(at, "00=");
    const size_t end = m_Fields.Find(begin, "01=");
    if (end == m_Fields.Size()) {
      InsertRecord(m_Fields.Size());
    } else if (Below(4) == 0) {
      m_Fields.Erase(begin, end + 1 - begin);
    } else {
      m_Fields.Insert(other, m_Fields.At(begin), end + 1 - begin);
    }
  }

  TRows m_Rows{};
  uint64_t m_nState = 0;
  size_t m_nMax = 0;
  CScratch m_Scratch;
  CFields m_Fields;
  CFields m_Others;
};

CMutator s_Mutator;

/// Writes the call to where its texts may still lie.
size_t Store(const TFuzzCall& call, uint8_t* data, size_t maxSize) {
  static uint8_t s_Bytes[kMaxInput];
  const size_t size = WriteCall(call, s_Bytes, std::min(maxSize, kMaxInput));
  std::memcpy(data, s_Bytes, size);
  return size;
}

}  // namespace
}  // namespace gateway_fuzz

extern "C" size_t LLVMFuzzerCustomMutator(uint8_t* data, size_t size, size_t maxSize,
                                          unsigned seed) {
  using namespace gateway_fuzz;
  TFuzzCall call = ReadCall(FuzzRows(), data, size);
  s_Mutator.Start(FuzzRows(), seed, maxSize);
  for (unsigned rounds = 1 + seed % 4; rounds > 0; --rounds) s_Mutator.Mutate(call);
  return Store(call, data, maxSize);
}

extern "C" size_t LLVMFuzzerCustomCrossOver(const uint8_t* data1, size_t size1,
                                            const uint8_t* data2, size_t size2, uint8_t* out,
                                            size_t maxSize, unsigned seed) {
  using namespace gateway_fuzz;
  TFuzzCall call = ReadCall(FuzzRows(), data1, size1);
  s_Mutator.Start(FuzzRows(), seed, maxSize);
  s_Mutator.Cross(call, ReadCall(FuzzRows(), data2, size2));
  return Store(call, out, maxSize);
}
