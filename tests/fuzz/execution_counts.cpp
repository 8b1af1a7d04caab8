#include "tests/fuzz/execution_counts.h"

#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>

namespace gateway_fuzz {
namespace {

constexpr size_t kRoom = 64;
static_assert(kRoom >= gateway_tests::kExportCount);

uint64_t s_nOwn[kRoom];
uint64_t* s_pCounts = s_nOwn;

[[noreturn]] void GiveUp(const char* path) {
  std::perror(path);
  std::exit(1);
}

}  // namespace

void OpenCounts() {
  const char* const path = std::getenv("QUORVANE_FUZZ_COUNTS");
  if (path == nullptr) return;
  const int file = open(path, O_RDWR | O_CREAT, 0666);
  if (file < 0 || ftruncate(file, sizeof s_nOwn) != 0) GiveUp(path);
  void* const shared = mmap(nullptr, sizeof s_nOwn, PROT_READ | PROT_WRITE, MAP_SHARED, file, 0);
  if (shared == MAP_FAILED) GiveUp(path);
  close(file);
  s_pCounts = static_cast<uint64_t*>(shared);
}

void CountExecution(size_t row) {
  __atomic_fetch_add(&s_pCounts[row], uint64_t{1}, __ATOMIC_RELAXED);
}

bool PrintCounts(const Rows& rows) {
  bool all = true;
  unsigned long long total = 0;
  for (size_t row = 0; row < rows.count; ++row) {
    const unsigned long long count = s_pCounts[row];
    const std::string_view name = rows.rows[row].name;
    std::printf("executions %.*s %llu\n", static_cast<int>(name.size()), name.data(), count);
    total += count;
    all = all && count > 0;
  }
  std::printf("executions all %llu\n", total);
  return all;
}

}  // namespace gateway_fuzz
