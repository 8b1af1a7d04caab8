// Fuzzes a target for a while, as fast as its calls are:
//
//   DRIVE SECONDS WORKERS FINDINGS FOUND FOLDER...
//
// Starts with the inputs of the folders and of FOUND, changes them by the target's mutator, and
// keeps what passes the code as nothing did before: in FOUND, too. Each worker is a process that
// lives for a minute, then another goes on with all that was found. What ends a worker, or holds it
// for kPatience seconds, becomes a file in FINDINGS. Tells how far it is as scripts/progress reads
// it. Nothing is allocated and no system is called for an execution. Uses no more of the C++
// library than its headers hold: the memory sanitizer sees only what was compiled for it.

#include <dirent.h>
#include <fcntl.h>
#include <sys/mman.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <csignal>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <string>
#include <vector>

#include "tests/fuzz/coverage_map.h"
#include "tests/fuzz/execution_counts.h"
#include "tests/fuzz/input_files.h"

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv);
extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size);
extern "C" size_t LLVMFuzzerCustomMutator(uint8_t* data, size_t size, size_t maxSize,
                                          unsigned seed);
extern "C" size_t LLVMFuzzerCustomCrossOver(const uint8_t* data1, size_t size1,
                                            const uint8_t* data2, size_t size2, uint8_t* out,
                                            size_t maxSize, unsigned seed);

namespace gateway_fuzz {
namespace {

constexpr size_t kMaxSize = 6000;
constexpr size_t kUsualSize = 1024;  // no mutation makes an input longer, but one in eight
constexpr int kTurn = 60;
constexpr int kPatience = 10;
constexpr int kMaxFindings = 20;

// What a worker leaves to its parent, also when it dies: the input that it plays.
struct Slot {
  uint64_t executions;
  uint64_t size;
  uint8_t bytes[kMaxSize];
};

struct Run {
  int seconds;
  int workers;
  const char* findings;
  const char* found;
  std::vector<const char*> folders;
};

uint32_t s_nRandom = 1;

uint32_t Random() {
  s_nRandom ^= s_nRandom << 13;
  s_nRandom ^= s_nRandom >> 17;
  s_nRandom ^= s_nRandom << 5;
  return s_nRandom;
}
size_t Below(size_t bound) {
  return Random() % bound;
}

// The clock of the wall; `time` is stopped by the targets.
std::time_t Now() {
  std::timespec now{};
  clock_gettime(CLOCK_MONOTONIC, &now);
  return now.tv_sec;
}

// FNV-1a: a name for a sequence of bytes.
uint64_t Digest(const uint8_t* data, size_t size) {
  uint64_t digest = 0xCBF29CE484222325U;
  for (size_t i = 0; i < size; ++i) digest = (digest ^ data[i]) * 0x100000001B3U;
  return digest;
}

void WriteInput(const char* folder, const char* prefix, const uint8_t* data, size_t size) {
  char path[4096];
  std::snprintf(path, sizeof path, "%s/%s%016llx", folder, prefix,
                static_cast<unsigned long long>(Digest(data, size)));
  FILE* const file = std::fopen(path, "wb");
  if (file == nullptr || std::fwrite(data, 1, size, file) != size) std::perror(path);
  if (file != nullptr) std::fclose(file);
}

// One process that plays mutations for a turn.
class CWorker {
 public:
  CWorker(const Run& run, Slot& slot)
      : m_run(run), m_slot(slot), m_nRows(FuzzRows().count), m_rows(m_nRows) {}

  void Work(int seconds) {
    const std::time_t end = Now() + seconds;
    std::vector<Bytes> read;
    for (const char* folder : m_run.folders) ReadInputs(folder, read);
    ReadInputs(m_run.found, read);
    for (const Bytes& input : read) {
      m_slot.size = std::min(input.size(), kMaxSize);
      std::memcpy(m_slot.bytes, input.data(), m_slot.size);
      if (Play() || m_inputs.size() < m_nRows) Keep();
    }
    if (m_inputs.empty()) return;
    while (Now() < end) {
      for (int i = 0; i < 1024; ++i) PlayOne();
    }
  }

 private:
  bool Play() {
    ++m_slot.executions;
    LLVMFuzzerTestOneInput(m_slot.bytes, m_slot.size);
    return TakeCoverage();
  }

  void Keep() {
    m_inputs.emplace_back(m_slot.bytes, m_slot.bytes + m_slot.size);
    if (m_slot.size > 0) m_rows[m_slot.bytes[0] % m_nRows].push_back(m_inputs.size() - 1);
  }

  // Half of the time any input, half of the time one of any row, so that none is left behind.
  const Bytes& Any() {
    const std::vector<size_t>& row = m_rows[Below(m_nRows)];
    if (row.empty() || Below(2) == 0) return m_inputs[Below(m_inputs.size())];
    return m_inputs[row[Below(row.size())]];
  }

  // Mostly the shorter one of two: it says as much in less time.
  const Bytes& Parent() {
    const Bytes& one = Any();
    const Bytes& other = Any();
    return (one.size() < other.size()) == (Below(8) != 0) ? one : other;
  }

  void PlayOne() {
    const Bytes& parent = Parent();
    uint8_t* const bytes = m_slot.bytes;
    const size_t room = Below(8) == 0 ? kMaxSize : std::max(parent.size(), kUsualSize);
    if (Below(8) == 0) {
      const Bytes& other = Parent();
      m_slot.size = LLVMFuzzerCustomCrossOver(parent.data(), parent.size(), other.data(),
                                              other.size(), bytes, room, Random());
    } else {
      m_slot.size = parent.size();
      std::memcpy(bytes, parent.data(), parent.size());
    }
    m_slot.size = LLVMFuzzerCustomMutator(bytes, m_slot.size, room, Random());
    if (!Play()) return;
    Keep();
    WriteInput(m_run.found, "", bytes, m_slot.size);
  }

  const Run& m_run;
  Slot& m_slot;
  size_t m_nRows;
  std::vector<Bytes> m_inputs;
  std::vector<std::vector<size_t>> m_rows;  // the inputs of each row
};

// A worker as its parent sees it.
struct Child {
  pid_t process = 0;
  Slot* slot = nullptr;
  uint64_t seen = 0;  // executions when it was looked at last
  int idle = 0;       // seconds without one
};

volatile std::sig_atomic_t s_nStopped = 0;

class CParent {
 public:
  explicit CParent(const Run& run) : m_run(run), m_children(static_cast<size_t>(run.workers)) {}

  // The number of findings.
  int Work() {
    const std::time_t begin = Now();
    m_nEnd = begin + m_run.seconds;
    for (Child& child : m_children) Start(child);
    while (Now() < m_nEnd && s_nStopped == 0 && m_nFindings < kMaxFindings) {
      sleep(1);
      for (Child& child : m_children) LookAfter(child);
      std::printf("-- %d/%d seconds, %llu executions, %d findings\n",
                  static_cast<int>(std::min<std::time_t>(Now() - begin, m_run.seconds)),
                  m_run.seconds, static_cast<unsigned long long>(Executions()), m_nFindings);
      std::fflush(stdout);
    }
    for (Child& child : m_children) End(child);
    return m_nFindings;
  }

 private:
  void Start(Child& child) {
    if (child.slot == nullptr) {
      void* const shared =
          mmap(nullptr, sizeof(Slot), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
      if (shared == MAP_FAILED) std::abort();
      child.slot = static_cast<Slot*>(shared);
    }
    const int seconds = static_cast<int>(std::min<std::time_t>(kTurn, m_nEnd - Now()));
    const auto seed =
        static_cast<uint32_t>(Now()) * 2654435761U + static_cast<uint32_t>(++m_nForks);
    child.idle = 0;
    child.process = fork();
    if (child.process != 0) return;
    std::signal(SIGINT, SIG_IGN);  // the parent decides
    std::signal(SIGTERM, SIG_IGN);
    s_nRandom = seed | 1;
    CWorker(m_run, *child.slot).Work(seconds);
    _exit(0);
  }

  void LookAfter(Child& child) {
    int status = 0;
    if (waitpid(child.process, &status, WNOHANG) == child.process) {
      if (status != 0) KeepFinding(child);
      if (Now() < m_nEnd) Start(child);
      return;
    }
    child.idle = child.slot->executions == child.seen ? child.idle + 1 : 0;
    child.seen = child.slot->executions;
    if (child.idle < kPatience) return;
    std::fprintf(stderr, "an execution does not end\n");
    kill(child.process, SIGKILL);  // found dead the next time
  }

  void End(Child& child) {
    if (child.process <= 0) return;
    int status = 0;
    for (int looks = s_nStopped != 0 ? 1 : 10 * kPatience; looks > 0; --looks) {
      if (waitpid(child.process, &status, WNOHANG) != 0) {
        if (status != 0) KeepFinding(child);
        return;
      }
      usleep(100000);
    }
    Kill(child);
    if (s_nStopped == 0) KeepFinding(child);  // stopped amid any input
  }

  static void Kill(const Child& child) {
    kill(child.process, SIGKILL);
    waitpid(child.process, nullptr, 0);
  }

  void KeepFinding(const Child& child) {
    WriteInput(m_run.findings, "found-", child.slot->bytes, child.slot->size);
    ++m_nFindings;
  }

  uint64_t Executions() const {
    uint64_t all = 0;
    for (const Child& child : m_children) all += child.slot->executions;
    return all;
  }

  const Run& m_run;
  std::vector<Child> m_children;
  std::time_t m_nEnd = 0;
  int m_nForks = 0;
  int m_nFindings = 0;
};

}  // namespace
}  // namespace gateway_fuzz

// Stands in for the fuzzer's own mutations: the mutator asks for them.
extern "C" size_t LLVMFuzzerMutate(uint8_t* data, size_t size, size_t maxSize) {
  using gateway_fuzz::Below;
  const size_t at = Below(size + 1);
  if (Below(3) == 0 && size < maxSize) {
    std::memmove(data + at + 1, data + at, size - at);
    data[at] = static_cast<uint8_t>(Below(256));
    return size + 1;
  }
  if (at == size) return size;
  if (Below(2) == 0) {
    std::memmove(data + at, data + at + 1, size - at - 1);
    return size - 1;
  }
  data[at] = static_cast<uint8_t>(Below(256));
  return size;
}

int main(int argc, char** argv) {
  using namespace gateway_fuzz;
  if (argc < 6) {
    std::fputs("usage: SECONDS WORKERS FINDINGS FOUND FOLDER...\n", stderr);
    return 2;
  }
  LLVMFuzzerInitialize(&argc, &argv);
  std::signal(SIGINT, [](int) { s_nStopped = 1; });
  std::signal(SIGTERM, [](int) { s_nStopped = 1; });
  const Run run = {std::atoi(argv[1]), std::atoi(argv[2]), argv[3], argv[4],
                   std::vector<const char*>(argv + 5, argv + argc)};
  return CParent(run).Work() == 0 ? 0 : 1;
}
