// What a fuzzing run needs of the golden cases:
//
//   PREPARE seeds VECTORS CALLS READERS RECORDS   one seed for each golden case in each folder that
//                                                 is for such cases
//   PREPARE dictionary   prints the wire's tags and texts, as libFuzzer reads them

#include <algorithm>
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
using gateway_tests::Argument;
using gateway_tests::FindExport;
using gateway_tests::GoldenCase;

constexpr size_t kMaxSeed = 65536;

void Write(const std::filesystem::path& file, const FuzzCall& call) {
  uint8_t bytes[kMaxSeed];
  const size_t size = WriteCall(call, bytes, kMaxSeed);
  std::ofstream(file, std::ios::binary)
      .write(reinterpret_cast<const char*>(bytes), static_cast<std::streamsize>(size));
}

FuzzArgument AsFuzzArgument(const Argument& golden) {
  const bool null = golden.letter == 'S' && !golden.text.has_value();
  return {golden.letter, null, golden.number,
          golden.text.has_value() ? std::string_view(*golden.text) : std::string_view()};
}

// The number of a decoder among decoders.
size_t DecoderNumber(const gateway_tests::Export* row) {
  return static_cast<size_t>(std::count_if(
      AllExports(), row, [](const gateway_tests::Export& each) { return each.IsDecoder(); }));
}

void WriteSeeds(const char* vectors, const char* calls, const char* readers, const char* records) {
  for (const char* folder : {calls, readers, records}) std::filesystem::create_directories(folder);
  for (const GoldenCase& golden : gateway_tests::ReadGoldenCases(vectors).cases) {
    const gateway_tests::Export* const row = FindExport(golden.operation);
    const std::string name = golden.file + "-" + std::to_string(golden.line);
    FuzzCall call;
    call.row = static_cast<size_t>(row - AllExports());
    call.moment = 54;
    for (const Argument& argument : golden.arguments) call.Add(AsFuzzArgument(argument));
    Write(std::filesystem::path(calls) / name, call);
    if (!row->IsDecoder()) continue;
    call.row = DecoderNumber(row);
    Write(std::filesystem::path(records) / name, call);
    FuzzCall reading;
    reading.Add({'b', false, -1, {}});
    reading.Add({'b', false, 1, {}});
    reading.Add({'S', false, 0, "68"});
    reading.Add(AsFuzzArgument(golden.arguments.back()));
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
  if (argc == 6 && std::strcmp(argv[1], "seeds") == 0) {
    gateway_fuzz::WriteSeeds(argv[2], argv[3], argv[4], argv[5]);
  } else if (argc == 2 && std::strcmp(argv[1], "dictionary") == 0) {
    gateway_fuzz::PrintDictionary();
  } else {
    std::fputs("usage: seeds VECTORS CALLS READERS RECORDS | dictionary\n", stderr);
    return 1;
  }
  return 0;
}
