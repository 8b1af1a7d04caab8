// The diagnostic log.
#ifndef QUORVANE_GATEWAY_CORE_LOG_H_
#define QUORVANE_GATEWAY_CORE_LOG_H_

// Writes `text` to the Android log, priority debug, tag "gatewayjni"; a null text is an empty line.
// Compiled out where QUORVANE_NO_LOG is defined: the lines carry account data.
void debuglog(const char* text);

#endif  // QUORVANE_GATEWAY_CORE_LOG_H_
