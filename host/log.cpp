#include "android/log.h"

#include <errno.h>
#include <sched.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>

#include <atomic>

namespace {

constexpr char kLetters[] = "??VDIWEFS";  // a letter's position is its priority
constexpr char kSeparators[] = " ,\t\n";
constexpr size_t kMostFilters = 32;

struct Filter {
  const char* tag;
  size_t tagLen;
  int lowest;  // the lowest priority to write
};

// The filters of ANDROID_LOG_TAGS: filled at the first line, read-only from then on.
struct Filters {
  char* text;  // a copy, since the environment may change; it lives as long as the process
  Filter filter[kMostFilters];
  size_t count;
  int lowest;  // no filter lets anything below this through
};

Filters g_filters = {nullptr, {}, 0, ANDROID_LOG_SILENT};

enum { kUnread, kBeingRead, kRead };
std::atomic<int> g_state = {kUnread};

// The priority that stands behind a filter's colon; what is no priority asks for nothing.
int PriorityOf(char letter) {
  const char* first = kLetters + ANDROID_LOG_VERBOSE;
  const char* found = letter == '\0' ? nullptr : strchr(first, letter);
  return found == nullptr ? ANDROID_LOG_SILENT : static_cast<int>(found - kLetters);
}

// Adds one filter, `tag:priority` or `tag` alone, which asks for everything.
void Add(const char* text, size_t length) {
  if (g_filters.count == kMostFilters) return;
  const void* colon = memchr(text, ':', length);
  const size_t tag =
      colon == nullptr ? length : static_cast<size_t>(static_cast<const char*>(colon) - text);
  const int lowest = tag + 1 < length ? PriorityOf(text[tag + 1]) : ANDROID_LOG_VERBOSE;
  g_filters.filter[g_filters.count++] = {text, tag, lowest};
  if (lowest < g_filters.lowest) g_filters.lowest = lowest;
}

void ReadFilters() {
  const char* wanted = getenv("ANDROID_LOG_TAGS");
  if (wanted == nullptr) return;
  g_filters.text = strdup(wanted);
  if (g_filters.text == nullptr) return;
  const char* text = g_filters.text + strspn(g_filters.text, kSeparators);
  while (*text != '\0') {
    const size_t length = strcspn(text, kSeparators);
    Add(text, length);
    text += length;
    text += strspn(text, kSeparators);
  }
}

// Reads the filters at the first call. Not by pthread_once: that of glibc 2.34 is not found by the
// C libraries before it, where the library is to be loaded too.
void Ready() {
  int state = g_state.load(std::memory_order_acquire);
  if (state == kRead) return;
  if (state == kUnread && g_state.compare_exchange_strong(state, kBeingRead)) {
    ReadFilters();
    g_state.store(kRead, std::memory_order_release);
  }
  while (g_state.load(std::memory_order_acquire) != kRead) sched_yield();
}

// The lowest priority to write under `tag`: that of its own last filter, else of the last `*`.
int LowestFor(const char* tag) {
  const size_t length = strlen(tag);
  int others = ANDROID_LOG_SILENT;
  int own = -1;
  for (size_t i = 0; i < g_filters.count; ++i) {
    const Filter& filter = g_filters.filter[i];
    if (filter.tagLen == length && memcmp(filter.tag, tag, length) == 0) {
      own = filter.lowest;
    } else if (filter.tagLen == 1 && filter.tag[0] == '*') {
      others = filter.lowest;
    }
  }
  return own < 0 ? others : own;
}

}  // namespace

__attribute__((visibility("default"))) int __android_log_write(int prio, const char* tag,
                                                               const char* text) {
  Ready();
  if (prio < g_filters.lowest || prio >= ANDROID_LOG_SILENT) return -EPERM;
  if (tag == nullptr) tag = "";
  if (prio < LowestFor(tag)) return -EPERM;
  if (text == nullptr) text = "";
  // One call: stdio holds the stream's lock for the whole line.
  return fprintf(stderr, "%c/%s: %s\n", kLetters[prio], tag, text) < 0 ? -EPERM : 1;
}
