// The mutator of both fuzz targets: it works on what a call is made of - the row, numbers, texts,
// and in texts on fields and records - and leaves bytes to the fuzzer's own mutations.

#include <algorithm>
#include <cstring>
#include <iterator>
#include <string>
#include <vector>

#include "tests/fuzz/fuzz_call.h"
#include "tests/fuzz/wire_words.h"

extern "C" size_t LLVMFuzzerMutate(uint8_t* data, size_t size, size_t maxSize);

namespace gateway_fuzz {
namespace {

using gateway_tests::TArgument;

using TFields = std::vector<std::string>;

template <class TList>
auto At(TList& list, size_t index) {
  return list.begin() + static_cast<std::ptrdiff_t>(index);
}

class CMutator {
 public:
  CMutator(const TRows& rows, unsigned seed, size_t maxSize)
      : m_Rows(rows), m_nState(seed * uint64_t{2654435761U} + 88172645463325252U), m_nMax(maxSize) {
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
      TArgument& argument = call.m_Arguments[Below(call.m_Arguments.size())];
      if (argument.m_chLetter == 'S') {
        MutateText(argument);
      } else {
        MutateNumber(argument);
      }
    }
  }

  /// Gives the call a text, or some fields of a text, of another call.
  void Cross(TFuzzCall& call, const TFuzzCall& other) {
    const TArgument* const from = SomeText(other);
    const TArgument* const to = SomeText(call);
    if (from == nullptr || to == nullptr) return;
    TArgument& target = call.m_Arguments[static_cast<size_t>(to - call.m_Arguments.data())];
    if (Below(4) == 0 || !target.m_Text.has_value() || !from->m_Text.has_value()) {
      target.m_Text = from->m_Text;
      return;
    }
    TFields fields = Split(*target.m_Text);
    const TFields others = Split(*from->m_Text);
    const size_t begin = Below(others.size());
    const size_t count = 1 + Below(others.size() - begin);
    fields.insert(At(fields, Below(fields.size() + 1)), At(others, begin),
                  At(others, begin + count));
    target.m_Text = Join(fields);
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

  const TArgument* SomeText(const TFuzzCall& call) {
    std::vector<const TArgument*> texts;
    for (const TArgument& argument : call.m_Arguments) {
      if (argument.m_chLetter == 'S') texts.push_back(&argument);
    }
    return texts.empty() ? nullptr : Choose(texts);
  }

  static TFields Split(const std::string& text) {
    TFields fields;
    size_t begin = 0;
    for (size_t bar; (bar = text.find('|', begin)) != std::string::npos; begin = bar + 1) {
      fields.push_back(text.substr(begin, bar - begin));
    }
    fields.push_back(text.substr(begin));
    return fields;
  }

  static std::string Join(const TFields& fields) {
    std::string text;
    for (const std::string& field : fields) text.append(field).push_back('|');
    text.pop_back();
    return text;
  }

  std::string Value() {
    if (Below(8) != 0) return Choose(kValues);
    const char fill[] = {'0', '9', 'x', ' ', '.', '&'};
    return std::string(Choose(kLengths), Choose(fill));
  }
  std::string Field() { return std::string(Choose(kTags)) + "=" + Value(); }

  TFields Record() {
    TFields record = {"00=1", "67=" + std::to_string(Below(9)),
                      Below(4) != 0 ? "68=0000" : Field()};
    for (size_t more = Below(24); more > 0; --more) record.push_back(Field());
    record.emplace_back("01=");
    return record;
  }

  void MutateNumber(TArgument& argument) {
    const int64_t value =
        Below(2) != 0 ? Choose(kNumbers) : argument.m_nNumber + int64_t(Below(9)) - 4;
    const auto bits = static_cast<uint32_t>(value);
    argument.m_nNumber = argument.m_chLetter == 'c'   ? int64_t{static_cast<uint16_t>(bits)}
                         : argument.m_chLetter == 'b' ? int64_t{static_cast<int8_t>(bits)}
                                                      : int64_t{static_cast<int32_t>(bits)};
  }

  void MutateText(TArgument& argument) {
    if (!argument.m_Text.has_value()) {
      argument.m_Text = Value();
      return;
    }
    const size_t kind = Below(16);
    if (kind == 0) {
      argument.m_Text = Value();
    } else if (kind == 1) {
      argument.m_Text = Below(4) != 0 ? std::string() : std::optional<std::string>();
    } else if (kind < 6) {
      MutateBytes(*argument.m_Text);
    } else {
      MutateFields(*argument.m_Text);
    }
  }

  void MutateBytes(std::string& text) {
    std::vector<uint8_t> bytes(std::max(m_nMax, text.size()));
    std::copy(text.begin(), text.end(), bytes.begin());
    const size_t size = LLVMFuzzerMutate(bytes.data(), text.size(), bytes.size());
    text.assign(reinterpret_cast<const char*>(bytes.data()), size);
    text.erase(std::remove(text.begin(), text.end(), '\0'), text.end());
  }

  void MutateFields(std::string& text) {
    TFields fields = Split(text);
    const size_t at = Below(fields.size());
    const size_t other = Below(fields.size());
    switch (Below(12)) {
      case 0:
      case 1:
        fields.insert(At(fields, other + 1), Field());
        break;
      case 2:
        fields.erase(At(fields, at));
        break;
      case 3: {
        const std::string copy = fields[at];
        fields.insert(At(fields, other), copy);
        break;
      }
      case 4:
        std::swap(fields[at], fields[other]);
        break;
      case 5:
      case 6:
        fields[at].resize(std::min(fields[at].size(), fields[at].find('=') + 1));
        fields[at] += Value();
        break;
      case 7:
        fields[at].erase(0, fields[at].find('='));
        fields[at].insert(0, Choose(kTags));
        break;
      case 8:
        Insert(fields, other + 1, Record());
        break;
      case 9:
        fields.insert(At(fields, at), Below(2) == 0 ? "00=" : "01=");
        break;
      case 10:
        fields.resize(at + 1);
        break;
      default:
        CopyRecord(fields, at, other);
    }
    text = fields.empty() ? std::string() : Join(fields);
  }

  static void Insert(TFields& fields, size_t at, const TFields& more) {
    fields.insert(At(fields, at), more.begin(), more.end());
  }

  /// Repeats, or takes out, the record that begins next behind `at`.
  void CopyRecord(TFields& fields, size_t at, size_t other) {
    const auto marks = [](const char* mark) {
      return [mark](const std::string& field) { return field.compare(0, 3, mark) == 0; };
    };
    const auto begin = std::find_if(At(fields, at), fields.end(), marks("00="));
    const auto end = std::find_if(begin, fields.end(), marks("01="));
    if (end == fields.end()) {
      Insert(fields, fields.size(), Record());
    } else if (Below(4) == 0) {
      fields.erase(begin, end + 1);
    } else {
      Insert(fields, other, TFields(begin, end + 1));
    }
  }

  TRows m_Rows;
  uint64_t m_nState;
  size_t m_nMax;
};

size_t Store(const TFuzzCall& call, uint8_t* data, size_t maxSize) {
  const std::string bytes = WriteCall(call);
  const size_t size = std::min(bytes.size(), maxSize);
  std::memcpy(data, bytes.data(), size);
  return size;
}

}  // namespace
}  // namespace gateway_fuzz

extern "C" size_t LLVMFuzzerCustomMutator(uint8_t* data, size_t size, size_t maxSize,
                                          unsigned seed) {
  using namespace gateway_fuzz;
  TFuzzCall call = ReadCall(FuzzRows(), data, size);
  CMutator mutator(FuzzRows(), seed, maxSize);
  for (unsigned rounds = 1 + seed % 4; rounds > 0; --rounds) mutator.Mutate(call);
  return Store(call, data, maxSize);
}

extern "C" size_t LLVMFuzzerCustomCrossOver(const uint8_t* data1, size_t size1,
                                            const uint8_t* data2, size_t size2, uint8_t* out,
                                            size_t maxSize, unsigned seed) {
  using namespace gateway_fuzz;
  TFuzzCall call = ReadCall(FuzzRows(), data1, size1);
  CMutator(FuzzRows(), seed, maxSize).Cross(call, ReadCall(FuzzRows(), data2, size2));
  return Store(call, out, maxSize);
}
