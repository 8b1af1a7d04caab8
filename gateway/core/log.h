// The diagnostic log. Where QUORVANE_NO_LOG is defined nothing is logged, nothing formatted for it,
// and no text of it is in the library: the lines carry account data.
#ifndef QUORVANE_GATEWAY_CORE_LOG_H_
#define QUORVANE_GATEWAY_CORE_LOG_H_

#include <string_view>

#include "gateway/core/text_writer.h"

#ifdef QUORVANE_NO_LOG

#define LOG_TEXT(text) nullptr
inline void debuglog(const char*) {}
template <class... Arguments>
void LogLine(const Arguments&...) {}
inline void LogReply(const char*, std::string_view) {}

#else

// A text that is logged later, null where there is no log.
#define LOG_TEXT(text) text

// Writes `text` to the Android log, priority debug, tag "gatewayjni"; a null text is an empty line.
void debuglog(const char* text);

// Logs one piece, which has less than 1024 characters.
template <class Format, class... Values>
void LogLine(Format format, const Values&... values) {
  char scratch[1024];
  CTextWriter line(scratch, sizeof scratch);
  line.Append(format, values...);
  debuglog(line.Text());
}

// Logs "<name>: Len:<length>" and then the reply itself.
inline void LogReply(const char* name, std::string_view reply) {
  LogLine(WIRE("%s: Len:%ld"), name, reply.size());
  debuglog(reply.data());
}

#endif

#endif  // QUORVANE_GATEWAY_CORE_LOG_H_
