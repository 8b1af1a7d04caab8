#include "tests/fuzz/input_files.h"

#include <dirent.h>

#include <cstdio>
#include <string>

namespace gateway_fuzz {
namespace {

bool ReadFile(const std::string& path, std::vector<Bytes>& inputs) {
  static uint8_t s_Bytes[size_t{1} << 20];
  FILE* const file = std::fopen(path.c_str(), "rb");
  if (file == nullptr) {
    std::perror(path.c_str());
    return false;
  }
  const size_t size = std::fread(s_Bytes, 1, sizeof s_Bytes, file);
  std::fclose(file);
  inputs.emplace_back(s_Bytes, s_Bytes + size);
  return true;
}

}  // namespace

bool ReadInputs(const char* path, std::vector<Bytes>& inputs) {
  DIR* const folder = opendir(path);
  if (folder == nullptr) return ReadFile(path, inputs);
  bool good = true;
  while (const dirent* const entry = readdir(folder)) {
    if (entry->d_name[0] == '.') continue;
    good = ReadFile(std::string(path) + "/" + entry->d_name, inputs) && good;
  }
  closedir(folder);
  return good;
}

}  // namespace gateway_fuzz
