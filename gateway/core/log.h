// The diagnostic log.
#ifndef QUORVANE_GATEWAY_CORE_LOG_H_
#define QUORVANE_GATEWAY_CORE_LOG_H_

// Writes `text` to the Android log, priority debug, tag "gatewayjni"; a null text is an empty line.
// Compiled out where QUORVANE_NO_LOG is defined, texts and all: the lines carry account data.
#ifdef QUORVANE_NO_LOG
inline void debuglog(const char*) {}
#else
void debuglog(const char* text);
#endif

#endif  // QUORVANE_GATEWAY_CORE_LOG_H_
