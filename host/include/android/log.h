#pragma once

// The part of the Android log interface that this project uses, for machines without Android.

enum {
  ANDROID_LOG_VERBOSE = 2,
  ANDROID_LOG_DEBUG,
  ANDROID_LOG_INFO,
  ANDROID_LOG_WARN,
  ANDROID_LOG_ERROR,
  ANDROID_LOG_FATAL,
  ANDROID_LOG_SILENT,
};

extern "C" {

// Writes `text` under `tag` to standard error as `D/tag: text`, if the environment variable
// ANDROID_LOG_TAGS asks for it; nothing is written without that variable. It holds filters of the
// form `tag:priority`, separated by blanks or commas; the tag `*` stands for all that have no
// filter of their own, the priority is the lowest one to write: V D I W E F, or S for none.
//
// The variable is read at the first call. Lines of several threads do not mix. A null tag or text
// counts as an empty one. Returns 1 if the line was written and -EPERM if it was filtered out.
int __android_log_write(int prio, const char* tag, const char* text);
}
