#include "gateway/core/log.h"

#ifdef QUORVANE_NO_LOG

void debuglog(const char*) {}

#else

#include <android/log.h>

void debuglog(const char* text) {
  __android_log_write(ANDROID_LOG_DEBUG, "gatewayjni", text == nullptr ? "" : text);
}

#endif
