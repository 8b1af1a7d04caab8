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

// Copies a text, which may be an empty one of no place.
void Copy(std::string_view text, char* to) {
  if (!text.empty()) std::memcpy(to, text.data(), text.size());
}

// Room for all that one mutation makes; what does not fit is not made.
class CScratch {
 public:
  void Clear() { m_nUsed = 0; }
  size_t Left() const { return sizeof m_bytes - m_nUsed; }

  // The next bytes; how many of them are used is told later.
  char* Open() { return m_bytes + m_nUsed; }
  std::string_view Close(size_t size) {
    const std::string_view text(m_bytes + m_nUsed, size);
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
  char m_bytes[size_t{1} << 20];
};

// The fields of a text, between its bars.
class CFields {
 public:
  void Clear() { m_nSize = 0; }
  size_t Size() const { return m_nSize; }
  std::string_view& operator[](size_t at) { return m_fields[at]; }
  const std::string_view* At(size_t at) const { return m_fields + at; }

  void Split(std::string_view text) {
    Clear();
    while (m_nSize < kMax) {
      const void* const bar = text.empty() ? nullptr : std::memchr(text.data(), '|', text.size());
      if (bar == nullptr) break;
      const auto size = static_cast<size_t>(static_cast<const char*>(bar) - text.data());
      m_fields[m_nSize++] = text.substr(0, size);
      text.remove_prefix(size + 1);
    }
    if (m_nSize < kMax) m_fields[m_nSize++] = text;
  }

  std::string_view Join(CScratch& scratch, size_t maxSize) const {
    char* const begin = scratch.Open();
    const size_t room = std::min(maxSize, scratch.Left());
    size_t size = 0;
    for (size_t i = 0; i < m_nSize; ++i) {
      const std::string_view field = m_fields[i];
      if (size + field.size() + 1 > room) break;
      if (i > 0) begin[size++] = '|';
      Copy(field, begin + size);
      size += field.size();
    }
    return scratch.Close(size);
  }

  void Insert(size_t at, std::string_view field) { Insert(at, &field, 1); }

  // `fields` may be fields of this text.
  void Insert(size_t at, const std::string_view* fields, size_t count) {
    if (m_nSize + count > kMax) return;
    std::copy_n(fields, count, m_more);
    std::copy_backward(m_fields + at, m_fields + m_nSize, m_fields + m_nSize + count);
    std::copy_n(m_more, count, m_fields + at);
    m_nSize += count;
  }

  void Erase(size_t at, size_t count) {
    std::copy(m_fields + at + count, m_fields + m_nSize, m_fields + at);
    m_nSize -= count;
  }

  void Cut(size_t size) { m_nSize = size; }

  // The first field from `at` on that begins with `mark`, else Size().
  size_t Find(size_t at, std::string_view mark) const {
    while (at < m_nSize && m_fields[at].substr(0, mark.size()) != mark) ++at;
    return at;
  }

 private:
  static constexpr size_t kMax = 8192;
  size_t m_nSize = 0;
  std::string_view m_fields[kMax];
  std::string_view m_more[kMax];
};

// A text of one character, as long as one wants.
struct Fill {
  char bytes[4096];
};
template <char... kFill>
std::string_view FillOf(size_t which, size_t size) {
  static const auto s_Fills = [] {
    std::array<Fill, sizeof...(kFill)> fills;
    size_t i = 0;
    for (const char fill : {kFill...}) std::memset(fills[i++].bytes, fill, sizeof(Fill));
    return fills;
  }();
  return {s_Fills[which % sizeof...(kFill)].bytes, std::min(size, sizeof(Fill))};
}

class CMutator {
 public:
  // To be called before each mutation: what the last one made is gone then.
  void Start(const Rows& rows, unsigned seed, size_t maxSize) {
    m_rows = rows;
    m_nState = seed * uint64_t{2654435761U} + 88172645463325252U;
    m_nMax = maxSize;
    m_scratch.Clear();
    Below(1);
  }

  void Mutate(FuzzCall& call) {
    const size_t kind = Below(16);
    if (kind == 0) {
      call.row = Below(m_rows.count);
      FitArguments(m_rows, call);
    } else if (kind == 1) {
      call.moment = static_cast<uint8_t>(Below(256));
    } else {
      FuzzArgument& argument = call.arguments[Below(call.argumentCount)];
      if (argument.letter == 'S') {
        MutateText(argument);
      } else {
        MutateNumber(argument);
      }
    }
  }

  // Gives the call a text, or some fields of a text, of another call.
  void Cross(FuzzCall& call, const FuzzCall& other) {
    const size_t from = SomeText(other);
    const size_t to = SomeText(call);
    if (from == other.argumentCount || to == call.argumentCount) return;
    const FuzzArgument& source = other.arguments[from];
    FuzzArgument& target = call.arguments[to];
    if (Below(4) == 0 || target.null || source.null) {
      target = source;
      return;
    }
    m_fields.Split(target.text);
    m_others.Split(source.text);
    const size_t begin = Below(m_others.Size());
    const size_t count = 1 + Below(m_others.Size() - begin);
    m_fields.Insert(Below(m_fields.Size() + 1), m_others.At(begin), count);
    target.text = m_fields.Join(m_scratch, m_nMax);
  }

 private:
  size_t Below(size_t bound) {
    m_nState ^= m_nState << 13;
    m_nState ^= m_nState >> 7;
    m_nState ^= m_nState << 17;
    return static_cast<size_t>(m_nState % bound);
  }
  template <class List>
  auto Choose(const List& list) {
    return list[Below(std::size(list))];
  }

  // The place of one of the texts; argumentCount when there is none.
  size_t SomeText(const FuzzCall& call) {
    size_t texts[FuzzCall::kMaxArguments];
    size_t count = 0;
    for (size_t i = 0; i < call.argumentCount; ++i) {
      if (call.arguments[i].letter == 'S') texts[count++] = i;
    }
    return count == 0 ? call.argumentCount : texts[Below(count)];
  }

  std::string_view Value() {
    if (Below(8) != 0) return Choose(kValues);
    const size_t size = Choose(kLengths);
    return FillOf<'0', '9', 'x', ' ', '.', '&'>(Below(6), size);
  }
  std::string_view Field() { return m_scratch.Concatenate({Choose(kTags), "=", Value()}); }

  void InsertRecord(size_t at) {
    constexpr const char* kNumbers67[] = {"67=0", "67=1", "67=2", "67=3", "67=4",
                                          "67=5", "67=6", "67=7", "67=8"};
    std::string_view record[32] = {"00=1", Choose(kNumbers67),
                                   Below(4) != 0 ? std::string_view("68=0000") : Field()};
    size_t count = 3;
    for (size_t more = Below(24); more > 0; --more) record[count++] = Field();
    record[count++] = "01=";
    m_fields.Insert(at, record, count);
  }

  void MutateNumber(FuzzArgument& argument) {
    const int64_t value =
        Below(2) != 0 ? Choose(kNumbers) : argument.number + int64_t(Below(9)) - 4;
    const auto bits = static_cast<uint32_t>(value);
    argument.number = argument.letter == 'c'   ? int64_t{static_cast<uint16_t>(bits)}
                      : argument.letter == 'b' ? int64_t{static_cast<int8_t>(bits)}
                                               : int64_t{static_cast<int32_t>(bits)};
  }

  void MutateText(FuzzArgument& argument) {
    const size_t kind = argument.null ? 0 : Below(16);
    argument.null = false;
    if (kind == 0) {
      argument.text = Value();
    } else if (kind == 1) {
      argument.null = Below(4) == 0;
      argument.text = {};
    } else if (kind < 6) {
      argument.text = MutateBytes(argument.text);
    } else {
      argument.text = MutateFields(argument.text);
    }
  }

  std::string_view MutateBytes(std::string_view text) {
    const size_t room = std::max(m_nMax, text.size());
    if (room > m_scratch.Left()) return text;
    char* const bytes = m_scratch.Open();
    Copy(text, bytes);
    const size_t size = LLVMFuzzerMutate(reinterpret_cast<uint8_t*>(bytes), text.size(), room);
    char* const end = std::remove(bytes, bytes + size, '\0');
    return m_scratch.Close(static_cast<size_t>(end - bytes));
  }

  std::string_view MutateFields(std::string_view text) {
    m_fields.Split(text);
    const size_t at = Below(m_fields.Size());
    const size_t other = Below(m_fields.Size());
    std::string_view& field = m_fields[at];
    switch (Below(13)) {
      case 0:
      case 1:
        m_fields.Insert(other + 1, Field());
        break;
      case 2:
        m_fields.Erase(at, 1);
        break;
      case 3:
        m_fields.Insert(other, field);
        break;
      case 4:
        std::swap(field, m_fields[other]);
        break;
      case 5:
      case 6:
        field = m_scratch.Concatenate({field.substr(0, field.find('=') + 1), Value()});
        break;
      case 7:
        field = m_scratch.Concatenate(
            {Choose(kTags), field.substr(std::min(field.find('='), field.size()))});
        break;
      case 8:
        InsertRecord(other + 1);
        break;
      case 9:
        m_fields.Insert(at, Below(2) == 0 ? "00=" : "01=");
        break;
      case 10:
        m_fields.Cut(at + 1);
        break;
      case 11:
        field = AtBound(field);
        break;
      default:
        CopyRecord(at, other);
    }
    return m_fields.Join(m_scratch, m_nMax);
  }

  // A field whose value just fits the buffer of its tag, or just does not.
  std::string_view AtBound(std::string_view field) {
    const size_t end = field.find('=');
    if (end == std::string_view::npos) return field;
    size_t bound = 0;
    for (const TagBound& row : kTagBounds) {
      if (field.substr(0, end) == row.tag && (bound == 0 || Below(2) == 0)) bound = row.bound;
    }
    if (bound == 0) return field;
    const size_t size = bound - Below(2);
    return m_scratch.Concatenate({field.substr(0, end + 1), FillOf<'0', '9', 'x'>(Below(3), size)});
  }

  // Repeats, or takes out, the record that begins next behind `at`.
  void CopyRecord(size_t at, size_t other) {
    const size_t begin = m_fields.Find(at, "00=");
    const size_t end = m_fields.Find(begin, "01=");
    if (end == m_fields.Size()) {
      InsertRecord(m_fields.Size());
    } else if (Below(4) == 0) {
      m_fields.Erase(begin, end + 1 - begin);
    } else {
      m_fields.Insert(other, m_fields.At(begin), end + 1 - begin);
    }
  }

  Rows m_rows{};
  uint64_t m_nState = 0;
  size_t m_nMax = 0;
  CScratch m_scratch;
  CFields m_fields;
  CFields m_others;
};

CMutator s_Mutator;

// Writes the call to where its texts may still lie.
size_t Store(const FuzzCall& call, uint8_t* data, size_t maxSize) {
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
  FuzzCall call = ReadCall(FuzzRows(), data, size);
  s_Mutator.Start(FuzzRows(), seed, maxSize);
  for (unsigned rounds = 1 + seed % 4; rounds > 0; --rounds) s_Mutator.Mutate(call);
  return Store(call, data, maxSize);
}

extern "C" size_t LLVMFuzzerCustomCrossOver(const uint8_t* data1, size_t size1,
                                            const uint8_t* data2, size_t size2, uint8_t* out,
                                            size_t maxSize, unsigned seed) {
  using namespace gateway_fuzz;
  FuzzCall call = ReadCall(FuzzRows(), data1, size1);
  s_Mutator.Start(FuzzRows(), seed, maxSize);
  s_Mutator.Cross(call, ReadCall(FuzzRows(), data2, size2));
  return Store(call, out, maxSize);
}
