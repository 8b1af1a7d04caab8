// How the time of every decoder grows with its reply: prints, as a table, the slope of the time
// over the length in logarithms, 1 being proportional, from 1 KiB to 16 MiB. Ends with 1 when a
// slope is above the bound.
//
// A time is the median of a few calls' processor time, a slope the median of the slopes between all
// pairs of lengths. A slope above the bound is measured again, twice at most: what else the machine
// does can slow some lengths down, but can make no time proportional that is not.

#include <malloc.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <ctime>
#include <iterator>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/bare_host.h"
#include "tests/support/call_table.h"
#include "tests/support/hostile_replies.h"
#include "tests/support/sample_replies.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

constexpr double kBound = 1.1;
constexpr size_t kShortest = 1 << 10;
constexpr size_t kLongest = 1 << 24;
constexpr size_t kStep = 4;
constexpr int kAttempts = 3;

double Median(std::vector<double> values) {
  const auto middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
  std::nth_element(values.begin(), middle, values.end());
  return *middle;
}

double Now() {
  std::timespec now{};
  clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
  return static_cast<double>(now.tv_sec) + 1e-9 * static_cast<double>(now.tv_nsec);
}

class CDecoder {
 public:
  explicit CDecoder(const Export& row) : m_row(row), m_pEntryPoint(row.EntryPoint()) {}

  void Call(const std::string& reply) const {
    jint status = 0;
    jvalue values[3] = {};
    jvalue* at = values;
    if (m_row.shape.front() == 'i') (at++)->i = 0;
    (at++)->l = BareText(reply.c_str());
    at->l = BareStatus(&status);
    m_row.call(m_pEntryPoint, BareHost(), values);
  }

  // Seconds of one call.
  double Seconds(const std::string& reply) const {
    Call(reply);  // memory is at hand from now on
    const size_t repeats = 1 + (64 << 10) / reply.size();
    std::vector<double> times;
    for (int round = 0; round < (reply.size() > (1 << 20) ? 3 : 7); ++round) {
      const double begin = Now();
      for (size_t i = 0; i < repeats; ++i) Call(reply);
      times.push_back((Now() - begin) / static_cast<double>(repeats));
    }
    return Median(times);
  }

 private:
  const Export& m_row;
  void* m_pEntryPoint;
};

struct Growth {
  double slope = 0;
  double longest = 0;  // seconds of the longest reply
};

// `make(length)` makes a reply of about that length.
template <class Make>
Growth MeasureOnce(const CDecoder& decoder, const Make& make) {
  std::vector<double> lengths;
  std::vector<double> times;
  Growth growth;
  for (size_t length = kShortest; length <= kLongest; length *= kStep) {
    const std::string reply = make(length);
    growth.longest = decoder.Seconds(reply);
    lengths.push_back(std::log(static_cast<double>(reply.size())));
    times.push_back(std::log(growth.longest));
  }
  std::vector<double> slopes;
  for (size_t i = 0; i < times.size(); ++i) {
    for (size_t j = 0; j < i; ++j) {
      slopes.push_back((times[i] - times[j]) / (lengths[i] - lengths[j]));
    }
  }
  growth.slope = Median(slopes);
  return growth;
}

template <class Make>
Growth Measure(const CDecoder& decoder, const Make& make) {
  Growth growth = MeasureOnce(decoder, make);
  for (int more = 1; more < kAttempts && growth.slope > kBound; ++more) {
    growth = MeasureOnce(decoder, make);
  }
  return growth;
}

// What a gateway sends, at any length: records, or fields that an answer does not ask for.
std::string OrdinaryReply(std::string_view decoder, size_t length) {
  constexpr size_t kSome = 8;
  const std::string few = SampleList(decoder, kSome);
  if (!few.empty()) return SampleList(decoder, 1 + kSome * length / few.size());
  std::string reply = SampleAnswer(decoder);
  while (reply.size() < length) reply += "|ZZ=0123456789";
  return reply;
}

// Prints the decoder's row; false when a slope is above the bound.
bool PrintDecoder(const Export& row) {
  const CDecoder decoder(row);
  const Growth ordinary =
      Measure(decoder, [&](size_t length) { return OrdinaryReply(row.name, length); });
  Growth steepest;
  const char* name = "";
  for (const HostilePattern& hostile : kHostileReplies) {
    const Growth growth =
        Measure(decoder, [&](size_t length) { return MakeReply(hostile, length); });
    if (growth.slope > steepest.slope) {
      steepest = growth;
      name = hostile.name;
    }
  }
  std::printf("| %.*s | %.2f | %.1f | %.2f | %s |\n", static_cast<int>(row.name.size()),
              row.name.data(), ordinary.slope, 1e3 * ordinary.longest, steepest.slope, name);
  std::fflush(stdout);
  return ordinary.slope <= kBound && steepest.slope <= kBound;
}

}  // namespace
}  // namespace gateway_tests

int main() {
  using namespace gateway_tests;
  // What the system takes for handing memory out anew is not the library's.
  mallopt(M_MMAP_THRESHOLD, 1 << 30);
  mallopt(M_TRIM_THRESHOLD, 1 << 30);
  SetClock("2024-01-15 13:45:21");
  std::puts("| decoder | ordinary | of 16 MiB, ms | steepest | of the arrangement |");
  std::puts("|---|---|---|---|---|");
  int decoders = 0;
  bool good = true;
  for (const Export& row : AllExports()) {
    if (!row.IsDecoder()) continue;
    ++decoders;
    good = PrintDecoder(row) && good;
  }
  std::printf("\n%d decoders, %zu hostile arrangements each; %s %.1f.\n", decoders,
              std::size(kHostileReplies), good ? "no slope is above" : "A SLOPE IS ABOVE", kBound);
  return good ? 0 : 1;
}
