// What a fuzzing run needs of the golden cases:
//
//   PREPARE seeds VECTORS CALLS READERS   one seed for each golden case in the two folders
//   PREPARE dictionary                    prints the wire's tags and texts, as libFuzzer reads them

#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <string>
#include <string_view>

#include "tests/fuzz/fuzz_call.h"
#include "tests/fuzz/wire_words.h"
#include "tests/support/golden_file.h"

namespace gateway_fuzz {
namespace {

using gateway_tests::AllExports;
using gateway_tests::FindExport;
using gateway_tests::TArgument;
using gateway_tests::TGoldenCase;

constexpr size_t kMaxSeed = 65536;

void Write(const std::filesystem::path& file, const TFuzzCall& call) {
  uint8_t bytes[kMaxSeed];
  const size_t size = WriteCall(call, bytes, kMaxSeed);
  std::ofstream(file, std::ios::binary)
      .write(reinterpret_cast<const char*>(bytes), static_cast<std::streamsize>(size));
}

TFuzzArgument Argument(const TArgument& golden) {
  const bool null = golden.m_chLetter == 'S' && !golden.m_Text.has_value();
  return {golden.m_chLetter, null, golden.m_nNumber,
          golden.m_Text.has_value() ? std::string_view(*golden.m_Text) : std::string_view()};
}

void WriteSeeds(const char* vectors, const char* calls, const char* readers) {
  std::filesystem::create_directories(calls);
  std::filesystem::create_directories(readers);
  for (const TGoldenCase& golden : gateway_tests::ReadGoldenCases(vectors).m_Cases) {
    const gateway_tests::TExport* const row = FindExport(golden.m_Operation);
    const std::string name = golden.m_File + "-" + std::to_string(golden.m_nLine);
    TFuzzCall call;
    call.m_nRow = static_cast<size_t>(row - AllExports());
    call.m_nMoment = 54;
    for (const TArgument& argument : golden.m_Arguments) call.Add(Argument(argument));
    Write(std::filesystem::path(calls) / name, call);
    if (!row->IsDecoder()) continue;
    TFuzzCall reading;
    reading.Add({'b', false, -1, {}});
    reading.Add({'b', false, 1, {}});
    reading.Add({'S', false, 0, "68"});
    reading.Add(Argument(golden.m_Arguments.back()));
    Write(std::filesystem::path(readers) / name, reading);
  }
}

void PrintWord(const std::string& word) {
  if (word.empty()) return;
  std::putchar('"');
  for (const char c : word) std::printf("\\x%02x", static_cast<unsigned>(static_cast<uint8_t>(c)));
  std::puts("\"");
}

void PrintDictionary() {
  for (const char* tag : kTags) PrintWord(std::string("|") + tag + "=");
  for (const char* value : kValues) PrintWord(value);
}

}  // namespace
}  // namespace gateway_fuzz

int main(int argc, char** argv) {
  if (argc == 5 && std::strcmp(argv[1], "seeds") == 0) {
    gateway_fuzz::WriteSeeds(argv[2], argv[3], argv[4]);
  } else if (argc == 2 && std::strcmp(argv[1], "dictionary") == 0) {
    gateway_fuzz::PrintDictionary();
  } else {
    std::fputs("usage: seeds VECTORS CALLS READERS | dictionary\n", stderr);
    return 1;
  }
  return 0;
}
