// What a fuzzing run needs of the golden cases:
//
//   PREPARE seeds VECTORS CALLS READERS   one seed for each golden case in the two folders
//   PREPARE dictionary                    prints the wire's tags and texts, as libFuzzer reads them

#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <string>

#include "tests/fuzz/fuzz_call.h"
#include "tests/fuzz/wire_words.h"
#include "tests/support/golden_file.h"

namespace gateway_fuzz {
namespace {

using gateway_tests::AllExports;
using gateway_tests::FindExport;
using gateway_tests::TArgument;
using gateway_tests::TGoldenCase;

void Write(const std::filesystem::path& file, const TFuzzCall& call) {
  std::ofstream(file, std::ios::binary) << WriteCall(call);
}

void WriteSeeds(const char* vectors, const char* calls, const char* readers) {
  std::filesystem::create_directories(calls);
  std::filesystem::create_directories(readers);
  for (const TGoldenCase& golden : gateway_tests::ReadGoldenCases(vectors).m_Cases) {
    const gateway_tests::TExport* const row = FindExport(golden.m_Operation);
    const std::string name = golden.m_File + "-" + std::to_string(golden.m_nLine);
    const auto number = static_cast<size_t>(row - AllExports());
    Write(std::filesystem::path(calls) / name, {number, 54, golden.m_Arguments});
    if (!row->IsDecoder()) continue;
    Write(std::filesystem::path(readers) / name,
          {0,
           0,
           {TArgument::Byte(-1), TArgument::Byte(1), TArgument::Text("68"),
            golden.m_Arguments.back()}});
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
