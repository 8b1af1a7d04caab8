// golden_answers VECTORS OUT: writes each golden file of VECTORS to the folder OUT, with what the
// library answers in place of each answer that does not hold or is not there yet.

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <string>
#include <vector>

#include "tests/support/golden_file.h"
#include "tests/support/golden_writer.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

int Run(const std::filesystem::path& vectors, const std::filesystem::path& out) {
  EnterMarketTimeZone();
  const GoldenCases golden = ReadGoldenCases(vectors, Unanswered::kTaken);
  for (const std::string& error : golden.errors) std::fprintf(stderr, "%s\n", error.c_str());
  if (!golden.errors.empty()) return EXIT_FAILURE;
  std::map<std::string, std::vector<GoldenCase>> files;
  for (const GoldenCase& one : golden.cases) files[one.file].push_back(one);
  for (const auto& [name, cases] : files) {
    std::ifstream in(vectors / name);
    const std::string text{std::istreambuf_iterator<char>(in), {}};
    std::ofstream file(out / name);
    if (!(file << WithAnswers(text, cases, Rewrite::kWrongCases)).flush()) return EXIT_FAILURE;
  }
  return EXIT_SUCCESS;
}

}  // namespace
}  // namespace gateway_tests

int main(int argc, char** argv) {
  if (argc != 3) {
    std::fputs("usage: golden_answers VECTORS OUT\n", stderr);
    return EXIT_FAILURE;
  }
  return gateway_tests::Run(argv[1], argv[2]);
}
