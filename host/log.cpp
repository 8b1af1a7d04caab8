#include "android/log.h"

#include <errno.h>
#include <pthread.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>

namespace {

constexpr char kPriorities[] = "??VDIWEFS";  // a letter's position is its priority
constexpr size_t kMostFilters = 32;

struct Filter {
  const char* m_szTag;
  size_t m_nTagLen;
  int m_nPriority;  // the lowest one to write
};

/// The filters of ANDROID_LOG_TAGS; filled once, read-only from then on.
struct Filters {
  Filter m_aFilter[kMostFilters];
  size_t m_nCount;
  int m_nLowest;  // no filter lets a lower priority through
};

Filters g_filters;
pthread_once_t g_once = PTHREAD_ONCE_INIT;

/// The priority that `letter` names, or `otherwise`.
int PriorityOf(char letter, int otherwise) {
  const char* found = letter == '\0' ? nullptr : strchr("VDIWEFS", letter & ~0x20);
  return found == nullptr ? otherwise
                          : static_cast<int>(strchr(kPriorities, *found) - kPriorities);
}

/// Adds one filter, `tag` or `tag:priority`. A tag without a priority asks for everything.
void Add(Filters& filters, const char* text, size_t length) {
  const void* colon = memchr(text, ':', length);
  const size_t tagLength =
      colon == nullptr ? length : static_cast<size_t>(static_cast<const char*>(colon) - text);
  int priority = ANDROID_LOG_VERBOSE;
  if (tagLength < length) {
    priority = tagLength + 1 < length ? PriorityOf(text[tagLength + 1], ANDROID_LOG_SILENT)
                                      : ANDROID_LOG_VERBOSE;
  }
  if (filters.m_nCount < kMostFilters) {
    filters.m_aFilter[filters.m_nCount++] = {text, tagLength, priority};
    if (priority < filters.m_nLowest) filters.m_nLowest = priority;
  }
}

void ReadFilters() {
  constexpr char kSeparators[] = " ,\t\n";
  g_filters.m_nLowest = ANDROID_LOG_SILENT;
  const char* wanted = getenv("ANDROID_LOG_TAGS");
  if (wanted == nullptr) return;
  // The copy lives as long as the process: the environment itself may change behind us.
  const char* text = strdup(wanted);
  if (text == nullptr) return;
  while (*(text += strspn(text, kSeparators)) != '\0') {
    const size_t length = strcspn(text, kSeparators);
    Add(g_filters, text, length);
    text += length;
  }
}

/// The lowest priority to write under `tag`: of its own last filter, else of the last `*`.
int LowestFor(const char* tag) {
  const size_t length = strlen(tag);
  int forAll = ANDROID_LOG_SILENT;
  int forTag = -1;
  for (size_t i = 0; i < g_filters.m_nCount; ++i) {
    const Filter& filter = g_filters.m_aFilter[i];
    if (filter.m_nTagLen == 1 && filter.m_szTag[0] == '*') {
      forAll = filter.m_nPriority;
    } else if (filter.m_nTagLen == length && memcmp(filter.m_szTag, tag, length) == 0) {
      forTag = filter.m_nPriority;
    }
  }
  return forTag < 0 ? forAll : forTag;
}

}  // namespace

extern "C" __attribute__((visibility("default"))) int __android_log_write(int prio,
                                                                          const char* tag,
                                                                          const char* text) {
  pthread_once(&g_once, ReadFilters);
  if (prio < g_filters.m_nLowest || g_filters.m_nCount == 0) return -EPERM;
  if (tag == nullptr) tag = "";
  if (prio >= ANDROID_LOG_SILENT || prio < LowestFor(tag)) return -EPERM;
  const char letter = kPriorities[prio < 0 ? 0 : prio];
  // One call: stdio holds the stream's lock for the whole line.
  fprintf(stderr, "%c/%s: %s\n", letter, tag, text == nullptr ? "" : text);
  return 1;
}
